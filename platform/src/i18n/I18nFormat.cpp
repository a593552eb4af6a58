// Locale, date-pattern generator, date format and time zones over ICU4C.
#include "utils_i18n.h"

#include <new>

#include <unicode/timezone.h>
#include <unicode/udat.h>
#include <unicode/udatpg.h>
#include <unicode/uloc.h>
#include <unicode/unistr.h>

#include "i18n/I18nError.h"

using platform::i18n::ErrorOf;

namespace
{
const UChar* AsUChars(const i18n_uchar* text)
{
    return reinterpret_cast<const UChar*>(text);
}

UChar* AsUChars(i18n_uchar* text)
{
    return reinterpret_cast<UChar*>(text);
}
}  // namespace

extern "C" int i18n_ulocale_get_default(const char** locale)
{
    if (!locale)
        return I18N_ERROR_INVALID_PARAMETER;
    *locale = uloc_getDefault();
    return I18N_ERROR_NONE;
}

extern "C" int i18n_ulocale_set_default(const char* locale_id)
{
    UErrorCode status = U_ZERO_ERROR;
    uloc_setDefault(locale_id, &status);
    return ErrorOf(status);
}

extern "C" int i18n_udatepg_create(const char* locale, i18n_udatepg_h* dtpg)
{
    if (!dtpg)
        return I18N_ERROR_INVALID_PARAMETER;
    UErrorCode status = U_ZERO_ERROR;
    UDateTimePatternGenerator* made = udatpg_open(locale, &status);
    int result = ErrorOf(status);
    if (result != I18N_ERROR_NONE || !made)
    {
        udatpg_close(made);
        *dtpg = nullptr;
        return result != I18N_ERROR_NONE ? result : I18N_ERROR_UNKNOWN;
    }
    *dtpg = made;
    return I18N_ERROR_NONE;
}

extern "C" int i18n_udatepg_get_best_pattern(i18n_udatepg_h dtpg, const i18n_uchar* skeleton, int32_t len,
                                             i18n_uchar* best_pattern, int32_t capacity,
                                             int32_t* best_pattern_len)
{
    if (!dtpg || !skeleton || len < -1 || capacity < 0 || (!best_pattern && capacity > 0) ||
        !best_pattern_len)
        return I18N_ERROR_INVALID_PARAMETER;
    UErrorCode status = U_ZERO_ERROR;
    *best_pattern_len =
        udatpg_getBestPattern(static_cast<UDateTimePatternGenerator*>(dtpg), AsUChars(skeleton), len,
                              AsUChars(best_pattern), capacity, &status);
    return ErrorOf(status);
}

extern "C" int i18n_udatepg_destroy(i18n_udatepg_h dtpg)
{
    if (!dtpg)
        return I18N_ERROR_INVALID_PARAMETER;
    udatpg_close(static_cast<UDateTimePatternGenerator*>(dtpg));
    return I18N_ERROR_NONE;
}

extern "C" int i18n_udate_create(i18n_udate_format_style_e time_style, i18n_udate_format_style_e date_style,
                                 const char* locale, const i18n_uchar* tz_id, int32_t tz_id_len,
                                 const i18n_uchar* pattern, int pattern_len, i18n_udate_format_h* format)
{
    if (!format || tz_id_len < -1 || pattern_len < -1)
        return I18N_ERROR_INVALID_PARAMETER;
    UErrorCode status = U_ZERO_ERROR;
    UDateFormat* made =
        udat_open(static_cast<UDateFormatStyle>(time_style), static_cast<UDateFormatStyle>(date_style),
                  locale, AsUChars(tz_id), tz_id_len, AsUChars(pattern), pattern_len, &status);
    int result = ErrorOf(status);
    if (result != I18N_ERROR_NONE || !made)
    {
        udat_close(made);
        *format = nullptr;
        return result != I18N_ERROR_NONE ? result : I18N_ERROR_UNKNOWN;
    }
    *format = made;
    return I18N_ERROR_NONE;
}

extern "C" int i18n_udate_format_date(const i18n_udate_format_h format, i18n_udate date_to_format,
                                      i18n_uchar* result, int32_t result_len, i18n_ufield_position_h pos,
                                      int32_t* buf_size_needed)
{
    if (!format || !buf_size_needed || result_len < 0 || (!result && result_len > 0))
        return I18N_ERROR_INVALID_PARAMETER;
    UErrorCode status = U_ZERO_ERROR;
    *buf_size_needed = udat_format(static_cast<const UDateFormat*>(format), date_to_format, AsUChars(result),
                                   result_len, static_cast<UFieldPosition*>(pos), &status);
    return ErrorOf(status);
}

extern "C" int i18n_udate_destroy(i18n_udate_format_h format)
{
    if (!format)
        return I18N_ERROR_INVALID_PARAMETER;
    udat_close(static_cast<UDateFormat*>(format));
    return I18N_ERROR_NONE;
}

extern "C" int i18n_timezone_create(i18n_timezone_h* timezone, const char* timezone_id)
{
    if (!timezone || !timezone_id)
        return I18N_ERROR_INVALID_PARAMETER;
    icu::TimeZone* zone = icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(timezone_id));
    if (!zone)
        return I18N_ERROR_OUT_OF_MEMORY;
    *timezone = zone;
    return I18N_ERROR_NONE;
}

extern "C" int i18n_timezone_set_default(i18n_timezone_h timezone)
{
    if (!timezone)
        return I18N_ERROR_INVALID_PARAMETER;
    icu::TimeZone* copy = static_cast<icu::TimeZone*>(timezone)->clone();
    if (!copy)
        return I18N_ERROR_OUT_OF_MEMORY;
    icu::TimeZone::adoptDefault(copy);
    return I18N_ERROR_NONE;
}

extern "C" int i18n_timezone_destroy(i18n_timezone_h timezone)
{
    if (!timezone)
        return I18N_ERROR_INVALID_PARAMETER;
    delete static_cast<icu::TimeZone*>(timezone);
    return I18N_ERROR_NONE;
}

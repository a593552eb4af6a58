#ifndef PLATFORM_UTILS_I18N_H
#define PLATFORM_UTILS_I18N_H

#include <stdint.h>

#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    /* UTF-16 code unit, as ICU's UChar. */
    typedef uint16_t i18n_uchar;
    /* Milliseconds since the epoch. */
    typedef double i18n_udate;

    typedef void* i18n_udatepg_h;
    typedef void* i18n_udate_format_h;
    typedef void* i18n_ufield_position_h;
    typedef void* i18n_timezone_h;

    typedef enum
    {
        I18N_ERROR_NONE = TIZEN_ERROR_NONE,
        I18N_ERROR_MISSING_RESOURCE = TIZEN_ERROR_UTILITY_ICU | 0x01,
        I18N_ERROR_INVALID_FORMAT = TIZEN_ERROR_UTILITY_ICU | 0x02,
        I18N_ERROR_FILE_ACCESS = TIZEN_ERROR_UTILITY_ICU | 0x03,
        I18N_ERROR_INTERNAL_PROGRAM = TIZEN_ERROR_UTILITY_ICU | 0x04,
        I18N_ERROR_INDEX_OUTOFBOUNDS = TIZEN_ERROR_UTILITY_ICU | 0x05,
        I18N_ERROR_INVALID_CHAR_FOUND = TIZEN_ERROR_UTILITY_ICU | 0x06,
        I18N_ERROR_BUFFER_OVERFLOW = TIZEN_ERROR_UTILITY_ICU | 0x07,
        I18N_ERROR_NOT_SUPPORTED = TIZEN_ERROR_NOT_SUPPORTED,
        I18N_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        I18N_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        I18N_ERROR_PERMISSION_DENIED = TIZEN_ERROR_PERMISSION_DENIED,
        I18N_ERROR_UNKNOWN = TIZEN_ERROR_UNKNOWN,
        I18N_WARNING_STRING_NOT_TERMINATED = TIZEN_ERROR_UTILITY_ICU | 0x1D,
    } i18n_error_code_e;

    typedef enum
    {
        I18N_UDATE_FULL = 0,
        I18N_UDATE_LONG = 1,
        I18N_UDATE_MEDIUM = 2,
        I18N_UDATE_SHORT = 3,
        I18N_UDATE_DEFAULT = I18N_UDATE_MEDIUM,
        I18N_UDATE_RELATIVE = (1 << 7),
        I18N_UDATE_FULL_RELATIVE = I18N_UDATE_FULL | I18N_UDATE_RELATIVE,
        I18N_UDATE_LONG_RELATIVE = I18N_UDATE_LONG | I18N_UDATE_RELATIVE,
        I18N_UDATE_MEDIUM_RELATIVE = I18N_UDATE_MEDIUM | I18N_UDATE_RELATIVE,
        I18N_UDATE_SHORT_RELATIVE = I18N_UDATE_SHORT | I18N_UDATE_RELATIVE,
        I18N_UDATE_NONE = -1,
        I18N_UDATE_PATTERN = -2,
    } i18n_udate_format_style_e;

    /* Locale */
    int i18n_ulocale_get_default(const char** locale);   /* not to be freed */
    int i18n_ulocale_set_default(const char* locale_id); /* NULL: the environment's locale */

    /* Date-time pattern generator */
    int i18n_udatepg_create(const char* locale, i18n_udatepg_h* dtpg);
    int i18n_udatepg_get_best_pattern(i18n_udatepg_h dtpg, const i18n_uchar* skeleton, int32_t len,
                                      i18n_uchar* best_pattern, int32_t capacity, int32_t* best_pattern_len);
    int i18n_udatepg_destroy(i18n_udatepg_h dtpg);

    /* Date format; tz_id NULL means the default zone, lengths -1 mean NUL-terminated. */
    int i18n_udate_create(i18n_udate_format_style_e time_style, i18n_udate_format_style_e date_style,
                          const char* locale, const i18n_uchar* tz_id, int32_t tz_id_len,
                          const i18n_uchar* pattern, int pattern_len, i18n_udate_format_h* format);
    int i18n_udate_format_date(const i18n_udate_format_h format, i18n_udate date_to_format,
                               i18n_uchar* result, int32_t result_len, i18n_ufield_position_h pos,
                               int32_t* buf_size_needed);
    int i18n_udate_destroy(i18n_udate_format_h format);

    /* Copies between UTF-8 and UTF-16 of at most n units; NUL-terminated when
     * there is room. NULL with get_last_result() set on bad arguments. */
    i18n_uchar* i18n_ustring_copy_ua_n(i18n_uchar* dest, const char* src, int32_t n);
    char* i18n_ustring_copy_au_n(char* dest, const i18n_uchar* src, int32_t n);

    /* Time zones */
    int i18n_timezone_create(i18n_timezone_h* timezone, const char* timezone_id);
    int i18n_timezone_set_default(i18n_timezone_h timezone); /* copies */
    int i18n_timezone_destroy(i18n_timezone_h timezone);

#ifdef __cplusplus
}
#endif

#endif

// UTF-16 copies. The phone's default codepage is UTF-8, so the conversion
// is UTF-8 here whatever the process's C locale says.
#include "utils_i18n.h"

#include <unicode/ucnv.h>
#include <unicode/ustring.h>

namespace
{

struct Converter
{
    UConverter* cnv = nullptr;
    Converter()
    {
        UErrorCode status = U_ZERO_ERROR;
        cnv = ucnv_open("UTF-8", &status);
        if (U_FAILURE(status))
            cnv = nullptr;
    }
    ~Converter() { ucnv_close(cnv); }
    Converter(const Converter&) = delete;
    Converter& operator=(const Converter&) = delete;
};

int32_t BoundedLength(const char* text, int32_t n)
{
    int32_t length = 0;
    while (length < n && text[length]) ++length;
    return length;
}

int32_t BoundedLength(const UChar* text, int32_t n)
{
    int32_t length = 0;
    while (length < n && text[length]) ++length;
    return length;
}

}  // namespace

extern "C" i18n_uchar* i18n_ustring_copy_ua_n(i18n_uchar* dest, const char* src, int32_t n)
{
    if (!dest || !src || n < 0)
    {
        set_last_result(I18N_ERROR_INVALID_PARAMETER);
        return nullptr;
    }
    UChar* begin = reinterpret_cast<UChar*>(dest);
    UChar* target = begin;
    Converter converter;
    UErrorCode status = U_ZERO_ERROR;
    if (converter.cnv)
        ucnv_toUnicode(converter.cnv, &target, begin + n, &src, src + BoundedLength(src, n), nullptr, true,
                       &status);
    bool failed = !converter.cnv || (U_FAILURE(status) && status != U_BUFFER_OVERFLOW_ERROR);
    if (failed && n > 0)
        *begin = 0;
    else if (target < begin + n)
        *target = 0;
    set_last_result(failed ? I18N_ERROR_UNKNOWN : I18N_ERROR_NONE);
    return dest;
}

extern "C" char* i18n_ustring_copy_au_n(char* dest, const i18n_uchar* src, int32_t n)
{
    if (!dest || !src || n < 0)
    {
        set_last_result(I18N_ERROR_INVALID_PARAMETER);
        return nullptr;
    }
    const UChar* source = reinterpret_cast<const UChar*>(src);
    char* target = dest;
    Converter converter;
    UErrorCode status = U_ZERO_ERROR;
    if (converter.cnv)
        ucnv_fromUnicode(converter.cnv, &target, dest + n, &source, source + BoundedLength(source, n),
                         nullptr, true, &status);
    bool failed = !converter.cnv || (U_FAILURE(status) && status != U_BUFFER_OVERFLOW_ERROR);
    if (failed && n > 0)
        *dest = 0;
    else if (target < dest + n)
        *target = 0;
    set_last_result(failed ? I18N_ERROR_UNKNOWN : I18N_ERROR_NONE);
    return dest;
}

#include "i18n/I18nError.h"

#include "utils_i18n.h"

namespace platform
{
namespace i18n
{

int ErrorOf(UErrorCode status)
{
    if (status == U_STRING_NOT_TERMINATED_WARNING)
        return I18N_WARNING_STRING_NOT_TERMINATED;
    if (U_SUCCESS(status))
        return I18N_ERROR_NONE;
    switch (status)
    {
        case U_ILLEGAL_ARGUMENT_ERROR:
            return I18N_ERROR_INVALID_PARAMETER;
        case U_MISSING_RESOURCE_ERROR:
            return I18N_ERROR_MISSING_RESOURCE;
        case U_INVALID_FORMAT_ERROR:
            return I18N_ERROR_INVALID_FORMAT;
        case U_FILE_ACCESS_ERROR:
            return I18N_ERROR_FILE_ACCESS;
        case U_INTERNAL_PROGRAM_ERROR:
            return I18N_ERROR_INTERNAL_PROGRAM;
        case U_INDEX_OUTOFBOUNDS_ERROR:
            return I18N_ERROR_INDEX_OUTOFBOUNDS;
        case U_INVALID_CHAR_FOUND:
            return I18N_ERROR_INVALID_CHAR_FOUND;
        case U_MEMORY_ALLOCATION_ERROR:
            return I18N_ERROR_OUT_OF_MEMORY;
        case U_BUFFER_OVERFLOW_ERROR:
            return I18N_ERROR_BUFFER_OVERFLOW;
        case U_UNSUPPORTED_ERROR:
            return I18N_ERROR_NOT_SUPPORTED;
        default:
            return I18N_ERROR_UNKNOWN;
    }
}

}  // namespace i18n
}  // namespace platform

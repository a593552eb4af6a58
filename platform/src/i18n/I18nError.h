#ifndef PLATFORM_I18N_I18N_ERROR_H
#define PLATFORM_I18N_I18N_ERROR_H

#include <unicode/utypes.h>

namespace platform
{
namespace i18n
{

// The platform's code for an ICU status: warnings count as success, except
// a string that could not be terminated.
int ErrorOf(UErrorCode status);

}  // namespace i18n
}  // namespace platform

#endif

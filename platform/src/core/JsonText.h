#ifndef PLATFORM_CORE_JSON_TEXT_H
#define PLATFORM_CORE_JSON_TEXT_H

#include <string>

#include "bundle.h"

// JSON texts of the platform's log lines (launch.log, usage.log). Internal
// to the platform library.
namespace platform
{

// `text` as a JSON string. Callers pass any bytes: what is not valid UTF-8
// becomes U+FFFD, one per bad byte, so that every line stays valid JSON.
std::string JsonString(const std::string& text);

// {"key":"value",...} of the bundle's entries, in its order.
std::string JsonObject(const bundle* b);

}  // namespace platform

#endif

#ifndef NSWEATHER_STRING_UTIL_H
#define NSWEATHER_STRING_UTIL_H

#include <string>

namespace NSWeather
{
class StringUtil
{
public:
    // Plain decimal digits, "-" for negatives, never the user's locale.
    static std::string IntToString(int value);
};
}  // namespace NSWeather

#endif

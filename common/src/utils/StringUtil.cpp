#include "StringUtil.h"

#include <sstream>

namespace NSWeather
{
std::string StringUtil::IntToString(int value)
{
    // Pinned to the classic locale: a global locale must never add grouping.
    std::ostringstream stream;
    stream.imbue(std::locale::classic());
    stream << value;
    return stream.str();
}
}  // namespace NSWeather

#ifndef NSWEATHER_VCONF_UTIL_H
#define NSWEATHER_VCONF_UTIL_H

namespace NSWeather
{

// The system key whose reading carries a rule of its own.
class VconfUtil
{
public:
    virtual ~VconfUtil() = default;

    // 1 for a 12-hour clock, anything else for 24 hours; 1 when the key
    // cannot be read.
    static int GetRegionFormatTime1224();
};

}  // namespace NSWeather

#endif

#ifndef NSWEATHER_CITY_TIME_ZONE_H
#define NSWEATHER_CITY_TIME_ZONE_H

#include <ctime>
#include <string>

namespace NSWeather
{

// A city's offset from UTC at a given moment, from its IANA zone (ICU).
class CityTimeZone
{
public:
    virtual ~CityTimeZone() = default;

    // False (logged) for a zone ICU does not know.
    static bool GetOffset(const std::string& zoneId, time_t when, double& offsetHours, bool& isSummerTime);
};

}  // namespace NSWeather

#endif

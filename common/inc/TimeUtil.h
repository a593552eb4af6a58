#ifndef NSWEATHER_TIME_UTIL_H
#define NSWEATHER_TIME_UTIL_H

#include <vconf.h>

#include <ctime>
#include <string>

#include "City.h"

namespace NSWeather
{

// A city's local time and clock text, day or night at a city, and the
// system keys whose changes alter time texts.
class TimeUtil
{
public:
    virtual ~TimeUtil() = default;

    static time_t GetCurrentTime();
    // t shifted so that the device's local clock shows the city's clock.
    static time_t GetCityTime(time_t t, double gmtOffset);
    // Whether the city's clock at t lies in [sunrise, sunset).
    static bool GetIsDay(const CityPtr& cityPtr, time_t t);
    // Weekday, date and clock of the city now; `contentProvider` is the
    // provider code, of which all but the default one add summer time.
    static std::string GetLocalTimeStringLong(const CityPtr& cityPtr, int contentProvider);

    // Change callbacks of the keys; each returns the platform's result.
    static int RegisterSystemTimeChangedCb(vconf_callback_fn cb, void* userData);
    static int UnregisterSystemTimeChangedCb(vconf_callback_fn cb);
    static int RegisterTimezoneIdChangedCb(vconf_callback_fn cb, void* userData);
    static int UnregisterTimezoneIdChangedCb(vconf_callback_fn cb);
    static int RegisterDateFormatChangedCb(vconf_callback_fn cb, void* userData);
    static int UnregisterDateFormatChangedCb(vconf_callback_fn cb);
    static int RegisterRegionFormatTime1224ChangedCb(vconf_callback_fn cb, void* userData);
    static int UnregisterRegionFormatTime1224ChangedCb(vconf_callback_fn cb);

private:
    // Local clock of t as hours * 100 + minutes (06:05 is 605).
    static int GetClockValue(time_t t);
};

}  // namespace NSWeather

#endif

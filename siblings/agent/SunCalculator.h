#ifndef NSWEATHER_SUN_CALCULATOR_H
#define NSWEATHER_SUN_CALCULATOR_H

#include <ctime>

namespace NSWeather
{

// Sunrise and sunset of one solar day at a place, accurate to a few
// minutes (no equation of time): enough for day and night.
class SunCalculator
{
public:
    virtual ~SunCalculator() = default;

    // The solar day that contains `when` at `longitude`. With polar night
    // both times are solar noon; with midnight sun they span the whole day.
    static void GetSunTimes(double latitude, double longitude, time_t when, time_t& sunrise, time_t& sunset);
    static bool IsDayTime(double latitude, double longitude, time_t when);
    // Hours 0-24 of local solar time.
    static double GetSolarHour(double longitude, time_t when);
    // Day of the year 0-365 of `when` in UTC.
    static int GetDayOfYear(time_t when);
};

}  // namespace NSWeather

#endif

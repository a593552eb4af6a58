#include "SunCalculator.h"

#include <cmath>

namespace NSWeather
{

namespace
{
constexpr double PI = 3.14159265358979323846;
constexpr double DAY_SECONDS = 86400.0;

double Radians(double degrees)
{
    return degrees * PI / 180.0;
}
}  // namespace

double SunCalculator::GetSolarHour(double longitude, time_t when)
{
    double hours = std::fmod(static_cast<double>(when) / 3600.0 + longitude / 15.0, 24.0);
    return hours < 0 ? hours + 24.0 : hours;
}

int SunCalculator::GetDayOfYear(time_t when)
{
    struct tm utc = {};
    gmtime_r(&when, &utc);
    return utc.tm_yday;
}

void SunCalculator::GetSunTimes(double latitude, double longitude, time_t when, time_t& sunrise,
                                time_t& sunset)
{
    double noon = static_cast<double>(when) + (12.0 - GetSolarHour(longitude, when)) * 3600.0;
    double declination = Radians(23.44) * std::sin(2.0 * PI * (284 + GetDayOfYear(when)) / 365.0);
    double phi = Radians(latitude);
    double cosHour = (std::sin(Radians(-0.833)) - std::sin(phi) * std::sin(declination)) /
                     (std::cos(phi) * std::cos(declination));
    double halfDay = 0.0;
    if (cosHour <= -1.0)
        halfDay = DAY_SECONDS / 2 - 1;
    else if (cosHour < 1.0)
        halfDay = std::acos(cosHour) / (2.0 * PI) * DAY_SECONDS;
    sunrise = static_cast<time_t>(std::llround(noon - halfDay));
    sunset = static_cast<time_t>(std::llround(noon + halfDay));
}

bool SunCalculator::IsDayTime(double latitude, double longitude, time_t when)
{
    time_t sunrise = 0;
    time_t sunset = 0;
    GetSunTimes(latitude, longitude, when, sunrise, sunset);
    return when >= sunrise && when < sunset;
}

}  // namespace NSWeather

#include "MoonCalculator.h"

#include <cmath>

#include "SunCalculator.h"

namespace NSWeather
{

namespace
{
constexpr time_t HOUR = 3600;
constexpr time_t DAY = 86400;
constexpr double SYNODIC_DAYS = 29.530588;
constexpr time_t KNOWN_NEW_MOON = 947182440;  // 2000-01-06 18:14 UTC

const char* MoonPhaseText(double age)
{
    static const char* const names[] = {"New Moon",  "Waxing Crescent", "First Quarter", "Waxing Gibbous",
                                        "Full Moon", "Waning Gibbous",  "Last Quarter",  "Waning Crescent"};
    int index = static_cast<int>(std::floor(age / SYNODIC_DAYS * 8.0 + 0.5)) % 8;
    return names[index];
}
}  // namespace

MoonPhasePtrVectorPtr MoonCalculator::MakePhases(const std::string& locationId, double longitude, time_t now,
                                                 int count)
{
    auto moonPhasePtrVector = std::make_shared<MoonPhasePtrVector>();
    time_t midnight = now - static_cast<time_t>(SunCalculator::GetSolarHour(longitude, now) * 3600.0);
    for (int i = 0; i < count; ++i)
    {
        time_t day = midnight + i * DAY;
        double age = std::fmod(static_cast<double>(day + 12 * HOUR - KNOWN_NEW_MOON) / DAY, SYNODIC_DAYS);
        age = age < 0 ? age + SYNODIC_DAYS : age;
        time_t rise = day + 6 * HOUR + static_cast<time_t>(age / SYNODIC_DAYS * DAY);
        auto moonPtr = std::make_shared<MoonPhase>();
        moonPtr->SetLocationID(locationId);
        moonPtr->SetDate(day);
        moonPtr->SetMoonRiseTime(rise);
        moonPtr->SetMoonSetTime(rise + 12 * HOUR + 25 * 60);
        moonPtr->SetPhaseText(MoonPhaseText(age));
        moonPtr->SetAge(static_cast<int>(age));
        moonPhasePtrVector->push_back(moonPtr);
    }
    return moonPhasePtrVector;
}

}  // namespace NSWeather

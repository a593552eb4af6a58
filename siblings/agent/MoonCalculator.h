#ifndef NSWEATHER_MOON_CALCULATOR_H
#define NSWEATHER_MOON_CALCULATOR_H

#include <ctime>
#include <string>

#include "MoonPhase.h"

namespace NSWeather
{

// The moon calendar of a place: age and phase from the mean synodic month,
// rise and set about 50 minutes later each day of its age. Good to a day
// for the phase; the times are rough.
class MoonCalculator
{
public:
    virtual ~MoonCalculator() = default;

    // `count` days from the solar day that contains `now` at `longitude`.
    static MoonPhasePtrVectorPtr MakePhases(const std::string& locationId, double longitude, time_t now,
                                            int count);
};

}  // namespace NSWeather

#endif

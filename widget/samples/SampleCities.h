#ifndef NSWEATHERWIDGET_SAMPLE_CITIES_H
#define NSWEATHERWIDGET_SAMPLE_CITIES_H

#include <ctime>
#include <string>

#include "City.h"

namespace NSWeatherWidget
{

// Plausible cities with their weather, for pictures, tests and benchmarks
// of the real pages. The data are fixed by the arguments alone.
class SampleCities
{
public:
    static const int kCount = 4;

    // City `index` (0 to kCount-1) refreshed at `refreshedTime`, with `days`
    // daily records. AccuWeather icon numbers.
    static NSWeather::CityPtr MakeCity(int index, time_t refreshedTime, int days);
    // Writes `count` cities through the store, replacing what was there;
    // ERR_OK or -1.
    static int WriteCities(int count, time_t refreshedTime, int days, bool firstIsCurrentLocation);
};

}  // namespace NSWeatherWidget

#endif

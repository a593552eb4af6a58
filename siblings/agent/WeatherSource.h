#ifndef NSWEATHER_WEATHER_SOURCE_H
#define NSWEATHER_WEATHER_SOURCE_H

#include <ctime>
#include <memory>
#include <string>

#include "CatalogueCity.h"
#include "City.h"

namespace NSWeather
{

// Where the agent's weather comes from. A source fills the weather of one
// place at one moment into a city record: current, hourly, daily, extra
// and moon, the day/night flag and the provider page. Names, offsets and
// times of the city are the agent's.
class WeatherSource
{
public:
    virtual ~WeatherSource() = default;

    // Icon numbers are those of `contentProvider` (a ContentProviderType).
    // False when the source has nothing for the place.
    virtual bool Fill(const CatalogueCity& place, time_t now, int contentProvider, City& city) = 0;
    // Said in the agent's log and help.
    virtual std::string GetDescription() const = 0;
    // True when the stored city's weather came from this source so lately
    // that asking again would only load the service.
    virtual bool IsFreshEnough(const City& stored, time_t now) const
    {
        (void)stored;
        (void)now;
        return false;
    }
};

using WeatherSourcePtr = std::shared_ptr<WeatherSource>;

}  // namespace NSWeather

#endif

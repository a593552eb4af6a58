#ifndef NSWEATHER_OPEN_METEO_WEATHER_SOURCE_H
#define NSWEATHER_OPEN_METEO_WEATHER_SOURCE_H

#include <cstddef>
#include <ctime>
#include <string>

#include "HttpClient.h"
#include "OpenMeteoForecast.h"
#include "WeatherSource.h"

namespace NSWeather
{

// Forecasts from Open-Meteo (no key; data under CC BY 4.0): one request per
// city, refused answers change nothing, and a city is not asked again
// within the minimum interval. Moon rows are calculated, not fetched.
class OpenMeteoWeatherSource : public WeatherSource
{
public:
    static constexpr const char* DEFAULT_BASE_URL = "https://api.open-meteo.com/v1/forecast";
    // Where the rows' links lead: the service's page, which also states its terms.
    static constexpr const char* PAGE_URL = "https://open-meteo.com/";
    static constexpr const char* CREDIT =
        "Weather data by Open-Meteo.com (https://open-meteo.com/), CC BY 4.0";
    static constexpr int MOON_COUNT = 7;
    // After a timeout or an unreachable host, the next cities are not
    // asked for this long: one refresh then costs one timeout, not one per city.
    static constexpr time_t QUIET_AFTER_FAILURE = 60;

    struct Options
    {
        std::string baseUrl;
        long timeoutMs;
        // Seconds before a city this source filled is asked again.
        time_t minimumInterval;
        size_t maxAnswerBytes;
    };
    static Options GetDefaultOptions();

    OpenMeteoWeatherSource();
    explicit OpenMeteoWeatherSource(const Options& options);

    bool Fill(const CatalogueCity& place, time_t now, int contentProvider, City& city) override;
    std::string GetDescription() const override;
    bool IsFreshEnough(const City& stored, time_t now) const override;
    std::string MakeUrl(const CatalogueCity& place) const;

private:
    bool Fetch(const CatalogueCity& place, time_t now, std::string& body);
    static void FillCurrent(const OpenMeteoForecast& forecast, int provider, City& city);
    static void FillHourly(const OpenMeteoForecast& forecast, int provider, City& city);
    static void FillDaily(const OpenMeteoForecast& forecast, int provider, City& city);
    static void FillExtra(const OpenMeteoForecast& forecast, const CatalogueCity& place, time_t now,
                          City& city);

    Options mOptions;
    HttpClient mClient;
    time_t mQuietUntil = 0;
};

}  // namespace NSWeather

#endif

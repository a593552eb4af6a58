#ifndef NSWEATHER_SAMPLE_WEATHER_SOURCE_H
#define NSWEATHER_SAMPLE_WEATHER_SOURCE_H

#include <cstdint>

#include "WeatherCondition.h"
#include "WeatherSource.h"

namespace NSWeather
{

// Offline sample weather: plausible and deterministic for a place and an
// hour. Temperature follows latitude, season and the solar hour; fronts
// (smooth noise per place, a few days long) bring clouds, rain and snow.
// Nothing here is a forecast.
class SampleWeatherSource : public WeatherSource
{
public:
    static constexpr int HOURLY_COUNT = 24;
    static constexpr int DAILY_COUNT = 10;
    static constexpr int MOON_COUNT = 7;

    bool Fill(const CatalogueCity& place, time_t now, int contentProvider, City& city) override;
    std::string GetDescription() const override;

    // The sample at one moment; public for the tests of plausibility.
    struct Sample
    {
        double temperature;
        double cloudiness;  // 0 clear .. 1 overcast and wet
        bool isDayTime;
        WeatherCondition condition;
    };
    static Sample SampleAt(const CatalogueCity& place, time_t when);

private:
    static double Front(uint64_t seed, time_t when);
    static double MeanTemperature(double latitude, time_t when);
    static WeatherCondition ConditionOf(double cloudiness, double temperature, double solarHour,
                                        uint64_t seed);
    static void DayRange(const CatalogueCity& place, time_t when, double& low, double& high);
    static void FillCurrent(const CatalogueCity& place, time_t now, int provider, City& city);
    static void FillHourly(const CatalogueCity& place, time_t now, int provider, City& city);
    static void FillDaily(const CatalogueCity& place, time_t now, int provider, City& city);
    static void FillExtra(const CatalogueCity& place, time_t now, City& city);
};

}  // namespace NSWeather

#endif

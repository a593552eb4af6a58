#ifndef NSWEATHER_WEATHER_H
#define NSWEATHER_WEATHER_H

#include <ctime>
#include <memory>
#include <string>
#include <vector>

#include "Temperature.h"

namespace NSWeather
{
// Fields shared by the current, hourly and daily weather records.
class Weather
{
public:
    Weather();
    virtual ~Weather();

    int GetWeatherIcon() const;
    void SetWeatherIcon(int weatherIcon);
    std::string GetWeatherStatus() const;
    void SetWeatherStatus(const std::string& weatherStatus);
    TemperaturePtr GetCurTemperature() const;
    void SetCurTemperature(TemperaturePtr curTemperature);
    TemperaturePtr GetLowTemperature() const;
    void SetLowTemperature(TemperaturePtr lowTemperature);
    TemperaturePtr GetHighTemperature() const;
    void SetHighTemperature(TemperaturePtr highTemperature);
    time_t GetDate() const;
    void SetDate(time_t date);

private:
    int mWeatherIcon;
    std::string mWeatherStatus;
    TemperaturePtr mCurTemperature;
    TemperaturePtr mLowTemperature;
    TemperaturePtr mHighTemperature;
    time_t mDate;
};

using WeatherPtr = std::shared_ptr<Weather>;
using WeatherPtrVector = std::vector<WeatherPtr>;
using WeatherPtrVectorPtr = std::shared_ptr<WeatherPtrVector>;
}  // namespace NSWeather

#endif

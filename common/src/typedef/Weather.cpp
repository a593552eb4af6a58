#include "Weather.h"

#include <memory>

namespace NSWeather
{

Weather::Weather()
    : mWeatherIcon(999),
      mWeatherStatus("NULL"),
      mCurTemperature(std::make_shared<Temperature>()),
      mLowTemperature(std::make_shared<Temperature>()),
      mHighTemperature(std::make_shared<Temperature>()),
      mDate(0)
{
}

Weather::~Weather() = default;

int Weather::GetWeatherIcon() const
{
    return mWeatherIcon;
}

void Weather::SetWeatherIcon(int weatherIcon)
{
    mWeatherIcon = weatherIcon;
}

std::string Weather::GetWeatherStatus() const
{
    return mWeatherStatus;
}

void Weather::SetWeatherStatus(const std::string& weatherStatus)
{
    mWeatherStatus = weatherStatus;
}

TemperaturePtr Weather::GetCurTemperature() const
{
    return mCurTemperature;
}

void Weather::SetCurTemperature(TemperaturePtr curTemperature)
{
    mCurTemperature = curTemperature;
}

TemperaturePtr Weather::GetLowTemperature() const
{
    return mLowTemperature;
}

void Weather::SetLowTemperature(TemperaturePtr lowTemperature)
{
    mLowTemperature = lowTemperature;
}

TemperaturePtr Weather::GetHighTemperature() const
{
    return mHighTemperature;
}

void Weather::SetHighTemperature(TemperaturePtr highTemperature)
{
    mHighTemperature = highTemperature;
}

time_t Weather::GetDate() const
{
    return mDate;
}

void Weather::SetDate(time_t date)
{
    mDate = date;
}

}  // namespace NSWeather

#ifndef NSWEATHER_WEATHER_DEFINE_H
#define NSWEATHER_WEATHER_DEFINE_H

// Values shared by every component of the suite.
namespace NSWeather
{
constexpr int ERR_OK = 0;
constexpr int ERR_FAIL = -1;

constexpr const char* WEATHER_APP_ID = "com.quorvex.weather-m";
constexpr const char* WEATHER_AGENT_APP_ID = "com.quorvex.weather-m-agent";
constexpr const char* WEATHER_WIDGET_APP_ID = "com.quorvex.weather-m-widget";
}  // namespace NSWeather

#endif

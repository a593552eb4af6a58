#ifndef NSWEATHER_WEATHER_SOURCE_CHOICE_H
#define NSWEATHER_WEATHER_SOURCE_CHOICE_H

#include <string>

#include "WeatherSource.h"

namespace NSWeather
{

// Which source the agent uses: the --source option, else the platform key
// (so that agents launched by the widget follow it too), else sample
// weather. The Open-Meteo address and time limit can be changed through
// the environment, for tests against a local server.
class WeatherSourceChoice
{
public:
    static constexpr const char* SOURCE_KEY = "db/weather-agent/source";
    static constexpr const char* OPEN_METEO = "open-meteo";
    static constexpr const char* SAMPLE = "sample";
    static constexpr const char* BASE_URL_ENV = "WEATHER_AGENT_OPEN_METEO_URL";
    static constexpr const char* TIMEOUT_ENV = "WEATHER_AGENT_TIMEOUT_MS";

    virtual ~WeatherSourceChoice() = default;

    // `name` from the command line, or empty to read the key. Null for an
    // unknown name; an unknown key value is logged and gives sample weather.
    static WeatherSourcePtr Make(const std::string& name);

private:
    static std::string ReadKey();
    static WeatherSourcePtr MakeOpenMeteo();
};

}  // namespace NSWeather

#endif

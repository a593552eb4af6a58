#ifndef NSWEATHER_WEATHER_CONDITION_H
#define NSWEATHER_WEATHER_CONDITION_H

#include <string>

namespace NSWeather
{

// The conditions the sample weather knows, independent of any provider.
enum class WeatherCondition
{
    SUNNY,
    PARTLY_SUNNY,
    CLOUDY,
    FOG,
    SHOWER,
    RAIN,
    THUNDERSTORM,
    FLURRIES,
    SNOW,
    SLEET,
};

constexpr int WEATHER_CONDITION_COUNT = 10;

// Provider icon numbers and texts of a condition. Each provider numbers its
// icons its own way; the widget maps them back with its icon tables.
class WeatherConditionText
{
public:
    virtual ~WeatherConditionText() = default;

    // The icon number `contentProvider` (a ContentProviderType) uses for
    // the condition by day or by night.
    static int GetProviderIcon(WeatherCondition condition, int contentProvider, bool isDayTime);
    // The widget condition number the condition should end up as.
    static int GetWidgetIcon(WeatherCondition condition, bool isDayTime);
    static std::string GetStatus(WeatherCondition condition, bool isDayTime);
};

}  // namespace NSWeather

#endif

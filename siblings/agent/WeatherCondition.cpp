#include "WeatherCondition.h"

#include "ContentProvider.h"

namespace NSWeather
{

namespace
{
struct ConditionRow
{
    int widgetDay;
    int widgetNight;
    int accuDay;
    int accuNight;
    int cma;
    int kweather;
    int weatherNewsDay;
    int weatherNewsNight;
    const char* statusDay;
    const char* statusNight;
};

// Rows in WeatherCondition order. Twins 1/18 and 2/19 follow day and night.
const ConditionRow ROWS[WEATHER_CONDITION_COUNT] = {
    {1, 18, 1, 33, 0, 1, 100, 100, "Sunny", "Clear"},
    {2, 19, 3, 35, 2, 2, 101, 101, "Partly sunny", "Mostly clear"},
    {3, 3, 7, 7, 1, 3, 200, 200, "Cloudy", "Cloudy"},
    {5, 5, 11, 11, 18, 40, 130, 130, "Fog", "Fog"},
    {6, 6, 12, 12, 10, 7, 302, 302, "Showers", "Showers"},
    {4, 4, 18, 18, 7, 10, 300, 300, "Rain", "Rain"},
    {8, 8, 15, 15, 4, 39, 350, 350, "Thunderstorms", "Thunderstorms"},
    {10, 10, 19, 19, 14, 23, 402, 402, "Flurries", "Flurries"},
    {12, 12, 22, 22, 16, 18, 400, 400, "Snow", "Snow"},
    {13, 13, 29, 29, 6, 26, 303, 303, "Rain and snow", "Rain and snow"},
};

const ConditionRow& RowOf(WeatherCondition condition)
{
    int index = static_cast<int>(condition);
    return ROWS[index >= 0 && index < WEATHER_CONDITION_COUNT ? index : 0];
}
}  // namespace

int WeatherConditionText::GetProviderIcon(WeatherCondition condition, int contentProvider, bool isDayTime)
{
    const ConditionRow& row = RowOf(condition);
    switch (contentProvider)
    {
        case CP_CMAWEATHER:
            return row.cma;
        case CP_KWEATHER:
        case CP_WEATHERNEWS_KR:
            return row.kweather;
        case CP_WEATHERNEWS:
            return isDayTime ? row.weatherNewsDay : row.weatherNewsNight;
        default:
            return isDayTime ? row.accuDay : row.accuNight;
    }
}

int WeatherConditionText::GetWidgetIcon(WeatherCondition condition, bool isDayTime)
{
    const ConditionRow& row = RowOf(condition);
    return isDayTime ? row.widgetDay : row.widgetNight;
}

std::string WeatherConditionText::GetStatus(WeatherCondition condition, bool isDayTime)
{
    const ConditionRow& row = RowOf(condition);
    return isDayTime ? row.statusDay : row.statusNight;
}

}  // namespace NSWeather

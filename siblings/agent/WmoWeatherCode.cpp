#include "WmoWeatherCode.h"

#include "ContentProvider.h"

namespace NSWeather
{

namespace
{
struct CodeRow
{
    int code;
    int accuDay;
    int accuNight;
    int cmaDay;
    int cmaNight;
    int kweatherDay;
    int kweatherNight;
    int weatherNewsDay;
    int weatherNewsNight;
    WmoWeatherCode::PrecipitationType precipitation;
    const char* status;
};

constexpr auto DRY = WmoWeatherCode::PRECIPITATION_NONE;
constexpr auto RAIN = WmoWeatherCode::PRECIPITATION_RAIN;
constexpr auto SNOW = WmoWeatherCode::PRECIPITATION_SNOW;

// Only pictures every provider can show: KWeather has no flurries, ice or
// plain night showers, so light snow is snow and freezing rain is rain and
// snow. The AccuWeather numbers avoid the three where its two tables differ.
// Showers and snow showers are "partly sunny with ..." by day only.
const CodeRow ROWS[] = {
    {0, 1, 33, 0, 0, 1, 1, 100, 100, DRY, "Clear sky"},
    {1, 2, 33, 0, 0, 1, 1, 100, 100, DRY, "Mainly clear"},
    {2, 3, 35, 2, 2, 2, 2, 101, 101, DRY, "Partly cloudy"},
    {3, 7, 7, 1, 1, 3, 3, 200, 200, DRY, "Overcast"},
    {45, 11, 11, 18, 18, 40, 40, 130, 130, DRY, "Fog"},
    {48, 11, 11, 18, 18, 40, 40, 130, 130, DRY, "Rime fog"},
    {51, 12, 12, 10, 10, 7, 7, 302, 302, RAIN, "Light drizzle"},
    {53, 12, 12, 10, 10, 7, 7, 302, 302, RAIN, "Drizzle"},
    {55, 12, 12, 10, 10, 7, 7, 302, 302, RAIN, "Dense drizzle"},
    {56, 29, 29, 6, 6, 26, 26, 303, 303, RAIN, "Light freezing drizzle"},
    {57, 29, 29, 6, 6, 26, 26, 303, 303, RAIN, "Freezing drizzle"},
    {61, 18, 18, 7, 7, 10, 10, 300, 300, RAIN, "Light rain"},
    {63, 18, 18, 7, 7, 10, 10, 300, 300, RAIN, "Rain"},
    {65, 18, 18, 7, 7, 10, 10, 300, 300, RAIN, "Heavy rain"},
    {66, 29, 29, 6, 6, 26, 26, 303, 303, RAIN, "Light freezing rain"},
    {67, 29, 29, 6, 6, 26, 26, 303, 303, RAIN, "Freezing rain"},
    {71, 22, 22, 16, 16, 18, 18, 400, 400, SNOW, "Light snow"},
    {73, 22, 22, 16, 16, 18, 18, 400, 400, SNOW, "Snow"},
    {75, 22, 22, 16, 16, 18, 18, 400, 400, SNOW, "Heavy snow"},
    {77, 22, 22, 16, 16, 18, 18, 400, 400, SNOW, "Snow grains"},
    {80, 14, 39, 3, 10, 15, 7, 301, 301, RAIN, "Light showers"},
    {81, 14, 39, 3, 10, 15, 7, 301, 301, RAIN, "Showers"},
    {82, 14, 39, 3, 10, 15, 7, 301, 301, RAIN, "Violent showers"},
    {85, 21, 44, 13, 16, 23, 18, 401, 400, SNOW, "Light snow showers"},
    {86, 21, 44, 13, 16, 23, 18, 401, 400, SNOW, "Snow showers"},
    {95, 15, 15, 4, 4, 39, 39, 350, 350, RAIN, "Thunderstorm"},
    {96, 15, 15, 4, 4, 39, 39, 350, 350, RAIN, "Thunderstorm with hail"},
    {99, 15, 15, 4, 4, 39, 39, 350, 350, RAIN, "Thunderstorm with heavy hail"},
};

const CodeRow* RowOf(int code)
{
    for (const CodeRow& row : ROWS)
        if (row.code == code)
            return &row;
    return nullptr;
}
}  // namespace

bool WmoWeatherCode::IsKnown(int code)
{
    return RowOf(code) != nullptr;
}

int WmoWeatherCode::GetProviderIcon(int code, int contentProvider, bool isDayTime)
{
    const CodeRow* row = RowOf(code);
    if (!row)
        return 0;
    switch (contentProvider)
    {
        case CP_CMAWEATHER:
            return isDayTime ? row->cmaDay : row->cmaNight;
        case CP_KWEATHER:
        case CP_WEATHERNEWS_KR:
            return isDayTime ? row->kweatherDay : row->kweatherNight;
        case CP_WEATHERNEWS:
            return isDayTime ? row->weatherNewsDay : row->weatherNewsNight;
        default:
            return isDayTime ? row->accuDay : row->accuNight;
    }
}

std::string WmoWeatherCode::GetStatus(int code)
{
    const CodeRow* row = RowOf(code);
    if (!row)
        return std::string();
    return row->status;
}

WmoWeatherCode::PrecipitationType WmoWeatherCode::GetPrecipitationType(int code)
{
    const CodeRow* row = RowOf(code);
    return row ? row->precipitation : PRECIPITATION_NONE;
}

}  // namespace NSWeather

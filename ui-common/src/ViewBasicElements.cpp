#include "ViewBasicElements.h"

namespace NSWeather
{

namespace
{
const char* const ICON_BASE_NAMES[] = {
    "01.weather_view_sunny",         "01.weather_view_sunny",
    "02.weather_view_partly_sunny",  "03.weather_view_cloudy",
    "04.weather_view_rain",          "05.weather_view_fog",
    "06.weather_view_shower",        "07.weather_view_partly_sunny_with_shower",
    "08.weather_view_thunderstorms", "09.weather_view_partly_sunny_with_thunder_showers",
    "10.weather_view_flurries",      "11.weather_view_partly_sunny_with_flurries",
    "12.weather_view_snow",          "13.weather_view_rain_and_snow_mixed",
    "14.weather_view_ice",           "15.weather_view_hot",
    "16.weather_view_cold",          "17.weather_view_windy",
    "18.weather_view_clear",         "19.weather_view_mostly_clear",
    "01.weather_view_sunny",         "01.weather_view_sunny",
};

const char* const BACKGROUND_BASE_NAMES[] = {
    "bg_weatherview_sunny",  "bg_weatherview_sunny",        "bg_weatherview_partly_sunny",
    "bg_weatherview_cloudy", "bg_weatherview_rain",         "bg_weatherview_fog",
    "bg_weatherview_rain",   "bg_weatherview_partly_sunny", "bg_weatherview_rain",
    "bg_weatherview_rain",   "bg_weatherview_snow",         "bg_weatherview_cloudy",
    "bg_weatherview_snow",   "bg_weatherview_rain",         "bg_weatherview_snow",
    "bg_weatherview_hot",    "bg_weatherview_cold",         "bg_weatherview_cloudy",
    "bg_weatherview_sunny",  "bg_weatherview_partly_sunny", "bg_weatherview_sunny",
    "bg_weatherview_snow",
};

constexpr int CODE_COUNT = sizeof(ICON_BASE_NAMES) / sizeof(ICON_BASE_NAMES[0]);
static_assert(CODE_COUNT == sizeof(BACKGROUND_BASE_NAMES) / sizeof(BACKGROUND_BASE_NAMES[0]),
              "one background per condition code");

constexpr int CODE_HOT = 15;
constexpr int CODE_COLD = 16;

bool IsKnownCode(int conditionCode)
{
    return conditionCode >= 0 && conditionCode < CODE_COUNT;
}
}  // namespace

const char* ViewBasicElements::GetIconSizeSuffix(int viewType)
{
    switch (viewType)
    {
        case 1:
            return "_64x64";
        case 2:
            return "_97x97";
        case 3:
            return "_154x154";
        case 4:
            return "_96x96";
        case 5:
            return "_154x154";
        case 6:
            return "_196x196";
        default:
            return "_150x150";
    }
}

const char* ViewBasicElements::GetTemperatureUnitVariant(int viewType)
{
    switch (viewType)
    {
        case 3:
        case 5:
            return "_widget_4x2";
        case 6:
            return "_widget_4x4";
        default:
            return "_main";
    }
}

const char* ViewBasicElements::GetIconBaseName(int conditionCode)
{
    return ICON_BASE_NAMES[IsKnownCode(conditionCode) ? conditionCode : 0];
}

const char* ViewBasicElements::GetBackgroundBaseName(int conditionCode)
{
    return BACKGROUND_BASE_NAMES[IsKnownCode(conditionCode) ? conditionCode : 0];
}

std::string ViewBasicElements::MakeWeatherIconName(int viewType, int conditionCode, bool pressed)
{
    std::string name = GetIconBaseName(conditionCode);
    if (pressed)
        name += "_press";
    return name + GetIconSizeSuffix(viewType) + ".png";
}

std::string ViewBasicElements::MakeWeatherIconName(int viewType, int conditionCode)
{
    return MakeWeatherIconName(viewType, conditionCode, false);
}

std::string ViewBasicElements::MakeBackgroundImageName(int conditionCode, bool day)
{
    std::string name = GetBackgroundBaseName(conditionCode);
    if (conditionCode != CODE_HOT && conditionCode != CODE_COLD)
        name += day ? "_day" : "_night";
    return name + ".png";
}

std::string ViewBasicElements::MakeTemperatureUnitIconName(int viewType, bool celsius, bool pressed)
{
    std::string name = std::string("weather") + GetTemperatureUnitVariant(viewType);
    name += celsius ? "_temp_c" : "_temp_f";
    if (pressed)
        name += "_press";
    return name + ".png";
}

std::string ViewBasicElements::MakeTemperatureUnitIconName(int viewType, bool celsius)
{
    return MakeTemperatureUnitIconName(viewType, celsius, false);
}

}  // namespace NSWeather

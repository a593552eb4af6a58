#ifndef NSWEATHER_VIEW_BASIC_ELEMENTS_H
#define NSWEATHER_VIEW_BASIC_ELEMENTS_H

#include <string>

namespace NSWeather
{

// File names (no directory) of the weather images: condition icons,
// backgrounds and temperature-unit marks. The view type chooses the size
// and variant of an image; unknown view types and condition codes fall
// back to a default instead of failing.
class ViewBasicElements
{
public:
    static std::string MakeWeatherIconName(int viewType, int conditionCode, bool pressed);
    static std::string MakeWeatherIconName(int viewType, int conditionCode);

    // Hot and cold backgrounds have no day or night variant.
    static std::string MakeBackgroundImageName(int conditionCode, bool day);

    static std::string MakeTemperatureUnitIconName(int viewType, bool celsius, bool pressed);
    static std::string MakeTemperatureUnitIconName(int viewType, bool celsius);

private:
    static const char* GetIconSizeSuffix(int viewType);
    static const char* GetTemperatureUnitVariant(int viewType);
    static const char* GetIconBaseName(int conditionCode);
    static const char* GetBackgroundBaseName(int conditionCode);
};

}  // namespace NSWeather

#endif

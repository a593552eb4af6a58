#ifndef NSWEATHER_ICON_MAPPING_TABLE_H
#define NSWEATHER_ICON_MAPPING_TABLE_H

#include <string>

namespace NSWeather
{

// Turns a provider's icon number into the widget's condition number
// (0 = none, 1-22), for the provider chosen in the settings.
class IconMappingTable
{
public:
    virtual ~IconMappingTable() = default;

    int GetMappingIconNum(int iconNum, bool isDayTime);

    // Day and night twins of the widget's numbers: 1/18 and 2/19.
    static int ApplyDayNight(int widgetIconNum, bool isDayTime);

private:
    // iconNum must already lie within the table.
    static int GetAccuWeatherIcon(int iconNum, const std::string& daemonType);
};

}  // namespace NSWeather

#endif

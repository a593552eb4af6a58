#ifndef NSWEATHER_WMO_WEATHER_CODE_H
#define NSWEATHER_WMO_WEATHER_CODE_H

#include <string>

namespace NSWeather
{

// The WMO weather interpretation codes (table 4677) that Open-Meteo sends,
// turned into the icon numbers of the provider the settings name, so the
// widget's own icon tables show the right picture whatever the provider.
class WmoWeatherCode
{
public:
    enum PrecipitationType
    {
        PRECIPITATION_NONE = 0,
        PRECIPITATION_RAIN = 1,
        PRECIPITATION_SNOW = 2,
    };

    virtual ~WmoWeatherCode() = default;

    static bool IsKnown(int code);
    // The icon number of `contentProvider` (a ContentProviderType); 0 for
    // an unknown code.
    static int GetProviderIcon(int code, int contentProvider, bool isDayTime);
    // English text of the conditions; empty for an unknown code.
    static std::string GetStatus(int code);
    static PrecipitationType GetPrecipitationType(int code);
};

}  // namespace NSWeather

#endif

#ifndef NSWEATHER_WEATHER_NEWS_ICON_DB_CONTROLLER_H
#define NSWEATHER_WEATHER_NEWS_ICON_DB_CONTROLLER_H

namespace NSWeather
{

// The WeatherNews icon database shipped with the program
// ("data/weathernews_icon.db"), read in a cycle of its own and never written.
class WeatherNewsIconDBController
{
public:
    WeatherNewsIconDBController();
    virtual ~WeatherNewsIconDBController();

    // The widget icon for one provider number; 0 when the number is not
    // listed or the file cannot be read.
    int Select(int iconId, bool isDayTime);
};

}  // namespace NSWeather

#endif

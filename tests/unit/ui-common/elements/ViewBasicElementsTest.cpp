#include "ViewBasicElements.h"

#include <gtest/gtest.h>

#include <string>

namespace
{
using NSWeather::ViewBasicElements;

TEST(ViewBasicElements, WeatherIconNamesJoinStemPressAndSize)
{
    EXPECT_EQ(ViewBasicElements::MakeWeatherIconName(6, 3, false), "03.weather_view_cloudy_196x196.png");
    EXPECT_EQ(ViewBasicElements::MakeWeatherIconName(1, 12, true), "12.weather_view_snow_press_64x64.png");
    EXPECT_EQ(ViewBasicElements::MakeWeatherIconName(4, 9),
              "09.weather_view_partly_sunny_with_thunder_showers_96x96.png");
    EXPECT_EQ(ViewBasicElements::MakeWeatherIconName(5, 19, true),
              "19.weather_view_mostly_clear_press_154x154.png");

    const std::pair<int, const char*> sizes[] = {
        {2, "_97x97"}, {3, "_154x154"}, {0, "_150x150"}, {-1, "_150x150"}};
    for (const auto& [viewType, suffix] : sizes)
        EXPECT_EQ(ViewBasicElements::MakeWeatherIconName(viewType, 1),
                  std::string("01.weather_view_sunny") + suffix + ".png");
}

TEST(ViewBasicElements, UnmappedCodesFallBackToSunnyButTwentyOneSnows)
{
    for (int code : {0, 20, 21, 22, 999, -1})
        EXPECT_EQ(ViewBasicElements::MakeWeatherIconName(6, code), "01.weather_view_sunny_196x196.png")
            << code;
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(20, true), "bg_weatherview_sunny_day.png");
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(21, true), "bg_weatherview_snow_day.png");
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(22, false), "bg_weatherview_sunny_night.png");
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(-5, true), "bg_weatherview_sunny_day.png");
}

TEST(ViewBasicElements, BackgroundsByDayAndNightExceptHotAndCold)
{
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(4, false), "bg_weatherview_rain_night.png");
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(15, true), "bg_weatherview_hot.png");
    EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(16, false), "bg_weatherview_cold.png");
    const std::pair<int, const char*> stems[] = {{6, "rain"},         {7, "partly_sunny"}, {11, "cloudy"},
                                                 {14, "snow"},        {17, "cloudy"},      {18, "sunny"},
                                                 {19, "partly_sunny"}};
    for (const auto& [code, stem] : stems)
        EXPECT_EQ(ViewBasicElements::MakeBackgroundImageName(code, true),
                  std::string("bg_weatherview_") + stem + "_day.png")
            << code;
}

TEST(ViewBasicElements, TemperatureUnitMarksByVariantScaleAndPress)
{
    EXPECT_EQ(ViewBasicElements::MakeTemperatureUnitIconName(6, true, false),
              "weather_widget_4x4_temp_c.png");
    EXPECT_EQ(ViewBasicElements::MakeTemperatureUnitIconName(5, true, true),
              "weather_widget_4x2_temp_c_press.png");
    EXPECT_EQ(ViewBasicElements::MakeTemperatureUnitIconName(3, false), "weather_widget_4x2_temp_f.png");
    for (int viewType : {1, 4, 42})
        EXPECT_EQ(ViewBasicElements::MakeTemperatureUnitIconName(viewType, false, true),
                  "weather_main_temp_f_press.png");
}

}  // namespace

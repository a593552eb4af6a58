#include "ViewBasicElements.h"

#include <Edje.h>
#include <gtest/gtest.h>

#include <app_common.h>

#include <set>
#include <string>

#include "ElementaryHelper.h"
#include "TestPlatform.h"

namespace
{
using NSWeather::ViewBasicElements;

// The rules the widget's resource file is named by; that every name exists
// there is checked below.
TEST(ViewBasicElements, NamesFollowViewTypeCodeDayAndPress)
{
    const std::pair<std::string, std::string> cases[] = {
        {ViewBasicElements::MakeWeatherIconName(6, 3, false), "03.weather_view_cloudy_196x196.png"},
        {ViewBasicElements::MakeWeatherIconName(1, 12, true), "12.weather_view_snow_press_64x64.png"},
        {ViewBasicElements::MakeWeatherIconName(4, 9),
         "09.weather_view_partly_sunny_with_thunder_showers_96x96.png"},
        {ViewBasicElements::MakeWeatherIconName(5, 19, true),
         "19.weather_view_mostly_clear_press_154x154.png"},
        {ViewBasicElements::MakeWeatherIconName(2, 1), "01.weather_view_sunny_97x97.png"},
        {ViewBasicElements::MakeWeatherIconName(-1, 1), "01.weather_view_sunny_150x150.png"},
        // Unmapped codes fall back to sunny, but 21 snows.
        {ViewBasicElements::MakeWeatherIconName(6, 21), "01.weather_view_sunny_196x196.png"},
        {ViewBasicElements::MakeWeatherIconName(6, -1), "01.weather_view_sunny_196x196.png"},
        {ViewBasicElements::MakeBackgroundImageName(21, true), "bg_weatherview_snow_day.png"},
        {ViewBasicElements::MakeBackgroundImageName(22, false), "bg_weatherview_sunny_night.png"},
        {ViewBasicElements::MakeBackgroundImageName(-5, true), "bg_weatherview_sunny_day.png"},
        {ViewBasicElements::MakeBackgroundImageName(4, false), "bg_weatherview_rain_night.png"},
        {ViewBasicElements::MakeBackgroundImageName(15, true), "bg_weatherview_hot.png"},
        {ViewBasicElements::MakeBackgroundImageName(16, false), "bg_weatherview_cold.png"},
        {ViewBasicElements::MakeBackgroundImageName(11, true), "bg_weatherview_cloudy_day.png"},
        {ViewBasicElements::MakeBackgroundImageName(19, true), "bg_weatherview_partly_sunny_day.png"},
        {ViewBasicElements::MakeTemperatureUnitIconName(6, true, false), "weather_widget_4x4_temp_c.png"},
        {ViewBasicElements::MakeTemperatureUnitIconName(5, true, true),
         "weather_widget_4x2_temp_c_press.png"},
        {ViewBasicElements::MakeTemperatureUnitIconName(3, false), "weather_widget_4x2_temp_f.png"},
        {ViewBasicElements::MakeTemperatureUnitIconName(42, false, true), "weather_main_temp_f_press.png"},
    };
    for (const auto& [made, expected] : cases) EXPECT_EQ(made, expected);
}

// Every name the widget's pages can ask for is a group of its resource file,
// or the page shows an empty slot.
TEST(ViewBasicElements, EveryNameOfTheWidgetPagesIsAGroupOfWidgetResources)
{
    WeatherTest::LogCapture log;
    WeatherTest::TestPlatformRoot root;
    root.UseBuildResources();
    ASSERT_EQ(app_set_own_id("com.quorvex.weather-m-widget"), APP_ERROR_NONE);
    std::string path = NSWeather::ElementaryHelper().CreateMultiResPath("widget/WidgetResources.edj");
    ASSERT_FALSE(path.empty()) << "widget/WidgetResources.edj is not built into " << WeatherTest::BuildDir();

    std::set<std::string> groups;
    Eina_List* list = edje_file_collection_list(path.c_str());
    Eina_List* l = nullptr;
    void* group = nullptr;
    EINA_LIST_FOREACH(list, l, group) groups.insert(static_cast<const char*>(group));
    edje_file_collection_list_free(list);

    std::set<std::string> names = {"weather_box_ic_refresh.png", "weather_box_logo_accuweather.png"};
    for (int code = 0; code <= 22; ++code)
        for (bool on : {false, true})
        {
            for (int viewType : {4, 5, 6})
                names.insert(ViewBasicElements::MakeWeatherIconName(viewType, code, on));
            names.insert(ViewBasicElements::MakeBackgroundImageName(code, on));
            for (int viewType : {5, 6})
                for (bool pressed : {false, true})
                    names.insert(ViewBasicElements::MakeTemperatureUnitIconName(viewType, on, pressed));
        }
    for (const std::string& name : names) EXPECT_TRUE(groups.count(name)) << name << " missing from " << path;
}

}  // namespace

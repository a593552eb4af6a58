// Every image name the pages can ask for must be a group of the widget's
// resource file, or the page shows an empty slot.
#include "ElementaryHelper.h"
#include "ViewBasicElements.h"

#include <Edje.h>
#include <gtest/gtest.h>

#include <app_common.h>

#include <set>
#include <string>
#include <vector>

#include "TestPlatform.h"

namespace
{
using NSWeather::ViewBasicElements;

std::vector<std::string> NamesThePagesUse()
{
    std::vector<std::string> names;
    for (int code = 0; code <= 22; ++code)
    {
        for (bool pressed : {false, true})
            for (int viewType : {4, 5, 6})
                names.push_back(ViewBasicElements::MakeWeatherIconName(viewType, code, pressed));
        for (bool day : {false, true}) names.push_back(ViewBasicElements::MakeBackgroundImageName(code, day));
    }
    for (int viewType : {5, 6})
        for (bool celsius : {false, true})
            for (bool pressed : {false, true})
                names.push_back(ViewBasicElements::MakeTemperatureUnitIconName(viewType, celsius, pressed));
    names.push_back("weather_box_ic_refresh.png");
    names.push_back("weather_box_logo_accuweather.png");
    return names;
}

class WidgetResourcesTest : public WeatherTest::PlatformTest
{
};

TEST_F(WidgetResourcesTest, EveryImageNameIsAGroupOfWidgetResources)
{
    mRoot.UseBuildResources();
    ASSERT_EQ(app_set_own_id("com.quorvex.weather-m-widget"), APP_ERROR_NONE);
    NSWeather::ElementaryHelper helper;
    std::string path = helper.CreateMultiResPath("widget/WidgetResources.edj");
    ASSERT_FALSE(path.empty()) << "widget/WidgetResources.edj is not built into " << WeatherTest::BuildDir();

    Eina_List* groups = edje_file_collection_list(path.c_str());
    ASSERT_NE(groups, nullptr) << path << " holds no group";
    std::set<std::string> available;
    Eina_List* l = nullptr;
    void* group = nullptr;
    EINA_LIST_FOREACH(groups, l, group)
    available.insert(static_cast<const char*>(group));
    edje_file_collection_list_free(groups);

    for (const std::string& name : NamesThePagesUse())
        EXPECT_TRUE(available.count(name)) << name << " missing from " << path;
}

}  // namespace

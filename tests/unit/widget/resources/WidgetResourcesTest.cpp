// WidgetResources.edj holds, as a group named by its file name, every image
// the pages can ask for, and each group really shows its image.

#include <gtest/gtest.h>

#include <sys/stat.h>

#include <string>
#include <vector>

#include "EdjeCanvas.h"

namespace
{

using WeatherTest::EdjeCanvas;
using WeatherTest::WidgetLayoutFile;

const char* const kIconStems[] = {
    "01.weather_view_sunny",
    "02.weather_view_partly_sunny",
    "03.weather_view_cloudy",
    "04.weather_view_rain",
    "05.weather_view_fog",
    "06.weather_view_shower",
    "07.weather_view_partly_sunny_with_shower",
    "08.weather_view_thunderstorms",
    "09.weather_view_partly_sunny_with_thunder_showers",
    "10.weather_view_flurries",
    "11.weather_view_partly_sunny_with_flurries",
    "12.weather_view_snow",
    "13.weather_view_rain_and_snow_mixed",
    "14.weather_view_ice",
    "15.weather_view_hot",
    "16.weather_view_cold",
    "17.weather_view_windy",
    "18.weather_view_clear",
    "19.weather_view_mostly_clear",
};

struct ExpectedImage
{
    std::string name;
    int width;
    int height;
};

// Condition icons at the sizes of the forecast (96), the 4x2 page (154)
// and the 4x4 page (196), each also pressed.
std::vector<ExpectedImage> ConditionIcons()
{
    std::vector<ExpectedImage> images;
    for (const char* stem : kIconStems)
    {
        for (int size : {96, 154, 196})
        {
            const std::string suffix = "_" + std::to_string(size) + "x" + std::to_string(size) + ".png";
            images.push_back({stem + suffix, size, size});
            images.push_back({std::string(stem) + "_press" + suffix, size, size});
        }
    }
    return images;
}

std::vector<std::string> OtherImages()
{
    std::vector<std::string> names;
    for (const char* stem : {"sunny", "partly_sunny", "cloudy", "rain", "fog", "snow"})
    {
        names.push_back(std::string("bg_weatherview_") + stem + "_day.png");
        names.push_back(std::string("bg_weatherview_") + stem + "_night.png");
    }
    names.push_back("bg_weatherview_hot.png");
    names.push_back("bg_weatherview_cold.png");
    for (const char* variant : {"4x2", "4x4"})
    {
        for (const char* unit : {"c", "f"})
        {
            const std::string base = std::string("weather_widget_") + variant + "_temp_" + unit;
            names.push_back(base + ".png");
            names.push_back(base + "_press.png");
        }
    }
    names.push_back("weather_box_ic_refresh.png");
    names.push_back("weather_logo_accuweather_02.png");
    names.push_back("weather_logo_accuweather.png");
    names.push_back("weather_box_logo_accuweather.png");
    return names;
}

class WidgetResourcesTest : public ::testing::Test
{
protected:
    // Loads the group and returns its image object, or nullptr when the
    // group is missing or its image did not load.
    const Evas_Object* LoadImage(const std::string& group, int size)
    {
        Evas_Object* obj = mCanvas.Load(mFile, group.c_str(), size, size);
        if (!obj)
            return nullptr;
        const Evas_Object* image = edje_object_part_object_get(obj, "image");
        if (!image || evas_object_image_load_error_get(image) != EVAS_LOAD_ERROR_NONE)
            return nullptr;
        return image;
    }

    EdjeCanvas mCanvas{256, 256};
    std::string mFile = WidgetLayoutFile("WidgetResources.edj");
};

// Condition icons at their named size; the other images at any size.
TEST_F(WidgetResourcesTest, EveryImageExistsAndLoads)
{
    std::vector<ExpectedImage> images = ConditionIcons();
    for (const std::string& name : OtherImages()) images.push_back({name, 0, 0});
    for (const auto& expected : images)
    {
        SCOPED_TRACE(expected.name);
        ASSERT_TRUE(edje_file_group_exists(mFile.c_str(), expected.name.c_str()));
        const Evas_Object* image = LoadImage(expected.name, expected.width ? expected.width : 128);
        ASSERT_NE(image, nullptr);
        int w = 0, h = 0;
        evas_object_image_size_get(image, &w, &h);
        EXPECT_TRUE(expected.width ? w == expected.width && h == expected.height : w > 0 && h > 0)
            << w << "x" << h;
    }
}

// The pressed image is the same art, visibly different: drawn lighter.
TEST_F(WidgetResourcesTest, PressedIconDiffersFromTheNormalOne)
{
    const Evas_Object* normal = LoadImage("04.weather_view_rain_96x96.png", 96);
    const Evas_Object* pressed = LoadImage("04.weather_view_rain_press_96x96.png", 96);
    ASSERT_NE(normal, nullptr);
    ASSERT_NE(pressed, nullptr);
    auto alphaSum = [](const Evas_Object* image)
    {
        const auto* pixels = static_cast<const unsigned int*>(evas_object_image_data_get(image, EINA_FALSE));
        unsigned long sum = 0;
        for (int i = 0; pixels && i < 96 * 96; ++i) sum += pixels[i] >> 24;
        return sum;
    };
    unsigned long normalAlpha = alphaSum(normal);
    unsigned long pressedAlpha = alphaSum(pressed);
    EXPECT_GT(normalAlpha, 0u);
    EXPECT_LT(pressedAlpha, normalAlpha * 3 / 4);
    EXPECT_GT(pressedAlpha, normalAlpha / 4);
}

TEST_F(WidgetResourcesTest, NamesOutsideTheSetAreMissing)
{
    for (const char* name : {"20.weather_view_sunny_96x96.png", "01.weather_view_sunny_150x150.png",
                             "bg_weatherview_hot_day.png", "weather_main_temp_c.png"})
        EXPECT_FALSE(edje_file_group_exists(mFile.c_str(), name)) << name;
}

TEST(ResourceFilesTest, IconLicenceShipsWithTheImages)
{
    struct stat st;
    ASSERT_EQ(stat(WidgetLayoutFile("LICENSE.weather-icons").c_str(), &st), 0);
    EXPECT_GT(st.st_size, 100);
}

TEST(ResourceFilesTest, LayoutFilesAreReadableByEveryone)
{
    for (const char* name :
         {"WidgetView.edj", "Widget4x2Page.edj", "Widget4x4Page.edj", "WidgetResources.edj"})
    {
        struct stat st;
        ASSERT_EQ(stat(WidgetLayoutFile(name).c_str(), &st), 0) << name;
        EXPECT_EQ(st.st_mode & 0777, 0644u) << name;
    }
}

}  // namespace

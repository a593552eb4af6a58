// Every group and part that the view, page and touch code name exists in the
// compiled layout files, with the type the code uses it as.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "EdjeCanvas.h"

namespace
{

using WeatherTest::EdjeCanvas;
using WeatherTest::WidgetLayoutFile;

struct GroupParts
{
    const char* group;
    std::vector<std::string> swallows;
    std::vector<std::string> texts;
    std::vector<std::string> touchAreas;
};

std::vector<GroupParts> PageGroups(bool is4x4)
{
    std::vector<GroupParts> groups = {
        {"widgetPage", {"content"}, {}, {}},
        {"noCity", {"content"}, {}, {"backgroundTouchArea"}},
        {"noCityContent", {}, {"title", "message"}, {}},
        {"loading", {}, {"message"}, {"backgroundTouchArea"}},
        {"city",
         {"cityNameSwallow", "iconAndTemperatureSwallow", "bottomLineSwallow"},
         {"localTime"},
         {"todayTouchArea"}},
        {"cityName", {}, {"name"}, {}},
        {"cityNameCurrentLocation", {}, {"name"}, {}},
        {"iconAndTemperature", {"icon", "iconPress", "currentUnit", "currentUnitPress"}, {"current"}, {}},
        {"bottomLine",
         {"cpLogo", "refreshButton", "cpLogoEffect", "refreshButtonEffect"},
         {"date", "time", "msg"},
         {}},
        {"BottomLinePressEffect", {}, {}, {}},
    };
    if (is4x4)
    {
        groups[4].swallows.push_back("weatherForecastSwallow");
        GroupParts forecast{"weatherForecast", {}, {}, {}};
        for (int n = 1; n <= 4; ++n)
        {
            const std::string row = std::to_string(n);
            forecast.texts.push_back("weatherForecastWeek" + row);
            forecast.texts.push_back("weatherForecastHighTemp" + row);
            forecast.texts.push_back("weatherForecastLowTemp" + row);
            forecast.swallows.push_back("weatherForecastIcon" + row);
            forecast.swallows.push_back("weatherForecastPressIcon" + row);
            forecast.touchAreas.push_back("forecast" + row);
        }
        groups.push_back(forecast);
    }
    return groups;
}

// Checks that each named part exists and behaves as its kind: swallows take
// an object, texts keep a text, touch areas are objects that take events.
void ExpectParts(EdjeCanvas& canvas, const std::string& file, const GroupParts& parts)
{
    SCOPED_TRACE(file + " group " + parts.group);
    ASSERT_TRUE(edje_file_group_exists(file.c_str(), parts.group));
    Evas_Object* obj = canvas.Load(file, parts.group, 712, 712);
    ASSERT_NE(obj, nullptr);
    for (const auto& part : parts.swallows)
    {
        EXPECT_TRUE(edje_object_part_exists(obj, part.c_str())) << part;
        Evas_Object* rect = canvas.Rect();
        EXPECT_TRUE(edje_object_part_swallow(obj, part.c_str(), rect)) << part << " is not a swallow";
        EXPECT_EQ(edje_object_part_swallow_get(obj, part.c_str()), rect) << part;
    }
    for (const auto& part : parts.texts)
    {
        EXPECT_TRUE(edje_object_part_exists(obj, part.c_str())) << part;
        EXPECT_TRUE(edje_object_part_text_set(obj, part.c_str(), "21")) << part << " is not a text";
        const char* text = edje_object_part_text_get(obj, part.c_str());
        EXPECT_STREQ(text ? text : "", "21") << part;
    }
    for (const auto& part : parts.touchAreas)
    {
        EXPECT_TRUE(edje_object_part_exists(obj, part.c_str())) << part;
        const Evas_Object* area = edje_object_part_object_get(obj, part.c_str());
        ASSERT_NE(area, nullptr) << part;
        EXPECT_FALSE(evas_object_pass_events_get(area)) << part << " ignores touches";
    }
    evas_object_del(obj);
}

class PageLayoutTest : public ::testing::TestWithParam<bool>
{
protected:
    bool Is4x4() const { return GetParam(); }
    std::string File() const { return WidgetLayoutFile(Is4x4() ? "Widget4x4Page.edj" : "Widget4x2Page.edj"); }
    int Height() const { return Is4x4() ? 712 : 354; }

    EdjeCanvas mCanvas{712, 712};
};

TEST_P(PageLayoutTest, HasEveryGroupAndPartThePagesUse)
{
    for (const auto& group : PageGroups(Is4x4())) ExpectParts(mCanvas, File(), group);
}

TEST_P(PageLayoutTest, UnknownGroupIsNotFound)
{
    EXPECT_FALSE(edje_file_group_exists(File().c_str(), "widgetpage"));
    EXPECT_EQ(mCanvas.Load(File(), "noSuchGroup", 10, 10), nullptr);
}

// The city page stacks its blocks from top to bottom inside the page, so
// that nothing is cut off or drawn over another block.
TEST_P(PageLayoutTest, CityBlocksStackInsideThePage)
{
    Evas_Object* city = mCanvas.Load(File(), "city", 712, Height());
    ASSERT_NE(city, nullptr);
    std::vector<const char*> order = {"cityNameSwallow", "localTime", "iconAndTemperatureSwallow"};
    if (Is4x4())
        order.push_back("weatherForecastSwallow");
    order.push_back("bottomLineSwallow");
    int previousBottom = 0;
    for (const char* part : order)
    {
        int x = 0, y = 0, w = 0, h = 0;
        edje_object_part_geometry_get(city, part, &x, &y, &w, &h);
        SCOPED_TRACE(part);
        EXPECT_GT(w, 0);
        EXPECT_GT(h, 0);
        EXPECT_GE(x, 0);
        EXPECT_LE(x + w, 712);
        EXPECT_GE(y, previousBottom);
        EXPECT_LE(y + h, Height());
        previousBottom = y + h;
    }
}

// Image names carry their pixel size (_154x154, _196x196, _96x96); the
// slots they go into have that size at the base scale.
TEST_P(PageLayoutTest, ImageSlotsMatchTheImageSizes)
{
    const int iconSize = Is4x4() ? 196 : 154;
    Evas_Object* today = mCanvas.Load(File(), "iconAndTemperature", 712, Is4x4() ? 248 : 180);
    ASSERT_NE(today, nullptr);
    for (const char* part : {"icon", "iconPress"})
    {
        int w = 0, h = 0;
        edje_object_part_geometry_get(today, part, nullptr, nullptr, &w, &h);
        EXPECT_EQ(w, iconSize) << part;
        EXPECT_EQ(h, iconSize) << part;
    }
    if (!Is4x4())
        return;
    Evas_Object* forecast = mCanvas.Load(File(), "weatherForecast", 712, 250);
    ASSERT_NE(forecast, nullptr);
    for (int n = 1; n <= 4; ++n)
    {
        int w = 0, h = 0;
        const std::string part = "weatherForecastIcon" + std::to_string(n);
        edje_object_part_geometry_get(forecast, part.c_str(), nullptr, nullptr, &w, &h);
        EXPECT_EQ(w, 96) << part;
        EXPECT_EQ(h, 96) << part;
    }
}

INSTANTIATE_TEST_SUITE_P(BothSizes, PageLayoutTest, ::testing::Values(false, true),
                         [](const ::testing::TestParamInfo<bool>& info)
                         { return info.param ? std::string("Page4x4") : std::string("Page4x2"); });

TEST(WidgetViewLayoutTest, HasThePageSlotsAndTheFlickArea)
{
    EdjeCanvas canvas(712, 354);
    ExpectParts(canvas, WidgetLayoutFile("WidgetView.edj"),
                {"widgetView", {"prevLayout", "centerLayout", "nextLayout"}, {}, {"flickArea"}});
}

// The neighbour slots sit one page above and below the centre, where a
// flick's translation by one page height brings them into view.
TEST(WidgetViewLayoutTest, NeighbourSlotsLieOnePageAwayAndAreClipped)
{
    EdjeCanvas canvas(712, 354);
    Evas_Object* view = canvas.Load(WidgetLayoutFile("WidgetView.edj"), "widgetView", 712, 354);
    ASSERT_NE(view, nullptr);
    int y = 0, h = 0;
    edje_object_part_geometry_get(view, "prevLayout", nullptr, &y, nullptr, &h);
    EXPECT_EQ(y, -354);
    EXPECT_EQ(h, 354);
    edje_object_part_geometry_get(view, "nextLayout", nullptr, &y, nullptr, &h);
    EXPECT_EQ(y, 354);
    EXPECT_EQ(h, 354);
    Evas_Object* page = canvas.Rect();
    ASSERT_TRUE(edje_object_part_swallow(view, "nextLayout", page));
    edje_object_calc_force(view);
    const Evas_Object* clip = evas_object_clip_get(page);
    ASSERT_NE(clip, nullptr);
    int cy = 0, ch = 0;
    evas_object_geometry_get(clip, nullptr, &cy, nullptr, &ch);
    EXPECT_EQ(cy, 0);
    EXPECT_EQ(ch, 354);
}

}  // namespace

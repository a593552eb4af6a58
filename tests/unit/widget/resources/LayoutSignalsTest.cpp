// The signals the page and touch code exchange with the layouts, and the
// pressed and hidden states they drive.

#include <gtest/gtest.h>

#include <string>

#include "EdjeCanvas.h"

namespace
{

using WeatherTest::EdjeCanvas;
using WeatherTest::PartState;
using WeatherTest::Signal;
using WeatherTest::SignalRecorder;
using WeatherTest::WidgetLayoutFile;

class PageSignalsTest : public ::testing::TestWithParam<bool>
{
protected:
    bool Is4x4() const { return GetParam(); }
    std::string File() const { return WidgetLayoutFile(Is4x4() ? "Widget4x4Page.edj" : "Widget4x2Page.edj"); }
    int Height() const { return Is4x4() ? 712 : 354; }
    Evas_Object* Load(const char* group, int w, int h)
    {
        Evas_Object* obj = mCanvas.Load(File(), group, w, h);
        EXPECT_NE(obj, nullptr) << group;
        return obj;
    }
    static void Centre(Evas_Object* obj, const char* part, int& x, int& y)
    {
        int px = 0, py = 0, pw = 0, ph = 0;
        evas_object_geometry_get(edje_object_part_object_get(obj, part), &px, &py, &pw, &ph);
        x = px + pw / 2;
        y = py + ph / 2;
    }
    // Whether an object swallowed into `part` is shown after a recalc.
    bool SwallowShown(Evas_Object* obj, const char* part)
    {
        edje_object_message_signal_process(obj);
        edje_object_calc_force(obj);
        Evas_Object* content = edje_object_part_swallow_get(obj, part);
        return content && evas_object_visible_get(content);
    }
    void SwallowRects(Evas_Object* obj, std::initializer_list<const char*> parts)
    {
        for (const char* part : parts)
            ASSERT_TRUE(edje_object_part_swallow(obj, part, mCanvas.Rect())) << part;
        edje_object_calc_force(obj);
    }

    EdjeCanvas mCanvas{712, 712};
};

TEST_P(PageSignalsTest, HoldingTodayReportsPressAndRelease)
{
    Evas_Object* city = Load("city", 712, Height());
    ASSERT_NE(city, nullptr);
    SignalRecorder signals(city);
    int x = 0, y = 0;
    Centre(city, "todayTouchArea", x, y);
    mCanvas.Press(x, y);
    EXPECT_TRUE(signals.Saw("sender,pressed,widgettoday", "todayTouchArea"));
    EXPECT_FALSE(signals.Saw("sender,unpressed,widgettoday", "todayTouchArea"));
    EXPECT_EQ(PartState(city, "localTime"), "pressed");
    mCanvas.Release(x, y);
    EXPECT_TRUE(signals.Saw("sender,unpressed,widgettoday", "todayTouchArea"));
    EXPECT_EQ(PartState(city, "localTime"), "default");
}

TEST_P(PageSignalsTest, TouchesOnTheBottomLineDoNotPressToday)
{
    Evas_Object* city = Load("city", 712, Height());
    ASSERT_NE(city, nullptr);
    SignalRecorder signals(city);
    int x = 0, y = 0;
    Centre(city, "bottomLineSwallow", x, y);
    mCanvas.Tap(x, y);
    EXPECT_FALSE(signals.Saw("sender,pressed,widgettoday", "todayTouchArea"));
}

TEST_P(PageSignalsTest, CurrentLocationHidesTheLocalTime)
{
    Evas_Object* city = Load("city", 712, Height());
    ASSERT_NE(city, nullptr);
    edje_object_part_text_set(city, "localTime", "Sun 6 Dec 12:00");
    const Evas_Object* text = edje_object_part_object_get(city, "localTime");
    ASSERT_NE(text, nullptr);
    const Evas_Object* clip = evas_object_clip_get(text);
    ASSERT_NE(clip, nullptr);
    EXPECT_TRUE(evas_object_visible_get(clip));
    Signal(city, "receiver,invisible,localtime", "localTime");
    EXPECT_FALSE(evas_object_visible_get(clip));
    // A later press of today's area must not bring it back.
    int x = 0, y = 0;
    Centre(city, "todayTouchArea", x, y);
    mCanvas.Press(x, y);
    edje_object_message_signal_process(city);
    edje_object_calc_force(city);
    EXPECT_FALSE(evas_object_visible_get(clip));
}

TEST_P(PageSignalsTest, CityNamesTakeThePressedState)
{
    for (const char* group : {"cityName", "cityNameCurrentLocation"})
    {
        Evas_Object* name = Load(group, 712, 60);
        ASSERT_NE(name, nullptr);
        EXPECT_EQ(PartState(name, "name"), "default") << group;
        Signal(name, "receiver,pressed,widgettoday", "cityName");
        EXPECT_EQ(PartState(name, "name"), "pressed") << group;
    }
}

TEST_P(PageSignalsTest, PressedTodayShowsThePressedImages)
{
    Evas_Object* today = Load("iconAndTemperature", 712, 200);
    ASSERT_NE(today, nullptr);
    SwallowRects(today, {"icon", "iconPress", "currentUnit", "currentUnitPress"});
    EXPECT_TRUE(SwallowShown(today, "icon"));
    EXPECT_FALSE(SwallowShown(today, "iconPress"));
    EXPECT_TRUE(SwallowShown(today, "currentUnit"));
    EXPECT_FALSE(SwallowShown(today, "currentUnitPress"));

    Signal(today, "receiver,pressed,widgettoday", "iconAndTemperature");
    EXPECT_FALSE(SwallowShown(today, "icon"));
    EXPECT_TRUE(SwallowShown(today, "iconPress"));
    EXPECT_FALSE(SwallowShown(today, "currentUnit"));
    EXPECT_TRUE(SwallowShown(today, "currentUnitPress"));
    EXPECT_EQ(PartState(today, "current"), "pressed");

    Signal(today, "receiver,unpressed,widgettoday", "iconAndTemperature");
    EXPECT_TRUE(SwallowShown(today, "icon"));
    EXPECT_FALSE(SwallowShown(today, "iconPress"));
    EXPECT_TRUE(SwallowShown(today, "currentUnit"));
    EXPECT_FALSE(SwallowShown(today, "currentUnitPress"));
}

// The bottom line reports taps on its two press-effect layouts, which are
// swallowed objects, not parts of its own.
TEST_P(PageSignalsTest, BottomLineReportsLogoAndRefreshTaps)
{
    Evas_Object* line = Load("bottomLine", 712, 64);
    ASSERT_NE(line, nullptr);
    for (const char* part : {"cpLogoEffect", "refreshButtonEffect"})
    {
        Evas_Object* effect = mCanvas.Load(File(), "BottomLinePressEffect", 10, 10);
        ASSERT_NE(effect, nullptr);
        ASSERT_TRUE(edje_object_part_swallow(line, part, effect));
    }
    edje_object_calc_force(line);
    SignalRecorder signals(line);
    int x = 0, y = 0;
    Centre(line, "refreshButtonEffect", x, y);
    mCanvas.Tap(x, y);
    EXPECT_TRUE(signals.Saw("refreshIconClicked", "refreshButtonEffect"));
    EXPECT_FALSE(signals.Saw("cpLogoClicked", "cpLogoEffect"));
    Centre(line, "cpLogoEffect", x, y);
    mCanvas.Tap(x, y);
    EXPECT_TRUE(signals.Saw("cpLogoClicked", "cpLogoEffect"));
}

TEST_P(PageSignalsTest, PressEffectLightsWhileHeld)
{
    Evas_Object* effect = Load("BottomLinePressEffect", 80, 60);
    ASSERT_NE(effect, nullptr);
    EXPECT_EQ(PartState(effect, "highlight"), "default");
    mCanvas.Press(40, 30);
    EXPECT_EQ(PartState(effect, "highlight"), "pressed");
}

TEST_P(PageSignalsTest, WholeNoCityAndLoadingPagesAreTouchable)
{
    for (const char* group : {"noCity", "loading"})
    {
        Evas_Object* page = Load(group, 712, Height());
        ASSERT_NE(page, nullptr);
        int x = 0, y = 0, w = 0, h = 0;
        edje_object_part_geometry_get(page, "backgroundTouchArea", &x, &y, &w, &h);
        EXPECT_EQ(x, 0) << group;
        EXPECT_EQ(y, 0) << group;
        EXPECT_EQ(w, 712) << group;
        EXPECT_EQ(h, Height()) << group;
        evas_object_del(page);
    }
}

INSTANTIATE_TEST_SUITE_P(BothSizes, PageSignalsTest, ::testing::Values(false, true),
                         [](const ::testing::TestParamInfo<bool>& info)
                         { return info.param ? std::string("Page4x4") : std::string("Page4x2"); });

class ForecastSignalsTest : public PageSignalsTest
{
protected:
    Evas_Object* LoadForecast()
    {
        Evas_Object* forecast =
            mCanvas.Load(WidgetLayoutFile("Widget4x4Page.edj"), "weatherForecast", 712, 250);
        if (!forecast)
            return nullptr;
        for (int n = 1; n <= 4; ++n)
        {
            const std::string row = std::to_string(n);
            edje_object_part_swallow(forecast, ("weatherForecastIcon" + row).c_str(), mCanvas.Rect());
            edje_object_part_swallow(forecast, ("weatherForecastPressIcon" + row).c_str(), mCanvas.Rect());
        }
        edje_object_calc_force(forecast);
        return forecast;
    }
    bool RowPressed(Evas_Object* forecast, int n)
    {
        const std::string row = std::to_string(n);
        bool icon = SwallowShown(forecast, ("weatherForecastIcon" + row).c_str());
        bool press = SwallowShown(forecast, ("weatherForecastPressIcon" + row).c_str());
        EXPECT_NE(icon, press) << "row " << n << " shows both or neither image";
        return press && PartState(forecast, ("weatherForecastHighTemp" + row).c_str()) == "pressed";
    }
};

TEST_F(ForecastSignalsTest, TodayPressPressesEveryDay)
{
    Evas_Object* forecast = LoadForecast();
    ASSERT_NE(forecast, nullptr);
    for (int n = 1; n <= 4; ++n) EXPECT_FALSE(RowPressed(forecast, n)) << n;
    Signal(forecast, "receiver,pressed,widgettoday", "weatherForecast");
    for (int n = 1; n <= 4; ++n) EXPECT_TRUE(RowPressed(forecast, n)) << n;
    Signal(forecast, "receiver,unpressed,widgettoday", "weatherForecast");
    for (int n = 1; n <= 4; ++n) EXPECT_FALSE(RowPressed(forecast, n)) << n;
}

TEST_F(ForecastSignalsTest, HoldingOneDayPressesOnlyThatDay)
{
    Evas_Object* forecast = LoadForecast();
    ASSERT_NE(forecast, nullptr);
    int x = 0, y = 0;
    Centre(forecast, "forecast3", x, y);
    mCanvas.Press(x, y);
    EXPECT_TRUE(RowPressed(forecast, 3));
    for (int n : {1, 2, 4}) EXPECT_FALSE(RowPressed(forecast, n)) << n;
    mCanvas.Release(x, y);
    EXPECT_FALSE(RowPressed(forecast, 3));
}

// The flick area lies over the pages and passes every touch on, so the
// page under it still sees its taps.
TEST(WidgetViewSignalsTest, FlickAreaSeesTouchesAndPassesThemOn)
{
    EdjeCanvas canvas(712, 354);
    Evas_Object* view = canvas.Load(WidgetLayoutFile("WidgetView.edj"), "widgetView", 712, 354);
    ASSERT_NE(view, nullptr);
    Evas_Object* page = canvas.Rect();
    ASSERT_TRUE(edje_object_part_swallow(view, "centerLayout", page));
    edje_object_calc_force(view);
    int flickDowns = 0;
    int pageDowns = 0;
    auto countCb = [](void* data, Evas*, Evas_Object*, void*) { ++*static_cast<int*>(data); };
    Evas_Object* flickArea = const_cast<Evas_Object*>(edje_object_part_object_get(view, "flickArea"));
    ASSERT_NE(flickArea, nullptr);
    evas_object_event_callback_add(flickArea, EVAS_CALLBACK_MOUSE_DOWN, countCb, &flickDowns);
    evas_object_event_callback_add(page, EVAS_CALLBACK_MOUSE_DOWN, countCb, &pageDowns);
    canvas.Press(356, 177);
    EXPECT_EQ(flickDowns, 1);
    EXPECT_EQ(pageDowns, 1);
}

}  // namespace

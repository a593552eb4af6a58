// Taps on the real pages, read back from the platform's launch log.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "WidgetHostPages.h"

namespace WeatherTest
{

using ::testing::HasSubstr;

namespace
{
// Places on a 4x2 page (712x354).
const char* const kBody = "200 150";
const char* const kLogo = "530 312";
}  // namespace

class WidgetTapsTest : public WidgetHostPagesTest
{
public:
    void Start(int cities)
    {
        WriteCities(cities);
        ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetCurrentCityLocationId("190390"); });
        StartHost({"4x2"});
    }

    void Tap(const char* where) { EXPECT_EQ(Send("tap " + Id(1) + " " + where).compare(0, 2, "OK"), 0); }

    void ForgetAgent() const { unlink(mRoot.Path("apps/com.quorvex.weather-m-agent/app.conf").c_str()); }
};

TEST_F(WidgetTapsTest, TapsOpenTheApplicationTheAddCityFlowOrTheProviderPage)
{
    struct Case
    {
        const char* name;
        int cities;
        const char* cpType;
        const char* where;
        std::vector<std::string> launch;  // empty: nothing is launched
    };
    const Case cases[] = {
        {"Page",
         3,
         "AccuWeather",
         kBody,
         {"\"app_id\":\"com.quorvex.weather-m\"", "\"LOCATION_ID\":\"190390\""}},
        {"NoCity",
         0,
         "AccuWeather",
         kBody,
         {"\"app_id\":\"com.quorvex.weather-m\"", "\"MODE\":\"ADD_CITY\""}},
        {"Logo",
         1,
         "AccuWeather",
         kLogo,
         {"\"app_id\":\"org.tizen.browser\"", "accuweather.com", "partner="}},
        {"WhereNoLogoIsDrawn", 1, "WeatherNews", kLogo, {}},
    };
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        ChangeSetting([&c](const NSWeather::SettingPtr& s) { s->SetCpType(c.cpType); });
        Start(c.cities);
        Tap(c.where);
        WaitIdle();
        std::vector<std::string> launches = Launches();
        ASSERT_EQ(launches.size(), c.launch.empty() ? 0u : 1u);
        for (const std::string& part : c.launch) EXPECT_THAT(launches[0], HasSubstr(part));
        TearDown();
        mHostPid = -1;
        mClient.Disconnect();
        unlink(mRoot.Path("log/launch.log").c_str());
    }
}

TEST_F(WidgetTapsTest, RefreshAsksTheAgentOnceAndShowsTheIndicator)
{
    Start(3);
    Tap(kRefreshButton);
    Tap(kRefreshButton);
    EXPECT_EQ(CountLaunches(kRefreshRequest), 1);
    std::string centre = Slot(Id(1), "centerLayout");
    EXPECT_THAT(centre, HasSubstr("progressbar"));
    EXPECT_THAT(centre, ::testing::Not(HasSubstr("weather_box_ic_refresh.png")));
    NSWeather::SettingPtr setting = ReadSetting();
    EXPECT_TRUE(setting->GetIsNowRefreshing());
    EXPECT_GT(setting->GetRefreshingStartTime(), 0);
}

// A request the agent never got must not spin for 90 s nor mark the row.
TEST_F(WidgetTapsTest, RefreshThatCannotReachTheAgentKeepsTheButton)
{
    struct Case
    {
        const char* name;
        std::function<void(WidgetTapsTest&)> prepare;
        const char* message;
    };
    const Case cases[] = {
        {"AgentMissing", [](WidgetTapsTest& t) { t.ForgetAgent(); }, ""},
        {"NoNetwork", [](WidgetTapsTest& t) { t.SetKey("memory/dnet/status", 0); }, "No network connection"},
    };
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        Start(1);
        c.prepare(*this);
        Tap(kRefreshButton);
        WaitIdle();
        EXPECT_EQ(CountLaunches(kRefreshRequest), 0);
        std::string centre = Slot(Id(1), "centerLayout");
        EXPECT_THAT(centre, HasSubstr("weather_box_ic_refresh.png"));
        EXPECT_THAT(centre, HasSubstr(std::string("\"msg\":\"") + c.message + "\""));
        EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
        TearDown();
        mHostPid = -1;
        mClient.Disconnect();
    }
}

}  // namespace WeatherTest

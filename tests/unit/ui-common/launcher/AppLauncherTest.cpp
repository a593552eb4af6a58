#include "AppLauncher.h"

#include <app_control_launch.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <functional>
#include <string>
#include <vector>

#include "QuorvexLogManager.h"
#include "TestFiles.h"
#include "TestPlatform.h"

using NSWeather::AppLauncher;

namespace
{

const char* const kAgent = "com.quorvex.weather-m-agent";
const char* const kApp = "com.quorvex.weather-m";
const char* const kPort = "com.quorvex.weather-m-widget.message.port.local";

// The target and extra data of one launch.log line.
struct Launch
{
    std::string appId;
    std::string operation;
    std::string uri;
    std::string extra;

    bool operator==(const Launch& other) const
    {
        return appId == other.appId && operation == other.operation && uri == other.uri &&
               extra == other.extra;
    }
};

std::ostream& operator<<(std::ostream& out, const Launch& launch)
{
    return out << launch.appId << " | " << launch.operation << " | " << launch.uri << " | " << launch.extra;
}

std::string Field(const std::string& line, const std::string& name, char end)
{
    std::string marker = "\"" + name + "\":" + (end == '"' ? "\"" : "");
    size_t at = line.find(marker);
    if (at == std::string::npos)
        return "(missing)";
    at += marker.size();
    if (end == '"')
        return line.substr(at, line.find('"', at) - at);
    return line.substr(at, line.rfind('}') - at);
}

class AppLauncherTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        Register(kAgent, "exec=/bin/true\n");
        Register(kApp, "exec=/bin/true\n");
        Register(APP_CONTROL_BROWSER_APP_ID, "exec=/bin/true\nview-uri=http,https\n");
        Register(APP_CONTROL_LOCATION_SETTING_APP_ID,
                 "exec=/bin/true\noperation=" APP_CONTROL_OPERATION_SETTING_LOCATION "\n");
    }

    void TearDown() override { NSWeather::QuorvexLogManager::GetInstance()->Destroy(); }

    void Register(const std::string& appId, const std::string& conf) const { mRoot.RegisterApp(appId, conf); }

    std::vector<Launch> Launches() const
    {
        std::vector<Launch> launches;
        for (const std::string& line : WeatherTest::ReadLines(mRoot.Path("log/launch.log")))
            launches.push_back({Field(line, "app_id", '"'), Field(line, "operation", '"'),
                                Field(line, "uri", '"'), Field(line, "extra", '}')});
        return launches;
    }

    int UsageRecords() const
    {
        int count = 0;
        for (const std::string& line : WeatherTest::ReadLines(mRoot.Path("log/usage.log")))
            count += line.find("\"extra\":\"enter_accuweather\"") != std::string::npos;
        return count;
    }

    AppLauncher mLauncher;
};

TEST_F(AppLauncherTest, AgentRequestsCarryTheirCommandsInOrder)
{
    struct Case
    {
        std::function<int(AppLauncher&)> request;
        std::string extra;
    };
    const std::vector<Case> cases = {
        {[](AppLauncher& l) { return l.RequestRefreshToAgent(); },
         "{\"MESSAGE\":\"REQUEST_ALL_WEATHER_INFO\"}"},
        {[](AppLauncher& l) { return l.RequestWeatherInfoWithLocationIdToAgent("cityA"); },
         "{\"MESSAGE\":\"REQUEST_WEATHER_INFO_WITH_LOCATION_ID\",\"locationId\":\"cityA\"}"},
        {[](AppLauncher& l) { return l.RequestWeatherInfoWithLocationIdForAddToAgent(kPort, "cityB"); },
         std::string("{\"PORT_ID\":\"") + kPort +
             "\",\"MESSAGE\":\"REQUEST_WEATHER_INFO_WITH_LOCATION_ID_FOR_ADD\",\"locationId\":\"cityB\"}"},
        {[](AppLauncher& l)
         { return l.RequestWeatherInfoWithCurrentLocationIdForAddToAgent(kPort, "cityC"); },
         std::string("{\"PORT_ID\":\"") + kPort +
             "\",\"MESSAGE\":\"REQUEST_WEATHER_INFO_WITH_CURRENT_LOCATION_ID_FOR_ADD\",\"locationId\":"
             "\"cityC\"}"},
        {[](AppLauncher& l) { return l.RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent(kPort); },
         std::string("{\"PORT_ID\":\"") + kPort +
             "\",\"MESSAGE\":\"REQUEST_CURRENT_LOCATION_WEATHER_INFO_FOR_SIMPLE_ADD_PROCESS\"}"},
        {[](AppLauncher& l) { return l.RequestSetNowRefreshingToAgent(true); },
         "{\"MESSAGE\":\"SET_NOW_REFRESHING\",\"refreshing\":\"true\"}"},
        {[](AppLauncher& l) { return l.RequestSetNowRefreshingToAgent(false); },
         "{\"MESSAGE\":\"SET_NOW_REFRESHING\",\"refreshing\":\"false\"}"},
        {[](AppLauncher& l) { return l.RequestSetLocationIdOfDisplayCityToAgent("cityD"); },
         "{\"MESSAGE\":\"SET_LOCATIONID_OF_DISPLAY_CITY\",\"locationId\":\"cityD\"}"},
        {[](AppLauncher& l) { return l.RequestCancelAllRequest(); },
         "{\"MESSAGE\":\"REQUEST_CANCEL_ALL_REQUEST\"}"},
    };
    // One launcher for all: every request builds and drops its own handle.
    for (const Case& item : cases) EXPECT_EQ(0, item.request(mLauncher)) << item.extra;
    std::vector<Launch> launches = Launches();
    ASSERT_EQ(cases.size(), launches.size());
    for (size_t i = 0; i < cases.size(); ++i)
        EXPECT_EQ((Launch{kAgent, "", "", cases[i].extra}), launches[i]);
}

TEST_F(AppLauncherTest, WeatherApplicationRequests)
{
    EXPECT_EQ(0, mLauncher.RequestLaunchApplication());
    EXPECT_EQ(0, mLauncher.RequestLaunchApplicationWithLocationId("cityA"));
    EXPECT_EQ(0, mLauncher.RequestLaunchApplicationWithLocationId(""));
    EXPECT_EQ(0, mLauncher.RequestLaunchApplicationForAddCity());
    std::vector<Launch> expected = {{kApp, "", "", "{}"},
                                    {kApp, "", "", "{\"LOCATION_ID\":\"cityA\"}"},
                                    {kApp, "", "", "{}"},
                                    {kApp, "", "", "{\"MODE\":\"ADD_CITY\"}"}};
    EXPECT_EQ(expected, Launches());
}

TEST_F(AppLauncherTest, BrowserGetsTheUrlAndAccuWeatherIsCounted)
{
    NSWeather::QuorvexLogManager::GetInstance()->Create();
    const std::string accu = "http://www.accuweather.com/m?partner=quorvex";
    const std::string other = "https://weathernews.example/home";
    EXPECT_EQ(0, mLauncher.RequestLaunchingBrowserWithUrl(accu));
    EXPECT_EQ(1, UsageRecords());
    EXPECT_EQ(0, mLauncher.RequestLaunchingBrowserWithUrl(other));
    EXPECT_EQ(1, UsageRecords());
    EXPECT_TRUE(mLog.Contains("RequestLaunchingBrowserWithUrl : " + other, "weather-ui-common"));

    std::vector<Launch> expected = {{APP_CONTROL_BROWSER_APP_ID, APP_CONTROL_OPERATION_VIEW, accu, "{}"},
                                    {APP_CONTROL_BROWSER_APP_ID, APP_CONTROL_OPERATION_VIEW, other, "{}"}};
    EXPECT_EQ(expected, Launches());
}

TEST_F(AppLauncherTest, PreconditionsStopBeforeAnyRequest)
{
    EXPECT_EQ(-1, mLauncher.RequestSetLocationIdOfDisplayCityToAgent(""));
    EXPECT_TRUE(mLog.Contains("(locationId.length() < 1) [return]", "weather-ui-common")) << mLog.Dump();
    EXPECT_EQ(-1, mLauncher.LaunchSetting("some.app", ""));
    EXPECT_TRUE(mLog.Contains("(operation.length() < 1) [return]", "weather-ui-common"));
    EXPECT_TRUE(Launches().empty());
    EXPECT_FALSE(mLog.Contains("[Fail]"));
}

TEST_F(AppLauncherTest, FailedSendStillDropsTheHandle)
{
    // The agent is not installed.
    std::remove(mRoot.Path(std::string("apps/") + kAgent + "/app.conf").c_str());
    EXPECT_EQ(-1, mLauncher.RequestRefreshToAgent());
    EXPECT_TRUE(mLog.Contains("[Fail] app_control_send_launch_request failed : " +
                              std::to_string(APP_CONTROL_ERROR_APP_NOT_FOUND)));
    EXPECT_TRUE(mLog.Contains("[app_control_send_launch_request failed]"));
    EXPECT_FALSE(mLog.Contains("mAppControl == NULL"));
    EXPECT_FALSE(mLog.Contains("app_control_destroy failed"));

    // The same launcher goes on with a fresh handle.
    EXPECT_EQ(0, mLauncher.RequestLaunchApplicationForAddCity());
    ASSERT_EQ(1u, Launches().size());
    EXPECT_EQ("{\"MODE\":\"ADD_CITY\"}", Launches()[0].extra);
}

TEST_F(AppLauncherTest, RefusedExtraDataAbortsTheRequest)
{
    // The platform refuses empty values, so nothing is launched.
    EXPECT_EQ(-1, mLauncher.RequestWeatherInfoWithLocationIdToAgent(""));
    EXPECT_TRUE(mLog.Contains("[Fail] app_control_add_extra_data(" +
                              std::to_string(APP_CONTROL_ERROR_INVALID_PARAMETER) + ")"));
    EXPECT_TRUE(Launches().empty());
}

TEST_F(AppLauncherTest, SettingsLaunches)
{
    EXPECT_EQ(0, mLauncher.LaunchSetting("", APP_CONTROL_OPERATION_SETTING_LOCATION));
    EXPECT_EQ(0, mLauncher.LaunchSetting(kApp, "custom.operation"));
    EXPECT_EQ(0, mLauncher.LaunchGPSSetting());
    EXPECT_EQ(-1, mLauncher.LaunchSetting("", "unknown.operation"));
    std::vector<Launch> expected = {
        {APP_CONTROL_LOCATION_SETTING_APP_ID, APP_CONTROL_OPERATION_SETTING_LOCATION, "", "{}"},
        {kApp, "custom.operation", "", "{}"},
        {APP_CONTROL_LOCATION_SETTING_APP_ID, APP_CONTROL_OPERATION_SETTING_LOCATION, "", "{}"}};
    EXPECT_EQ(expected, Launches());
}

}  // namespace

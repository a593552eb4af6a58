#include "AppLauncher.h"

#include <app_control_launch.h>
#include <gtest/gtest.h>

#include <array>
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
const char* const kAccu = "http://www.accuweather.com/m?partner=quorvex";
const char* const kOther = "https://weathernews.example/home";

// App id, operation, uri and extra data of one launch.log line.
using Launch = std::array<std::string, 4>;

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
        mRoot.RegisterApp(kAgent, "exec=/bin/true\n");
        mRoot.RegisterApp(kApp, "exec=/bin/true\n");
        mRoot.RegisterApp(APP_CONTROL_BROWSER_APP_ID, "exec=/bin/true\nview-uri=http,https\n");
        mRoot.RegisterApp(APP_CONTROL_LOCATION_SETTING_APP_ID,
                          "exec=/bin/true\noperation=" APP_CONTROL_OPERATION_SETTING_LOCATION "\n");
    }

    void TearDown() override { NSWeather::QuorvexLogManager::GetInstance()->Destroy(); }

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

// What each request launches, in order; one launcher for all, as every
// request builds and drops its own handle.
TEST_F(AppLauncherTest, EachRequestLaunchesItsTargetWithItsExtraData)
{
    const std::string port = std::string("{\"PORT_ID\":\"") + kPort + "\",";
    const std::string loc = APP_CONTROL_LOCATION_SETTING_APP_ID;
    const std::string setLoc = APP_CONTROL_OPERATION_SETTING_LOCATION;
    const struct
    {
        std::function<int(AppLauncher&)> request;
        Launch launch;
    } cases[] = {
        {[](AppLauncher& l) { return l.RequestRefreshToAgent(); },
         {kAgent, "", "", "{\"MESSAGE\":\"REQUEST_ALL_WEATHER_INFO\"}"}},
        {[](AppLauncher& l) { return l.RequestWeatherInfoWithLocationIdToAgent("cityA"); },
         {kAgent, "", "",
          "{\"MESSAGE\":\"REQUEST_WEATHER_INFO_WITH_LOCATION_ID\",\"locationId\":\"cityA\"}"}},
        {[](AppLauncher& l) { return l.RequestWeatherInfoWithLocationIdForAddToAgent(kPort, "cityB"); },
         {kAgent, "", "",
          port + "\"MESSAGE\":\"REQUEST_WEATHER_INFO_WITH_LOCATION_ID_FOR_ADD\",\"locationId\":\"cityB\"}"}},
        {[](AppLauncher& l)
         { return l.RequestWeatherInfoWithCurrentLocationIdForAddToAgent(kPort, "cityC"); },
         {kAgent, "", "",
          port + "\"MESSAGE\":\"REQUEST_WEATHER_INFO_WITH_CURRENT_LOCATION_ID_FOR_ADD\",\"locationId\":"
                 "\"cityC\"}"}},
        {[](AppLauncher& l) { return l.RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent(kPort); },
         {kAgent, "", "",
          port + "\"MESSAGE\":\"REQUEST_CURRENT_LOCATION_WEATHER_INFO_FOR_SIMPLE_ADD_PROCESS\"}"}},
        {[](AppLauncher& l) { return l.RequestSetNowRefreshingToAgent(true); },
         {kAgent, "", "", "{\"MESSAGE\":\"SET_NOW_REFRESHING\",\"refreshing\":\"true\"}"}},
        {[](AppLauncher& l) { return l.RequestSetNowRefreshingToAgent(false); },
         {kAgent, "", "", "{\"MESSAGE\":\"SET_NOW_REFRESHING\",\"refreshing\":\"false\"}"}},
        {[](AppLauncher& l) { return l.RequestSetLocationIdOfDisplayCityToAgent("cityD"); },
         {kAgent, "", "", "{\"MESSAGE\":\"SET_LOCATIONID_OF_DISPLAY_CITY\",\"locationId\":\"cityD\"}"}},
        {[](AppLauncher& l) { return l.RequestCancelAllRequest(); },
         {kAgent, "", "", "{\"MESSAGE\":\"REQUEST_CANCEL_ALL_REQUEST\"}"}},
        {[](AppLauncher& l) { return l.RequestLaunchApplication(); }, {kApp, "", "", "{}"}},
        {[](AppLauncher& l) { return l.RequestLaunchApplicationWithLocationId("cityA"); },
         {kApp, "", "", "{\"LOCATION_ID\":\"cityA\"}"}},
        {[](AppLauncher& l) { return l.RequestLaunchApplicationWithLocationId(""); }, {kApp, "", "", "{}"}},
        {[](AppLauncher& l) { return l.RequestLaunchApplicationForAddCity(); },
         {kApp, "", "", "{\"MODE\":\"ADD_CITY\"}"}},
        {[](AppLauncher& l) { return l.LaunchSetting("", APP_CONTROL_OPERATION_SETTING_LOCATION); },
         {loc, setLoc, "", "{}"}},
        {[](AppLauncher& l) { return l.LaunchSetting(kApp, "custom.operation"); },
         {kApp, "custom.operation", "", "{}"}},
        {[](AppLauncher& l) { return l.LaunchGPSSetting(); }, {loc, setLoc, "", "{}"}},
        {[](AppLauncher& l) { return l.RequestLaunchingBrowserWithUrl(kAccu); },
         {APP_CONTROL_BROWSER_APP_ID, APP_CONTROL_OPERATION_VIEW, kAccu, "{}"}},
        {[](AppLauncher& l) { return l.RequestLaunchingBrowserWithUrl(kOther); },
         {APP_CONTROL_BROWSER_APP_ID, APP_CONTROL_OPERATION_VIEW, kOther, "{}"}},
    };
    for (const auto& c : cases) EXPECT_EQ(0, c.request(mLauncher)) << c.launch[3];
    std::vector<Launch> launches = Launches();
    ASSERT_EQ(std::size(cases), launches.size());
    for (size_t i = 0; i < launches.size(); ++i) EXPECT_EQ(cases[i].launch, launches[i]);
}

// Of the pages opened in the browser, only AccuWeather's is counted.
TEST_F(AppLauncherTest, OnlyTheAccuWeatherPageIsCounted)
{
    NSWeather::QuorvexLogManager::GetInstance()->Create();
    EXPECT_EQ(0, mLauncher.RequestLaunchingBrowserWithUrl(kAccu));
    EXPECT_EQ(0, mLauncher.RequestLaunchingBrowserWithUrl(kOther));
    EXPECT_EQ(1, UsageRecords());
}

TEST_F(AppLauncherTest, FailedSendStillDropsTheHandle)
{
    // The agent is not installed.
    std::remove(mRoot.Path(std::string("apps/") + kAgent + "/app.conf").c_str());
    EXPECT_EQ(-1, mLauncher.RequestRefreshToAgent());
    EXPECT_TRUE(mLog.Contains("[Fail] app_control_send_launch_request failed : " +
                              std::to_string(APP_CONTROL_ERROR_APP_NOT_FOUND)));
    EXPECT_FALSE(mLog.Contains("app_control_destroy failed"));

    // The same launcher goes on with a fresh handle.
    EXPECT_EQ(0, mLauncher.RequestLaunchApplicationForAddCity());
    ASSERT_EQ(1u, Launches().size());
    EXPECT_EQ("{\"MODE\":\"ADD_CITY\"}", Launches()[0][3]);
}

// Bad arguments, and values the platform refuses, launch nothing.
TEST_F(AppLauncherTest, RefusedRequestsLaunchNothing)
{
    EXPECT_EQ(-1, mLauncher.RequestSetLocationIdOfDisplayCityToAgent(""));
    EXPECT_EQ(-1, mLauncher.LaunchSetting("some.app", ""));
    EXPECT_EQ(-1, mLauncher.LaunchSetting("", "unknown.operation"));
    EXPECT_EQ(-1, mLauncher.RequestWeatherInfoWithLocationIdToAgent(""));
    EXPECT_TRUE(mLog.Contains("[Fail] app_control_add_extra_data(" +
                              std::to_string(APP_CONTROL_ERROR_INVALID_PARAMETER) + ")"))
        << mLog.Dump();
    EXPECT_TRUE(Launches().empty());
}

}  // namespace

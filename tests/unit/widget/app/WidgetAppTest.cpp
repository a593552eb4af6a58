// The weather-widget program as the platform runs it: instances, refreshes
// through a recording agent and the message port, system changes made by
// other processes (vconftool, msgport-send).
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vconf.h>
#include <widget_errno.h>

#include <chrono>
#include <thread>

#include "SampleCities.h"
#include "TestDB.h"
#include "WeatherDefine.h"
#include "WidgetHostPages.h"

namespace WeatherTest
{

using ::testing::Contains;
using ::testing::HasSubstr;

namespace
{
const char* const kPort = "com.quorvex.weather-m-widget.message.port.local";

int RunTool(std::vector<std::string> args)
{
    pid_t pid = fork();
    if (pid == 0)
    {
        std::vector<char*> argv;
        for (auto& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        _exit(127);
    }
    int status = 0;
    waitpid(pid, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}
}  // namespace

class WidgetAppTest : public WidgetHostPagesTest
{
public:
    void SetUp() override
    {
        WidgetHostPagesTest::SetUp();
        mRoot.RegisterApp("com.quorvex.weather-m-agent", std::string("exec=") + LAUNCH_RECORDER_PATH + "\n");
    }

    void SetKeyByTool(const std::string& type, const std::string& key, const std::string& value)
    {
        ASSERT_EQ(RunTool({VCONFTOOL_PATH, "set", "-t", type, key, value}), 0) << key;
    }

    void SendToPort(const std::vector<std::string>& pairs)
    {
        std::vector<std::string> args = {MSGPORT_SEND_PATH, kWidgetId, kPort};
        args.insert(args.end(), pairs.begin(), pairs.end());
        ASSERT_EQ(RunTool(args), 0);
    }

    // Another process's change reaches the widget through the main loop:
    // wait for its trace in the widget's log, then for the widget to settle.
    void WaitForLog(const std::string& text, int count)
    {
        for (int i = 0; i < 500 && CountLog(text) < count; ++i)
            std::this_thread::sleep_for(std::chrono::milliseconds(20));
        EXPECT_GE(CountLog(text), count) << text;
        WaitIdle();
    }

    void Refreshing(bool refreshing)
    {
        ChangeSetting(
            [&](const NSWeather::SettingPtr& s)
            {
                s->SetIsNowRefreshing(refreshing);
                s->SetRefreshingStartTime(time(nullptr));
            });
    }
};

TEST_F(WidgetAppTest, InstancesLiveAndDieOnTheirOwn)
{
    WriteCities(3);
    StartHost({"4x2", "4x4"});
    EXPECT_THAT(Send("list"), HasSubstr("OK 2"));
    EXPECT_EQ(Send("destroy " + Id(1)), "OK");
    EXPECT_THAT(Send("list"), HasSubstr("OK 1"));
    EXPECT_NE(CentreText(Id(2), "name"), "");
    EXPECT_THAT(Send("pause " + Id(1)), HasSubstr("ERR"));
    // To the other size type and back: the pages stay drawn.
    for (const char* size : {"4x2", "4x2", "4x4"})
    {
        EXPECT_EQ(Send("resize " + Id(2) + " " + size), "OK");
        EXPECT_NE(CentreText(Id(2), "name"), "") << size;
    }
}

TEST_F(WidgetAppTest, AnInstanceWithoutAWindowGetsItsViewOnTheFirstResize)
{
    WriteCities(2);
    StartHost({"4x2"});
    EXPECT_EQ(Send("create 4x4 nowindow"), "OK " + Id(2) + " " + std::to_string(WIDGET_ERROR_FAULT));
    EXPECT_THAT(Send("list"), HasSubstr("OK 2"));
    EXPECT_EQ(CountLog("WidgetView Created"), 1);
    EXPECT_EQ(Send("resize " + Id(2) + " 4x4"), "OK");
    WaitIdle();
    EXPECT_EQ(CountLog("WidgetView Created"), 2);
    EXPECT_NE(CentreText(Id(2), "name"), "");
}

TEST_F(WidgetAppTest, StaleDataStartsOneRefreshAfterASecondUnlessAPauseComesFirst)
{
    ASSERT_EQ(NSWeatherWidget::SampleCities::WriteCities(2, time(nullptr) - 7200, 7, false),
              NSWeather::ERR_OK);
    ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetAutoRefreshInterval(1); });
    StartHost({"4x2"});
    EXPECT_EQ(CountLaunches(kRefreshRequest), 0) << "the first resume never refreshes";

    ASSERT_EQ(Send("pause " + Id(1)), "OK");
    ASSERT_EQ(Send("resume " + Id(1)), "OK");
    ASSERT_EQ(Send("pause " + Id(1)), "OK");
    WaitIdle();
    EXPECT_EQ(CountLaunches(kRefreshRequest), 0) << "a pause cancels the pending refresh";

    // Once the request is out the page shows its progress indicator, whose
    // animation keeps the host from ever being idle: wait for the launch.
    ASSERT_EQ(Send("resume " + Id(1)), "OK");
    for (int i = 0; i < 500 && CountLaunches(kRefreshRequest) == 0; ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    std::vector<std::string> launches = Launches();
    ASSERT_EQ(launches.size(), 1u);
    EXPECT_THAT(launches[0], HasSubstr("\"app_id\":\"com.quorvex.weather-m-agent\""));
    EXPECT_THAT(launches[0], HasSubstr(kRefreshRequest));
    EXPECT_TRUE(ReadSetting()->GetIsNowRefreshing());
}

// The mark is set behind the widget's back: a shown progress indicator
// would keep the canvas drawing and the host never idle.
class WidgetNetworkTest : public WidgetAppTest, public ::testing::WithParamInterface<bool>
{
};

TEST_P(WidgetNetworkTest, LossClearsTheMarkAndTheReturnAsksForAMissingCurrentLocationCity)
{
    bool hasCurrentLocationCity = GetParam();
    WriteCities(2, 7, hasCurrentLocationCity);
    ChangeSetting(
        [](const NSWeather::SettingPtr& s)
        {
            s->SetUseCurrentLocationOn(true);
            s->SetShowCurrentCityAgreement(true);
        });
    // Location off at start, so the first resume does not ask already.
    SetKey("db/location/setting/Usemylocation", 0);
    StartHost({"4x2"});
    SetKey("db/location/setting/Usemylocation", 1);
    int requests = CountLaunches(kCurrentLocationRequest);
    EXPECT_EQ(requests, 0);
    Refreshing(true);
    SetKeyByTool("int", "memory/dnet/status", "0");
    WaitForLog("OnNetworkConnectionStateChanged state:0", 1);
    EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
    SetKeyByTool("int", "memory/dnet/status", "1");
    int expected = requests + (hasCurrentLocationCity ? 0 : 1);
    for (int i = 0; i < 500 && CountLog("OnNetworkConnectionStateChanged state:1") < 1; ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    EXPECT_EQ(CountLaunches(kCurrentLocationRequest), expected);
    EXPECT_EQ(CountLaunches(std::string("\"PORT_ID\":\"") + kPort + "\""), expected);
    EXPECT_EQ(ReadSetting()->GetIsNowRefreshing(), !hasCurrentLocationCity);
}

INSTANTIATE_TEST_SUITE_P(CurrentLocationCity, WidgetNetworkTest, ::testing::Bool());

TEST_F(WidgetAppTest, EverySystemChangeRedrawsEveryInstance)
{
    struct Case
    {
        const char* name;
        std::function<void(WidgetAppTest&)> change;
    };
    const Case cases[] = {
        {"Language",
         [](WidgetAppTest& t) { t.SetKeyByTool("string", "db/menu_widget/language", "ko_KR.UTF-8"); }},
        {"LanguageUnset",
         [](WidgetAppTest& t)
         {
             ASSERT_EQ(vconf_set_str("db/menu_widget/language", ""), 0);
             EXPECT_EQ(t.Send("event language"), "OK");
         }},
        {"RegionFormat", [](WidgetAppTest& t) { EXPECT_EQ(t.Send("event region"), "OK"); }},
        {"SystemTime", [](WidgetAppTest& t) { t.SetKeyByTool("int", "memory/system/timechanged", "1"); }},
        {"TimeZone",
         [](WidgetAppTest& t) { t.SetKeyByTool("string", "db/setting/timezone_id", "Asia/Tokyo"); }},
        {"DateFormat", [](WidgetAppTest& t) { t.SetKeyByTool("int", "db/setting/date_format", "2"); }},
        {"Clock1224",
         [](WidgetAppTest& t) { t.SetKeyByTool("int", "db/menu_widget/regionformat_time1224", "2"); }},
        {"ColourTheme", [](WidgetAppTest& t) { t.SetKeyByTool("int", "db/setting/change_ui/theme", "1"); }},
        {"FontTheme",
         [](WidgetAppTest& t) { t.SetKeyByTool("int", "db/setting/accessibility/font_size", "3"); }},
    };
    WriteCities(3);
    SetKey("db/menu_widget/regionformat_time1224", 1);
    StartHost({"4x2", "4x4"});
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        int before = CountLog("UpdateWidgetInstance");
        c.change(*this);
        WaitForLog("UpdateWidgetInstance", before + 2);
    }
}

TEST_F(WidgetAppTest, ClockFormatAndTimeZoneChangeTheTimeTextWithoutNewData)
{
    struct Case
    {
        const char* type;
        const char* key;
        const char* value;
    };
    const Case cases[] = {{"int", "db/menu_widget/regionformat_time1224", "2"},
                          {"int", "db/menu_widget/regionformat_time1224", "1"},
                          {"string", "db/setting/timezone_id", "Asia/Tokyo"}};
    WriteCities(1);
    SetKey("db/menu_widget/regionformat_time1224", 1);
    ASSERT_EQ(vconf_set_str("db/setting/timezone_id", "Europe/London"), 0);
    StartHost({"4x2"});
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.key);
        std::string before = CentreText(Id(1), "time");
        int updates = CountLog("UpdateWidgetInstance");
        SetKeyByTool(c.type, c.key, c.value);
        WaitForLog("UpdateWidgetInstance", updates + 1);
        EXPECT_NE(CentreText(Id(1), "time"), before);
    }
}

TEST_F(WidgetAppTest, LowBatteryEndsTheProcess)
{
    WriteCities(1);
    StartHost({"4x2", "4x4"});
    SetKeyByTool("int", "memory/sysman/battery_status_low", "1");
    int status = -1;
    for (int i = 0; i < 500 && waitpid(mHostPid, &status, WNOHANG) == 0; ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    EXPECT_TRUE(WIFEXITED(status));
    mHostPid = -1;
}

TEST_F(WidgetAppTest, AnyPortMessageEndsTheRefreshAndRedrawsWithTheNewData)
{
    struct Case
    {
        const char* name;
        std::vector<std::string> sizes;
        std::vector<std::string> message;
    };
    const Case cases[] = {{"WithContent", {"4x2", "4x4"}, {"RESULT=OK"}},
                          {"Empty", {"4x2", "4x4"}, {}},
                          {"NoInstance", {}, {}}};
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        WriteCities(1);
        StartHost(c.sizes);
        // What the agent writes before it posts.
        Refreshing(true);
        WriteCities(3);
        ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetLastRefreshedTime(time(nullptr) + 5); });
        SendToPort(c.message);
        for (int i = 0; i < 500 && ReadSetting()->GetIsNowRefreshing(); ++i)
            std::this_thread::sleep_for(std::chrono::milliseconds(20));
        EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
        WaitIdle();
        for (size_t n = 1; n <= c.sizes.size(); ++n)
            EXPECT_THAT(Slot(Id(static_cast<int>(n)), "nextLayout"), HasSubstr("\"name\":")) << n;
        TearDown();
        mHostPid = -1;
        mClient.Disconnect();
    }
}

TEST_F(WidgetAppTest, StartUpOnAnEmptyRootCreatesTheDatabasesAndShowsNoCity)
{
    for (const char* file : {".weather.db", ".setting.db", ".share_target.db", ".version.db"})
        unlink((mRoot.SharedDataDir() + "/db/" + file).c_str());
    StartHost({"4x2"});
    struct stat st;
    for (const char* file : {".weather.db", ".setting.db", ".share_target.db", ".version.db"})
        EXPECT_EQ(stat((mRoot.SharedDataDir() + "/db/" + file).c_str(), &st), 0) << file;
    ASSERT_TRUE(ReadSetting());
    EXPECT_THAT(Slot(Id(1), "centerLayout"), HasSubstr("\"group\":\"noCity\""));
}

TEST_F(WidgetAppTest, StartUpUpgradesAnOldWeatherDatabaseBeforeReadingIt)
{
    WriteCities(2);
    {
        // What a 0.6 installation left: the two later columns missing.
        RawDB weather(mRoot.SharedDataDir() + "/db/.weather.db");
        weather.Exec("ALTER TABLE CITY_TABLE DROP COLUMN isSummerTime;");
        weather.Exec("ALTER TABLE EXTRA_WEATHER_TABLE DROP COLUMN precProbabilityNight;");
        RawDB version(mRoot.SharedDataDir() + "/db/.version.db");
        version.Exec("UPDATE VERSION_TABLE SET dbVersion = 0.6;");
    }
    StartHost({"4x2"});
    EXPECT_NE(CentreText(Id(1), "name"), "");
    RawDB weather(mRoot.SharedDataDir() + "/db/.weather.db", true);
    EXPECT_THAT(weather.ColumnNames("CITY_TABLE"), Contains("isSummerTime"));
    EXPECT_DOUBLE_EQ(RawDB(mRoot.SharedDataDir() + "/db/.version.db", true)
                         .QueryDouble("SELECT dbVersion FROM VERSION_TABLE"),
                     0.8);
}

}  // namespace WeatherTest

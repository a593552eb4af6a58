// The real weather-widget under the host with the real weather-agent it
// launches and the weather-app run from a shell, all on one root: what one
// process writes, the others show.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>
#include <vconf.h>

#include <ctime>

#include "DBController.h"
#include "FileUtil.h"
#include "SiblingTestSupport.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "WeatherAgent.h"
#include "WeatherDefine.h"
#include "WidgetHostPages.h"

namespace WeatherTest
{

using ::testing::HasSubstr;
using ::testing::Not;

namespace
{
// A temperature the agent's weather never has: shows which data a page draws.
const char* const kOldTemperature = "99";
const char* const kIdleButton = "weather_box_ic_refresh.png";
}  // namespace

class SuiteTest : public WidgetHostPagesTest
{
public:
    void SetUp() override
    {
        WidgetHostPagesTest::SetUp();
        SiblingTest::RegisterPrograms(mRoot);
    }

    // weather-app with `args`, as a user runs it; what it printed.
    std::string App(const std::vector<std::string>& args)
    {
        std::vector<std::string> command = {SiblingTest::AppProgram()};
        command.insert(command.end(), args.begin(), args.end());
        std::string output = mRoot.Path("app.out");
        EXPECT_EQ(SiblingTest::Run(command, output), 0) << ReadText(output);
        return ReadText(output);
    }

    // Weather two hours old, with a temperature no refresh gives.
    static void AgeWeather()
    {
        RawDB(NSWeather::FileUtil::GetWeatherDBFilePath())
            .Exec(
                "UPDATE CITY_TABLE SET refreshedTime = refreshedTime - 7200;"
                "UPDATE CURRENT_WEATHER_TABLE SET curTemperature = " +
                std::string(kOldTemperature));
    }

    static std::string CityName(const std::string& locationId)
    {
        NSWeather::CityPtr cityPtr = NSWeather::DBController().SelectCityData(locationId);
        return cityPtr ? cityPtr->GetCityName() : std::string();
    }

    void Resume(int n)
    {
        ASSERT_EQ(Send("pause " + Id(n)), "OK");
        ASSERT_EQ(Send("resume " + Id(n)), "OK");
    }

    // The instance draws weather the agent has written, with its button idle.
    void ExpectRefreshed(int n)
    {
        EXPECT_TRUE(WaitUntil(
            [&]
            {
                std::string temperature = CentreText(Id(n), "current");
                return !temperature.empty() && temperature != kOldTemperature;
            }))
            << n;
        WaitIdle();
        std::string centre = Slot(Id(n), "centerLayout");
        EXPECT_THAT(centre, HasSubstr(kIdleButton)) << n;
        EXPECT_THAT(centre, Not(HasSubstr("progressbar"))) << n;
    }

    std::string Log() const { return ReadText(mRoot.Path("log/dlog.log")); }
};

TEST_F(SuiteTest, RefreshButtonRunsTheAgentAndEveryInstanceDrawsItsWeather)
{
    App({"add", "seoul"});
    App({"add", "oslo"});
    AgeWeather();
    time_t start = time(nullptr);
    StartHost({"4x2", "4x4"});
    for (int n : {1, 2}) ASSERT_EQ(CentreText(Id(n), "current"), kOldTemperature) << n;

    ASSERT_EQ(Send("tap " + Id(1) + " " + kRefreshButton).compare(0, 2, "OK"), 0);
    // Only the port message clears the mark through the widget's own path.
    ASSERT_TRUE(WaitUntil([this] { return CountLog("SetIsNowRefreshing as:0") > 0; })) << Log();
    std::vector<std::string> launches = Launches();
    ASSERT_EQ(launches.size(), 1u);
    EXPECT_THAT(launches[0], HasSubstr("\"app_id\":\"com.quorvex.weather-m-agent\""));
    EXPECT_THAT(launches[0], HasSubstr(std::string("\"extra\":{") + kRefreshRequest + "}"));
    EXPECT_EQ(CountLog("request 'REQUEST_ALL_WEATHER_INFO' (port '')"), 1);
    EXPECT_EQ(CountLog(std::string("posted 'OK' to port '") + NSWeather::WeatherAgent::WIDGET_PORT + "'"), 1);

    RawDB db(NSWeather::FileUtil::GetWeatherDBFilePath(), true);
    EXPECT_EQ(db.QueryInt("SELECT COUNT(*) FROM CITY_TABLE WHERE refreshedTime < " + std::to_string(start)),
              0);
    EXPECT_EQ(db.QueryInt(std::string("SELECT COUNT(*) FROM CURRENT_WEATHER_TABLE WHERE curTemperature = ") +
                          kOldTemperature),
              0);
    EXPECT_GE(ReadSetting()->GetLastRefreshedTime(), start);
    for (int n : {1, 2}) ExpectRefreshed(n);
    EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
}

TEST_F(SuiteTest, ResumeAsksForTheCurrentLocationCityAndTheLoadingPageBecomesIt)
{
    App({"location", "on"});
    ASSERT_EQ(vconf_set_dbl(NSWeather::WeatherAgent::POSITION_LATITUDE_KEY, 37.55), 0);
    ASSERT_EQ(vconf_set_dbl(NSWeather::WeatherAgent::POSITION_LONGITUDE_KEY, 127.0), 0);
    // Location off at start, so the first resume does not ask already.
    SetKey("db/location/setting/Usemylocation", 0);
    StartHost({"4x2"});
    EXPECT_THAT(Slot(Id(1), "centerLayout"), HasSubstr("\"group\":\"noCity\""));
    SetKey("db/location/setting/Usemylocation", 1);
    {
        // The agent waits for this write lock, so the loading page stays up.
        RawDB lock(NSWeather::FileUtil::GetWeatherDBFilePath());
        ASSERT_TRUE(lock.Exec("BEGIN IMMEDIATE"));
        Resume(1);
        EXPECT_TRUE(WaitUntil(
            [this] { return Slot(Id(1), "centerLayout").find("\"group\":\"loading\"") != std::string::npos; },
            4.0));
        lock.Exec("COMMIT");
    }
    std::string name;
    EXPECT_TRUE(WaitUntil([&] { return !(name = CityName("kr-seoul:C")).empty(); })) << Log();
    EXPECT_TRUE(WaitUntil([&] { return CentreText(Id(1), "name") == name; })) << Slot(Id(1), "centerLayout");
    EXPECT_EQ(CountLaunches(kCurrentLocationRequest), 1);
    EXPECT_EQ(CountLaunches(std::string("\"PORT_ID\":\"") + NSWeather::WeatherAgent::WIDGET_PORT + "\""), 1);
    WaitIdle();
    EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
}

TEST_F(SuiteTest, StaleWeatherIsRefreshedASecondAfterAResume)
{
    App({"add", "seoul"});
    App({"interval", "1"});
    AgeWeather();
    time_t start = time(nullptr);
    StartHost({"4x2"});
    ASSERT_EQ(CentreText(Id(1), "current"), kOldTemperature);
    Resume(1);
    ExpectRefreshed(1);
    EXPECT_EQ(CountLog("AutoRefreshTimerCb will be called after 1 sec"), 1);
    EXPECT_EQ(CountLaunches(kRefreshRequest), 1);
    EXPECT_GE(NSWeather::DBController().SelectCityData("kr-seoul")->GetRefreshedTime(), start);
    EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
}

// The mark of a refresh nobody answers expires after 90 s: its start time,
// stored in the settings, is moved back instead of waiting.
TEST_F(SuiteTest, ARefreshTheAgentNeverEndsExpiresAndTheNextResumeTriesAgain)
{
    struct Case
    {
        const char* name;
        const char* agentConf;  // null: not registered
        const char* failureLog;
        int launches;  // per attempt
    };
    const Case cases[] = {
        {"AgentMissing", nullptr, "auto refresh request failed", 0},
        {"AgentExitsWithoutPosting", "exec=/bin/true\n", nullptr, 1},
    };
    auto expire = [this]
    { ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetRefreshingStartTime(time(nullptr) - 91); }); };
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        App({"add", "seoul"});
        App({"interval", "1"});
        AgeWeather();
        if (c.agentConf)
            mRoot.RegisterApp(NSWeather::WEATHER_AGENT_APP_ID, c.agentConf);
        else
            unlink(mRoot.Path(std::string("apps/") + NSWeather::WEATHER_AGENT_APP_ID + "/app.conf").c_str());
        StartHost({"4x2"});
        for (int attempt = 1; attempt <= 2; ++attempt)
        {
            SCOPED_TRACE(attempt);
            if (attempt > 1)
                expire();
            Resume(1);
            ASSERT_TRUE(WaitUntil([&] { return CountLog("SetIsNowRefreshing as:1") == attempt; })) << Log();
            if (c.failureLog)
            {
                EXPECT_TRUE(WaitUntil([&] { return CountLog(c.failureLog) == attempt; }));
            }
            EXPECT_TRUE(WaitUntil([&] { return CountLaunches(kRefreshRequest) == c.launches * attempt; }));
            EXPECT_TRUE(ReadSetting()->GetIsNowRefreshing());
            EXPECT_THAT(Slot(Id(1), "centerLayout"), HasSubstr("progressbar"));
        }
        // Once expired nothing spins, and no new refresh starts by itself.
        App({"interval", "0"});
        expire();
        Resume(1);
        WaitIdle();
        EXPECT_THAT(Slot(Id(1), "centerLayout"), HasSubstr(kIdleButton));
        EXPECT_EQ(CountLog("SetIsNowRefreshing as:1"), 2);
        TearDown();
        mHostPid = -1;
        mClient.Disconnect();
        unlink(mRoot.Path("log/dlog.log").c_str());
        unlink(mRoot.Path("log/launch.log").c_str());
    }
}

TEST_F(SuiteTest, WeatherAppAndWidgetShowOneCurrentCity)
{
    for (const char* city : {"seoul", "oslo", "paris"}) App({"add", city});
    StartHost({"4x2", "4x4"});
    for (int n : {1, 2}) ASSERT_EQ(CentreText(Id(n), "name"), CityName("kr-seoul")) << n;

    App({"current", "fr-paris"});
    EXPECT_EQ(CentreText(Id(1), "name"), CityName("kr-seoul")) << "followed before its resume";
    for (int n : {1, 2}) Resume(n);
    WaitIdle();
    for (int n : {1, 2}) EXPECT_EQ(CentreText(Id(n), "name"), CityName("fr-paris")) << n;

    // Up from the last city wraps around to the first.
    ASSERT_EQ(Send("swipe " + Id(1) + " 300 300 300 150 200").compare(0, 2, "OK"), 0);
    WaitIdle();
    EXPECT_EQ(CentreText(Id(1), "name"), CityName("kr-seoul"));
    EXPECT_THAT(App({"list"}), HasSubstr("* 0 kr-seoul "));
}

}  // namespace WeatherTest

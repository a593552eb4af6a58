#include <bundle.h>
#include <message_port.h>
#include <vconf-keys.h>
#include <vconf.h>

#include <ctime>
#include <string>

#include "AppLauncher.h"
#include "ContentProvider.h"
#include "FileUtil.h"
#include "IconMappingTable.h"
#include "LoopbackHttpServer.h"
#include "MainLoop.h"
#include "SampleWeatherSource.h"
#include "SettingDBController.h"
#include "SiblingTestSupport.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "WeatherAgent.h"
#include "WeatherAppCommands.h"
#include "WeatherDefine.h"
#include "WeatherSourceChoice.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{

// The agent runs as its own process, started by the real launch requests
// or from a shell; the test listens on the port it posts to.
class WeatherAgentTest : public SiblingTest::SiblingFixture
{
protected:
    void SetUp() override
    {
        SiblingFixture::SetUp();
        RegisterPrograms();
        ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, 1));
        Listen(WeatherAgent::WIDGET_PORT);
    }

    void TearDown() override
    {
        if (mPortId > 0)
            message_port_unregister_local_port(mPortId);
        SiblingFixture::TearDown();
    }

    void Listen(const char* port)
    {
        if (mPortId > 0)
            message_port_unregister_local_port(mPortId);
        mPortId = message_port_register_local_port(port, MessageCb, this);
        ASSERT_GT(mPortId, 0);
    }

    static void MessageCb(int, const char*, const char*, bool, bundle* message, void* data)
    {
        char* result = nullptr;
        bundle_get_str(message, "RESULT", &result);
        static_cast<WeatherAgentTest*>(data)->mResults.push_back(result ? result : "");
    }

    // The one result posted; "" when nothing came.
    std::string WaitForPost()
    {
        WeatherTest::RunLoopUntil([this] { return !mResults.empty(); }, 60.0);
        return mResults.empty() ? std::string() : mResults.front();
    }

    void AddCities(const std::vector<std::string>& names)
    {
        WeatherAppCommands commands(mCataloguePtr, std::make_shared<SampleWeatherSource>());
        for (const std::string& name : names)
        {
            std::string out;
            ASSERT_EQ(ERR_OK, commands.Run({"add", name}, out)) << out;
        }
    }

    std::string DBPath() const { return FileUtil::GetWeatherDBFilePath(); }

    std::string AgentLog() const { return WeatherTest::ReadText(mRoot.Path("log/dlog.log")); }

    // Every forecast table holds the full set of rows for every city.
    void ExpectCompleteCities(int cityCount, time_t refreshedSince)
    {
        RawDB db(DBPath(), true);
        EXPECT_EQ(cityCount, db.QueryInt("SELECT COUNT(*) FROM CITY_TABLE"));
        EXPECT_EQ(cityCount,
                  db.QueryInt("SELECT COUNT(DISTINCT pageIndex) FROM CITY_TABLE WHERE pageIndex < " +
                              std::to_string(cityCount)));
        EXPECT_EQ(0, db.QueryInt("SELECT COUNT(*) FROM CITY_TABLE WHERE refreshedTime < " +
                                 std::to_string(refreshedSince)));
        const char* const counts[][2] = {
            {"CURRENT_WEATHER_TABLE", "1"}, {"HOURLY_WEATHER_TABLE", "24"}, {"WEEKLY_WEATHER_TABLE", "10"},
            {"EXTRA_WEATHER_TABLE", "1"},   {"MOON_PHASE_TABLE", "7"},
        };
        for (const auto& table : counts)
        {
            std::string sql = std::string("SELECT COUNT(*) FROM CITY_TABLE c WHERE (SELECT COUNT(*) FROM ") +
                              table[0] + " t WHERE t.FK_ID = c.PK_ID) != " + table[1];
            EXPECT_EQ(0, db.QueryInt(sql)) << table[0];
        }
    }

    int mPortId = -1;
    std::vector<std::string> mResults;
};

TEST_F(WeatherAgentTest, RefreshRequestFillsEveryCityAndPosts)
{
    AddCities({"seoul", "oslo", "sydney"});
    ASSERT_TRUE(
        SettingDBController().SelectAndUpdate([](const SettingPtr& s) { s->SetCpType("cmaweather"); }));
    RawDB(DBPath()).Exec("UPDATE CITY_TABLE SET refreshedTime = 1000; DELETE FROM MOON_PHASE_TABLE;");
    time_t start = time(nullptr);

    ASSERT_EQ(0, AppLauncher().RequestRefreshToAgent());
    EXPECT_EQ("OK", WaitForPost()) << AgentLog();

    ExpectCompleteCities(3, start);
    RawDB db(DBPath(), true);
    EXPECT_DOUBLE_EQ(9.0, db.QueryDouble("SELECT gmtOffset FROM CITY_TABLE WHERE locationId = 'kr-seoul'"));
    EXPECT_GE(SettingDBController().Select()->GetLastRefreshedTime(), start);
    // Icon numbers are the provider's: the widget's CMA table maps each one.
    for (const std::string& icon : db.QueryTexts("SELECT weatherIcon FROM HOURLY_WEATHER_TABLE"))
        EXPECT_NE(0, IconMappingTable().GetMappingIconNum(std::stoi(icon), true)) << icon;
    EXPECT_NE(std::string::npos, AgentLog().find("sample weather")) << AgentLog();
}

TEST_F(WeatherAgentTest, LocateAddsNearestCityAsCurrentLocationAndFollowsTheDevice)
{
    AddCities({"paris"});
    Listen("test.location.port");
    ASSERT_EQ(VCONF_OK, vconf_set_dbl(WeatherAgent::POSITION_LATITUDE_KEY, 37.55));
    ASSERT_EQ(VCONF_OK, vconf_set_dbl(WeatherAgent::POSITION_LONGITUDE_KEY, 127.0));
    ASSERT_EQ(
        0, AppLauncher().RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent("test.location.port"));
    EXPECT_EQ("OK", WaitForPost()) << AgentLog();

    ExpectCompleteCities(2, 0);
    RawDB db(DBPath(), true);
    EXPECT_EQ("kr-seoul:C", db.QueryText("SELECT locationId FROM CITY_TABLE WHERE isCurrentLocation = 1"));
    EXPECT_EQ(1, db.QueryInt("SELECT pageIndex FROM CITY_TABLE WHERE isCurrentLocation = 1"));

    // The device moves: the same page now holds the new place.
    Listen(WeatherAgent::WIDGET_PORT);
    mResults.clear();
    ASSERT_EQ(VCONF_OK, vconf_set_dbl(WeatherAgent::POSITION_LATITUDE_KEY, 35.68));
    ASSERT_EQ(VCONF_OK, vconf_set_dbl(WeatherAgent::POSITION_LONGITUDE_KEY, 139.75));
    EXPECT_EQ(0, SiblingTest::Run({SiblingTest::AgentProgram(), "locate"}));
    EXPECT_EQ("OK", WaitForPost());
    ExpectCompleteCities(2, 0);
    EXPECT_EQ("jp-tokyo:C", db.QueryText("SELECT locationId FROM CITY_TABLE WHERE isCurrentLocation = 1"));
    EXPECT_EQ(1, db.QueryInt("SELECT pageIndex FROM CITY_TABLE WHERE isCurrentLocation = 1"));
}

struct FailureCase
{
    const char* name;
    const char* command;
    bool hasCity;
    bool hasPosition;
    bool isLocationOn;
    bool isLocked;
    const char* logLine;
};

// Each failure ends with a log line, a failed exit and still a post, so no
// refresh mark is left waiting.
const FailureCase FAILURE_CASES[] = {
    {"no cities", "refresh", false, true, true, false, "no cities to refresh"},
    {"no position", "locate", true, false, true, false, "no device position"},
    {"location off", "locate", true, true, false, false, "the location service is off"},
    {"database locked", "refresh", true, true, true, true, "the data store could not be opened"},
};

TEST_F(WeatherAgentTest, FailuresAreLoggedAndStillPost)
{
    AddCities({"seoul"});
    for (const FailureCase& c : FAILURE_CASES)
    {
        SCOPED_TRACE(c.name);
        mResults.clear();
        WeatherTest::WriteText(mRoot.Path("log/dlog.log"), "");
        RawDB db(DBPath());
        db.Exec(c.hasCity ? "SELECT 1" : "DELETE FROM CITY_TABLE");
        vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, c.isLocationOn ? 1 : 0);
        if (c.hasPosition)
            vconf_set_dbl(WeatherAgent::POSITION_LATITUDE_KEY, 10.0);
        else
            unlink(mRoot.Path(std::string("vconf/") + WeatherAgent::POSITION_LATITUDE_KEY).c_str());
        vconf_set_dbl(WeatherAgent::POSITION_LONGITUDE_KEY, 10.0);
        if (c.isLocked)
            db.Exec("BEGIN EXCLUSIVE");
        // The post waits in the port's queue until the loop runs.
        EXPECT_EQ(1, SiblingTest::Run({SiblingTest::AgentProgram(), c.command}));
        if (c.isLocked)
            db.Exec("ROLLBACK");
        EXPECT_EQ("FAIL", WaitForPost());
        EXPECT_NE(std::string::npos, AgentLog().find(c.logLine)) << AgentLog();
    }
}

// A launched agent follows the source key: the service's error is logged,
// the rows stay and the widget still hears back. --source wins over the key.
TEST_F(WeatherAgentTest, LaunchedAgentFollowsTheSourceKeyAndStillPostsWhenTheServiceFails)
{
    AddCities({"seoul"});
    SiblingTest::LoopbackHttpServer server;
    server.SetAnswer({503, ""});
    setenv(WeatherSourceChoice::BASE_URL_ENV, server.GetBaseUrl().c_str(), 1);
    ASSERT_EQ(VCONF_OK, vconf_set_str(WeatherSourceChoice::SOURCE_KEY, WeatherSourceChoice::OPEN_METEO));
    ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI));
    const std::string rows = "SELECT group_concat(curTemperature||date) FROM CURRENT_WEATHER_TABLE";
    std::string before = RawDB(DBPath(), true).QueryText(rows);

    ASSERT_EQ(0, AppLauncher().RequestRefreshToAgent());
    EXPECT_EQ("FAIL", WaitForPost()) << AgentLog();
    EXPECT_EQ(1u, server.GetRequests().size());
    EXPECT_NE(std::string::npos, AgentLog().find("Open-Meteo answered HTTP 503 for kr-seoul")) << AgentLog();
    EXPECT_EQ(before, RawDB(DBPath(), true).QueryText(rows));

    mResults.clear();
    EXPECT_EQ(0, SiblingTest::Run({SiblingTest::AgentProgram(), "--source", "sample", "refresh"}));
    EXPECT_EQ("OK", WaitForPost());
    EXPECT_EQ(1u, server.GetRequests().size());
    unsetenv(WeatherSourceChoice::BASE_URL_ENV);
}

struct UsageCase
{
    std::vector<std::string> args;
    int exitCode;
    const char* output;
};

const UsageCase USAGE_CASES[] = {
    {{"--help"}, 0, "Weather data by Open-Meteo.com (https://open-meteo.com/), CC BY 4.0."},
    {{"--source", "open-meteo", "--help"}, 0, "--source open-meteo|sample"},
    {{"--source", "elsewhere", "refresh"}, 2, "usage: weather-agent"},
    {{"--source"}, 2, "usage: weather-agent"},
    {{"refresh", "locate"}, 2, "usage: weather-agent"},
};

TEST_F(WeatherAgentTest, HelpCreditsOpenMeteoAndBadUsageFails)
{
    std::string outputPath = mRoot.Path("usage.txt");
    for (const UsageCase& c : USAGE_CASES)
    {
        std::vector<std::string> args = {SiblingTest::AgentProgram()};
        args.insert(args.end(), c.args.begin(), c.args.end());
        EXPECT_EQ(c.exitCode, SiblingTest::Run(args, outputPath)) << args.back();
        EXPECT_NE(std::string::npos, WeatherTest::ReadText(outputPath).find(c.output)) << args.back();
    }
}

}  // namespace

#include <vconf-keys.h>
#include <vconf.h>

#include <nlohmann/json.hpp>

#include <chrono>
#include <string>
#include <vector>

#include "FileUtil.h"
#include "LoopbackHttpServer.h"
#include "OpenMeteoWeatherSource.h"
#include "SampleWeatherSource.h"
#include "SettingDBController.h"
#include "SiblingTestSupport.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "WeatherAgent.h"
#include "WeatherAppCommands.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using Json = nlohmann::json;

namespace
{

// 2026-12-07 13:20 in Seoul: the fixture's current conditions are of 13:15
// and its hours start at midnight, so the 24 hours after now are 14:00 on.
constexpr time_t NOW = 1796617200;
const char* const WEATHER_TABLES[] = {"CITY_TABLE",           "CURRENT_WEATHER_TABLE", "HOURLY_WEATHER_TABLE",
                                      "WEEKLY_WEATHER_TABLE", "EXTRA_WEATHER_TABLE",   "MOON_PHASE_TABLE"};

class OpenMeteoWeatherSourceTest : public SiblingTest::SiblingFixture
{
protected:
    void SetUp() override
    {
        SiblingFixture::SetUp();
        ASSERT_EQ(VCONF_OK, vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI));
        mGood = WeatherTest::ReadText(std::string(AGENT_FIXTURE_DIR) + "/open-meteo-seoul.json");
        ASSERT_FALSE(mGood.empty());
        ASSERT_FALSE(mServer.GetBaseUrl().empty());
        AddCities({"seoul"});
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

    int Refresh(long timeoutMs = 5000, const std::string& baseUrl = std::string())
    {
        OpenMeteoWeatherSource::Options options = OpenMeteoWeatherSource::GetDefaultOptions();
        options.baseUrl = baseUrl.empty() ? mServer.GetBaseUrl() : baseUrl;
        options.timeoutMs = timeoutMs;
        WeatherAgent agent(mCataloguePtr, std::make_shared<OpenMeteoWeatherSource>(options),
                           [this] { return mNow; });
        return agent.RefreshAll();
    }

    // Every row of the weather tables and the last refresh time, as text.
    std::string DumpStore()
    {
        WeatherTest::RawDB db(FileUtil::GetWeatherDBFilePath(), true);
        std::string dump;
        for (const char* table : WEATHER_TABLES)
        {
            std::string columns;
            for (const std::string& column : db.ColumnNames(table))
                columns += (columns.empty() ? "quote(" : "||'|'||quote(") + column + ")";
            for (const std::string& row :
                 db.QueryTexts("SELECT " + columns + " FROM " + table + " ORDER BY rowid"))
                dump += row + "\n";
        }
        return dump + std::to_string(SettingDBController().Select()->GetLastRefreshedTime());
    }

    std::string Query(const std::string& sql)
    {
        return WeatherTest::RawDB(FileUtil::GetWeatherDBFilePath(), true).QueryText(sql);
    }

    SiblingTest::LoopbackHttpServer mServer;
    std::string mGood;
    time_t mNow = NOW;
};

std::string Edited(const std::string& text, void (*edit)(Json&))
{
    Json answer = Json::parse(text);
    edit(answer);
    return answer.dump();
}

void ResizeSeries(Json& block, size_t size)
{
    for (auto& item : block.items()) item.value().get_ref<Json::array_t&>().resize(size);
}

struct RowCheck
{
    const char* sql;
    const char* expected;
};

// Codes are AccuWeather's (the default provider) for the fixture's WMO codes.
const RowCheck GOOD_ROWS[] = {
    {"SELECT isDayTime||' '||refreshedTime||' '||gmtOffset||' '||websiteUrl FROM CITY_TABLE",
     "1 1796617200 9.0 https://open-meteo.com/"},
    {"SELECT "
     "weatherIcon||'|'||weatherStatus||'|'||curTemperature||'|'||lowTemperature||'|'||highTemperature||'|'||"
     "date FROM CURRENT_WEATHER_TABLE",
     "3|Partly cloudy, wind 13 km/h NW|5.1|-4.1|6.8|1796616900"},
    {"SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE WHERE hour = 1796619600 + 3600 * hourlyIndex "
     "AND curTemperature = lowTemperature AND curTemperature = highTemperature",
     "24"},
    {"SELECT hour||'|'||weatherIcon||'|'||weatherStatus||'|'||curTemperature FROM HOURLY_WEATHER_TABLE "
     "WHERE hourlyIndex = 0",
     "1796619600|11|Fog|5.5"},
    {"SELECT group_concat(weatherIcon||' '||weatherStatus||' '||curTemperature, '; ') FROM "
     "(SELECT * FROM HOURLY_WEATHER_TABLE WHERE hourlyIndex IN (4, 23) ORDER BY hourlyIndex)",
     "44 Light snow showers 3.3; 14 Showers 6.1"},
    {"SELECT COUNT(*) FROM WEEKLY_WEATHER_TABLE WHERE date = 1796612400 + 86400 * weeklyIndex "
     "AND curTemperature = highTemperature",
     "10"},
    {"SELECT group_concat(weatherIcon||' '||weatherStatus||' '||lowTemperature||' '||highTemperature, '; ') "
     "FROM "
     "(SELECT * FROM WEEKLY_WEATHER_TABLE WHERE weeklyIndex IN (0, 5, 9) ORDER BY weeklyIndex)",
     "7 Overcast -4.1 6.8; 15 Thunderstorm 3.9 11.2; 12 Light drizzle -1.0 4.6"},
    {"SELECT humidity||'|'||sunriseTime||'|'||sunsetTime||'|'||uvIndex||'|'||realfeel||'|'||precType||'|'||"
     "precProbability||'|'||precAmount||'|'||precProbabilityNight||'|'||precAmountNight||'|'||aqi "
     "FROM EXTRA_WEATHER_TABLE",
     "48|1796596560|1796631300|3|1.8|0|20.0|0.0|70.0|1.9|999"},
    {"SELECT COUNT(*) FROM MOON_PHASE_TABLE WHERE locationID = 'kr-seoul'", "7"},
    {"SELECT (SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE WHERE websiteUrl = 'https://open-meteo.com/') + "
     "(SELECT COUNT(*) FROM WEEKLY_WEATHER_TABLE WHERE websiteUrl = 'https://open-meteo.com/')",
     "34"},
};

TEST_F(OpenMeteoWeatherSourceTest, GoodAnswerFillsEveryRowExactly)
{
    mServer.SetAnswer({200, mGood});
    ASSERT_EQ(ERR_OK, Refresh()) << mLog.Dump();

    for (const RowCheck& check : GOOD_ROWS) EXPECT_EQ(check.expected, Query(check.sql)) << check.sql;
    EXPECT_EQ(NOW, SettingDBController().Select()->GetLastRefreshedTime());
    std::vector<std::string> requests = mServer.GetRequests();
    ASSERT_EQ(1u, requests.size());
    for (const char* part : {"GET /v1/forecast?latitude=37.", "&timezone=Asia%2FSeoul&", "&forecast_days=10 ",
                             "\r\nUser-Agent: weather-widget/"})
        EXPECT_NE(std::string::npos, requests[0].find(part)) << part << " in " << requests[0];
}

struct RefusedCase
{
    const char* name;
    int status;  // 0: nothing listens
    std::string (*makeBody)(const std::string& good);
    const char* logPart;
    bool isNetworkOn = true;
    bool isLengthSent = true;
};

std::string Text(const char* text)
{
    return text;
}

const RefusedCase REFUSED_CASES[] = {
    {"no network", 200, [](const std::string& good) { return good; }, "kr-seoul not asked: no network",
     false},
    {"nothing listens", 0, [](const std::string& good) { return good; }, "Couldn't connect"},
    {"HTTP error with a reason", 400,
     [](const std::string&) { return Text(R"({"error":true,"reason":"Invalid timezone\u0007"})"); },
     "HTTP 400 for kr-seoul: Invalid timezone "},
    {"HTTP error without a body", 503, [](const std::string&) { return Text(""); }, "HTTP 503 for kr-seoul"},
    {"not JSON", 200, [](const std::string&) { return Text("<html>busy</html>"); }, "not a JSON object"},
    {"cut short", 200, [](const std::string& good) { return good.substr(0, good.size() / 2); },
     "not a JSON object"},
    {"nested without end", 200,
     [](const std::string&) { return std::string(200000, '[') + std::string(200000, ']'); },
     "not a JSON object"},
    {"larger than the cap", 200, [](const std::string& good) { return good + std::string(600 * 1024, ' '); },
     "larger than 524288 bytes", true, false},
    {"no daily forecast", 200,
     [](const std::string& g) { return Edited(g, [](Json& j) { j.erase("daily"); }); }, "no daily times"},
    {"nine days", 200,
     [](const std::string& g) { return Edited(g, [](Json& j) { ResizeSeries(j["daily"], 9); }); },
     "has 9 days, not 10"},
    {"hours run out", 200,
     [](const std::string& g) { return Edited(g, [](Json& j) { ResizeSeries(j["hourly"], 30); }); },
     "has 15 hours after now"},
    {"one series shorter", 200,
     [](const std::string& g) { return Edited(g, [](Json& j) { j["hourly"]["is_day"].erase(0); }); },
     "hourly.is_day is missing or not as long as the times"},
    {"empty hour", 200,
     [](const std::string& g)
     { return Edited(g, [](Json& j) { j["hourly"]["temperature_2m"][20] = nullptr; }); },
     "hourly.temperature_2m[20] is empty"},
    {"unknown weather code", 200,
     [](const std::string& g) { return Edited(g, [](Json& j) { j["daily"]["weather_code"][3] = 4; }); },
     "weather_code 4 is no known weather code"},
    {"the no-value sentinel", 200,
     [](const std::string& g) { return Edited(g, [](Json& j) { j["current"]["temperature_2m"] = 999; }); },
     "current.temperature_2m is not a valid value"},
    {"text for a number", 200,
     [](const std::string& g)
     { return Edited(g, [](Json& j) { j["current"]["relative_humidity_2m"] = "48"; }); },
     "current.relative_humidity_2m is not a valid value"},
    {"yesterday's answer", 200,
     [](const std::string& g)
     { return Edited(g, [](Json& j) { j["current"]["time"] = j["current"]["time"].get<long>() - 86400; }); },
     "not of now"},
    {"minimum above maximum", 200,
     [](const std::string& g)
     { return Edited(g, [](Json& j) { j["daily"]["temperature_2m_min"][2] = 9.0; }); },
     "daily.temperature_2m_min[2] is above"},
    {"hours out of order", 200,
     [](const std::string& g)
     { return Edited(g, [](Json& j) { j["hourly"]["time"][30] = j["hourly"]["time"][29]; }); },
     "hourly.time[30] does not follow"},
};

// A refused answer changes no row and no refresh time; the reason is logged.
TEST_F(OpenMeteoWeatherSourceTest, EachFailureKeepsTheLastRows)
{
    mServer.SetAnswer({200, mGood});
    ASSERT_EQ(ERR_OK, Refresh());
    mNow += 3600;
    for (const RefusedCase& c : REFUSED_CASES)
    {
        SCOPED_TRACE(c.name);
        mLog.Clear();
        vconf_set_int(VCONFKEY_NETWORK_STATUS, c.isNetworkOn ? VCONFKEY_NETWORK_WIFI : VCONFKEY_NETWORK_OFF);
        SiblingTest::LoopbackHttpServer::Answer answer;
        answer.status = c.status;
        answer.body = c.makeBody(mGood);
        answer.isLengthSent = c.isLengthSent;
        mServer.SetAnswer(answer);
        std::string before = DumpStore();
        EXPECT_EQ(ERR_FAIL, Refresh(5000, c.status ? std::string() : "http://127.0.0.1:1/v1/forecast"));
        EXPECT_EQ(before, DumpStore());
        EXPECT_TRUE(mLog.Contains(c.logPart)) << mLog.Dump();
        EXPECT_TRUE(mLog.Contains("city 'kr-seoul' keeps its last weather")) << mLog.Dump();
    }
}

// The second city is not asked after the first timed out: one refresh
// costs one timeout, and the widget hears back long before it gives up.
TEST_F(OpenMeteoWeatherSourceTest, SlowServerHitsTheTimeoutOnce)
{
    AddCities({"oslo"});
    mServer.SetAnswer({200, mGood, 5000});
    std::string before = DumpStore();
    auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(ERR_FAIL, Refresh(300));
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::milliseconds(3000));
    EXPECT_EQ(before, DumpStore());
    EXPECT_EQ(1u, mServer.GetRequests().size());
    EXPECT_TRUE(mLog.Contains("Timeout")) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("no-oslo not asked: the service was out of reach")) << mLog.Dump();
}

TEST_F(OpenMeteoWeatherSourceTest, RecentCityIsNotAskedAgainWithinTheInterval)
{
    mServer.SetAnswer({200, mGood});
    ASSERT_EQ(ERR_OK, Refresh());
    mNow = NOW + OpenMeteoWeatherSource::GetDefaultOptions().minimumInterval - 1;
    EXPECT_EQ(ERR_OK, Refresh());
    EXPECT_EQ(1u, mServer.GetRequests().size());
    EXPECT_EQ(NOW, SettingDBController().Select()->GetLastRefreshedTime());
    mNow = NOW + OpenMeteoWeatherSource::GetDefaultOptions().minimumInterval;
    EXPECT_EQ(ERR_OK, Refresh());
    EXPECT_EQ(2u, mServer.GetRequests().size());
}

}  // namespace

#include <algorithm>
#include <cctype>
#include <set>

#include <sys/stat.h>
#include <unistd.h>

#include "DataStoreInitializer.h"
#include "DBTestSupport.h"
#include "UpgradeDBController.h"
#include "VersionDBController.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{

struct StepLog
{
    const char* line;
    double belowVersion;
};

const StepLog STEP_LOGS[] = {
    {"UpgradeDBTables < 0.1 : ALTER TABLE CITY_TABLE ADD countryNameEng", 0.1},
    {"UpgradeDBTables < 0.2 : ALTER TABLE HOURLY_WEATHER_TABLE ADD websiteUrl", 0.2},
    {"UpgradeDBTables : DROP TABLE VERSION_TABLE;", 0.2},
    {"UpgradeDBTables < 0.3 : ALTER TABLE EXTRA_WEATHER_TABLE ADD aqi", 0.3},
    {"UpgradeDBTables < 0.4 : ALTER TABLE EXTRA_WEATHER_TABLE ADD outdoorExcercise", 0.4},
    {"UpgradeDBTables < 0.5 : ALTER TABLE CITY_TABLE ADD needToUpdate", 0.5},
    {"UpgradeDBTables < 0.6 : ALTER TABLE EXTRA_WEATHER_TABLE ADD foodPoison", 0.6},
    {"UpgradeDBTables < 0.7 : ALTER TABLE CITY_TABLE ADD isSummerTime", 0.7},
    {"UpgradeDBTables < 0.8 : ALTER TABLE EXTRA_WEATHER_TABLE ADD precProbabilityNight", 0.8},
};

std::set<std::string> LowerCase(const std::vector<std::string>& names)
{
    std::set<std::string> lower;
    for (std::string name : names)
    {
        std::transform(name.begin(), name.end(), name.begin(),
                       [](unsigned char c) { return std::tolower(c); });
        lower.insert(name);
    }
    return lower;
}

class UpgradeFixture : public WeatherTest::StoreTest
{
protected:
    // A weather database as an installation of `version` left it: two
    // cities (the second found by position, stored without ":C"), each
    // with forecast rows, and a trigger that records every city rewrite.
    void MakeOldWeatherDB(double version, const std::string& currentLocationId = "2-1234")
    {
        MakeDBDir();
        RawDB db(WeatherDBPath());
        for (const auto& table : WeatherTest::WEATHER_TABLE_FORMATS)
            db.Exec(WeatherTest::OldWeatherTableSql(table.first, version));
        if (version < 0.2)
            db.Exec("CREATE TABLE VERSION_TABLE (dbVersion DOUBLE); INSERT INTO VERSION_TABLE VALUES (0.1);");
        db.Exec(
            "INSERT INTO CITY_TABLE (pageIndex, locationId, cityName, cityNameEng, countryName, "
            "isCurrentLocation, isDayTime, gmtOffset, refreshedTime, localTime, widgetReferenceCount, "
            "websiteUrl) "
            "VALUES (0, '226396', 'Seoul', 'Seoul', 'Korea', 0, 1, 9, 1700000000, 1700032400, 2, "
            "'http://a'), "
            "(1, '" +
            currentLocationId +
            "', 'Here', 'Here', 'Land', 1, 0, -3.5, 1700000100, 1699987500, 1, "
            "'http://b');");
        db.Exec(
            "INSERT INTO CURRENT_WEATHER_TABLE (FK_ID, weatherIcon, weatherStatus, curTemperature, "
            "lowTemperature, highTemperature, date, websiteUrl) VALUES (1, 3, 'Cloudy', 12.5, 8, 15, "
            "1700000000, "
            "'u'), (2, 1, 'Sunny', 25, 20, 30, 1700000100, 'v');");
        db.Exec("INSERT INTO EXTRA_WEATHER_TABLE (FK_ID, humidity, uvIndex) VALUES (1, 55, 3), (2, 80, 7);");
        db.Exec(
            "INSERT INTO HOURLY_WEATHER_TABLE (FK_ID, hourlyIndex, hour, weatherIcon, weatherStatus, "
            "curTemperature) VALUES (2, 0, 1700003600, 1, 'Sunny', 24), (2, 1, 1700007200, 2, 'Sunny', 23);");
        db.Exec(
            "CREATE TABLE CITY_REWRITES (locationId TEXT);"
            "CREATE TRIGGER CITY_REWRITTEN AFTER UPDATE ON CITY_TABLE "
            "BEGIN INSERT INTO CITY_REWRITES VALUES (NEW.locationId); END;");
    }

    void WriteVersion(double version)
    {
        MakeDBDir();
        RawDB db(VersionDBPath());
        db.Exec("CREATE TABLE VERSION_TABLE (dbVersion DOUBLE);");
        db.Exec("INSERT INTO VERSION_TABLE VALUES (" + std::to_string(version) + ");");
    }

    double StoredVersion()
    {
        return RawDB(VersionDBPath(), true).QueryDouble("SELECT dbVersion FROM VERSION_TABLE");
    }

    void ExpectCompleteColumns()
    {
        RawDB db(WeatherDBPath(), true);
        for (const auto& table : WeatherTest::WEATHER_TABLE_FORMATS)
        {
            std::string complete = WeatherTest::OldWeatherTableSql(table.first, 0.8);
            RawDB scratch(":memory:");
            scratch.Exec(complete);
            EXPECT_EQ(LowerCase(scratch.ColumnNames(table.first)), LowerCase(db.ColumnNames(table.first)))
                << table.first;
        }
    }

    void ExpectRowsKept()
    {
        RawDB db(WeatherDBPath(), true);
        EXPECT_EQ(
            "Seoul|Korea|2|Here|Land|1",
            db.QueryText(
                "SELECT a.cityName || '|' || a.countryName || '|' || a.widgetReferenceCount || '|' || "
                "b.cityName || '|' || b.countryName || '|' || b.widgetReferenceCount FROM CITY_TABLE a, "
                "CITY_TABLE b WHERE a.pageIndex = 0 AND b.pageIndex = 1"));
        EXPECT_EQ(2, db.QueryInt("SELECT COUNT(*) FROM CURRENT_WEATHER_TABLE"));
        EXPECT_EQ("55|80", db.QueryText("SELECT group_concat(humidity, '|') FROM (SELECT humidity FROM "
                                        "EXTRA_WEATHER_TABLE ORDER BY FK_ID)"));
        EXPECT_EQ(2, db.QueryInt("SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE WHERE FK_ID = 2"));
        EXPECT_DOUBLE_EQ(25.0,
                         db.QueryDouble("SELECT curTemperature FROM CURRENT_WEATHER_TABLE WHERE FK_ID = 2"));
    }
};

class UpgradeFromVersionTest : public UpgradeFixture, public ::testing::WithParamInterface<double>
{
};

TEST_P(UpgradeFromVersionTest, StartUpBringsTheOldFileToTheLatestSchema)
{
    double version = GetParam();
    MakeOldWeatherDB(version);
    // The oldest installations had no version file of their own.
    if (version > 0.0)
        WriteVersion(version);

    ASSERT_EQ(ERR_OK, DataStoreInitializer::Run());

    ExpectCompleteColumns();
    ExpectRowsKept();
    for (const StepLog& step : STEP_LOGS)
        EXPECT_EQ(version < step.belowVersion ? 1 : 0, mLog.Count(step.line)) << step.line << "\n"
                                                                              << mLog.Dump();
    EXPECT_EQ(version < 0.8 ? 1 : 0, mLog.Count("Need to upgrade DB : CurrentVersion[")) << mLog.Dump();

    RawDB db(WeatherDBPath(), true);
    EXPECT_EQ("", db.TableSql("VERSION_TABLE"));
    bool migrates = version < 0.7;
    EXPECT_EQ(migrates ? "2-1234:C" : "2-1234",
              db.QueryText("SELECT locationId FROM CITY_TABLE WHERE isCurrentLocation = 1"));
    EXPECT_EQ(migrates ? "2-1234:C" : "", db.QueryText("SELECT group_concat(locationId) FROM CITY_REWRITES"));
    EXPECT_EQ("226396", db.QueryText("SELECT locationId FROM CITY_TABLE WHERE pageIndex = 0"));

    EXPECT_DOUBLE_EQ(0.8, StoredVersion());
    EXPECT_EQ(1, RawDB(VersionDBPath(), true).QueryInt("SELECT COUNT(*) FROM VERSION_TABLE"));
}

INSTANTIATE_TEST_SUITE_P(OldInstallations, UpgradeFromVersionTest,
                         ::testing::Values(0.0, 0.1, 0.3, 0.7, 0.8));

TEST_F(UpgradeFixture, CurrentLocationIdWithSuffixIsNotRewritten)
{
    MakeOldWeatherDB(0.6, "2-1234:C");
    WriteVersion(0.6);
    ASSERT_EQ(ERR_OK, DataStoreInitializer::Run());
    RawDB db(WeatherDBPath(), true);
    EXPECT_EQ("2-1234:C", db.QueryText("SELECT locationId FROM CITY_TABLE WHERE isCurrentLocation = 1"));
    EXPECT_EQ(0, db.QueryInt("SELECT COUNT(*) FROM CITY_REWRITES"));
    EXPECT_DOUBLE_EQ(0.8, StoredVersion());
}

TEST_F(UpgradeFixture, NewerVersionIsLeftAlone)
{
    MakeOldWeatherDB(0.8);
    WriteVersion(0.9);
    UpgradeDBController controller;
    EXPECT_FALSE(controller.IsNeedToUpgrade());
    controller.UpgradeIfNeeded();
    EXPECT_FALSE(mLog.Contains("UpgradeDBTables")) << mLog.Dump();
    EXPECT_DOUBLE_EQ(0.9, StoredVersion());
}

TEST_F(UpgradeFixture, UnopenableWeatherDatabaseLeavesTheVersionForTheNextStart)
{
    WriteVersion(0.3);
    // A folder where the file should be: SQLite cannot open it.
    ASSERT_EQ(0, mkdir(WeatherDBPath().c_str(), 0755));

    DataStoreInitializer::Run();
    EXPECT_TRUE(mLog.Contains("/.weather.db for writing")) << mLog.Dump();
    EXPECT_EQ(1, mLog.Count("UpgradeDBTables < 0.4 : ")) << mLog.Dump();
    EXPECT_EQ(0, mLog.Count("UpgradeDBTables < 0.5 : ")) << mLog.Dump();
    EXPECT_DOUBLE_EQ(0.3, StoredVersion());

    // Once the file can be opened, the remaining steps run.
    ASSERT_EQ(0, rmdir(WeatherDBPath().c_str()));
    MakeOldWeatherDB(0.3);
    mLog.Clear();
    ASSERT_EQ(ERR_OK, DataStoreInitializer::Run());
    EXPECT_EQ(1, mLog.Count("UpgradeDBTables < 0.5 : ")) << mLog.Dump();
    ExpectCompleteColumns();
    EXPECT_DOUBLE_EQ(0.8, StoredVersion());
}

TEST_F(UpgradeFixture, UnreadableVersionDatabaseCountsAsVersionZero)
{
    MakeDBDir();
    EXPECT_DOUBLE_EQ(0.0, VersionDBController().GetCurrentDBVersion());
    EXPECT_TRUE(mLog.Contains("/.version.db for reading")) << mLog.Dump();
    UpgradeDBController controller;
    EXPECT_TRUE(controller.IsNeedToUpgrade());
    EXPECT_DOUBLE_EQ(0.0, controller.GetCurrentVersion());
    EXPECT_DOUBLE_EQ(0.8, controller.GetLatestVersion());
}

}  // namespace

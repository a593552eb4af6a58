#include "DataStoreInitializer.h"
#include "Setting.h"
#include "DBTestSupport.h"
#include "WeatherDefine.h"

#include <cstdlib>

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{

constexpr const char* SETTING_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (CurrentCityIndex INT, CurrentCityLocationId TEXT,TemperatureUnit INT, "
    "LastRefreshedTime INT64, CurrentLocationAreaRefreshedTime INT64, IsFirstLaunch INT, AutoRefreshOn INT, "
    "AutoRefreshInterval INT, UseCurrentLocationOn INT, ShowCurrentCityAgreement INT, RefreshOnOpeningOn "
    "INT, "
    "RefreshOnOpeningOnAgreement INT, NotificationOn INT, NotificationTime INT64, "
    "NetworkPositionPopupAgreement "
    "INT, ShowNetworkPopup INT, ChinaDataGPSPerformPopupOn INT, AutoScrollOn INT, AutoScrollInterval INT, "
    "LastUpdateLanguageCode TEXT, CpType TEXT, DaemonType TEXT, IsNowRefreshing INT, IsSupportManualRefresh "
    "INT, "
    "RefreshingStartTime INT64);";
constexpr const char* VERSION_FORMAT = "CREATE TABLE IF NOT EXISTS %s (dbVersion DOUBLE);";

// User tables of a database file, without SQLite's own.
std::vector<std::string> TableNames(RawDB& db)
{
    return db.QueryTexts(
        "SELECT name FROM sqlite_master WHERE type = 'table' AND name NOT LIKE 'sqlite_%' "
        "ORDER BY name");
}

class DataStoreInitializerTest : public WeatherTest::StoreTest
{
};

TEST_F(DataStoreInitializerTest, FreshRootGetsFourDatabasesWithTheirTablesAndDefaults)
{
    ASSERT_EQ(ERR_OK, DataStoreInitializer::Run());

    RawDB weather(WeatherDBPath(), true);
    ASSERT_TRUE(weather.GetIsOpen());
    // Their exact texts are pinned by the table statement tests.
    EXPECT_EQ((std::vector<std::string>{"CITY_TABLE", "CURRENT_WEATHER_TABLE", "EXTRA_WEATHER_TABLE",
                                        "HOURLY_WEATHER_TABLE", "MOON_PHASE_TABLE", "WEEKLY_WEATHER_TABLE"}),
              TableNames(weather));

    RawDB setting(SettingDBPath(), true);
    EXPECT_EQ(std::vector<std::string>{"SETTING_TABLE"}, TableNames(setting));
    EXPECT_EQ(WeatherTest::StoredCreateSql(SETTING_FORMAT, "SETTING_TABLE"),
              setting.TableSql("SETTING_TABLE"));

    EXPECT_EQ(0, RawDB(ShareTargetDBPath(), true).QueryInt("SELECT COUNT(*) FROM SHARE_TARGET_TABLE"));

    RawDB version(VersionDBPath(), true);
    EXPECT_EQ(std::vector<std::string>{"VERSION_TABLE"}, TableNames(version));
    EXPECT_EQ(WeatherTest::StoredCreateSql(VERSION_FORMAT, "VERSION_TABLE"),
              version.TableSql("VERSION_TABLE"));

    EXPECT_EQ("1|Accuweather|RI_DAEMON|6|1|en",
              setting.QueryText("SELECT COUNT(*) || '|' || max(CpType) || '|' || max(DaemonType) || '|' || "
                                "max(AutoRefreshInterval) || '|' || max(TemperatureUnit) || '|' || "
                                "max(LastUpdateLanguageCode) FROM SETTING_TABLE"));
    EXPECT_EQ(1, version.QueryInt("SELECT COUNT(*) FROM VERSION_TABLE"));
    EXPECT_DOUBLE_EQ(0.8, version.QueryDouble("SELECT dbVersion FROM VERSION_TABLE"));
    // A new installation runs every step once against complete tables.
    EXPECT_EQ(1, mLog.Count("Need to upgrade DB : CurrentVersion[0.0], LastestVersion[0.8]")) << mLog.Dump();
    EXPECT_EQ(1, mLog.Count("UpgradeDBTables < 0.8 : ")) << mLog.Dump();
}

TEST_F(DataStoreInitializerTest, SecondStartChangesNothing)
{
    ASSERT_EQ(ERR_OK, DataStoreInitializer::Run());
    RawDB(SettingDBPath()).Exec("UPDATE SETTING_TABLE SET CpType = 'Kweather'");
    mLog.Clear();

    ASSERT_EQ(ERR_OK, DataStoreInitializer::Run());
    EXPECT_FALSE(mLog.Contains("Need to upgrade DB")) << mLog.Dump();
    EXPECT_FALSE(mLog.Contains("UpgradeDBTables")) << mLog.Dump();
    EXPECT_EQ("Kweather", RawDB(SettingDBPath()).QueryText("SELECT CpType FROM SETTING_TABLE"));
    EXPECT_EQ(1, RawDB(SettingDBPath()).QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
    EXPECT_EQ(1, RawDB(VersionDBPath()).QueryInt("SELECT COUNT(*) FROM VERSION_TABLE"));
}

TEST_F(DataStoreInitializerTest, UnknownSharedFolderFailsWithoutCrash)
{
    // Without the weather application's folders no path can be built.
    std::string sharedData = mRoot.SharedDataDir();
    ASSERT_EQ(0, system(("rm -r '" + mRoot.Path("apps/com.quorvex.weather-m") + "'").c_str()));
    EXPECT_EQ(ERR_FAIL, DataStoreInitializer::Run());
    EXPECT_FALSE(WeatherTest::FileExists(sharedData));
    EXPECT_TRUE(mLog.Contains("(directoryPath.length() < 1) [return]")) << mLog.Dump();
}

}  // namespace

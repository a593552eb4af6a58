#include <cstdlib>
#include <vector>

#include <sys/stat.h>

#include "DBController.h"
#include "IconMappingTable.h"
#include "SettingsTestSupport.h"

using namespace NSWeather;
using SettingsTest::RawDB;

namespace
{

class IconMappingTableTest : public SettingsTest::SettingsFixture
{
protected:
    void SetUp() override { InitializeSettings(); }

    void UseProvider(const std::string& cpType, const std::string& daemonType = "RI_DAEMON")
    {
        SetSettingColumn("CpType", "'" + cpType + "'");
        SetSettingColumn("DaemonType", "'" + daemonType + "'");
    }

    static int Map(int iconNum, bool isDayTime) { return IconMappingTable().GetMappingIconNum(iconNum, isDayTime); }
};

// The widget's own resources: the icon database built with the program.
class WeatherNewsIconTest : public IconMappingTableTest
{
protected:
    void SetUp() override
    {
        IconMappingTableTest::SetUp();
        setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-widget", 1);
        UseProvider("WeatherNews");
    }
    void TearDown() override { unsetenv("PLATFORM_APP_ID"); }
};

TEST_F(IconMappingTableTest, AccuWeatherDaemonTypeChoosesTheTable)
{
    UseProvider("Accuweather", "RI_DAEMON");
    EXPECT_EQ(8, Map(16, true));
    EXPECT_EQ(10, Map(20, true));
    EXPECT_EQ(18, Map(34, false));
    EXPECT_EQ(1, Map(34, true));

    for (const char* other : {"OTHER_DAEMON", "", "ri_daemon"})
    {
        UseProvider("Accuweather", other);
        EXPECT_EQ(9, Map(16, true)) << other;
        EXPECT_EQ(11, Map(20, true)) << other;
        EXPECT_EQ(19, Map(34, false)) << other;
        EXPECT_EQ(2, Map(34, true)) << other;
    }
}

TEST_F(IconMappingTableTest, AccuWeatherTablesAgreeAwayFromTheThreeNumbers)
{
    auto mapAll = [](std::vector<int>& day, std::vector<int>& night) {
        for (int n = 0; n < 45; ++n)
        {
            day.push_back(Map(n, true));
            night.push_back(Map(n, false));
        }
    };
    std::vector<int> riDay, riNight, otherDay, otherNight;
    UseProvider("Accuweather", "RI_DAEMON");
    mapAll(riDay, riNight);
    UseProvider("Accuweather", "OTHER_DAEMON");
    mapAll(otherDay, otherNight);
    for (int n = 0; n < 45; ++n)
    {
        if (n == 16 || n == 20 || n == 34)
            EXPECT_NE(riNight[n], otherNight[n]) << n;
        else
            EXPECT_TRUE(riDay[n] == otherDay[n] && riNight[n] == otherNight[n]) << n;
    }
}

TEST_F(IconMappingTableTest, DayAndNightTwins)
{
    UseProvider("Accuweather");
    EXPECT_EQ(1, Map(1, true));
    EXPECT_EQ(18, Map(1, false));
    EXPECT_EQ(1, Map(33, true));
    EXPECT_EQ(18, Map(33, false));
    EXPECT_EQ(19, Map(35, false));
    EXPECT_EQ(2, Map(35, true));
    EXPECT_EQ(2, Map(3, true));
    EXPECT_EQ(19, Map(3, false));
    // Numbers without a twin are the same by day and night.
    EXPECT_EQ(12, Map(22, false));
    EXPECT_EQ(0, Map(9, false));
}

TEST_F(IconMappingTableTest, AccuWeatherBounds)
{
    UseProvider("Accuweather");
    EXPECT_EQ(12, Map(44, true));
    EXPECT_EQ(0, Map(45, true));
    EXPECT_EQ(0, Map(-1, false));
    EXPECT_EQ(2, mLog.Count("(iconNum >= ACCUWEATHER_ICON_ID_MAX || iconNum < 0) [return]")) << mLog.Dump();
}

TEST_F(IconMappingTableTest, CmaWeatherTableAndBounds)
{
    UseProvider("cmaweather");
    EXPECT_EQ(18, Map(0, false));
    EXPECT_EQ(1, Map(0, true));
    EXPECT_EQ(20, Map(5, true));
    EXPECT_EQ(22, Map(31, true));
    EXPECT_EQ(0, Map(32, true));
    EXPECT_EQ(0, Map(52, true));
    EXPECT_EQ(5, Map(53, true));
    EXPECT_FALSE(mLog.Contains("CMAWEATHER_ICON_ID_MAX"));
    EXPECT_EQ(0, Map(54, true));
    EXPECT_EQ(0, Map(-1, true));
    EXPECT_EQ(2, mLog.Count("(iconNum >= CMAWEATHER_ICON_ID_MAX || iconNum < 0) [return]")) << mLog.Dump();
}

TEST_F(IconMappingTableTest, KWeatherTableServesBothKoreanProviders)
{
    for (const char* cpType : {"Kweather", "weathernews_kr"})
    {
        UseProvider(cpType);
        mLog.Clear();
        EXPECT_EQ(18, Map(1, false)) << cpType;
        EXPECT_EQ(2, Map(2, true)) << cpType;
        EXPECT_EQ(8, Map(39, true)) << cpType;
        EXPECT_EQ(5, Map(40, true)) << cpType;
        EXPECT_EQ(0, Map(41, true)) << cpType;
        EXPECT_EQ(0, Map(-1, false)) << cpType;
        EXPECT_EQ(2, mLog.Count("(iconNum >= KWEATHER_ICON_ID_MAX || iconNum < 0) [return]")) << mLog.Dump();
    }
}

TEST_F(IconMappingTableTest, AccuWeatherWithoutSettingRowGivesNoIcon)
{
    RawDB(SettingDBPath()).Exec("DELETE FROM SETTING_TABLE");
    EXPECT_EQ(0, Map(1, true));
    EXPECT_TRUE(mLog.Contains("(!settingPtr) [return]")) << mLog.Dump();
}

TEST_F(WeatherNewsIconTest, ShippedDatabaseGivesDayAndNightNumbers)
{
    mRoot.UseBuildResources();
    EXPECT_EQ(1, Map(100, true));
    EXPECT_EQ(18, Map(100, false));
    EXPECT_EQ(2, Map(101, true));
    EXPECT_EQ(19, Map(101, false));
    EXPECT_EQ(12, Map(400, true));
    EXPECT_EQ(1, DBController().GetWeatherNewsIcon(100, true));
}

TEST_F(WeatherNewsIconTest, UnknownProviderNumberGivesNoIcon)
{
    mRoot.UseBuildResources();
    EXPECT_EQ(0, Map(999, true));
    EXPECT_EQ(0, Map(-5, false));
    EXPECT_EQ(2, mLog.Count("No result : 101")) << mLog.Dump();
}

TEST_F(WeatherNewsIconTest, MissingDatabaseIsReportedAndNotCreated)
{
    std::string iconDB = mRoot.Path("apps/com.quorvex.weather-m-widget/res/data/weathernews_icon.db");
    EXPECT_EQ(0, Map(100, true));
    EXPECT_TRUE(mLog.Contains("sqlite3_open_open failed.")) << mLog.Dump();
    EXPECT_FALSE(SettingsTest::FileExists(iconDB));

    // An empty file in its place has no icon table.
    mkdir(mRoot.Path("apps/com.quorvex.weather-m-widget/res/data").c_str(), 0755);
    SettingsTest::WriteFileBytes(iconDB, "");
    EXPECT_EQ(0, Map(100, true));
    EXPECT_TRUE(mLog.Contains("Fail: sqlite3_prepare_v2 Failed rc [1][no such table: icon_table]")) << mLog.Dump();
}

TEST_F(WeatherNewsIconTest, UnknownResourceFolderGivesNoIcon)
{
    unsetenv("PLATFORM_APP_ID");
    EXPECT_EQ(0, Map(100, true));
    EXPECT_TRUE(mLog.Contains("(iconDBPath.length() < 1) [return]")) << mLog.Dump();
}

TEST(WeatherNewsIconDatabase, EveryRowMapsToAWidgetIcon)
{
    RawDB db(WeatherTest::BuildDir() + "/res/com.quorvex.weather-m-widget/res/data/weathernews_icon.db", true);
    ASSERT_TRUE(db.GetIsOpen());
    EXPECT_GT(db.QueryInt("SELECT COUNT(*) FROM icon_table"), 40);
    EXPECT_EQ(0, db.QueryInt("SELECT COUNT(*) FROM icon_table WHERE typeof(icon_id) <> 'integer' OR "
                             "typeof(day_mapping_id) <> 'integer' OR typeof(night_mapping_id) <> 'integer' OR "
                             "day_mapping_id NOT BETWEEN 1 AND 22 OR night_mapping_id NOT BETWEEN 1 AND 22"));
    // Night rows never show the sun, day rows never the night sky.
    EXPECT_EQ(0, db.QueryInt("SELECT COUNT(*) FROM icon_table WHERE night_mapping_id IN (1, 2, 7, 9, 11) OR "
                             "day_mapping_id IN (18, 19)"));
}

}  // namespace

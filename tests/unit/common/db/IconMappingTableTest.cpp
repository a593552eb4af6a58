#include <cstdlib>
#include <vector>

#include <sys/stat.h>

#include "DBController.h"
#include "IconMappingTable.h"
#include "DBTestSupport.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{

class IconMappingTableTest : public WeatherTest::StoreTest
{
protected:
    void SetUp() override { InitializeSettings(); }

    void UseProvider(const std::string& cpType, const std::string& daemonType = "RI_DAEMON")
    {
        SetSettingColumn("CpType", "'" + cpType + "'");
        SetSettingColumn("DaemonType", "'" + daemonType + "'");
    }

    static int Map(int iconNum, bool isDayTime)
    {
        return IconMappingTable().GetMappingIconNum(iconNum, isDayTime);
    }
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

struct MappingCase
{
    const char* cpType;
    const char* daemonType;
    int iconNum;
    bool isDayTime;
    int expected;
};

// Table values, both AccuWeather tables where they differ, the day/night
// twins and the first number past each table.
const MappingCase MAPPING_CASES[] = {
    {"Accuweather", "RI_DAEMON", 16, true, 8},    {"Accuweather", "OTHER_DAEMON", 16, true, 9},
    {"Accuweather", "RI_DAEMON", 20, false, 10},  {"Accuweather", "", 20, false, 11},
    {"Accuweather", "RI_DAEMON", 34, false, 18},  {"Accuweather", "ri_daemon", 34, false, 19},
    {"Accuweather", "RI_DAEMON", 34, true, 1},    {"Accuweather", "OTHER_DAEMON", 34, true, 2},
    {"Accuweather", "RI_DAEMON", 1, false, 18},   {"Accuweather", "RI_DAEMON", 33, true, 1},
    {"Accuweather", "RI_DAEMON", 35, false, 19},  {"Accuweather", "RI_DAEMON", 3, true, 2},
    {"Accuweather", "RI_DAEMON", 22, false, 12},  {"Accuweather", "RI_DAEMON", 9, true, 0},
    {"Accuweather", "RI_DAEMON", 44, true, 12},   {"Accuweather", "RI_DAEMON", 45, true, 0},
    {"Accuweather", "RI_DAEMON", -1, false, 0},   {"cmaweather", "RI_DAEMON", 0, false, 18},
    {"cmaweather", "RI_DAEMON", 0, true, 1},      {"cmaweather", "RI_DAEMON", 5, true, 20},
    {"cmaweather", "RI_DAEMON", 31, true, 22},    {"cmaweather", "RI_DAEMON", 32, true, 0},
    {"cmaweather", "RI_DAEMON", 53, true, 5},     {"cmaweather", "RI_DAEMON", 54, true, 0},
    {"cmaweather", "RI_DAEMON", -1, true, 0},     {"Kweather", "RI_DAEMON", 1, false, 18},
    {"Kweather", "RI_DAEMON", 39, true, 8},       {"Kweather", "RI_DAEMON", 40, true, 5},
    {"Kweather", "RI_DAEMON", 41, true, 0},       {"Kweather", "RI_DAEMON", -1, false, 0},
    {"weathernews_kr", "RI_DAEMON", 2, true, 2},  {"weathernews_kr", "RI_DAEMON", 2, false, 19},
    {"weathernews_kr", "RI_DAEMON", 41, true, 0}, {"weathernews_kr", "RI_DAEMON", -1, true, 0},
};

TEST_F(IconMappingTableTest, FixedTablesByProvider)
{
    for (const MappingCase& c : MAPPING_CASES)
    {
        UseProvider(c.cpType, c.daemonType);
        EXPECT_EQ(c.expected, Map(c.iconNum, c.isDayTime))
            << c.cpType << "/" << c.daemonType << " " << c.iconNum << (c.isDayTime ? " day" : " night");
    }
    // Each number past a table is reported once, in its provider's words.
    EXPECT_EQ(2, mLog.Count("(iconNum >= ACCUWEATHER_ICON_ID_MAX || iconNum < 0) [return]")) << mLog.Dump();
    EXPECT_EQ(2, mLog.Count("(iconNum >= CMAWEATHER_ICON_ID_MAX || iconNum < 0) [return]")) << mLog.Dump();
    EXPECT_EQ(4, mLog.Count("(iconNum >= KWEATHER_ICON_ID_MAX || iconNum < 0) [return]")) << mLog.Dump();
}

TEST_F(IconMappingTableTest, AccuWeatherTablesAgreeAwayFromTheThreeNumbers)
{
    auto mapAll = [](std::vector<int>& day, std::vector<int>& night)
    {
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

TEST_F(IconMappingTableTest, AccuWeatherWithoutSettingRowGivesNoIcon)
{
    RawDB(SettingDBPath()).Exec("DELETE FROM SETTING_TABLE");
    EXPECT_EQ(0, Map(1, true));
    EXPECT_TRUE(mLog.Contains("(!settingPtr) [return]")) << mLog.Dump();
}

TEST_F(WeatherNewsIconTest, ShippedDatabaseGivesDayAndNightNumbers)
{
    mRoot.UseBuildResources();
    const int cases[][3] = {{100, true, 1},
                            {100, false, 18},
                            {101, true, 2},
                            {101, false, 19},
                            {400, true, 12},
                            // Numbers the provider does not know give no icon.
                            {999, true, 0},
                            {-5, false, 0}};
    for (const auto& c : cases) EXPECT_EQ(c[2], Map(c[0], c[1])) << c[0] << (c[1] ? " day" : " night");
    EXPECT_EQ(1, DBController().GetWeatherNewsIcon(100, true));
}

TEST_F(WeatherNewsIconTest, MissingDatabaseIsReportedAndNotCreated)
{
    std::string iconDB = mRoot.Path("apps/com.quorvex.weather-m-widget/res/data/weathernews_icon.db");
    EXPECT_EQ(0, Map(100, true));
    EXPECT_TRUE(mLog.Contains("sqlite3_open_open failed.")) << mLog.Dump();
    EXPECT_FALSE(WeatherTest::FileExists(iconDB));

    // An empty file in its place has no icon table.
    mkdir(mRoot.Path("apps/com.quorvex.weather-m-widget/res/data").c_str(), 0755);
    WeatherTest::WriteText(iconDB, "");
    EXPECT_EQ(0, Map(100, true));
    EXPECT_TRUE(mLog.Contains("Fail: sqlite3_prepare_v2 Failed rc [1][no such table: icon_table]"))
        << mLog.Dump();

    // Without its own app id the widget knows no resource folder.
    unsetenv("PLATFORM_APP_ID");
    EXPECT_EQ(0, Map(100, true));
}

TEST(WeatherNewsIconDatabase, EveryRowMapsToAWidgetIcon)
{
    RawDB db(WeatherTest::BuildDir() + "/res/com.quorvex.weather-m-widget/res/data/weathernews_icon.db",
             true);
    ASSERT_TRUE(db.GetIsOpen());
    EXPECT_GT(db.QueryInt("SELECT COUNT(*) FROM icon_table"), 40);
    EXPECT_EQ(0,
              db.QueryInt("SELECT COUNT(*) FROM icon_table WHERE typeof(icon_id) <> 'integer' OR "
                          "typeof(day_mapping_id) <> 'integer' OR typeof(night_mapping_id) <> 'integer' OR "
                          "day_mapping_id NOT BETWEEN 1 AND 22 OR night_mapping_id NOT BETWEEN 1 AND 22"));
    // Night rows never show the sun, day rows never the night sky.
    EXPECT_EQ(0, db.QueryInt("SELECT COUNT(*) FROM icon_table WHERE night_mapping_id IN (1, 2, 7, 9, 11) OR "
                             "day_mapping_id IN (18, 19)"));
}

}  // namespace

#include "ContentProvider.h"
#include "DataStoreInitializer.h"
#include "IconMappingTable.h"
#include "SettingDBController.h"
#include "DBTestSupport.h"
#include "ShareTargetDBController.h"
#include "VersionDBController.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::RandomBytes;
using WeatherTest::RawDB;

namespace
{

class BadInputTest : public WeatherTest::StoreTest
{
protected:
    // Every reader of the settings gives its empty value.
    void ExpectEmptyReadings()
    {
        EXPECT_FALSE(SettingDBController().Select());
        EXPECT_EQ(CP_ACCUWEATHER, ContentProvider::GetContentProvider());
        EXPECT_EQ("weather_logo_accuweather.png", ContentProvider::GetCPLogoIconPath(1));
        for (int iconNum : {1, 16, 33})
            EXPECT_EQ(0, IconMappingTable().GetMappingIconNum(iconNum, true)) << iconNum;
    }
};

TEST_F(BadInputTest, SettingsFileOfRandomBytesIsReadAsAbsentAndKept)
{
    MakeDBDir();
    for (unsigned seed : {1u, 2u, 3u})
    {
        std::string garbage = RandomBytes(4096, seed);
        WeatherTest::WriteText(SettingDBPath(), garbage);

        ExpectEmptyReadings();
        EXPECT_EQ(ERR_FAIL, SettingDBController().Initialize());
        SettingDBController().Update(std::make_shared<Setting>());
        SettingDBController().UpdateLocationIdOfDisplayCity("x");
        EXPECT_EQ(ERR_FAIL, DataStoreInitializer::Run());
        EXPECT_EQ(garbage, WeatherTest::ReadText(SettingDBPath())) << "seed " << seed;
    }
}

TEST_F(BadInputTest, SettingTableOfAForeignSchemaIsReadAsAbsent)
{
    MakeDBDir();
    {
        RawDB db(SettingDBPath());
        db.Exec(
            "CREATE TABLE SETTING_TABLE (name TEXT, value TEXT);"
            "INSERT INTO SETTING_TABLE VALUES ('CpType', 'WeatherNews');");
    }
    ExpectEmptyReadings();
    EXPECT_EQ(ERR_OK, SettingDBController().Initialize());
    SettingDBController().Update(std::make_shared<Setting>());
    ExpectEmptyReadings();
    RawDB db(SettingDBPath(), true);
    EXPECT_EQ("CpType=WeatherNews",
              db.QueryText("SELECT group_concat(name || '=' || value) FROM SETTING_TABLE"));
}

TEST_F(BadInputTest, EmptyForeignSettingTableTakesNoRowAndSaysSo)
{
    MakeDBDir();
    RawDB(SettingDBPath()).Exec("CREATE TABLE SETTING_TABLE (name TEXT, value TEXT);");
    EXPECT_EQ(ERR_FAIL, SettingDBController().Initialize());
    ExpectEmptyReadings();
}

TEST_F(BadInputTest, OtherDatabasesOfRandomBytesDoNotStopTheStart)
{
    MakeDBDir();
    std::string garbage = RandomBytes(2048, 7);
    WeatherTest::WriteText(ShareTargetDBPath(), garbage);
    WeatherTest::WriteText(VersionDBPath(), garbage);

    DataStoreInitializer::Run();
    EXPECT_EQ(garbage, WeatherTest::ReadText(ShareTargetDBPath()));
    EXPECT_EQ(garbage, WeatherTest::ReadText(VersionDBPath()));
    EXPECT_FALSE(ShareTargetDBController().Select());
    EXPECT_DOUBLE_EQ(0.0, VersionDBController().GetCurrentDBVersion());
    // The settings are still usable.
    EXPECT_EQ("Accuweather", SettingDBController().Select()->GetCpType());
}

}  // namespace

#include "ContentProvider.h"

#include "FileUtil.h"
#include "SettingDBController.h"
#include "TestDB.h"
#include "TestPlatform.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace
{

class ContentProviderTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        FileUtil::ClearCache();
        FileUtil::MakeDirectory(mRoot.SharedDataDir() + "db");
        ASSERT_EQ(ERR_OK, SettingDBController().Initialize());
    }
    void TearDown() override { FileUtil::ClearCache(); }
    WeatherTest::RawDB SettingDB() const
    {
        return WeatherTest::RawDB(mRoot.SharedDataDir() + "db/.setting.db");
    }
    void SetCpType(const std::string& cpType)
    {
        SettingDB().Exec("UPDATE SETTING_TABLE SET CpType = '" + cpType + "'");
    }
};

// The stored text is matched exactly; anything else is AccuWeather.
TEST_F(ContentProviderTest, StoredTextPicksProviderAndLogo)
{
    const char* const accu[] = {"weather_logo_accuweather_02.png", "weather_logo_accuweather.png",
                                "weather_box_logo_accuweather.png", "weather_box_logo_accuweather.png"};
    const char* const none[] = {"", "", "", ""};
    const struct
    {
        const char* cpType;
        int code;
        const char* const* logos;  // styles 0, 1, 2, -1
    } cases[] = {
        {"Accuweather", CP_ACCUWEATHER, accu},    {"cmaweather", CP_CMAWEATHER, accu},
        {"Kweather", CP_KWEATHER, none},          {"weathernews_kr", CP_WEATHERNEWS_KR, none},
        {"WeatherNews", CP_WEATHERNEWS, none},    {"", CP_ACCUWEATHER, accu},
        {"kweather", CP_ACCUWEATHER, accu},       {"Kweather ", CP_ACCUWEATHER, accu},
        {"WeatherNews_kr", CP_ACCUWEATHER, accu},
    };
    for (const auto& c : cases)
    {
        SettingDB().Exec(std::string("UPDATE SETTING_TABLE SET CpType = '") + c.cpType + "'");
        EXPECT_EQ(c.code, ContentProvider::GetContentProvider()) << "'" << c.cpType << "'";
        for (int style : {0, 1, 2, -1})
            EXPECT_EQ(c.logos[style < 0 ? 3 : style], ContentProvider::GetCPLogoIconPath(style))
                << "'" << c.cpType << "' style " << style;
    }
}

TEST_F(ContentProviderTest, MissingSettingRowFallsBackToAccuWeather)
{
    SettingDB().Exec("DELETE FROM SETTING_TABLE");
    EXPECT_EQ(CP_ACCUWEATHER, ContentProvider::GetContentProvider());
    EXPECT_EQ("weather_logo_accuweather.png", ContentProvider::GetCPLogoIconPath(1));
    EXPECT_TRUE(mLog.Contains("(!settingPtr) [return]")) << mLog.Dump();
}

// Inside a rebuild the provider is read once; a change by another process
// shows once the outermost scope has ended, and at once outside any scope.
TEST_F(ContentProviderTest, RebuildScopeReadsTheProviderOnce)
{
    SetCpType("Kweather");
    {
        ContentProvider::RebuildScope outer;
        EXPECT_EQ(CP_KWEATHER, ContentProvider::GetContentProvider());
        SetCpType("WeatherNews");
        {
            ContentProvider::RebuildScope inner;
            EXPECT_EQ(CP_KWEATHER, ContentProvider::GetContentProvider());
        }
        EXPECT_EQ(CP_KWEATHER, ContentProvider::GetContentProvider());
    }
    EXPECT_EQ(CP_WEATHERNEWS, ContentProvider::GetContentProvider());
    ContentProvider::RebuildScope next;
    SetCpType("cmaweather");
    EXPECT_EQ(CP_CMAWEATHER, ContentProvider::GetContentProvider());
}

}  // namespace

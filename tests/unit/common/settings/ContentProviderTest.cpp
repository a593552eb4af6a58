#include "ContentProvider.h"
#include "SettingDBController.h"
#include "SettingsTestSupport.h"

using namespace NSWeather;

namespace
{

class ContentProviderTest : public SettingsTest::SettingsFixture
{
protected:
    void SetUp() override { InitializeSettings(); }
    void SetCpType(const std::string& cpType) { SetSettingColumn("CpType", "'" + cpType + "'"); }
};

TEST_F(ContentProviderTest, EachKnownTextGivesItsCode)
{
    const std::pair<const char*, int> cases[] = {
        {"Accuweather", CP_ACCUWEATHER},    {"cmaweather", CP_CMAWEATHER},
        {"Kweather", CP_KWEATHER},          {"weathernews_kr", CP_WEATHERNEWS_KR},
        {"WeatherNews", CP_WEATHERNEWS},    {"", CP_ACCUWEATHER},
        {"kweather", CP_ACCUWEATHER},       {"Kweather ", CP_ACCUWEATHER},
        {"WeatherNews_kr", CP_ACCUWEATHER},
    };
    for (const auto& c : cases)
    {
        SetCpType(c.first);
        EXPECT_EQ(c.second, ContentProvider::GetContentProvider()) << "CpType '" << c.first << "'";
    }
}

TEST_F(ContentProviderTest, AccuWeatherAndCmaShowTheLogoByStyle)
{
    for (const char* cpType : {"Accuweather", "cmaweather"})
    {
        SetCpType(cpType);
        EXPECT_EQ("weather_logo_accuweather_02.png", ContentProvider::GetCPLogoIconPath(0)) << cpType;
        EXPECT_EQ("weather_logo_accuweather.png", ContentProvider::GetCPLogoIconPath(1)) << cpType;
        EXPECT_EQ("weather_box_logo_accuweather.png", ContentProvider::GetCPLogoIconPath(2)) << cpType;
        EXPECT_EQ("weather_box_logo_accuweather.png", ContentProvider::GetCPLogoIconPath(-1)) << cpType;
    }
}

TEST_F(ContentProviderTest, OtherProvidersShowNoLogo)
{
    for (const char* cpType : {"Kweather", "weathernews_kr", "WeatherNews"})
    {
        SetCpType(cpType);
        for (int style : {0, 1, 2})
            EXPECT_EQ("", ContentProvider::GetCPLogoIconPath(style)) << cpType << " style " << style;
    }
    EXPECT_TRUE(mLog.Contains("we don't need to display the cp logo")) << mLog.Dump();
}

TEST_F(ContentProviderTest, MissingSettingRowFallsBackToAccuWeather)
{
    SettingsTest::RawDB(SettingDBPath()).Exec("DELETE FROM SETTING_TABLE");
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

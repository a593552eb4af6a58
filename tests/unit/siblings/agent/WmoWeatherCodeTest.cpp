#include "ContentProvider.h"
#include "IconMappingTable.h"
#include "SettingDBController.h"
#include "SiblingTestSupport.h"
#include "WmoWeatherCode.h"

using namespace NSWeather;

namespace
{

class WmoWeatherCodeTest : public SiblingTest::SiblingFixture
{
};

struct Picture
{
    int code;
    int day;  // widget condition by day and by night
    int night;
};

// Every code Open-Meteo sends and the picture the widget should show.
const Picture PICTURES[] = {
    {0, 1, 18},   {1, 1, 18},   {2, 2, 19},   {3, 3, 3},    {45, 5, 5},   {48, 5, 5},   {51, 6, 6},
    {53, 6, 6},   {55, 6, 6},   {56, 13, 13}, {57, 13, 13}, {61, 4, 4},   {63, 4, 4},   {65, 4, 4},
    {66, 13, 13}, {67, 13, 13}, {71, 12, 12}, {73, 12, 12}, {75, 12, 12}, {77, 12, 12}, {80, 7, 6},
    {81, 7, 6},   {82, 7, 6},   {85, 11, 12}, {86, 11, 12}, {95, 8, 8},   {96, 8, 8},   {99, 8, 8},
};

struct Provider
{
    const char* cpType;
    const char* daemonType;
};

const Provider PROVIDERS[] = {
    {"Accuweather", ""}, {"Accuweather", "RI_DAEMON"}, {"cmaweather", ""},
    {"Kweather", ""},    {"weathernews_kr", ""},       {"WeatherNews", ""},
};

// The widget's own icon tables (and the shipped WeatherNews database) turn
// each provider's number back into the intended picture.
TEST_F(WmoWeatherCodeTest, EveryCodeShowsItsPictureWithEveryProviderByDayAndNight)
{
    setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-widget", 1);
    for (const Provider& p : PROVIDERS)
    {
        ASSERT_TRUE(SettingDBController().SelectAndUpdate(
            [&p](const SettingPtr& s)
            {
                s->SetCpType(p.cpType);
                s->SetDaemonType(p.daemonType);
            }));
        int provider = ContentProvider::GetContentProviderOfCpType(p.cpType);
        for (const Picture& picture : PICTURES)
        {
            EXPECT_TRUE(WmoWeatherCode::IsKnown(picture.code));
            EXPECT_FALSE(WmoWeatherCode::GetStatus(picture.code).empty());
            for (bool isDay : {true, false})
            {
                int icon = WmoWeatherCode::GetProviderIcon(picture.code, provider, isDay);
                EXPECT_EQ(isDay ? picture.day : picture.night,
                          IconMappingTable().GetMappingIconNum(icon, isDay))
                    << p.cpType << " " << p.daemonType << " code " << picture.code
                    << (isDay ? " day" : " night");
            }
        }
    }
    unsetenv("PLATFORM_APP_ID");
}

TEST_F(WmoWeatherCodeTest, CodesOutsideTheTableAreRefused)
{
    for (int code : {-1, 4, 44, 50, 60, 79, 90, 98, 100})
    {
        EXPECT_FALSE(WmoWeatherCode::IsKnown(code)) << code;
        EXPECT_EQ(0, WmoWeatherCode::GetProviderIcon(code, CP_ACCUWEATHER, true)) << code;
        EXPECT_EQ("", WmoWeatherCode::GetStatus(code)) << code;
    }
}

}  // namespace

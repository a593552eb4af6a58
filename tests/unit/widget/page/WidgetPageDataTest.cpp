#include <gtest/gtest.h>
#include <libintl.h>
#include <vconf.h>

#include <clocale>
#include <ctime>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SettingDBController.h"
#include "TestPlatform.h"
#include "Widget4x4PageData.h"

namespace
{

using namespace NSWeather;
using NSWeatherWidget::WidgetPageData;

const time_t kDay = 86400;

class WidgetPageDataTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        FileUtil::ClearCache();
        setenv("LANGUAGE", "en", 1);
        setlocale(LC_ALL, "C.UTF-8");
        bindtextdomain("weather-m",
                       (WeatherTest::BuildDir() + "/res/com.quorvex.weather-m-widget/res/locale").c_str());
        bind_textdomain_codeset("weather-m", "UTF-8");
        ASSERT_EQ(DataStoreInitializer::Run(), 0);
        mSetting = SettingDBController().Select();
        ASSERT_TRUE(mSetting);
        mData.SetSettingPtr(mSetting);
    }

    void UseProvider(const char* cpType)
    {
        mSetting->SetCpType(cpType);
        SettingDBController().Update(mSetting);
    }

    // A city on UTC whose sun is up all day, or never.
    CityPtr MakeCity(int icon, double celsius, bool isDay)
    {
        CityPtr city = std::make_shared<City>();
        city->SetCityName("서울");
        city->SetCityNameEng("Seoul");
        city->SetGmtOffset(0);
        city->SetRefreshedTime(time(nullptr));
        city->GetCurrentPtr()->SetWeatherIcon(icon);
        city->GetCurrentPtr()->GetCurTemperature()->SetCelsiusValue(celsius);
        time_t midnight = time(nullptr) / kDay * kDay;
        city->GetExtraPtr()->SetSunriseTime(midnight);
        city->GetExtraPtr()->SetSunsetTime(isDay ? midnight + kDay - 1 : midnight);
        auto weekly = std::make_shared<WeeklyPtrVector>();
        for (int d = 0; d < 7; ++d)
        {
            WeeklyPtr day = std::make_shared<Weekly>();
            day->SetWeatherIcon(33);  // clear, a night-only icon
            day->GetHighTemperature()->SetCelsiusValue(celsius + d);
            day->GetLowTemperature()->SetCelsiusValue(celsius - d);
            day->SetDate(midnight + d * kDay);
            weekly->push_back(day);
        }
        city->SetWeeklyPtrVector(weekly);
        mData.SetCityPtr(city);
        return city;
    }

    SettingPtr mSetting;
    NSWeatherWidget::Widget4x4PageData mData;
};

TEST_F(WidgetPageDataTest, CityNameFollowsProviderAndLanguage)
{
    struct Case
    {
        const char* provider;
        const char* language;  // nullptr: key unset
        const char* cityName;
        const char* expected;
    };
    const Case cases[] = {
        {"Kweather", "en_US.UTF-8", "서울", "Seoul"},   {"weathernews_kr", "en_US.UTF-8", "서울", "Seoul"},
        {"Kweather", "ko_KR.UTF-8", "서울", "서울"},    {"Kweather", nullptr, "서울", "서울"},
        {"AccuWeather", "en_US.UTF-8", "서울", "서울"}, {"AccuWeather", "en_US.UTF-8", "", "Seoul"},
        {"WeatherNews", "ko_KR.UTF-8", "", "Seoul"},
    };
    CityPtr city = MakeCity(1, 20, true);
    for (const Case& c : cases)
    {
        UseProvider(c.provider);
        unlink(mRoot.Path("vconf/db/menu_widget/language").c_str());
        if (c.language)
        {
            ASSERT_EQ(vconf_set_str("db/menu_widget/language", c.language), 0);
        }
        city->SetCityName(c.cityName);
        EXPECT_EQ(mData.GetCityName(), c.expected)
            << c.provider << " " << (c.language ? c.language : "unset");
    }
}

TEST_F(WidgetPageDataTest, TemperaturesRoundHalfUpInTheChosenUnit)
{
    struct Case
    {
        double celsius;
        int unit;
        const char* current;
        const char* dayTwoHigh;
    };
    const Case cases[] = {
        {21.5, 1, "22", "23°"}, {-0.5, 1, "0", "1°"},     {-0.6, 1, "-1", "0°"},
        {21.5, 0, "71", "73°"}, {999, 1, "999", "1000°"},
    };
    for (const Case& c : cases)
    {
        CityPtr city = MakeCity(1, c.celsius, true);
        mSetting->SetTemperatureUnit(c.unit);
        EXPECT_EQ(mData.GetCurrentTemperatureString(), c.current) << c.celsius;
        EXPECT_EQ(mData.GetWeeklyHighTemperatureString(city, 1), c.dayTwoHigh) << c.celsius;
    }
    CityPtr city = MakeCity(1, 21.5, true);
    mData.SetSettingPtr(nullptr);
    EXPECT_EQ(mData.GetCurrentTemperatureString(), "0");
    EXPECT_EQ(mData.GetWeeklyLowTemperatureString(city, 0), "0");
    EXPECT_EQ(mData.GetTemperatureUnitIconPath(false, false), "");
    mData.SetCityPtr(nullptr);
    EXPECT_EQ(mData.GetCurrentTemperatureString(), "");
}

TEST_F(WidgetPageDataTest, ImagesByDayAndNightAndDailyIconsAlwaysByDay)
{
    struct Case
    {
        int icon;
        bool isDay;
        bool is4x4;
        const char* weather;
        const char* background;
    };
    const Case cases[] = {
        {1, true, true, "01.weather_view_sunny_196x196.png", "bg_weatherview_sunny_day.png"},
        {1, false, false, "18.weather_view_clear_154x154.png", "bg_weatherview_sunny_night.png"},
        {30, false, false, "15.weather_view_hot_154x154.png", "bg_weatherview_hot.png"},
        {18, false, true, "04.weather_view_rain_196x196.png", "bg_weatherview_rain_night.png"},
    };
    for (const Case& c : cases)
    {
        CityPtr city = MakeCity(c.icon, 20, c.isDay);
        EXPECT_EQ(mData.GetWeatherIconPath(c.is4x4, false), c.weather) << c.icon;
        EXPECT_EQ(mData.GetBackgroundImagePath(), c.background) << c.icon;
        EXPECT_EQ(mData.GetWeeklyIconPath(city, 0, true), "01.weather_view_sunny_press_96x96.png") << c.icon;
    }
    EXPECT_EQ(mData.GetTemperatureUnitIconPath(false, true), "weather_widget_4x2_temp_c_press.png");
    mSetting->SetTemperatureUnit(0);
    EXPECT_EQ(mData.GetTemperatureUnitIconPath(true, false), "weather_widget_4x4_temp_f.png");
}

TEST_F(WidgetPageDataTest, DayPastTheEndIsEmptyNotAFailure)
{
    CityPtr city = MakeCity(1, 20, true);
    EXPECT_FALSE(mData.GetWeeklyPtr(city, 7));
    EXPECT_EQ(mData.GetWeeklyWeekdayString(city, 7), "");
    EXPECT_EQ(mData.GetWeeklyHighTemperatureString(city, 7), "");
    EXPECT_EQ(mData.GetWeeklyIconPath(city, 7, false), "");
    EXPECT_TRUE(mLog.Contains("exception caught: out of range"));
    EXPECT_NE(mData.GetWeeklyWeekdayString(city, 6), "");
    city->SetExtraPtr(nullptr);
    EXPECT_EQ(mData.GetWeeklyIconPath(city, 0, false), "");
}

TEST_F(WidgetPageDataTest, RefreshingCountsForNinetySeconds)
{
    struct Case
    {
        bool isNowRefreshing;
        time_t startedAgo;
        bool expected;
    };
    const Case cases[] = {{true, 0, true}, {true, 89, true}, {true, 91, false}, {false, 0, false}};
    for (const Case& c : cases)
    {
        mSetting->SetIsNowRefreshing(c.isNowRefreshing);
        mSetting->SetRefreshingStartTime(time(nullptr) - c.startedAgo);
        EXPECT_EQ(mData.GetIsNowRefreshing(), c.expected) << c.startedAgo;
    }
    mData.SetSettingPtr(nullptr);
    EXPECT_FALSE(mData.GetIsNowRefreshing());
    EXPECT_FALSE(mData.SetIsNowRefreshing(true));
}

}  // namespace

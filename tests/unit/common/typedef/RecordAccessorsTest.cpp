#include "City.h"
#include "Setting.h"
#include "ShareTarget.h"

#include <gtest/gtest.h>

#include <memory>

namespace
{
using namespace NSWeather;

// Every field gets a distinct value, so a setter that writes the wrong
// member shows up as a mismatch.
TEST(RecordAccessorsTest, CityFieldsAreIndependent)
{
    City city;
    city.SetPageIndex(2);
    city.SetIsCurrentLocation(true);
    city.SetIsSummerTime(true);
    city.SetIsDayTime(false);
    city.SetWidgetReferenceCount(3);
    city.SetLocationId("loc");
    city.SetCityName("Seoul");
    city.SetCityNameEng("Seoul-en");
    city.SetCountryName("Korea");
    city.SetCountryNameEng("Korea-en");
    city.SetWebsiteUrl("http://w");
    city.SetGmtOffset(5.5);
    city.SetRefreshedTime(1000);
    city.SetLocalTime(2000);
    city.SetNeedToUpdate(false);

    EXPECT_EQ(city.GetPageIndex(), 2);
    EXPECT_TRUE(city.GetIsCurrentLocation());
    EXPECT_TRUE(city.GetIsSummerTime());
    EXPECT_FALSE(city.GetIsDayTime());
    EXPECT_EQ(city.GetWidgetReferenceCount(), 3);
    EXPECT_EQ(city.GetLocationId(), "loc");
    EXPECT_EQ(city.GetCityName(), "Seoul");
    EXPECT_EQ(city.GetCityNameEng(), "Seoul-en");
    EXPECT_EQ(city.GetCountryName(), "Korea");
    EXPECT_EQ(city.GetCountryNameEng(), "Korea-en");
    EXPECT_EQ(city.GetWebsiteUrl(), "http://w");
    EXPECT_DOUBLE_EQ(city.GetGmtOffset(), 5.5);
    EXPECT_EQ(city.GetRefreshedTime(), 1000);
    EXPECT_EQ(city.GetLocalTime(), 2000);
    EXPECT_FALSE(city.GetNeedToUpdate());
}

TEST(RecordAccessorsTest, PartsAreSharedNotCopied)
{
    City city;
    city.GetCurrentPtr()->SetWeatherIcon(7);
    EXPECT_EQ(city.GetCurrentPtr()->GetWeatherIcon(), 7);

    auto weekly = std::make_shared<Weekly>();
    city.GetWeeklyPtrVector()->push_back(weekly);
    weekly->SetDayOfWeek(4);
    ASSERT_EQ(city.GetWeeklyPtrVector()->size(), 1u);
    EXPECT_EQ(city.GetWeeklyPtrVector()->at(0)->GetDayOfWeek(), 4);

    auto hourly = std::make_shared<HourlyPtrVector>(2, std::make_shared<Hourly>());
    city.SetHourlyPtrVector(hourly);
    EXPECT_EQ(city.GetHourlyPtrVector(), hourly);

    // A string getter hands out a copy.
    std::string name = city.GetCityName();
    name += "x";
    EXPECT_EQ(city.GetCityName(), "NULL");
}

TEST(RecordAccessorsTest, ExtraFieldsAreIndependent)
{
    Extra extra;
    int (Extra::*getters[])() const = {
        &Extra::GetHumidity, &Extra::GetPm25, &Extra::GetPm10, &Extra::GetAqi, &Extra::GetUvIndex,
        &Extra::GetOutdoorExcercise, &Extra::GetComfort, &Extra::GetClothing, &Extra::GetSkincare,
        &Extra::GetCarwash, &Extra::GetFoodPoison, &Extra::GetSpoiledFood, &Extra::GetFrozenPipes,
        &Extra::GetFrostbite, &Extra::GetCold, &Extra::GetAirDust, &Extra::GetDrySkin,
        &Extra::GetHeat, &Extra::GetDiscomfort, &Extra::GetPollen};
    void (Extra::*setters[])(int) = {
        &Extra::SetHumidity, &Extra::SetPm25, &Extra::SetPm10, &Extra::SetAqi, &Extra::SetUvIndex,
        &Extra::SetOutdoorExcercise, &Extra::SetComfort, &Extra::SetClothing, &Extra::SetSkincare,
        &Extra::SetCarwash, &Extra::SetFoodPoison, &Extra::SetSpoiledFood, &Extra::SetFrozenPipes,
        &Extra::SetFrostbite, &Extra::SetCold, &Extra::SetAirDust, &Extra::SetDrySkin,
        &Extra::SetHeat, &Extra::SetDiscomfort, &Extra::SetPollen};
    static_assert(sizeof(getters) / sizeof(getters[0]) == sizeof(setters) / sizeof(setters[0]),
                  "one setter per getter");
    const int count = sizeof(getters) / sizeof(getters[0]);
    for (int i = 0; i < count; ++i)
        (extra.*setters[i])(i + 1);
    extra.SetSunsetTime(100);
    extra.SetSunriseTime(200);
    for (int i = 0; i < count; ++i)
        EXPECT_EQ((extra.*getters[i])(), i + 1) << "field " << i;
    EXPECT_EQ(extra.GetSunsetTime(), 100);
    EXPECT_EQ(extra.GetSunriseTime(), 200);
}

TEST(RecordAccessorsTest, SettingFieldsAreIndependent)
{
    Setting setting;
    setting.SetCurrentCityIndex(4);
    setting.SetCurrentCityLocationId("loc-4");
    setting.SetTemperatureUnit(2);
    setting.SetLastRefreshedTime(11);
    setting.SetCurrentLocationAreaRefreshedTime(12);
    setting.SetNotificationTime(13);
    setting.SetRefreshingStartTime(14);
    setting.SetAutoRefreshInterval(3);
    setting.SetAutoScrollInterval(5);
    setting.SetLastUpdateLanguageCode("ko");
    setting.SetCpType("CMA");
    setting.SetDaemonType("OTHER");
    setting.SetIsNowRefreshing(true);
    setting.SetAutoRefreshOn(false);

    EXPECT_EQ(setting.GetCurrentCityIndex(), 4);
    EXPECT_EQ(setting.GetCurrentCityLocationId(), "loc-4");
    EXPECT_EQ(setting.GetTemperatureUnit(), 2);
    EXPECT_EQ(setting.GetLastRefreshedTime(), 11);
    EXPECT_EQ(setting.GetCurrentLocationAreaRefreshedTime(), 12);
    EXPECT_EQ(setting.GetNotificationTime(), 13);
    EXPECT_EQ(setting.GetRefreshingStartTime(), 14);
    EXPECT_EQ(setting.GetAutoRefreshInterval(), 3);
    EXPECT_EQ(setting.GetAutoScrollInterval(), 5);
    EXPECT_EQ(setting.GetLastUpdateLanguageCode(), "ko");
    EXPECT_EQ(setting.GetCpType(), "CMA");
    EXPECT_EQ(setting.GetDaemonType(), "OTHER");
    EXPECT_TRUE(setting.GetIsNowRefreshing());
    EXPECT_FALSE(setting.GetAutoRefreshOn());
    EXPECT_FALSE(setting.GetIsSupportManualRefresh());

    ShareTarget target;
    target.SetAppID("app");
    target.SetPortID("port");
    EXPECT_EQ(target.GetAppID(), "app");
    EXPECT_EQ(target.GetPortID(), "port");
}

TEST(RecordAccessorsTest, EachSettingFlagHasItsOwnSetter)
{
    bool (Setting::*getters[])() const = {
        &Setting::GetIsFirstLaunch, &Setting::GetAutoRefreshOn, &Setting::GetUseCurrentLocationOn,
        &Setting::GetShowCurrentCityAgreement, &Setting::GetRefreshOnOpeningOn,
        &Setting::GetRefreshOnOpeningOnAgreement, &Setting::GetNotificationOn,
        &Setting::GetNetworkPositionPopupAgreement, &Setting::GetShowNetworkPopup,
        &Setting::GetChinaDataGPSPerformPopupOn, &Setting::GetAutoScrollOn,
        &Setting::GetIsNowRefreshing, &Setting::GetIsSupportManualRefresh};
    void (Setting::*setters[])(bool) = {
        &Setting::SetIsFirstLaunch, &Setting::SetAutoRefreshOn, &Setting::SetUseCurrentLocationOn,
        &Setting::SetShowCurrentCityAgreement, &Setting::SetRefreshOnOpeningOn,
        &Setting::SetRefreshOnOpeningOnAgreement, &Setting::SetNotificationOn,
        &Setting::SetNetworkPositionPopupAgreement, &Setting::SetShowNetworkPopup,
        &Setting::SetChinaDataGPSPerformPopupOn, &Setting::SetAutoScrollOn,
        &Setting::SetIsNowRefreshing, &Setting::SetIsSupportManualRefresh};
    const int count = sizeof(getters) / sizeof(getters[0]);
    static_assert(sizeof(getters) / sizeof(getters[0]) == sizeof(setters) / sizeof(setters[0]),
                  "one setter per getter");
    const Setting defaults;
    for (int flipped = 0; flipped < count; ++flipped)
    {
        Setting setting;
        (setting.*setters[flipped])(!(defaults.*getters[flipped])());
        for (int i = 0; i < count; ++i)
            EXPECT_EQ((setting.*getters[i])(), (defaults.*getters[i])() != (i == flipped))
                << "flipped " << flipped << ", read " << i;
    }
}

}  // namespace

#include "City.h"
#include "ShareTarget.h"

#include <gtest/gtest.h>

namespace
{
using namespace NSWeather;

void ExpectNoTemperature(const TemperaturePtr& temperature)
{
    ASSERT_TRUE(temperature);
    EXPECT_DOUBLE_EQ(temperature->GetCelsius(), 999.0);
    EXPECT_DOUBLE_EQ(temperature->GetFahrenheit(), 999.0);
}

void ExpectNoWeather(const Weather& weather)
{
    EXPECT_EQ(weather.GetWeatherIcon(), 999);
    EXPECT_EQ(weather.GetWeatherStatus(), "NULL");
    ExpectNoTemperature(weather.GetCurTemperature());
    ExpectNoTemperature(weather.GetLowTemperature());
    ExpectNoTemperature(weather.GetHighTemperature());
    EXPECT_EQ(weather.GetDate(), 0);
}

TEST(RecordDefaultsTest, FreshCityCarriesOnlySentinels)
{
    City city;
    EXPECT_EQ(city.GetPageIndex(), -1);
    EXPECT_FALSE(city.GetIsCurrentLocation());
    EXPECT_FALSE(city.GetIsSummerTime());
    EXPECT_TRUE(city.GetIsDayTime());
    EXPECT_EQ(city.GetWidgetReferenceCount(), 0);
    EXPECT_EQ(city.GetLocationId(), "NULL");
    EXPECT_EQ(city.GetCityName(), "NULL");
    EXPECT_EQ(city.GetCityNameEng(), "NULL");
    EXPECT_EQ(city.GetCountryName(), "NULL");
    EXPECT_EQ(city.GetCountryNameEng(), "");
    EXPECT_EQ(city.GetWebsiteUrl(), "NULL");
    EXPECT_DOUBLE_EQ(city.GetGmtOffset(), 0.0);
    EXPECT_EQ(city.GetRefreshedTime(), 0);
    EXPECT_EQ(city.GetLocalTime(), 0);
    EXPECT_TRUE(city.GetNeedToUpdate());

    ASSERT_TRUE(city.GetCurrentPtr());
    ExpectNoWeather(*city.GetCurrentPtr());
    EXPECT_EQ(city.GetCurrentPtr()->GetWebsiteUrl(), "NULL");
    ASSERT_TRUE(city.GetExtraPtr());
    ASSERT_TRUE(city.GetWeeklyPtrVector());
    ASSERT_TRUE(city.GetHourlyPtrVector());
    ASSERT_TRUE(city.GetMoonPhasePtrVector());
    EXPECT_TRUE(city.GetWeeklyPtrVector()->empty());
    EXPECT_TRUE(city.GetHourlyPtrVector()->empty());
    EXPECT_TRUE(city.GetMoonPhasePtrVector()->empty());
}

TEST(RecordDefaultsTest, EachRecordOwnsItsParts)
{
    City first;
    City second;
    EXPECT_NE(first.GetCurrentPtr(), second.GetCurrentPtr());
    EXPECT_NE(first.GetExtraPtr(), second.GetExtraPtr());
    EXPECT_NE(first.GetWeeklyPtrVector(), second.GetWeeklyPtrVector());

    Current current;
    current.GetLowTemperature()->SetCelsiusValue(3.0);
    EXPECT_DOUBLE_EQ(current.GetCurTemperature()->GetCelsius(), 999.0);
    EXPECT_DOUBLE_EQ(current.GetHighTemperature()->GetCelsius(), 999.0);

    Extra extra;
    EXPECT_NE(extra.GetRealfeel(), current.GetCurTemperature());
}

TEST(RecordDefaultsTest, ForecastRecordsStartEmpty)
{
    Hourly hourly;
    ExpectNoWeather(hourly);
    EXPECT_EQ(hourly.GetHour(), 999);
    EXPECT_EQ(hourly.GetWebsiteUrl(), "NULL");

    Weekly weekly;
    ExpectNoWeather(weekly);
    EXPECT_EQ(weekly.GetDayOfWeek(), 0);
    EXPECT_EQ(weekly.GetWebsiteUrl(), "NULL");

    MoonPhase moon;
    EXPECT_EQ(moon.GetLocationID(), "");
    EXPECT_EQ(moon.GetDate(), 999);
    EXPECT_EQ(moon.GetMoonRiseTime(), 999);
    EXPECT_EQ(moon.GetMoonSetTime(), 999);
    EXPECT_EQ(moon.GetPhaseText(), "");
    EXPECT_EQ(moon.GetAge(), 999);
}

TEST(RecordDefaultsTest, FreshExtraReads999ExceptAirDust)
{
    Extra extra;
    const int values[] = {
        extra.GetHumidity(), extra.GetPm25(), extra.GetPm10(), extra.GetAqi(), extra.GetUvIndex(),
        extra.GetOutdoorExcercise(), extra.GetComfort(), extra.GetClothing(), extra.GetSkincare(),
        extra.GetCarwash(), extra.GetFoodPoison(), extra.GetSpoiledFood(), extra.GetFrozenPipes(),
        extra.GetFrostbite(), extra.GetCold(), extra.GetDrySkin(), extra.GetHeat(),
        extra.GetDiscomfort(), extra.GetPollen()};
    for (int value : values)
        EXPECT_EQ(value, 999);
    EXPECT_EQ(extra.GetAirDust(), 9999);
    EXPECT_EQ(extra.GetSunsetTime(), 999);
    EXPECT_EQ(extra.GetSunriseTime(), 999);
    ExpectNoTemperature(extra.GetRealfeel());

    PrecipitationPtr precipitation = extra.GetPrecipitationPtr();
    ASSERT_TRUE(precipitation);
    EXPECT_EQ(precipitation->GetPrecType(), 999);
    EXPECT_DOUBLE_EQ(precipitation->GetPrecProbability(), 999.0);
    EXPECT_DOUBLE_EQ(precipitation->GetPrecAmount(), 999.0);
    EXPECT_DOUBLE_EQ(precipitation->GetPrecProbabilityNight(), 999.0);
    EXPECT_DOUBLE_EQ(precipitation->GetPrecAmountNight(), 999.0);
}

// The settings defaults are checked through the default row the store writes.
TEST(RecordDefaultsTest, FreshShareTargetIsEmpty)
{
    ShareTarget target;
    EXPECT_EQ(target.GetAppID(), "");
    EXPECT_EQ(target.GetPortID(), "");
}

}  // namespace

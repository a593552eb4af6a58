#include "City.h"

#include <gtest/gtest.h>

namespace
{
using namespace NSWeather;

// The pages and the store tell "no value" by these sentinels.
TEST(RecordDefaultsTest, FreshRecordsCarryTheNoValueSentinels)
{
    City city;
    EXPECT_EQ(city.GetPageIndex(), -1);
    EXPECT_EQ(city.GetLocationId(), "NULL");
    EXPECT_EQ(city.GetCountryNameEng(), "");
    EXPECT_TRUE(city.GetNeedToUpdate());
    EXPECT_TRUE(city.GetIsDayTime());
    ASSERT_TRUE(city.GetCurrentPtr() && city.GetExtraPtr() && city.GetWeeklyPtrVector() &&
                city.GetHourlyPtrVector() && city.GetMoonPhasePtrVector());
    EXPECT_TRUE(city.GetWeeklyPtrVector()->empty());

    const Hourly hourly;
    const Weekly weekly;
    for (const Weather* weather :
         {static_cast<const Weather*>(city.GetCurrentPtr().get()), static_cast<const Weather*>(&hourly),
          static_cast<const Weather*>(&weekly)})
    {
        EXPECT_EQ(weather->GetWeatherIcon(), 999);
        EXPECT_EQ(weather->GetWeatherStatus(), "NULL");
        for (const TemperaturePtr& t :
             {weather->GetCurTemperature(), weather->GetLowTemperature(), weather->GetHighTemperature()})
            EXPECT_DOUBLE_EQ(t->GetFahrenheit(), 999.0);
    }

    const Extra& extra = *city.GetExtraPtr();
    for (int value : {extra.GetHumidity(), extra.GetPm25(), extra.GetUvIndex(), extra.GetPollen()})
        EXPECT_EQ(value, 999);
    EXPECT_EQ(extra.GetSunriseTime(), 999);
    EXPECT_EQ(extra.GetAirDust(), 9999);
    EXPECT_DOUBLE_EQ(extra.GetPrecipitationPtr()->GetPrecAmountNight(), 999.0);
    EXPECT_EQ(MoonPhase().GetAge(), 999);
}

// A shared default part would let one record's change show up in another.
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
}

}  // namespace

#include "City.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "TestPlatform.h"

namespace
{
using namespace NSWeather;

CityPtr MakeCity()
{
    auto city = std::make_shared<City>();
    city->SetPageIndex(1);
    city->SetCityName("Lyon");
    city->SetLocationId("L-1");
    city->SetGmtOffset(1.0);
    city->SetRefreshedTime(1700000000);
    city->GetCurrentPtr()->SetWeatherIcon(12);
    city->GetCurrentPtr()->GetCurTemperature()->SetCelsiusValue(21.04);
    for (int i = 0; i < 2; ++i)
    {
        auto weekly = std::make_shared<Weekly>();
        weekly->SetWeatherIcon(i + 1);
        weekly->GetHighTemperature()->SetCelsiusValue(-2.25);
        city->GetWeeklyPtrVector()->push_back(weekly);
    }
    city->GetHourlyPtrVector()->push_back(std::make_shared<Hourly>());
    city->GetExtraPtr()->GetPrecipitationPtr()->SetPrecAmount(1.25);
    return city;
}

void DumpAll(const City& city)
{
    city.PrintCityInfo();
    city.PrintCurrentWeatherInfo();
    city.PrintForecastWeatherInfo();
    city.PrintHourlyWeatherInfo();
    city.PrintExtraWeatherInfo();
}

TEST(CityDumpTest, WeatherDumpsShowOneDecimalAndEveryEntry)
{
    CityPtr city = MakeCity();
    WeatherTest::LogCapture log;
    city->PrintCurrentWeatherInfo();
    city->PrintForecastWeatherInfo();
    city->PrintHourlyWeatherInfo();
    city->PrintExtraWeatherInfo();

    EXPECT_EQ(log.Count("curTemperature : 21.0"), 1) << log.Dump();
    EXPECT_EQ(log.Count("weatherIcon : 12"), 1);
    EXPECT_EQ(log.Count("highTemperature : -2.2"), 2);
    EXPECT_TRUE(log.Contains("index : 1"));
    EXPECT_EQ(log.Count("hour : 999"), 1);
    EXPECT_EQ(log.Count("precAmount : 1.25"), 1);
    EXPECT_EQ(log.Count("precProbabilityNight : 999.00"), 1);
    EXPECT_EQ(log.Count("uvIndex : 999"), 1);
}

// The stores may leave parts absent; a dump must say so, not crash.
TEST(CityDumpTest, AbsentPartsAreNamed)
{
    City city;
    city.SetCurrentPtr(nullptr);
    city.SetWeeklyPtrVector(nullptr);
    city.SetHourlyPtrVector(std::make_shared<HourlyPtrVector>(1));
    city.SetExtraPtr(nullptr);
    WeatherTest::LogCapture log;
    DumpAll(city);
    EXPECT_TRUE(log.Contains("currentPtr : NULL")) << log.Dump();
    EXPECT_TRUE(log.Contains("hourly : NULL"));
    EXPECT_TRUE(log.Contains("extraPtr : NULL"));

    City noPrecipitation;
    noPrecipitation.GetExtraPtr()->SetPrecipitationPtr(nullptr);
    noPrecipitation.GetCurrentPtr()->SetCurTemperature(nullptr);
    log.Clear();
    DumpAll(noPrecipitation);
    EXPECT_TRUE(log.Contains("precipitationPtr : NULL")) << log.Dump();
    EXPECT_TRUE(log.Contains("curTemperature : NULL"));
}

}  // namespace

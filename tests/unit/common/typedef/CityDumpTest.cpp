#include "City.h"

#include <gtest/gtest.h>

#include <memory>

#include "TestPlatform.h"

namespace
{
using namespace NSWeather;

void DumpAll(const City& city)
{
    city.PrintCityInfo();
    city.PrintCurrentWeatherInfo();
    city.PrintForecastWeatherInfo();
    city.PrintHourlyWeatherInfo();
    city.PrintExtraWeatherInfo();
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

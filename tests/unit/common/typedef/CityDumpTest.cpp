#include "City.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "TestPlatform.h"

namespace
{
using namespace NSWeather;

// The texts between the colour sequences, in order.
std::vector<std::string> Texts(const WeatherTest::LogCapture& log)
{
    const std::string begin = "\033[0;40;31m";
    const std::string end = "\033[0;m";
    std::vector<std::string> texts;
    for (const WeatherTest::LogLine& line : log.GetLines())
    {
        if (line.tag != "weather-common")
            continue;
        size_t from = line.text.find(begin);
        size_t to = line.text.rfind(end);
        if (from == std::string::npos || to == std::string::npos || to < from)
            continue;
        from += begin.size();
        texts.push_back(line.text.substr(from, to - from));
    }
    return texts;
}

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

TEST(CityDumpTest, CityInfoListsFieldsInOrder)
{
    WeatherTest::LogCapture log;
    MakeCity()->PrintCityInfo();
    std::vector<std::string> texts = Texts(log);
    const std::vector<std::string> expected = {
        "cityName : Lyon", "pageIndex : 1", "isCurrentLocation : 0", "isDayTime : 1",
        "locationId : L-1", "cityName : Lyon", "cityNameEng : NULL", "countryName : NULL",
        "websiteUrl : NULL", "gmtOffset : 1.00", "refreshedTime : 1700000000", "localTime : 0"};
    ASSERT_EQ(texts.size(), expected.size() + 1) << log.Dump();
    for (size_t i = 0; i < expected.size(); ++i)
        EXPECT_EQ(texts[i + 1], expected[i]);
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

TEST(CityDumpTest, EmptyCityDumpsOnlyHeaderLinesOfLists)
{
    City city;
    WeatherTest::LogCapture log;
    city.PrintForecastWeatherInfo();
    city.PrintHourlyWeatherInfo();
    EXPECT_EQ(Texts(log).size(), 2u) << log.Dump();
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

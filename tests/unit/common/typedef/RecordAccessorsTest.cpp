#include "City.h"

#include <gtest/gtest.h>

#include <memory>

namespace
{
using namespace NSWeather;

// Children are handed out by pointer, so edits through them reach the city;
// strings are handed out by value.
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

    std::string name = city.GetCityName();
    name += "x";
    EXPECT_EQ(city.GetCityName(), "NULL");
}

}  // namespace

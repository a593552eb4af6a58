#ifndef WEATHER_TESTS_DB_TEST_SUPPORT_H
#define WEATHER_TESTS_DB_TEST_SUPPORT_H

#include <string>
#include <vector>

#include "City.h"
#include "TestDB.h"
#include "TestPlatform.h"

namespace WeatherTest
{

// A fresh root with the database folder made and the weather tables created.
class DBTest : public PlatformTest
{
protected:
    void SetUp() override;
    std::string WeatherDBPath() const;
    std::string DBDir() const;
};

// A city with every field and child filled; `seed` varies the values.
NSWeather::CityPtr MakeCity(const std::string& locationId, int seed, bool isCurrentLocation = false);

}  // namespace WeatherTest

#endif

#ifndef WEATHER_TESTS_DB_TEST_SUPPORT_H
#define WEATHER_TESTS_DB_TEST_SUPPORT_H

#include <sqlite3.h>

#include <string>
#include <vector>

#include "City.h"
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

// Direct access to a database file, bypassing the code under test.
class RawDB
{
public:
    explicit RawDB(const std::string& path);
    ~RawDB();
    RawDB(const RawDB&) = delete;
    RawDB& operator=(const RawDB&) = delete;

    bool Exec(const std::string& sql);
    // Every row of the first column, as text ("" for NULL).
    std::vector<std::string> Column(const std::string& sql);
    int64_t Int(const std::string& sql);
    sqlite3* Get() const { return mDB; }

private:
    sqlite3* mDB = nullptr;
};

}  // namespace WeatherTest

#endif

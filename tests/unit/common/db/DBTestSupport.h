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

// Another process that holds `lock` ("BEGIN EXCLUSIVE;" or "BEGIN
// IMMEDIATE;") on every file of `paths` until `holdMs` passes, Release is
// called or the holder is destroyed.
class LockHolder
{
public:
    LockHolder(const std::vector<std::string>& paths, const char* lock, int holdMs);
    ~LockHolder();
    LockHolder(const LockHolder&) = delete;
    LockHolder& operator=(const LockHolder&) = delete;

    bool GetIsLocked() const { return mIsLocked; }
    void Release();

private:
    int mPid = -1;
    int mRelease[2] = {-1, -1};
    bool mIsLocked = false;
};

// A city with every field and child filled; `seed` varies the values.
NSWeather::CityPtr MakeCity(const std::string& locationId, int seed, bool isCurrentLocation = false);

}  // namespace WeatherTest

#endif

#ifndef WEATHER_TESTS_DB_TEST_SUPPORT_H
#define WEATHER_TESTS_DB_TEST_SUPPORT_H

#include <string>
#include <utility>
#include <vector>

#include "City.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "TestPlatform.h"

namespace WeatherTest
{

// "CREATE TABLE IF NOT EXISTS %s (...);" as SQLite keeps it once run.
std::string StoredCreateSql(const std::string& format, const std::string& table);

// The weather tables as a database of the given schema version has them:
// the columns that later versions added are left out.
std::string OldWeatherTableSql(const std::string& table, double version);
// Name and creation format of each weather table, as the store defines them.
extern const std::pair<const char*, const char*> WEATHER_TABLE_FORMATS[6];

bool FileExists(const std::string& path);

// `size` bytes of a fixed pseudo-random sequence, as a damaged file holds.
std::string RandomBytes(size_t size, unsigned seed);

// A fresh platform root per test, with FileUtil asked again for it.
class StoreTest : public PlatformTest
{
protected:
    StoreTest();
    ~StoreTest() override;

    std::string DBDir() const { return mRoot.SharedDataDir() + "db"; }
    std::string SettingDBPath() const { return DBDir() + "/.setting.db"; }
    std::string ShareTargetDBPath() const { return DBDir() + "/.share_target.db"; }
    std::string VersionDBPath() const { return DBDir() + "/.version.db"; }
    std::string WeatherDBPath() const { return DBDir() + "/.weather.db"; }
    void MakeDBDir() const;
    // Creates the settings row through the code under test.
    void InitializeSettings() const;
    // Sets one column of the settings row directly.
    void SetSettingColumn(const std::string& column, const std::string& sqlValue) const;
};

// ... with the database folder made and the weather tables created.
class DBTest : public StoreTest
{
protected:
    void SetUp() override;
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

// Every stored field of the city and its parts in column order, so that a
// swapped, dropped or mistyped column shows; the derived day of week is left out.
std::string DescribeCity(const NSWeather::City& city);

}  // namespace WeatherTest

#endif

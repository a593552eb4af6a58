#ifndef WEATHER_TESTS_SETTINGS_TEST_SUPPORT_H
#define WEATHER_TESTS_SETTINGS_TEST_SUPPORT_H

#include <string>
#include <utility>
#include <vector>

#include "FileUtil.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "TestPlatform.h"

namespace SettingsTest
{

using RawDB = WeatherTest::RawDB;

// "CREATE TABLE IF NOT EXISTS %s (...);" as SQLite keeps it once run.
std::string StoredCreateSql(const std::string& format, const std::string& table);

// The weather tables as a database of the given schema version has them:
// the columns that later versions added are left out.
std::string OldWeatherTableSql(const std::string& table, double version);
// Name and creation format of each weather table, as the store defines them.
extern const std::pair<const char*, const char*> WEATHER_TABLE_FORMATS[6];

bool FileExists(const std::string& path);

// A fresh platform root per test, with FileUtil asked again for it.
class SettingsFixture : public WeatherTest::PlatformTest
{
protected:
    SettingsFixture();
    ~SettingsFixture() override;

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

}  // namespace SettingsTest

#endif

#ifndef NSWEATHER_SETTING_DB_CONTROLLER_H
#define NSWEATHER_SETTING_DB_CONTROLLER_H

#include <functional>
#include <string>

#include "City.h"
#include "Setting.h"

namespace NSWeather
{

class DBCycleCloser;
class DBStatement;

// The one settings row that the suite's processes share ("db/.setting.db").
// Select, Update, SelectAndUpdate and UpdateLocationIdOfDisplayCity run
// their own cycle; CreateTable, Insert and IsSettingTableExist run on the
// caller's. Writers return ERR_OK, or ERR_FAIL with nothing written.
class SettingDBController
{
public:
    SettingDBController();
    virtual ~SettingDBController();

    // Creates the table and the default row when either is missing.
    // ERR_OK, or ERR_FAIL when the database cannot be opened or takes no row.
    int Initialize();
    bool IsSettingTableExist();
    bool CreateTable();
    int Insert(const SettingPtr& settingPtr);
    // Rewrites the whole row from the record; a null record writes nothing.
    int Update(const SettingPtr& settingPtr);
    int UpdateLocationIdOfDisplayCity(const std::string& locationId);
    // Null when there is no row or the database cannot be read.
    SettingPtr Select();
    // Reads the row, lets `change` edit it and writes it back whole, in one
    // write transaction taken before the read (BEGIN IMMEDIATE), so a write by
    // another process in between is never undone. Returns the record as
    // written, or null (nothing written, logged) when there is no row or any
    // step fails.
    SettingPtr SelectAndUpdate(const std::function<void(const SettingPtr&)>& change);
    // As SelectAndUpdate, and `change` also gets the stored cities in page
    // order (without forecasts), read from the weather database in the same
    // transaction: a city change of another process lands wholly before
    // what `change` sees or after what it writes.
    SettingPtr SelectAndUpdateWithCities(
        const std::function<void(const SettingPtr&, const CityPtrVector&)>& change);
    // The settings row has had the same columns in every version.
    void UpgradeDB(double currentVersion);

private:
    static void BindSetting(DBStatement& statement, const SettingPtr& settingPtr);
    static SettingPtr ReadSetting(const DBStatement& statement);
    SettingPtr SelectRow();
    // The read, change and write of the two operations above, on their cycle.
    SettingPtr ChangeRow(DBCycleCloser& cycle, const std::function<void(const SettingPtr&)>& change);
    bool UpdateRow(const SettingPtr& settingPtr);
};

}  // namespace NSWeather

#endif

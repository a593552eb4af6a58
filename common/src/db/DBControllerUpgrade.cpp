#include "DBController.h"

#include <cstdio>
#include <memory>
#include <stdexcept>
#include <string>

#include <sqlite3.h>

#include "CommonLog.h"
#include "DBConnector.h"
#include "DBCycleCloser.h"
#include "FileUtil.h"
#include "VersionDBController.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{
struct UpgradeStep
{
    double belowVersion;
    const char* logLabel;
    const char* query;
    bool migratesCurrentLocation;
};

// Each step runs for a database older than its version, and every later
// step runs after it. A statement that fails (a column already there, a
// table already gone) is logged by the connector and skipped.
const UpgradeStep UPGRADE_STEPS[] = {
    {0.1, "UpgradeDBTables < 0.1", "ALTER TABLE CITY_TABLE ADD countryNameEng TEXT DEFAULT '';", false},
    {0.2, "UpgradeDBTables < 0.2", "ALTER TABLE HOURLY_WEATHER_TABLE ADD websiteUrl TEXT DEFAULT '';", false},
    {0.2, "UpgradeDBTables", "DROP TABLE VERSION_TABLE;", false},
    {0.3, "UpgradeDBTables < 0.3",
     "ALTER TABLE EXTRA_WEATHER_TABLE ADD aqi INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD pm25 INTEGER;",
     false},
    {0.4, "UpgradeDBTables < 0.4",
     "ALTER TABLE EXTRA_WEATHER_TABLE ADD outdoorExcercise INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD "
     "comfort "
     "INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD clothing INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD "
     "skincare "
     "INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD carwash INTEGER;",
     false},
    {0.5, "UpgradeDBTables < 0.5", "ALTER TABLE CITY_TABLE ADD needToUpdate INTEGER;", false},
    {0.6, "UpgradeDBTables < 0.6",
     "ALTER TABLE EXTRA_WEATHER_TABLE ADD foodPoison INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD heat "
     "INTEGER;ALTER "
     "TABLE EXTRA_WEATHER_TABLE ADD spoiledFood INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD discomfort "
     "INTEGER;ALTER "
     "TABLE EXTRA_WEATHER_TABLE ADD frozenPipes INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD frostbite "
     "INTEGER;ALTER "
     "TABLE EXTRA_WEATHER_TABLE ADD cold INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD pollen INTEGER;ALTER "
     "TABLE "
     "EXTRA_WEATHER_TABLE ADD airDust INTEGER;ALTER TABLE EXTRA_WEATHER_TABLE ADD dryskin INTEGER;",
     false},
    {0.7, "UpgradeDBTables < 0.7", "ALTER TABLE CITY_TABLE ADD isSummerTime INTEGER;", true},
    {0.8, "UpgradeDBTables < 0.8",
     "ALTER TABLE EXTRA_WEATHER_TABLE ADD precProbabilityNight DOUBLE;ALTER TABLE EXTRA_WEATHER_TABLE ADD "
     "precAmountNight DOUBLE;",
     false},
};

constexpr const char* CURRENT_LOCATION_SUFFIX = ":C";
constexpr size_t ICON_QUERY_BUFFER_SIZE = 512;

std::string GetWeatherDBFilePath()
{
    return FileUtil::GetWeatherDBFilePath();
}

// Runs one step in a cycle of its own; false when the weather database
// cannot be opened.
bool RunUpgradeStep(const UpgradeStep& step)
{
    COMMON_LOG("%s : %s", step.logLabel, step.query);
    DBConnector* dbConnector = DBConnector::GetInstance();
    COMMON_RETV_IF(dbConnector->DBInitialize(GetWeatherDBFilePath(), false) == false, false);
    DBCycleCloser cycle(dbConnector);
    dbConnector->DBExecuteQuery(step.query);
    return true;
}

struct SqliteCloser
{
    void operator()(sqlite3* handle) const { sqlite3_close_v2(handle); }
};

struct StatementFinalizer
{
    void operator()(sqlite3_stmt* stmt) const { sqlite3_finalize(stmt); }
};

// The widget icon for one provider number from the icon database; 0 when
// the number is not listed or the file has no usable table.
int SelectMappedIcon(sqlite3* handle, int iconId, bool isDayTime)
{
    char query[ICON_QUERY_BUFFER_SIZE] = {};
    snprintf(query, sizeof(query),
             isDayTime ? "SELECT day_mapping_id FROM icon_table WHERE icon_id = %d;"
                       : "SELECT night_mapping_id FROM icon_table WHERE icon_id = %d;",
             iconId);
    sqlite3_stmt* rawStmt = nullptr;
    int rc = sqlite3_prepare_v2(handle, query, -1, &rawStmt, nullptr);
    std::unique_ptr<sqlite3_stmt, StatementFinalizer> stmt(rawStmt);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("Fail: sqlite3_prepare_v2 Failed rc [%d][%s]", rc, sqlite3_errmsg(handle));
        COMMON_LOG("Query: %s", query);
        return 0;
    }
    rc = sqlite3_step(stmt.get());
    if (rc != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", rc);
        return 0;
    }
    return sqlite3_column_int(stmt.get(), 0);
}

// The current-location city used to be stored under the provider's bare
// key; it now carries ":C" so that it never collides with the same city
// added by hand.
void MigrateCurrentLocationId(DBController& dbController)
{
    CityPtrVectorPtr cityPtrVector = dbController.SelectAllCityData();
    COMMON_RET_IF(!cityPtrVector);
    try
    {
        for (size_t i = 0; i < cityPtrVector->size(); ++i)
        {
            CityPtr cityPtr = cityPtrVector->at(i);
            if (!cityPtr || cityPtr->GetIsCurrentLocation() == false)
                continue;
            std::string locationId = cityPtr->GetLocationId();
            if (locationId.find(CURRENT_LOCATION_SUFFIX) == std::string::npos)
            {
                cityPtr->SetLocationId(locationId + CURRENT_LOCATION_SUFFIX);
                dbController.UpdateCityData(cityPtr);
            }
            break;
        }
    }
    catch (const std::out_of_range& e)
    {
        COMMON_LOG("exception caught: out of range");
        COMMON_LOG("[%s]", e.what());
    }
    catch (const std::exception& e)
    {
        COMMON_LOG("exception caught: %s", e.what());
        COMMON_LOG("[%s]", e.what());
    }
}

}  // namespace

int DBController::UpgradeDB()
{
    return UpgradeDB(VersionDBController().GetCurrentDBVersion());
}

int DBController::UpgradeDB(double currentVersion)
{
    for (const UpgradeStep& step : UPGRADE_STEPS)
    {
        if (!(currentVersion < step.belowVersion))
            continue;
        if (RunUpgradeStep(step) == false)
            return ERR_FAIL;
        if (step.migratesCurrentLocation)
            MigrateCurrentLocationId(*this);
    }
    return ERR_OK;
}

int DBController::GetWeatherNewsIcon(int iconId, bool isDayTime)
{
    std::string iconDBPath = FileUtil::GetWeatherNewsIconDBFilePath();
    COMMON_RETV_IF(iconDBPath.length() < 1, 0);

    // Shipped with the program: read-only, so a missing file is reported
    // instead of an empty database being created in the resource folder.
    sqlite3* rawHandle = nullptr;
    int rc = sqlite3_open_v2(iconDBPath.c_str(), &rawHandle, SQLITE_OPEN_SHAREDCACHE | SQLITE_OPEN_READONLY,
                             nullptr);
    std::unique_ptr<sqlite3, SqliteCloser> handle(rawHandle);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("sqlite3_open_open failed. %d %p", rc, static_cast<void*>(rawHandle));
        return 0;
    }
    return SelectMappedIcon(handle.get(), iconId, isDayTime);
}

}  // namespace NSWeather

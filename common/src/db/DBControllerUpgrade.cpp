#include "DBController.h"

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

std::string GetWeatherDBFilePath()
{
    return FileUtil::GetWeatherDBFilePath();
}

// Runs one step in a cycle of its own. A step refused as such (the column
// is already there, the table already gone) is skipped; false when the
// database cannot be opened or written (busy, full, read-only).
bool RunUpgradeStep(const UpgradeStep& step)
{
    COMMON_LOG("%s : %s", step.logLabel, step.query);
    DBCycleCloser cycle(GetWeatherDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, false);
    DBConnector* dbConnector = DBConnector::GetInstance();
    bool isDone = dbConnector->DBExecuteQuery(step.query) || dbConnector->GetLastErrorCode() == SQLITE_ERROR;
    return cycle.Close(isDone);
}

// The current-location city used to be stored under the provider's bare
// key; it now carries ":C" so that it never collides with the same city
// added by hand.
bool MigrateCurrentLocationId(DBController& dbController)
{
    CityPtrVectorPtr cityPtrVector = dbController.SelectAllCityData();
    COMMON_RETV_IF(!cityPtrVector, false);
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
                return dbController.UpdateCityData(cityPtr) == ERR_OK;
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
    return true;
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
        if (step.migratesCurrentLocation && MigrateCurrentLocationId(*this) == false)
            return ERR_FAIL;
    }
    return ERR_OK;
}

}  // namespace NSWeather

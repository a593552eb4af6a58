#ifndef NSWEATHER_DB_CONTROLLER_H
#define NSWEATHER_DB_CONTROLLER_H

#include <memory>
#include <string>
#include <vector>

#include "City.h"

namespace NSWeather
{

class CityDBController;

using StringVector = std::vector<std::string>;
using StringVectorPtr = std::shared_ptr<StringVector>;

// The weather database as the rest of the system sees it. Every operation
// is one complete cycle on the DBConnector (open, one transaction, close);
// a city is always read, written and deleted together with its forecast
// rows. Failures give the empty value of the operation: null, -1, false,
// an empty string or ERR_FAIL.
class DBController
{
public:
    DBController();
    virtual ~DBController();

    // Creates the missing tables; ERR_OK or ERR_FAIL.
    int Initialize();

    // Cities in page order with all their forecasts; empty, not null, when
    // there are none, and null when any read of them failed. Pages 0 to count - 1 are read and a missing page
    // (a gap another writer left) is skipped, never a null entry, so a city's position may differ from its
    // page index: callers pick the displayed city and its neighbours by position in this list, never by page
    // index.
    CityPtrVectorPtr SelectAllCityData();
    CityPtr SelectCityData(int pageIndex);
    CityPtr SelectCityData(const std::string& locationID);
    StringVectorPtr SelectAllLocationIDData();
    StringVectorPtr SelectNeedToUpdateLocationIDData();
    int GetNumberOfCities();
    int GetPageIndexOfCurrentCity();
    int GetPageIndexWithLocationID(const std::string& locationID);
    std::string GetLocationIdOfCurrentCity();
    bool IsCurrentLocationExist();

    // Writers return ERR_OK or ERR_FAIL. ERR_FAIL also when any statement of
    // the operation failed (locked, full or read-only file): then nothing of
    // it is kept. A city with the location id and current-location flag of
    // a stored one is not inserted (ERR_FAIL); a city that is not stored is
    // not updated (ERR_FAIL).
    int InsertCityData(CityPtr cityPtr);
    int UpdateCityData(CityPtr cityPtr);
    // The count never drops below 0.
    int UpdateOnlyWidgetReferenceCount(const std::string& locationID, bool isIncrease);
    int UpdateOnlyMobileLink(CityPtr cityPtr);
    int ReorderCityData(CityPtrVectorPtr reorderPtrVector);
    // Moves the city at one position of the page order to another, reading
    // the order in the same transaction; the moved city's location id, or
    // empty when a position is out of range or the write failed.
    std::string MoveCityData(int fromPosition, int toPosition);
    int DeleteCityData(int pageIndex);
    int DeleteCityData(const std::string& locationID);
    int DeleteAllCityData();
    // Found and removed in one transaction; ERR_OK also when there is none.
    int DeleteCurrentLocationCityData();
    // Replaces every city in a single transaction: another process sees the
    // old list or the new one, never a half-written one.
    int DeleteAllCityDataAndInsertCityPtrVector(CityPtrVectorPtr cityPtrVector);
    int UpdateOnlyMoonPhaseData(CityPtr cityPtr);
    // Removes moon rows whose location id belongs to no city.
    int DeleteUselessMoonPhaseData();

    // True when the oldest city refresh is older than the auto-refresh
    // interval of the settings.
    bool GetIsWeatherInfoExpired();

    // Defined in common/src/db/DBControllerUpgrade.cpp. ERR_FAIL when a
    // step could not run; the version is then left for the next start.
    int UpgradeDB();
    int UpgradeDB(double currentVersion);
    // The widget icon for a WeatherNews icon number, 0 on any failure.
    int GetWeatherNewsIcon(int iconId, bool isDayTime);

private:
    enum class InsertResult
    {
        INSERTED,
        ALREADY_STORED,
        FAILED,
    };

    CityPtr SelectDataWithPrimaryKey(CityDBController& cityDBController, int primaryKey);
    CityPtrVectorPtr SelectAllCities(CityDBController& cityDBController);
    InsertResult InsertIfNew(CityDBController& cityDBController, CityPtr cityPtr);
    bool InsertDataWithCityPtr(CityDBController& cityDBController, CityPtr cityPtr);
    bool UpdateDataWithCityPtr(CityDBController& cityDBController, CityPtr cityPtr);
    bool DeleteDataWithPrimaryKey(CityDBController& cityDBController, int primaryKey);
    bool DeleteAll(CityDBController& cityDBController);
    // The page index of a city without one is looked up by its location id.
    int ResolvePrimaryKey(CityDBController& cityDBController, const CityPtr& cityPtr);
};

using DBControllerPtr = std::shared_ptr<DBController>;

}  // namespace NSWeather

#endif

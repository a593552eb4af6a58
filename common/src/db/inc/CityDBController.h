#ifndef NSWEATHER_CITY_DB_CONTROLLER_H
#define NSWEATHER_CITY_DB_CONTROLLER_H

#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "City.h"
#include "QueryGenernator.h"

namespace NSWeather
{

class DBStatement;

// Statements on CITY_TABLE. Runs on the cycle the caller has opened.
class CityDBController
{
public:
    static const char* const TABLE_NAME;
    static const char* const CREATE_TABLE_FORMAT;

    CityDBController();
    virtual ~CityDBController();

    // Writers return false when a step failed or the record is null.
    bool CreateTable();
    // A current-location city gets ":C" appended to its id (record and row).
    bool Insert(CityPtr cityPtr);
    // Leaves the widget reference count as stored.
    bool Update(CityPtr cityPtr, int primaryKey);
    bool UpdateOnlyWidgetReferenceCount(const std::string& locationId, int count);
    bool UpdateOnlyMobileLink(CityPtr cityPtr, int primaryKey);
    int GetLastInsertedPrimaryKey();
    // 0 when no row matches.
    int GetPrimaryKey(int pageIndex);
    int GetPrimaryKey(const std::string& locationId);
    // -1 when no row comes back.
    int GetNumberOfCities();
    int GetPageIndexOfCurrentCity();
    int GetPageIndexWithLocationID(const std::string& locationId);
    std::string GetLocationIDWithPageIndex(int pageIndex);
    std::string GetLocationIdOfCurrentCity();
    bool IsCurrentLocationExist();
    // Page indexes become 0, 1, ... in insertion (PK_ID) order.
    bool SetPageIndexAsAscending();
    bool Delete(int primaryKey);
    bool DeleteAll();
    // Each city's stored page index names its row; its position in the
    // vector becomes the new page index.
    // False also when a city of the vector is null or names no stored row.
    bool Reorder(CityPtrVectorPtr reorderPtrVector);
    CityPtr Select(int primaryKey);
    CityPtr Select(const std::string& locationId);
    // Every row as (PK_ID, city without children), in PK_ID order.
    std::vector<std::pair<int, CityPtr>> SelectAll();
    // The rows with a page, in page order; the lowest key of a page wins.
    std::vector<std::pair<int, CityPtr>> SelectAllInPageOrder();

private:
    using Binder = std::function<void(DBStatement&)>;

    std::string ResolveLocationId(CityPtr cityPtr);
    int SelectInt(const std::string& column, const std::string& condition, const Binder& binder,
                  int defaultValue);
    std::string SelectText(const std::string& column, const std::string& condition, const Binder& binder);
    CityPtr SelectCity(const std::string& condition, const Binder& binder);

    QueryGenernator mQueryGenernator;
};

using CityDBControllerPtr = std::shared_ptr<CityDBController>;

}  // namespace NSWeather

#endif

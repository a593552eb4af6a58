#ifndef NSWEATHER_CURRENT_WEATHER_DB_CONTROLLER_H
#define NSWEATHER_CURRENT_WEATHER_DB_CONTROLLER_H

#include <map>
#include <memory>

#include "Current.h"
#include "QueryGenernator.h"

namespace NSWeather
{

// Statements on CURRENT_WEATHER_TABLE (one row per city, keyed by FK_ID).
class CurrentWeatherDBController
{
public:
    static const char* const TABLE_NAME;
    static const char* const CREATE_TABLE_FORMAT;

    CurrentWeatherDBController();
    virtual ~CurrentWeatherDBController();

    // Writers return false when a step failed; a null record writes nothing.
    bool CreateTable();
    bool DeleteAll();
    bool Delete(int foreignKey);
    bool Insert(int foreignKey, CurrentPtr currentPtr);
    bool Update(int foreignKey, CurrentPtr currentPtr);
    // Null when the city has no row.
    CurrentPtr Select(int foreignKey);
    // Every city's row by FK_ID in one pass (the first row of a key wins,
    // as in Select).
    std::map<int, CurrentPtr> SelectAll();

private:
    QueryGenernator mQueryGenernator;
};

using CurrentWeatherDBControllerPtr = std::shared_ptr<CurrentWeatherDBController>;

}  // namespace NSWeather

#endif

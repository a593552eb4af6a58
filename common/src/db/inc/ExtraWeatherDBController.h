#ifndef NSWEATHER_EXTRA_WEATHER_DB_CONTROLLER_H
#define NSWEATHER_EXTRA_WEATHER_DB_CONTROLLER_H

#include <map>
#include <memory>

#include "Extra.h"
#include "QueryGenernator.h"

namespace NSWeather
{

// Statements on EXTRA_WEATHER_TABLE (one row per city, keyed by FK_ID).
class ExtraWeatherDBController
{
public:
    static const char* const TABLE_NAME;
    static const char* const CREATE_TABLE_FORMAT;

    ExtraWeatherDBController();
    virtual ~ExtraWeatherDBController();

    // Writers return false when a step failed; a null record writes nothing.
    bool CreateTable();
    bool DeleteAll();
    bool Delete(int foreignKey);
    bool Insert(int foreignKey, ExtraPtr extraPtr);
    bool Update(int foreignKey, ExtraPtr extraPtr);
    // Null when the city has no row.
    ExtraPtr Select(int foreignKey);
    // Every city's row by FK_ID in one pass (the first row of a key wins).
    std::map<int, ExtraPtr> SelectAll();

private:
    QueryGenernator mQueryGenernator;
};

using ExtraWeatherDBControllerPtr = std::shared_ptr<ExtraWeatherDBController>;

}  // namespace NSWeather

#endif

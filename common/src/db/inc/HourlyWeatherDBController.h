#ifndef NSWEATHER_HOURLY_WEATHER_DB_CONTROLLER_H
#define NSWEATHER_HOURLY_WEATHER_DB_CONTROLLER_H

#include <map>
#include <memory>

#include "Hourly.h"
#include "QueryGenernator.h"

namespace NSWeather
{

// Statements on HOURLY_WEATHER_TABLE (rows keyed by FK_ID and hourlyIndex).
class HourlyWeatherDBController
{
public:
    static const char* const TABLE_NAME;
    static const char* const CREATE_TABLE_FORMAT;

    HourlyWeatherDBController();
    virtual ~HourlyWeatherDBController();

    // Writers return false when a step failed; a null record writes nothing.
    bool CreateTable();
    bool DeleteAll();
    bool Delete(int foreignKey);
    // Row i of the vector is stored with hourlyIndex i.
    bool Insert(int foreignKey, HourlyPtrVectorPtr hourlyPtrVector);
    // Changes only rows that exist; extra records are not written.
    bool Update(int foreignKey, HourlyPtrVectorPtr hourlyPtrVector);
    // Never null; empty when the city has no rows.
    HourlyPtrVectorPtr Select(int foreignKey);
    // Every city's rows by FK_ID in one pass, each list in the order Select
    // gives it.
    std::map<int, HourlyPtrVectorPtr> SelectAll();

private:
    QueryGenernator mQueryGenernator;
};

using HourlyWeatherDBControllerPtr = std::shared_ptr<HourlyWeatherDBController>;

}  // namespace NSWeather

#endif

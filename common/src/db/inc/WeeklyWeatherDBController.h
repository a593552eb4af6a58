#ifndef NSWEATHER_WEEKLY_WEATHER_DB_CONTROLLER_H
#define NSWEATHER_WEEKLY_WEATHER_DB_CONTROLLER_H

#include <map>
#include <memory>

#include "Weekly.h"
#include "QueryGenernator.h"

namespace NSWeather
{

// Statements on WEEKLY_WEATHER_TABLE (rows keyed by FK_ID and weeklyIndex).
class WeeklyWeatherDBController
{
public:
    static const char* const TABLE_NAME;
    static const char* const CREATE_TABLE_FORMAT;

    WeeklyWeatherDBController();
    virtual ~WeeklyWeatherDBController();

    // Writers return false when a step failed; a null record writes nothing.
    bool CreateTable();
    bool DeleteAll();
    bool Delete(int foreignKey);
    // Row i of the vector is stored with weeklyIndex i.
    bool Insert(int foreignKey, WeeklyPtrVectorPtr weeklyPtrVector);
    // Changes only rows that exist; extra records are not written.
    bool Update(int foreignKey, WeeklyPtrVectorPtr weeklyPtrVector);
    // Never null; empty when the city has no rows.
    WeeklyPtrVectorPtr Select(int foreignKey);
    // Every city's rows by FK_ID in one pass, each list in the order Select
    // gives it.
    std::map<int, WeeklyPtrVectorPtr> SelectAll();

private:
    QueryGenernator mQueryGenernator;
};

using WeeklyWeatherDBControllerPtr = std::shared_ptr<WeeklyWeatherDBController>;

}  // namespace NSWeather

#endif

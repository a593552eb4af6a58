#ifndef NSWEATHER_MOON_PHASE_DB_CONTROLLER_H
#define NSWEATHER_MOON_PHASE_DB_CONTROLLER_H

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "MoonPhase.h"
#include "QueryGenernator.h"

namespace NSWeather
{

// Statements on MOON_PHASE_TABLE (rows keyed by FK_ID and moonPhaseIndex,
// also found by their locationID).
class MoonPhaseDBController
{
public:
    static const char* const TABLE_NAME;
    static const char* const CREATE_TABLE_FORMAT;

    MoonPhaseDBController();
    virtual ~MoonPhaseDBController();

    // Writers return false when a step failed; a null record writes nothing.
    bool CreateTable();
    bool DeleteAll();
    bool Delete(int foreignKey);
    bool Delete(const std::string& locationId);
    bool Insert(int foreignKey, MoonPhasePtrVectorPtr moonPhasePtrVector);
    bool Update(int foreignKey, MoonPhasePtrVectorPtr moonPhasePtrVector);
    // Never null; empty when the city has no rows.
    MoonPhasePtrVectorPtr Select(int foreignKey);
    // Every city's rows by FK_ID in one pass, each list in the order Select
    // gives it.
    std::map<int, MoonPhasePtrVectorPtr> SelectAll();
    // The location id of every stored series (its first row).
    std::vector<std::string> SelectAllLocationId();

private:
    QueryGenernator mQueryGenernator;
};

using MoonPhaseDBControllerPtr = std::shared_ptr<MoonPhaseDBController>;

}  // namespace NSWeather

#endif

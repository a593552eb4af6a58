#ifndef NSWEATHER_CITY_CATALOGUE_H
#define NSWEATHER_CITY_CATALOGUE_H

#include <memory>
#include <string>
#include <vector>

#include "CatalogueCity.h"

namespace NSWeather
{

// The catalogue of world cities that the agent and the app pick from,
// largest city first. Read once from the data file built with the suite.
class CityCatalogue
{
public:
    virtual ~CityCatalogue() = default;

    // "<shared res of the weather app>/catalogue/cities.tsv".
    static std::string GetDefaultPath();
    // Null (logged) when the file is missing, too large or holds no city;
    // malformed lines are skipped with a log line.
    static std::shared_ptr<CityCatalogue> Load(const std::string& path);

    size_t GetSize() const { return mCityPtrVector.size(); }
    CatalogueCityPtr FindById(const std::string& id) const;
    // Cities whose name (either form) starts with `prefix`, compared without
    // case or accents (Unicode case folding, marks dropped), largest first,
    // at most `maxCount`.
    CatalogueCityPtrVector FindByPrefix(const std::string& prefix, size_t maxCount) const;
    // The city nearest to the position on the globe; null for a position
    // off the globe.
    CatalogueCityPtr FindNearest(double latitude, double longitude) const;

    // Great-circle distance in kilometres.
    static double DistanceKm(double lat1, double lon1, double lat2, double lon2);
    static std::string FoldCase(const std::string& text);

private:
    struct Entry
    {
        CatalogueCityPtr cityPtr;
        std::string foldedName;
        std::string foldedNameEng;
    };
    std::vector<Entry> mEntries;
    CatalogueCityPtrVector mCityPtrVector;
};

using CityCataloguePtr = std::shared_ptr<CityCatalogue>;

}  // namespace NSWeather

#endif

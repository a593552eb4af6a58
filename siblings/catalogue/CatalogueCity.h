#ifndef NSWEATHER_CATALOGUE_CITY_H
#define NSWEATHER_CATALOGUE_CITY_H

#include <memory>
#include <string>
#include <vector>

namespace NSWeather
{

// One city of the catalogue: names, country, position and IANA time zone.
class CatalogueCity
{
public:
    virtual ~CatalogueCity() = default;

    // Parses one tab-separated catalogue line; null for a malformed one.
    static std::shared_ptr<CatalogueCity> FromLine(const std::string& line);

    const std::string& GetId() const { return mId; }
    // Name as the set writes it (with its accents), and in plain letters.
    const std::string& GetName() const { return mName; }
    const std::string& GetNameEng() const { return mNameEng; }
    const std::string& GetCountry() const { return mCountry; }
    const std::string& GetCountryCode() const { return mCountryCode; }
    const std::string& GetProvince() const { return mProvince; }
    double GetLatitude() const { return mLatitude; }
    double GetLongitude() const { return mLongitude; }
    const std::string& GetTimeZone() const { return mTimeZone; }
    long long GetPopulation() const { return mPopulation; }

private:
    std::string mId;
    std::string mName;
    std::string mNameEng;
    std::string mCountry;
    std::string mCountryCode;
    std::string mProvince;
    double mLatitude = 0.0;
    double mLongitude = 0.0;
    std::string mTimeZone;
    long long mPopulation = 0;
};

using CatalogueCityPtr = std::shared_ptr<CatalogueCity>;
using CatalogueCityPtrVector = std::vector<CatalogueCityPtr>;

}  // namespace NSWeather

#endif

#include "CatalogueCity.h"

#include <cerrno>
#include <cmath>
#include <cstdlib>

namespace NSWeather
{

namespace
{
constexpr size_t FIELD_COUNT = 10;

std::vector<std::string> SplitTabs(const std::string& line)
{
    std::vector<std::string> fields;
    size_t start = 0;
    while (fields.size() < FIELD_COUNT + 1)
    {
        size_t tab = line.find('\t', start);
        fields.push_back(line.substr(start, tab == std::string::npos ? std::string::npos : tab - start));
        if (tab == std::string::npos)
            break;
        start = tab + 1;
    }
    return fields;
}

bool ParseDouble(const std::string& text, double& value)
{
    if (text.empty())
        return false;
    char* end = nullptr;
    errno = 0;
    value = strtod(text.c_str(), &end);
    return errno == 0 && end && *end == '\0' && std::isfinite(value);
}

bool ParseCount(const std::string& text, long long& value)
{
    if (text.empty())
        return false;
    char* end = nullptr;
    errno = 0;
    value = strtoll(text.c_str(), &end, 10);
    return errno == 0 && end && *end == '\0' && value >= 0;
}

// Ids become location ids, which the store suffixes with ":C".
bool IsValidId(const std::string& id)
{
    if (id.empty() || id.size() > 64)
        return false;
    for (char c : id)
        if (!((c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '-'))
            return false;
    return true;
}
}  // namespace

CatalogueCityPtr CatalogueCity::FromLine(const std::string& line)
{
    std::vector<std::string> fields = SplitTabs(line);
    if (fields.size() != FIELD_COUNT)
        return nullptr;
    auto cityPtr = std::make_shared<CatalogueCity>();
    cityPtr->mId = fields[0];
    cityPtr->mName = fields[1];
    cityPtr->mNameEng = fields[2];
    cityPtr->mCountry = fields[3];
    cityPtr->mCountryCode = fields[4];
    cityPtr->mProvince = fields[5];
    cityPtr->mTimeZone = fields[8];
    bool isValid = IsValidId(cityPtr->mId) && !cityPtr->mName.empty() && !cityPtr->mNameEng.empty() &&
                   !cityPtr->mTimeZone.empty() && ParseDouble(fields[6], cityPtr->mLatitude) &&
                   ParseDouble(fields[7], cityPtr->mLongitude) &&
                   ParseCount(fields[9], cityPtr->mPopulation) && std::fabs(cityPtr->mLatitude) <= 90.0 &&
                   std::fabs(cityPtr->mLongitude) <= 180.0;
    return isValid ? cityPtr : nullptr;
}

}  // namespace NSWeather

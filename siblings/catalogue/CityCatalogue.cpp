#include "CityCatalogue.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <unicode/normalizer2.h>
#include <unicode/uchar.h>
#include <unicode/unistr.h>

#include <algorithm>
#include <cmath>
#include <cstdio>

#include "FileUtil.h"
#include "SiblingLog.h"

namespace NSWeather
{

namespace
{
constexpr off_t MAX_FILE_BYTES = 8 * 1024 * 1024;
constexpr size_t MAX_LINE_BYTES = 1024;
constexpr double EARTH_RADIUS_KM = 6371.0;
constexpr double PI = 3.14159265358979323846;

double Radians(double degrees)
{
    return degrees * PI / 180.0;
}

// The whole file when it is a regular file of a sane size; false otherwise.
bool ReadBounded(const std::string& path, std::string& text)
{
    int fd = open(path.c_str(), O_RDONLY | O_CLOEXEC);
    SIBLING_RETV_IF(fd < 0, false);
    struct stat st;
    bool isUsable = fstat(fd, &st) == 0 && S_ISREG(st.st_mode) && st.st_size <= MAX_FILE_BYTES;
    if (isUsable)
    {
        text.resize(static_cast<size_t>(st.st_size));
        size_t done = 0;
        while (done < text.size())
        {
            ssize_t n = read(fd, &text[done], text.size() - done);
            if (n <= 0)
                break;
            done += static_cast<size_t>(n);
        }
        text.resize(done);
    }
    close(fd);
    SIBLING_RETV_IF(!isUsable, false);
    return true;
}
}  // namespace

std::string CityCatalogue::GetDefaultPath()
{
    std::string dir = FileUtil::GetSharedResourceDirectoryPath();
    return dir.empty() ? std::string() : dir + "catalogue/cities.tsv";
}

std::string CityCatalogue::FoldCase(const std::string& text)
{
    // Case folded and without accents, so "montre" finds "Montréal".
    UErrorCode status = U_ZERO_ERROR;
    const icu::Normalizer2* nfd = icu::Normalizer2::getNFDInstance(status);
    icu::UnicodeString decomposed = icu::UnicodeString::fromUTF8(text).foldCase();
    if (nfd && U_SUCCESS(status))
        decomposed = nfd->normalize(decomposed, status);
    icu::UnicodeString plain;
    for (int32_t i = 0; i < decomposed.length();)
    {
        UChar32 c = decomposed.char32At(i);
        if (U_FAILURE(status) || u_charType(c) != U_NON_SPACING_MARK)
            plain.append(c);
        i += U16_LENGTH(c);
    }
    std::string folded;
    plain.toUTF8String(folded);
    return folded;
}

std::shared_ptr<CityCatalogue> CityCatalogue::Load(const std::string& path)
{
    std::string text;
    if (path.empty() || !ReadBounded(path, text))
    {
        SIBLING_LOG("cannot read the city catalogue %s", path.c_str());
        return nullptr;
    }
    auto cataloguePtr = std::make_shared<CityCatalogue>();
    size_t start = 0;
    int lineNumber = 0;
    while (start < text.size())
    {
        size_t end = text.find('\n', start);
        std::string line = text.substr(start, end == std::string::npos ? std::string::npos : end - start);
        start = end == std::string::npos ? text.size() : end + 1;
        ++lineNumber;
        if (line.empty() || line[0] == '#')
            continue;
        CatalogueCityPtr cityPtr = line.size() <= MAX_LINE_BYTES ? CatalogueCity::FromLine(line) : nullptr;
        if (!cityPtr || cataloguePtr->FindById(cityPtr->GetId()))
        {
            SIBLING_LOG("catalogue line %d skipped", lineNumber);
            continue;
        }
        cataloguePtr->mEntries.push_back(
            {cityPtr, FoldCase(cityPtr->GetName()), FoldCase(cityPtr->GetNameEng())});
        cataloguePtr->mCityPtrVector.push_back(cityPtr);
    }
    SIBLING_RETV_IF(cataloguePtr->mCityPtrVector.empty(), nullptr);
    return cataloguePtr;
}

CatalogueCityPtr CityCatalogue::FindById(const std::string& id) const
{
    for (const CatalogueCityPtr& cityPtr : mCityPtrVector)
        if (cityPtr->GetId() == id)
            return cityPtr;
    return nullptr;
}

CatalogueCityPtrVector CityCatalogue::FindByPrefix(const std::string& prefix, size_t maxCount) const
{
    CatalogueCityPtrVector found;
    std::string folded = FoldCase(prefix);
    if (folded.empty())
        return found;
    for (const Entry& entry : mEntries)
    {
        if (found.size() >= maxCount)
            break;
        if (entry.foldedName.compare(0, folded.size(), folded) == 0 ||
            entry.foldedNameEng.compare(0, folded.size(), folded) == 0)
            found.push_back(entry.cityPtr);
    }
    return found;
}

CatalogueCityPtr CityCatalogue::FindNearest(double latitude, double longitude) const
{
    SIBLING_RETV_IF(!std::isfinite(latitude) || !std::isfinite(longitude), nullptr);
    SIBLING_RETV_IF(std::fabs(latitude) > 90.0 || std::fabs(longitude) > 180.0, nullptr);
    CatalogueCityPtr nearestPtr;
    double nearest = 0.0;
    for (const CatalogueCityPtr& cityPtr : mCityPtrVector)
    {
        double distance = DistanceKm(latitude, longitude, cityPtr->GetLatitude(), cityPtr->GetLongitude());
        if (!nearestPtr || distance < nearest)
        {
            nearestPtr = cityPtr;
            nearest = distance;
        }
    }
    return nearestPtr;
}

double CityCatalogue::DistanceKm(double lat1, double lon1, double lat2, double lon2)
{
    double dLat = Radians(lat2 - lat1);
    double dLon = Radians(lon2 - lon1);
    double a = std::sin(dLat / 2) * std::sin(dLat / 2) +
               std::cos(Radians(lat1)) * std::cos(Radians(lat2)) * std::sin(dLon / 2) * std::sin(dLon / 2);
    return 2.0 * EARTH_RADIUS_KM * std::asin(std::sqrt(std::min(1.0, a)));
}

}  // namespace NSWeather

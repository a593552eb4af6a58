#include "CityTimeZone.h"

#include <unicode/timezone.h>
#include <unicode/unistr.h>

#include <memory>

#include "SiblingLog.h"

namespace NSWeather
{

bool CityTimeZone::GetOffset(const std::string& zoneId, time_t when, double& offsetHours, bool& isSummerTime)
{
    std::unique_ptr<icu::TimeZone> zone(icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(zoneId)));
    SIBLING_RETV_IF(!zone, false);
    icu::UnicodeString id;
    zone->getID(id);
    if (zoneId.empty() || id == icu::UnicodeString("Etc/Unknown"))
    {
        SIBLING_LOG("unknown time zone '%s'", zoneId.c_str());
        return false;
    }
    int32_t rawOffset = 0;
    int32_t dstOffset = 0;
    UErrorCode status = U_ZERO_ERROR;
    zone->getOffset(static_cast<UDate>(when) * 1000.0, false, rawOffset, dstOffset, status);
    if (U_FAILURE(status))
    {
        SIBLING_LOG("offset of %s failed: %s", zoneId.c_str(), u_errorName(status));
        return false;
    }
    offsetHours = (rawOffset + dstOffset) / 3600000.0;
    isSummerTime = dstOffset != 0;
    return true;
}

}  // namespace NSWeather

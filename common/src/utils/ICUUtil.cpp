#include "ICUUtil.h"

#include <utils_i18n.h>

#include <cstdlib>
#include <cstring>
#include <map>
#include <memory>
#include <tuple>
#include <type_traits>

#include "CommonLog.h"

namespace NSWeather
{

namespace
{
// UTF-16 units of the zone, pattern and result buffers.
const int32_t kBufferUnits = 64;
// Room for the UTF-8 of a full result buffer.
const int32_t kUtf8Bytes = kBufferUnits * 3 + 1;

const char* const kSkeletons[ICUUtil::SKELETON_COUNT] = {
    "dd",    "MMMdd",        "yyyyMMM",      "yyyyMMMdd",  "ddMMMyyyy", "MMMMdyyyy", "yyyyMMMMdd",
    "yyyy",  "MMM",          "HHmm",         "hhmm",       "EEE",       "MM",        "MMMMEd",
    "MMMEd", "MMdd",         "yyyy/MM/dd",   "a",          "h",         "HH",        "mm",
    "d",     "EEEdMMM HHmm", "EEEdMMM hhmm", "MMMdd HHmm", "MMMdd hhmm"};

std::u16string ToUtf16(const std::string& text)
{
    i18n_uchar buffer[kBufferUnits + 1] = {0};
    if (!i18n_ustring_copy_ua_n(buffer, text.c_str(), kBufferUnits))
        return std::u16string();
    return std::u16string(reinterpret_cast<const char16_t*>(buffer));
}

std::string ToUtf8(const i18n_uchar* text)
{
    char buffer[kUtf8Bytes] = {0};
    if (!i18n_ustring_copy_au_n(buffer, text, kUtf8Bytes - 1))
        return std::string();
    return std::string(buffer);
}

const i18n_uchar* AsUChars(const std::u16string& text)
{
    return reinterpret_cast<const i18n_uchar*>(text.c_str());
}

struct FormatDestroy
{
    void operator()(i18n_udate_format_h format) const { i18n_udate_destroy(format); }
};
using FormatOwner = std::unique_ptr<std::remove_pointer<i18n_udate_format_h>::type, FormatDestroy>;

// A pattern generator costs milliseconds; a rebuild asks for the same few
// patterns and formats many times. Keyed on every value the result depends
// on (locale, skeleton, zone), so a changed locale, zone or 12/24 setting
// misses instead of serving a stale text.
std::map<std::pair<std::string, std::string>, std::u16string> gPatternCache;
std::map<std::tuple<std::string, std::string, std::u16string>, FormatOwner> gFormatCache;
// Bounds both caches: locales and zones change rarely, but nothing stops them.
const size_t kCacheEntries = 64;
}  // namespace

void ICUUtil::ClearCache()
{
    gPatternCache.clear();
    gFormatCache.clear();
}

std::string ICUUtil::GetLocaleStr()
{
    const char* locale = nullptr;
    if (i18n_ulocale_get_default(&locale) != I18N_ERROR_NONE || !locale)
        locale = "en_US.UTF-8";
    char buffer[64] = {0};
    strncpy(buffer, locale, sizeof(buffer) - 1);
    char* save = nullptr;
    char* token = strtok_r(buffer, ".", &save);
    // strtok skips leading dots; a text that begins with one has no locale part.
    if (buffer[0] == '.')
        token = NULL;
    COMMON_RETV_IF(token == NULL, "en_US");
    return token;
}

int ICUUtil::GetTmGmtOff()
{
    time_t now = time(nullptr);
    struct tm local;
    if (!localtime_r(&now, &local))
        return 0;
    return static_cast<int>(local.tm_gmtoff);
}

std::string ICUUtil::MakeTimeZoneId(int offsetSeconds)
{
    long magnitude = offsetSeconds < 0 ? -static_cast<long>(offsetSeconds) : offsetSeconds;
    long minutes = (magnitude % 3600) / 60;
    std::string id =
        std::string("GMT") + (offsetSeconds < 0 ? "-" : "+") + std::to_string(magnitude / 3600) + ":";
    if (minutes < 10)
        id += "0";
    return id + std::to_string(minutes);
}

std::string ICUUtil::GetSkeleton(int index)
{
    if (index < 0 || index >= SKELETON_COUNT)
        return std::string();
    return kSkeletons[index];
}

std::string ICUUtil::GetDateTimeString(time_t t, int index)
{
    COMMON_RETV_IF(index < 0 || index >= SKELETON_COUNT, std::string());
    int offset = GetTmGmtOff();
    int ret = i18n_ulocale_set_default(getenv("LC_TIME"));
    if (ret != I18N_ERROR_NONE)
        COMMON_LOG("i18n_ulocale_set_default failed(%d)", ret);
    std::string locale = GetLocaleStr();
    std::u16string pattern = GetPattern(locale, index);
    if (pattern.empty())
        return std::string();
    return Format(t, locale, MakeTimeZoneId(offset), pattern);
}

std::u16string ICUUtil::GetPattern(const std::string& locale, int index)
{
    if (index == SKELETON_MMdd && locale == "ko_KR")
        return u"MM/dd";
    if (index == SKELETON_MMdd && locale == "lo_LA")
        return u"dd/MM";
    return GetBestPattern(locale, kSkeletons[index]);
}

std::u16string ICUUtil::GetBestPattern(const std::string& locale, const std::string& skeleton)
{
    auto key = std::make_pair(locale, skeleton);
    auto found = gPatternCache.find(key);
    if (found != gPatternCache.end())
        return found->second;
    std::u16string pattern = MakeBestPattern(locale, skeleton);
    if (pattern.empty())
        return pattern;
    if (gPatternCache.size() >= kCacheEntries)
        gPatternCache.clear();
    gPatternCache.emplace(key, pattern);
    return pattern;
}

std::u16string ICUUtil::MakeBestPattern(const std::string& locale, const std::string& skeleton)
{
    i18n_udatepg_h generator = nullptr;
    int ret = i18n_udatepg_create(locale.c_str(), &generator);
    if (ret != I18N_ERROR_NONE || !generator)
    {
        COMMON_LOG("i18n_udatepg_create failed(%d)", ret);
        return std::u16string();
    }
    std::u16string skeletonText = ToUtf16(skeleton);
    i18n_uchar pattern[kBufferUnits + 1] = {0};
    int32_t length = 0;
    ret =
        i18n_udatepg_get_best_pattern(generator, AsUChars(skeletonText), -1, pattern, kBufferUnits, &length);
    i18n_udatepg_destroy(generator);
    if (ret != I18N_ERROR_NONE || length <= 0 || length > kBufferUnits)
    {
        COMMON_LOG("i18n_udatepg_get_best_pattern failed(%d)", ret);
        return std::u16string();
    }
    return std::u16string(reinterpret_cast<const char16_t*>(pattern), static_cast<size_t>(length));
}

namespace
{
i18n_udate_format_h GetFormat(const std::string& locale, const std::string& zoneId,
                              const std::u16string& pattern)
{
    auto key = std::make_tuple(locale, zoneId, pattern);
    auto found = gFormatCache.find(key);
    if (found != gFormatCache.end())
        return found->second.get();
    std::u16string zone = ToUtf16(zoneId);
    i18n_udate_format_h format = nullptr;
    int ret = i18n_udate_create(I18N_UDATE_PATTERN, I18N_UDATE_PATTERN, locale.c_str(), AsUChars(zone), -1,
                                AsUChars(pattern), static_cast<int>(pattern.size()), &format);
    if (ret != I18N_ERROR_NONE || !format)
    {
        COMMON_LOG("i18n_udate_create failed(%d)", ret);
        return nullptr;
    }
    if (gFormatCache.size() >= kCacheEntries)
        gFormatCache.clear();
    gFormatCache.emplace(key, FormatOwner(format));
    return format;
}
}  // namespace

std::string ICUUtil::Format(time_t t, const std::string& locale, const std::string& zoneId,
                            const std::u16string& pattern)
{
    i18n_udate_format_h format = GetFormat(locale, zoneId, pattern);
    if (!format)
        return std::string();
    i18n_uchar result[kBufferUnits + 1] = {0};
    int32_t needed = 0;
    int ret = i18n_udate_format_date(format, static_cast<i18n_udate>(t) * 1000.0, result, kBufferUnits,
                                     nullptr, &needed);
    if (ret != I18N_ERROR_NONE || needed > kBufferUnits)
    {
        COMMON_LOG("i18n_udate_format_date failed(%d)", ret);
        return std::string();
    }
    return ToUtf8(result);
}

}  // namespace NSWeather

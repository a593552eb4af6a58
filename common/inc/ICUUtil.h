#ifndef NSWEATHER_ICU_UTIL_H
#define NSWEATHER_ICU_UTIL_H

#include <ctime>
#include <string>

namespace NSWeather
{

// Locale-aware date and time texts in the device's current UTC offset.
// Main loop only.
class ICUUtil
{
public:
    // Indexes of the skeleton table that callers use.
    enum SkeletonIndex
    {
        SKELETON_HHMM = 9,
        SKELETON_hhmm = 10,
        SKELETON_EEE = 11,
        SKELETON_MMdd = 15,
        SKELETON_EEEdMMM_HHmm = 22,
        SKELETON_EEEdMMM_hhmm = 23,
        SKELETON_COUNT = 26
    };

    virtual ~ICUUtil() = default;

    // The i18n default locale without its encoding ("ko_KR" of
    // "ko_KR.UTF-8"); "en_US" when there is nothing before the dot.
    static std::string GetLocaleStr();
    // Seconds east of UTC of the device's local time now.
    static int GetTmGmtOff();
    // t formatted with the best pattern for the skeleton at `index` in the
    // region-format locale (LC_TIME); empty on any failure.
    static std::string GetDateTimeString(time_t t, int index);
    // "GMT+5:30", "GMT-3:30", "GMT+0:00".
    static std::string MakeTimeZoneId(int offsetSeconds);
    // The skeleton at `index`, or empty outside the table.
    static std::string GetSkeleton(int index);
    // Drops the cached patterns and formatters. Nothing needs it for
    // correctness (the caches are keyed on locale and zone); it frees them.
    static void ClearCache();

private:
    static std::u16string GetPattern(const std::string& locale, int index);
    static std::u16string GetBestPattern(const std::string& locale, const std::string& skeleton);
    static std::u16string MakeBestPattern(const std::string& locale, const std::string& skeleton);
    static std::string Format(time_t t, const std::string& locale, const std::string& zoneId,
                              const std::u16string& pattern);
};

}  // namespace NSWeather

#endif

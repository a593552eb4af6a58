#include "TimeUtil.h"

#include <cmath>
#include <cstdlib>

#include "CommonLog.h"
#include "ContentProvider.h"
#include "ICUUtil.h"
#include "VconfUtil.h"

namespace NSWeather
{

time_t TimeUtil::GetCurrentTime()
{
    return time(nullptr);
}

namespace
{
// Every place is within a day of UTC; beyond that (or not a number) the
// offset came from a damaged file, and UTC serves.
double SaneGmtOffset(double gmtOffset)
{
    if (std::isfinite(gmtOffset) && std::fabs(gmtOffset) <= 24.0)
        return gmtOffset;
    COMMON_LOG("gmtOffset %g is no offset of a place; UTC taken", gmtOffset);
    return 0.0;
}

// 2^63: the doubles below it (and from its negative on) convert to time_t.
const double kTimeLimit = 9223372036854775808.0;
}  // namespace

time_t TimeUtil::GetCityTime(time_t t, double gmtOffset)
{
    double shifted = static_cast<double>(t) - ICUUtil::GetTmGmtOff() + SaneGmtOffset(gmtOffset) * 3600.0;
    if (!(shifted >= -kTimeLimit && shifted < kTimeLimit))
    {
        COMMON_LOG("time %lld cannot be shifted; taken as it is", static_cast<long long>(t));
        return t;
    }
    return static_cast<time_t>(shifted);
}

int TimeUtil::GetClockValue(time_t t)
{
    struct tm local;
    if (!localtime_r(&t, &local))
        return -1;
    char text[16] = {0};
    strftime(text, sizeof(text), "%H%M", &local);
    return atoi(text);
}

bool TimeUtil::GetIsDay(const CityPtr& cityPtr, time_t t)
{
    COMMON_RETV_IF(!cityPtr, false);
    ExtraPtr extraPtr = cityPtr->GetExtraPtr();
    COMMON_RETV_IF(!extraPtr, false);
    double gmtOffset = cityPtr->GetGmtOffset();
    // Sunrise and sunset are instants too: read all three on the city's clock.
    int now = GetClockValue(GetCityTime(t, gmtOffset));
    int sunrise = GetClockValue(GetCityTime(extraPtr->GetSunriseTime(), gmtOffset));
    int sunset = GetClockValue(GetCityTime(extraPtr->GetSunsetTime(), gmtOffset));
    return now >= sunrise && now < sunset;
}

std::string TimeUtil::GetLocalTimeStringLong(const CityPtr& cityPtr, int contentProvider)
{
    COMMON_RETV_IF(!cityPtr, std::string());
    time_t shifted = GetCurrentTime() + static_cast<time_t>(SaneGmtOffset(cityPtr->GetGmtOffset()) * 3600.0) -
                     ICUUtil::GetTmGmtOff();
    if (contentProvider != CP_ACCUWEATHER && cityPtr->GetIsSummerTime())
        shifted += 3600;
    int index = VconfUtil::GetRegionFormatTime1224() == VCONFKEY_TIME_FORMAT_12
                    ? ICUUtil::SKELETON_EEEdMMM_hhmm
                    : ICUUtil::SKELETON_EEEdMMM_HHmm;
    return ICUUtil::GetDateTimeString(shifted, index);
}

int TimeUtil::RegisterSystemTimeChangedCb(vconf_callback_fn cb, void* userData)
{
    return vconf_notify_key_changed(VCONFKEY_SYSTEM_TIME_CHANGED, cb, userData);
}

int TimeUtil::UnregisterSystemTimeChangedCb(vconf_callback_fn cb)
{
    return vconf_ignore_key_changed(VCONFKEY_SYSTEM_TIME_CHANGED, cb);
}

int TimeUtil::RegisterTimezoneIdChangedCb(vconf_callback_fn cb, void* userData)
{
    return vconf_notify_key_changed(VCONFKEY_SETAPPL_TIMEZONE_ID, cb, userData);
}

int TimeUtil::UnregisterTimezoneIdChangedCb(vconf_callback_fn cb)
{
    return vconf_ignore_key_changed(VCONFKEY_SETAPPL_TIMEZONE_ID, cb);
}

int TimeUtil::RegisterDateFormatChangedCb(vconf_callback_fn cb, void* userData)
{
    return vconf_notify_key_changed(VCONFKEY_SETAPPL_DATE_FORMAT_INT, cb, userData);
}

int TimeUtil::UnregisterDateFormatChangedCb(vconf_callback_fn cb)
{
    return vconf_ignore_key_changed(VCONFKEY_SETAPPL_DATE_FORMAT_INT, cb);
}

int TimeUtil::RegisterRegionFormatTime1224ChangedCb(vconf_callback_fn cb, void* userData)
{
    return vconf_notify_key_changed(VCONFKEY_REGIONFORMAT_TIME1224, cb, userData);
}

int TimeUtil::UnregisterRegionFormatTime1224ChangedCb(vconf_callback_fn cb)
{
    return vconf_ignore_key_changed(VCONFKEY_REGIONFORMAT_TIME1224, cb);
}

}  // namespace NSWeather

#include "WidgetPageData.h"

#include <libintl.h>
#include <vconf.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <stdexcept>

#include "ContentProvider.h"
#include "ICUUtil.h"
#include "IconMappingTable.h"
#include "StringUtil.h"
#include "TimeUtil.h"
#include "VconfUtil.h"
#include "ViewBasicElements.h"
#include "WidgetLog.h"
#include "WidgetSettingWriter.h"

namespace NSWeatherWidget
{

using NSWeather::CityPtr;
using NSWeather::ContentProvider;
using NSWeather::ICUUtil;
using NSWeather::TemperaturePtr;
using NSWeather::ViewBasicElements;
using NSWeather::WeeklyPtr;

namespace
{
const char* const kLanguageKey = "db/menu_widget/language";
const int kViewType4x4 = 6;
const int kViewType4x2 = 5;
const int kViewTypeDay = 4;
const int kCelsius = 1;
const time_t kRefreshingLifetime = 90;
}  // namespace

WidgetPageData::WidgetPageData() : mContentProvider(ContentProvider::GetContentProvider()) {}

std::string WidgetPageData::GetCityName() const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    int provider = ContentProvider::GetContentProvider();
    if (provider == NSWeather::CP_KWEATHER || provider == NSWeather::CP_WEATHERNEWS_KR)
    {
        char* language = vconf_get_str(kLanguageKey);
        bool isKorean = !language || std::string(language).compare(0, 2, "ko") == 0;
        free(language);
        return isKorean ? mCityPtr->GetCityName() : mCityPtr->GetCityNameEng();
    }
    std::string name = mCityPtr->GetCityName();
    return name.empty() ? mCityPtr->GetCityNameEng() : name;
}

bool WidgetPageData::GetIsCurrentCity(const CityPtr& cityPtr) const
{
    WIDGET_RETV_IF(!cityPtr, false);
    return cityPtr->GetIsCurrentLocation();
}

// Rounds half up in the scale of the settings; "0" without settings.
std::string WidgetPageData::FormatTemperature(const TemperaturePtr& temperaturePtr) const
{
    WIDGET_RETV_IF(!temperaturePtr, std::string());
    WIDGET_RETV_IF(!mSettingPtr, "0");
    double value = mSettingPtr->GetTemperatureUnit() == kCelsius ? temperaturePtr->GetCelsius()
                                                                 : temperaturePtr->GetFahrenheit();
    return NSWeather::StringUtil::IntToString(static_cast<int>(std::floor(value + 0.5)));
}

std::string WidgetPageData::GetTemperatureString(int kind) const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    NSWeather::CurrentPtr currentPtr = mCityPtr->GetCurrentPtr();
    WIDGET_RETV_IF(!currentPtr, std::string());
    if (kind == TEMPERATURE_LOW)
        return FormatTemperature(currentPtr->GetLowTemperature());
    if (kind == TEMPERATURE_HIGH)
        return FormatTemperature(currentPtr->GetHighTemperature());
    return FormatTemperature(currentPtr->GetCurTemperature());
}

std::string WidgetPageData::GetTemperatureUnitIconPath(bool is4x4, bool pressed) const
{
    WIDGET_RETV_IF(!mSettingPtr, std::string());
    return ViewBasicElements::MakeTemperatureUnitIconName(
        is4x4 ? kViewType4x4 : kViewType4x2, mSettingPtr->GetTemperatureUnit() == kCelsius, pressed);
}

int WidgetPageData::GetCurrentIconNum(bool& isDay) const
{
    isDay = NSWeather::TimeUtil::GetIsDay(mCityPtr, NSWeather::TimeUtil::GetCurrentTime());
    NSWeather::IconMappingTable iconMappingTable;
    return iconMappingTable.GetMappingIconNum(mCityPtr->GetCurrentPtr()->GetWeatherIcon(), isDay);
}

std::string WidgetPageData::GetWeatherIconPath(bool is4x4, bool pressed) const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    WIDGET_RETV_IF(!mCityPtr->GetCurrentPtr(), std::string());
    bool isDay = true;
    int iconNum = GetCurrentIconNum(isDay);
    return ViewBasicElements::MakeWeatherIconName(is4x4 ? kViewType4x4 : kViewType4x2, iconNum, pressed);
}

std::string WidgetPageData::GetBackgroundImagePath() const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    WIDGET_RETV_IF(!mCityPtr->GetCurrentPtr(), std::string());
    bool isDay = true;
    int iconNum = GetCurrentIconNum(isDay);
    return ViewBasicElements::MakeBackgroundImageName(iconNum, isDay);
}

std::string WidgetPageData::GetUpdatedDate() const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    return ICUUtil::GetDateTimeString(mCityPtr->GetRefreshedTime(), ICUUtil::SKELETON_MMdd);
}

std::string WidgetPageData::GetUpdatedTime() const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    int skeleton = NSWeather::VconfUtil::GetRegionFormatTime1224() == 1 ? ICUUtil::SKELETON_hhmm
                                                                        : ICUUtil::SKELETON_HHMM;
    return ICUUtil::GetDateTimeString(mCityPtr->GetRefreshedTime(), skeleton);
}

std::string WidgetPageData::GetLocalTimeString() const
{
    WIDGET_RETV_IF(!mCityPtr, std::string());
    return NSWeather::TimeUtil::GetLocalTimeStringLong(mCityPtr, mContentProvider);
}

std::string WidgetPageData::GetCPLogoIconPath() const
{
    const int kWidgetLogo = 2;
    return ContentProvider::GetCPLogoIconPath(kWidgetLogo);
}

WeeklyPtr WidgetPageData::GetWeeklyPtr(const CityPtr& cityPtr, int dayIndex) const
{
    WIDGET_RETV_IF(!cityPtr, nullptr);
    NSWeather::WeeklyPtrVectorPtr weeklyPtrVector = cityPtr->GetWeeklyPtrVector();
    WIDGET_RETV_IF(!weeklyPtrVector, nullptr);
    try
    {
        return weeklyPtrVector->at(static_cast<size_t>(dayIndex));
    }
    catch (const std::out_of_range&)
    {
        WIDGET_LOG("exception caught: out of range");
    }
    return nullptr;
}

std::string WidgetPageData::GetWeeklyWeekdayString(const CityPtr& cityPtr, int dayIndex) const
{
    WeeklyPtr weeklyPtr = GetWeeklyPtr(cityPtr, dayIndex);
    WIDGET_RETV_IF(!weeklyPtr, std::string());
    return ICUUtil::GetDateTimeString(weeklyPtr->GetDate(), ICUUtil::SKELETON_EEE);
}

std::string WidgetPageData::GetWeeklyTemperatureString(const CityPtr& cityPtr, int dayIndex, bool high) const
{
    WeeklyPtr weeklyPtr = GetWeeklyPtr(cityPtr, dayIndex);
    WIDGET_RETV_IF(!weeklyPtr, std::string());
    std::string value =
        FormatTemperature(high ? weeklyPtr->GetHighTemperature() : weeklyPtr->GetLowTemperature());
    if (value.empty() || !mSettingPtr)
        return value;
    return value + dgettext("weather-m", "IDS_MF_BODY_M_DEGREE");
}

std::string WidgetPageData::GetWeeklyHighTemperatureString(const CityPtr& cityPtr, int dayIndex) const
{
    return GetWeeklyTemperatureString(cityPtr, dayIndex, true);
}

std::string WidgetPageData::GetWeeklyLowTemperatureString(const CityPtr& cityPtr, int dayIndex) const
{
    return GetWeeklyTemperatureString(cityPtr, dayIndex, false);
}

// Days always take the day image: a forecast covers the whole day.
std::string WidgetPageData::GetWeeklyIconPath(const CityPtr& cityPtr, int dayIndex, bool pressed) const
{
    WeeklyPtr weeklyPtr = GetWeeklyPtr(cityPtr, dayIndex);
    WIDGET_RETV_IF(!weeklyPtr, std::string());
    WIDGET_RETV_IF(!cityPtr->GetExtraPtr(), std::string());
    NSWeather::IconMappingTable iconMappingTable;
    int iconNum = iconMappingTable.GetMappingIconNum(weeklyPtr->GetWeatherIcon(), true);
    return ViewBasicElements::MakeWeatherIconName(kViewTypeDay, iconNum, pressed);
}

// A negative number shows the default image, so it reads as that one.
int WidgetPageData::GetCurrentConditionCode() const
{
    WIDGET_RETV_IF(!mCityPtr, -1);
    WIDGET_RETV_IF(!mCityPtr->GetCurrentPtr(), -1);
    bool isDay = true;
    return std::max(0, GetCurrentIconNum(isDay));
}

int WidgetPageData::GetWeeklyConditionCode(const CityPtr& cityPtr, int dayIndex) const
{
    WeeklyPtr weeklyPtr = GetWeeklyPtr(cityPtr, dayIndex);
    WIDGET_RETV_IF(!weeklyPtr, -1);
    WIDGET_RETV_IF(!cityPtr->GetExtraPtr(), -1);
    NSWeather::IconMappingTable iconMappingTable;
    return std::max(0, iconMappingTable.GetMappingIconNum(weeklyPtr->GetWeatherIcon(), true));
}

bool WidgetPageData::GetIsCelsius() const
{
    return mSettingPtr && mSettingPtr->GetTemperatureUnit() == kCelsius;
}

// A refresh whose end never arrived stops counting after 90 seconds.
bool WidgetPageData::GetIsNowRefreshing() const
{
    if (!mSettingPtr)
        return false;
    return mSettingPtr->GetIsNowRefreshing() && mSettingPtr->GetRefreshingStartTime() + kRefreshingLifetime >
                                                    NSWeather::TimeUtil::GetCurrentTime();
}

bool WidgetPageData::SetIsNowRefreshing(bool isNowRefreshing)
{
    WIDGET_RETV_IF(!mSettingPtr, false);
    time_t now = NSWeather::TimeUtil::GetCurrentTime();
    NSWeather::SettingPtr written = WidgetSettingWriter::Change(
        [&](const NSWeather::SettingPtr& settingPtr)
        {
            settingPtr->SetIsNowRefreshing(isNowRefreshing);
            if (isNowRefreshing)
                settingPtr->SetRefreshingStartTime(now);
        });
    WIDGET_RETV_IF(!written, false);
    mSettingPtr = written;
    return true;
}

}  // namespace NSWeatherWidget

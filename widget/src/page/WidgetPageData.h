#ifndef NSWEATHERWIDGET_WIDGET_PAGE_DATA_H
#define NSWEATHERWIDGET_WIDGET_PAGE_DATA_H

#include <memory>
#include <string>

#include "City.h"
#include "Setting.h"

namespace NSWeatherWidget
{

// Texts and image names of one page, computed afresh from the city and
// the settings at every call, so a redraw never shows stale values.
// No toolkit here.
class WidgetPageData
{
public:
    enum TemperatureKind
    {
        TEMPERATURE_LOW = 0,
        TEMPERATURE_CURRENT = 1,
        TEMPERATURE_HIGH = 2
    };

    WidgetPageData();
    virtual ~WidgetPageData() = default;

    static std::string GetResourceEdjPath() { return "widget/WidgetResources.edj"; }

    void SetCityPtr(const NSWeather::CityPtr& cityPtr) { mCityPtr = cityPtr; }
    NSWeather::CityPtr GetCityPtr() const { return mCityPtr; }
    void SetSettingPtr(const NSWeather::SettingPtr& settingPtr) { mSettingPtr = settingPtr; }
    NSWeather::SettingPtr GetSettingPtr() const { return mSettingPtr; }

    std::string GetCityName() const;
    bool GetIsCurrentCity(const NSWeather::CityPtr& cityPtr) const;
    std::string GetTemperatureString(int kind) const;
    std::string GetCurrentTemperatureString() const { return GetTemperatureString(TEMPERATURE_CURRENT); }
    std::string GetTemperatureUnitIconPath(bool is4x4, bool pressed) const;
    std::string GetWeatherIconPath(bool is4x4, bool pressed) const;
    std::string GetBackgroundImagePath() const;
    std::string GetUpdatedDate() const;
    std::string GetUpdatedTime() const;
    std::string GetLocalTimeString() const;
    std::string GetCPLogoIconPath() const;
    NSWeather::WeeklyPtr GetWeeklyPtr(const NSWeather::CityPtr& cityPtr, int dayIndex) const;
    std::string GetWeeklyWeekdayString(const NSWeather::CityPtr& cityPtr, int dayIndex) const;
    std::string GetWeeklyHighTemperatureString(const NSWeather::CityPtr& cityPtr, int dayIndex) const;
    std::string GetWeeklyLowTemperatureString(const NSWeather::CityPtr& cityPtr, int dayIndex) const;
    std::string GetWeeklyIconPath(const NSWeather::CityPtr& cityPtr, int dayIndex, bool pressed) const;
    // Condition codes of the images shown (see ViewBasicElements); -1
    // when there is no image.
    int GetCurrentConditionCode() const;
    int GetWeeklyConditionCode(const NSWeather::CityPtr& cityPtr, int dayIndex) const;
    // The scale temperatures are shown in; false without settings.
    bool GetIsCelsius() const;
    bool GetIsNowRefreshing() const;
    // Stores the state in the settings row; false when it was not written.
    bool SetIsNowRefreshing(bool isNowRefreshing);

private:
    std::string FormatTemperature(const NSWeather::TemperaturePtr& temperaturePtr) const;
    std::string GetWeeklyTemperatureString(const NSWeather::CityPtr& cityPtr, int dayIndex, bool high) const;
    int GetCurrentIconNum(bool& isDay) const;

    NSWeather::SettingPtr mSettingPtr;
    NSWeather::CityPtr mCityPtr;
    int mContentProvider;
};

using WidgetPageDataPtr = std::shared_ptr<WidgetPageData>;

}  // namespace NSWeatherWidget

#endif

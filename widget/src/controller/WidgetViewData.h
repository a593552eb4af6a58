#ifndef NSWEATHERWIDGET_WIDGET_VIEW_DATA_H
#define NSWEATHERWIDGET_WIDGET_VIEW_DATA_H

#include <ctime>
#include <memory>
#include <string>

#include "City.h"
#include "Setting.h"

namespace NSWeatherWidget
{

// The model of one widget instance: the city list as last loaded, the
// settings, which city the instance shows and the instance's identity.
// Indexes are positions in the list. No toolkit and no database here.
class WidgetViewData
{
public:
    static constexpr int kSizeTypeUnknown = 0xFFFF;

    WidgetViewData();
    ~WidgetViewData() = default;

    int GetSizeType() const { return mSizeType; }
    void SetSizeType(int sizeType) { mSizeType = sizeType; }
    time_t GetLastRefreshedTime() const { return mLastRefreshedTime; }
    void SetLastRefreshedTime(time_t lastRefreshedTime) { mLastRefreshedTime = lastRefreshedTime; }
    NSWeather::SettingPtr GetSettingPtr() const { return mSettingPtr; }
    void SetSettingPtr(const NSWeather::SettingPtr& settingPtr) { mSettingPtr = settingPtr; }
    std::string GetLocationIdOfDisplayCity() const { return mLocationIdOfDisplayCity; }
    void SetLocationIdOfDisplayCity(const std::string& locationId) { mLocationIdOfDisplayCity = locationId; }
    bool GetIsFirstCreated() const { return mIsFirstCreated; }
    void SetIsFirstCreated(bool isFirstCreated) { mIsFirstCreated = isFirstCreated; }
    int GetContentProvider() const { return mContentProvider; }
    void SetCityPtrVector(const NSWeather::CityPtrVectorPtr& cityPtrVector)
    {
        mCityPtrVector = cityPtrVector;
    }
    std::shared_ptr<std::string> GetIdStringPtr() const { return mIdStringPtr; }
    void SetIdStringPtr(const std::shared_ptr<std::string>& idStringPtr) { mIdStringPtr = idStringPtr; }

    static std::string GetEdjPath() { return "widget/WidgetView.edj"; }

    int GetNumberOfCities() const;
    NSWeather::CityPtr GetCityPtr(int index) const;
    NSWeather::CityPtr GetCityPtrWithLocationId(const std::string& locationId) const;
    std::string GetLocationId(int index) const;
    // Position of the city in the list, -1 when it is not there.
    int GetPositionOfCity(const NSWeather::CityPtr& cityPtr) const;
    int GetIndexOfDisplayCity() const;
    int GetPrevCityIndex() const;
    int GetNextCityIndex() const;

private:
    int mSizeType;
    time_t mLastRefreshedTime;
    NSWeather::SettingPtr mSettingPtr;
    std::string mLocationIdOfDisplayCity;
    bool mIsFirstCreated;
    int mContentProvider;
    NSWeather::CityPtrVectorPtr mCityPtrVector;
    std::shared_ptr<std::string> mIdStringPtr;
};

using WidgetViewDataPtr = std::shared_ptr<WidgetViewData>;

}  // namespace NSWeatherWidget

#endif

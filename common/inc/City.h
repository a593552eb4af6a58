#ifndef NSWEATHER_CITY_H
#define NSWEATHER_CITY_H

#include <ctime>
#include <memory>
#include <string>
#include <vector>

#include "Current.h"
#include "Extra.h"
#include "Hourly.h"
#include "MoonPhase.h"
#include "Weekly.h"

namespace NSWeather
{
// One registered city with its weather. Holds no primary key: the city
// store looks the key up by page index or location id.
class City
{
public:
    City();
    virtual ~City();

    // 0-based position in the user's list of cities.
    int GetPageIndex() const;
    void SetPageIndex(int pageIndex);
    bool GetIsCurrentLocation() const;
    void SetIsCurrentLocation(bool isCurrentLocation);
    bool GetIsSummerTime() const;
    void SetIsSummerTime(bool isSummerTime);
    bool GetIsDayTime() const;
    void SetIsDayTime(bool isDayTime);
    int GetWidgetReferenceCount() const;
    void SetWidgetReferenceCount(int widgetReferenceCount);
    std::string GetLocationId() const;
    void SetLocationId(const std::string& locationId);
    std::string GetCityName() const;
    void SetCityName(const std::string& cityName);
    std::string GetCityNameEng() const;
    void SetCityNameEng(const std::string& cityNameEng);
    std::string GetCountryName() const;
    void SetCountryName(const std::string& countryName);
    std::string GetCountryNameEng() const;
    void SetCountryNameEng(const std::string& countryNameEng);
    std::string GetWebsiteUrl() const;
    void SetWebsiteUrl(const std::string& websiteUrl);
    // Hours from UTC; fractions allowed.
    double GetGmtOffset() const;
    void SetGmtOffset(double gmtOffset);
    time_t GetRefreshedTime() const;
    void SetRefreshedTime(time_t refreshedTime);
    time_t GetLocalTime() const;
    void SetLocalTime(time_t localTime);
    CurrentPtr GetCurrentPtr() const;
    void SetCurrentPtr(CurrentPtr currentPtr);
    // Daily forecast in weeklyIndex order.
    WeeklyPtrVectorPtr GetWeeklyPtrVector() const;
    void SetWeeklyPtrVector(WeeklyPtrVectorPtr weeklyPtrVector);
    // Hourly forecast in hourlyIndex order.
    HourlyPtrVectorPtr GetHourlyPtrVector() const;
    void SetHourlyPtrVector(HourlyPtrVectorPtr hourlyPtrVector);
    ExtraPtr GetExtraPtr() const;
    void SetExtraPtr(ExtraPtr extraPtr);
    MoonPhasePtrVectorPtr GetMoonPhasePtrVector() const;
    void SetMoonPhasePtrVector(MoonPhasePtrVectorPtr moonPhasePtrVector);
    bool GetNeedToUpdate() const;
    void SetNeedToUpdate(bool needToUpdate);

    // Debug dumps to the log, one line per field; they never change the record.
    void PrintCityInfo() const;
    void PrintCurrentWeatherInfo() const;
    void PrintForecastWeatherInfo() const;
    void PrintHourlyWeatherInfo() const;
    void PrintExtraWeatherInfo() const;

private:
    int mPageIndex;
    bool mIsCurrentLocation;
    bool mIsSummerTime;
    bool mIsDayTime;
    int mWidgetReferenceCount;
    std::string mLocationId;
    std::string mCityName;
    std::string mCityNameEng;
    std::string mCountryName;
    std::string mCountryNameEng;
    std::string mWebsiteUrl;
    double mGmtOffset;
    time_t mRefreshedTime;
    time_t mLocalTime;
    CurrentPtr mCurrentPtr;
    WeeklyPtrVectorPtr mWeeklyPtrVector;
    HourlyPtrVectorPtr mHourlyPtrVector;
    ExtraPtr mExtraPtr;
    MoonPhasePtrVectorPtr mMoonPhasePtrVector;
    bool mNeedToUpdate;
};

using CityPtr = std::shared_ptr<City>;
using CityPtrVector = std::vector<CityPtr>;
using CityPtrVectorPtr = std::shared_ptr<CityPtrVector>;
}  // namespace NSWeather

#endif

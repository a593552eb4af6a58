#include "City.h"

#include <memory>

#include "CommonLog.h"

namespace NSWeather
{

namespace
{
const char* TextOf(const std::string& text)
{
    return text.c_str();
}

long long TimeOf(time_t value)
{
    return static_cast<long long>(value);
}

void LogTemperature(const char* name, const TemperaturePtr& temperature)
{
    if (!temperature)
    {
        COMMON_LOG("%s : NULL", name);
        return;
    }
    COMMON_LOG("%s : %.1f", name, temperature->GetCelsius());
}

// Icon, status and the three temperatures: the part every weather record shares.
void LogWeather(const Weather& weather)
{
    COMMON_LOG("weatherIcon : %d", weather.GetWeatherIcon());
    COMMON_LOG("weatherStatus : %s", TextOf(weather.GetWeatherStatus()));
    LogTemperature("curTemperature", weather.GetCurTemperature());
    LogTemperature("highTemperature", weather.GetHighTemperature());
    LogTemperature("lowTemperature", weather.GetLowTemperature());
}

void LogWeekly(size_t index, const WeeklyPtr& weekly)
{
    COMMON_LOG("index : %zu", index);
    if (!weekly)
    {
        COMMON_LOG("weekly : NULL");
        return;
    }
    LogWeather(*weekly);
    COMMON_LOG("date : %lld", TimeOf(weekly->GetDate()));
    COMMON_LOG("websiteUrl : %s", TextOf(weekly->GetWebsiteUrl()));
}

void LogHourly(size_t index, const HourlyPtr& hourly)
{
    COMMON_LOG("index : %zu", index);
    if (!hourly)
    {
        COMMON_LOG("hourly : NULL");
        return;
    }
    COMMON_LOG("hour : %lld", TimeOf(hourly->GetHour()));
    LogWeather(*hourly);
    COMMON_LOG("date : %lld", TimeOf(hourly->GetDate()));
}

void LogPrecipitation(const PrecipitationPtr& precipitation)
{
    if (!precipitation)
    {
        COMMON_LOG("precipitationPtr : NULL");
        return;
    }
    COMMON_LOG("precType : %d", precipitation->GetPrecType());
    COMMON_LOG("precProbability : %.2f", precipitation->GetPrecProbability());
    COMMON_LOG("precAmount : %.2f", precipitation->GetPrecAmount());
    COMMON_LOG("precProbabilityNight : %.2f", precipitation->GetPrecProbabilityNight());
    COMMON_LOG("precAmountNight : %.2f", precipitation->GetPrecAmountNight());
}
}  // namespace

City::City()
    : mPageIndex(-1),
      mIsCurrentLocation(false),
      mIsSummerTime(false),
      mIsDayTime(true),
      mWidgetReferenceCount(0),
      mLocationId("NULL"),
      mCityName("NULL"),
      mCityNameEng("NULL"),
      mCountryName("NULL"),
      mCountryNameEng(),
      mWebsiteUrl("NULL"),
      mGmtOffset(0.0),
      mRefreshedTime(0),
      mLocalTime(0),
      mCurrentPtr(std::make_shared<Current>()),
      mWeeklyPtrVector(std::make_shared<WeeklyPtrVector>()),
      mHourlyPtrVector(std::make_shared<HourlyPtrVector>()),
      mExtraPtr(std::make_shared<Extra>()),
      mMoonPhasePtrVector(std::make_shared<MoonPhasePtrVector>()),
      mNeedToUpdate(true)
{
}

City::~City() = default;

int City::GetPageIndex() const
{
    return mPageIndex;
}

void City::SetPageIndex(int pageIndex)
{
    mPageIndex = pageIndex;
}

bool City::GetIsCurrentLocation() const
{
    return mIsCurrentLocation;
}

void City::SetIsCurrentLocation(bool isCurrentLocation)
{
    mIsCurrentLocation = isCurrentLocation;
}

bool City::GetIsSummerTime() const
{
    return mIsSummerTime;
}

void City::SetIsSummerTime(bool isSummerTime)
{
    mIsSummerTime = isSummerTime;
}

bool City::GetIsDayTime() const
{
    return mIsDayTime;
}

void City::SetIsDayTime(bool isDayTime)
{
    mIsDayTime = isDayTime;
}

int City::GetWidgetReferenceCount() const
{
    return mWidgetReferenceCount;
}

void City::SetWidgetReferenceCount(int widgetReferenceCount)
{
    mWidgetReferenceCount = widgetReferenceCount;
}

std::string City::GetLocationId() const
{
    return mLocationId;
}

void City::SetLocationId(const std::string& locationId)
{
    mLocationId = locationId;
}

std::string City::GetCityName() const
{
    return mCityName;
}

void City::SetCityName(const std::string& cityName)
{
    mCityName = cityName;
}

std::string City::GetCityNameEng() const
{
    return mCityNameEng;
}

void City::SetCityNameEng(const std::string& cityNameEng)
{
    mCityNameEng = cityNameEng;
}

std::string City::GetCountryName() const
{
    return mCountryName;
}

void City::SetCountryName(const std::string& countryName)
{
    mCountryName = countryName;
}

std::string City::GetCountryNameEng() const
{
    return mCountryNameEng;
}

void City::SetCountryNameEng(const std::string& countryNameEng)
{
    mCountryNameEng = countryNameEng;
}

std::string City::GetWebsiteUrl() const
{
    return mWebsiteUrl;
}

void City::SetWebsiteUrl(const std::string& websiteUrl)
{
    mWebsiteUrl = websiteUrl;
}

double City::GetGmtOffset() const
{
    return mGmtOffset;
}

void City::SetGmtOffset(double gmtOffset)
{
    mGmtOffset = gmtOffset;
}

time_t City::GetRefreshedTime() const
{
    return mRefreshedTime;
}

void City::SetRefreshedTime(time_t refreshedTime)
{
    mRefreshedTime = refreshedTime;
}

time_t City::GetLocalTime() const
{
    return mLocalTime;
}

void City::SetLocalTime(time_t localTime)
{
    mLocalTime = localTime;
}

CurrentPtr City::GetCurrentPtr() const
{
    return mCurrentPtr;
}

void City::SetCurrentPtr(CurrentPtr currentPtr)
{
    mCurrentPtr = currentPtr;
}

WeeklyPtrVectorPtr City::GetWeeklyPtrVector() const
{
    return mWeeklyPtrVector;
}

void City::SetWeeklyPtrVector(WeeklyPtrVectorPtr weeklyPtrVector)
{
    mWeeklyPtrVector = weeklyPtrVector;
}

HourlyPtrVectorPtr City::GetHourlyPtrVector() const
{
    return mHourlyPtrVector;
}

void City::SetHourlyPtrVector(HourlyPtrVectorPtr hourlyPtrVector)
{
    mHourlyPtrVector = hourlyPtrVector;
}

ExtraPtr City::GetExtraPtr() const
{
    return mExtraPtr;
}

void City::SetExtraPtr(ExtraPtr extraPtr)
{
    mExtraPtr = extraPtr;
}

MoonPhasePtrVectorPtr City::GetMoonPhasePtrVector() const
{
    return mMoonPhasePtrVector;
}

void City::SetMoonPhasePtrVector(MoonPhasePtrVectorPtr moonPhasePtrVector)
{
    mMoonPhasePtrVector = moonPhasePtrVector;
}

bool City::GetNeedToUpdate() const
{
    return mNeedToUpdate;
}

void City::SetNeedToUpdate(bool needToUpdate)
{
    mNeedToUpdate = needToUpdate;
}

void City::PrintCityInfo() const
{
    COMMON_LOG("===== city info =====");
    COMMON_LOG("cityName : %s", TextOf(mCityName));
    COMMON_LOG("pageIndex : %d", mPageIndex);
    COMMON_LOG("isCurrentLocation : %d", mIsCurrentLocation);
    COMMON_LOG("isDayTime : %d", mIsDayTime);
    COMMON_LOG("locationId : %s", TextOf(mLocationId));
    COMMON_LOG("cityName : %s", TextOf(mCityName));
    COMMON_LOG("cityNameEng : %s", TextOf(mCityNameEng));
    COMMON_LOG("countryName : %s", TextOf(mCountryName));
    COMMON_LOG("websiteUrl : %s", TextOf(mWebsiteUrl));
    COMMON_LOG("gmtOffset : %.2f", mGmtOffset);
    COMMON_LOG("refreshedTime : %lld", TimeOf(mRefreshedTime));
    COMMON_LOG("localTime : %lld", TimeOf(mLocalTime));
}

void City::PrintCurrentWeatherInfo() const
{
    COMMON_LOG("===== current weather info =====");
    COMMON_LOG("pageIndex : %d", mPageIndex);
    if (!mCurrentPtr)
    {
        COMMON_LOG("currentPtr : NULL");
        return;
    }
    LogWeather(*mCurrentPtr);
    COMMON_LOG("date : %lld", TimeOf(mCurrentPtr->GetDate()));
    COMMON_LOG("websiteUrl : %s", TextOf(mCurrentPtr->GetWebsiteUrl()));
}

void City::PrintForecastWeatherInfo() const
{
    size_t count = mWeeklyPtrVector ? mWeeklyPtrVector->size() : 0;
    COMMON_LOG("===== forecast weather info (pageIndex : %d, count : %zu) =====", mPageIndex, count);
    for (size_t i = 0; i < count; ++i) LogWeekly(i, (*mWeeklyPtrVector)[i]);
}

void City::PrintHourlyWeatherInfo() const
{
    size_t count = mHourlyPtrVector ? mHourlyPtrVector->size() : 0;
    COMMON_LOG("===== hourly weather info (pageIndex : %d, count : %zu) =====", mPageIndex, count);
    for (size_t i = 0; i < count; ++i) LogHourly(i, (*mHourlyPtrVector)[i]);
}

void City::PrintExtraWeatherInfo() const
{
    COMMON_LOG("===== extra weather info (pageIndex : %d) =====", mPageIndex);
    if (!mExtraPtr)
    {
        COMMON_LOG("extraPtr : NULL");
        return;
    }
    COMMON_LOG("humidity : %d", mExtraPtr->GetHumidity());
    COMMON_LOG("sunsetTime : %lld", TimeOf(mExtraPtr->GetSunsetTime()));
    COMMON_LOG("sunriseTime : %lld", TimeOf(mExtraPtr->GetSunriseTime()));
    COMMON_LOG("pm10 : %d", mExtraPtr->GetPm10());
    COMMON_LOG("uvIndex : %d", mExtraPtr->GetUvIndex());
    LogPrecipitation(mExtraPtr->GetPrecipitationPtr());
}

}  // namespace NSWeather

#include "WidgetViewData.h"

#include <stdexcept>

#include "ContentProvider.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

using NSWeather::CityPtr;

WidgetViewData::WidgetViewData()
    : mSizeType(kSizeTypeUnknown),
      mLastRefreshedTime(-1),
      mIsFirstCreated(true),
      mContentProvider(NSWeather::ContentProvider::GetContentProvider())
{
}

int WidgetViewData::GetNumberOfCities() const
{
    WIDGET_RETV_IF(!mCityPtrVector, 0);
    return static_cast<int>(mCityPtrVector->size());
}

CityPtr WidgetViewData::GetCityPtr(int index) const
{
    WIDGET_RETV_IF(!mCityPtrVector, nullptr);
    try
    {
        return mCityPtrVector->at(static_cast<size_t>(index));
    }
    catch (const std::out_of_range&)
    {
        WIDGET_LOG("exception caught: out of range");
    }
    return nullptr;
}

CityPtr WidgetViewData::GetCityPtrWithLocationId(const std::string& locationId) const
{
    WIDGET_RETV_IF(!mCityPtrVector, nullptr);
    for (const CityPtr& cityPtr : *mCityPtrVector)
        if (cityPtr && cityPtr->GetLocationId() == locationId)
            return cityPtr;
    return nullptr;
}

std::string WidgetViewData::GetLocationId(int index) const
{
    CityPtr cityPtr = GetCityPtr(index);
    WIDGET_RETV_IF(!cityPtr, std::string());
    return cityPtr->GetLocationId();
}

int WidgetViewData::GetPositionOfCity(const CityPtr& cityPtr) const
{
    if (!mCityPtrVector || !cityPtr)
        return -1;
    for (size_t i = 0; i < mCityPtrVector->size(); ++i)
        if ((*mCityPtrVector)[i] == cityPtr)
            return static_cast<int>(i);
    return -1;
}

// The position, not the stored page index: the store skips gaps in page
// indexes, so only the position finds the neighbours.
int WidgetViewData::GetIndexOfDisplayCity() const
{
    WIDGET_RETV_IF(mLocationIdOfDisplayCity.length() < 1, 0);
    CityPtr cityPtr = GetCityPtrWithLocationId(mLocationIdOfDisplayCity);
    WIDGET_RETV_IF(!cityPtr, 0);
    return GetPositionOfCity(cityPtr);
}

int WidgetViewData::GetPrevCityIndex() const
{
    int count = GetNumberOfCities();
    if (count <= 1)
        return 0;
    int prev = GetIndexOfDisplayCity() - 1;
    return prev < 0 ? count - 1 : prev;
}

int WidgetViewData::GetNextCityIndex() const
{
    int count = GetNumberOfCities();
    if (count <= 1)
        return 0;
    int next = GetIndexOfDisplayCity() + 1;
    return next < count ? next : 0;
}

}  // namespace NSWeatherWidget

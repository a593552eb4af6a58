#include "WidgetMain.h"

#include <widget_errno.h>
#include <widget_service.h>

#include <stdexcept>

#include "DBController.h"
#include "SettingDBController.h"
#include "WidgetLog.h"
#include "WidgetViewController.h"

namespace NSWeatherWidget
{

using NSWeather::CityPtr;
using NSWeather::CityPtrVectorPtr;

const char* const WidgetMain::kWidgetId = "com.quorvex.weather-m-widget";
const char* const WidgetMain::kPortName = "com.quorvex.weather-m-widget.message.port.local";
const char* const WidgetMain::kTimeZoneLinkPath = "/opt/etc/localtime";
WidgetMain::ClockFn WidgetMain::sClock = WidgetMain::DefaultClock;
std::string WidgetMain::sTimeZoneLinkPath = WidgetMain::kTimeZoneLinkPath;

WidgetMain::~WidgetMain()
{
    CancelAutoRefresh();
}

time_t WidgetMain::DefaultClock()
{
    return time(nullptr);
}

WidgetMain* WidgetMain::GetInstance()
{
    // Lives until the process ends: callbacks may still arrive at exit.
    static WidgetMain* sInstance = new WidgetMain();
    return sInstance;
}

void WidgetMain::LoadAllWeatherInformation()
{
    NSWeather::SettingDBController settingDBController;
    mSettingPtr = settingDBController.Select();
    WIDGET_RET_IF(!mSettingPtr);
    NSWeather::DBController dbController;
    NSWeather::CityPtrVectorPtr cityPtrVector = dbController.SelectAllCityData();
    // A failed read keeps the cities last read rather than none.
    WIDGET_RET_IF(!cityPtrVector);
    mWeatherInfo = cityPtrVector;
    mLastRefreshedTime = mSettingPtr->GetLastRefreshedTime();
}

CityPtrVectorPtr WidgetMain::GetWeatherInfo()
{
    LoadAllWeatherInformation();
    return mWeatherInfo;
}

CityPtr WidgetMain::GetCityPtr(int position) const
{
    WIDGET_RETV_IF(!mWeatherInfo, nullptr);
    WIDGET_RETV_IF(position < 0 || position >= static_cast<int>(mWeatherInfo->size()), nullptr);
    return (*mWeatherInfo)[static_cast<size_t>(position)];
}

bool WidgetMain::IsCurrentLocationExist() const
{
    if (!mWeatherInfo)
        return false;
    for (const CityPtr& cityPtr : *mWeatherInfo)
        if (cityPtr && cityPtr->GetIsCurrentLocation())
            return true;
    return false;
}

WidgetViewControllerPtr WidgetMain::FindWidgetObject(const std::string& idString) const
{
    WIDGET_RETV_IF(idString.length() < 1, nullptr);
    for (const auto& entry : sWidgetViewControllerList)
        if (entry.first && *entry.first == idString)
            return entry.second;
    return nullptr;
}

void WidgetMain::RequestUpdateForEachInstances(int force)
{
    // A copy: a trigger may reach an instance that goes away meanwhile.
    WidgetViewControllerList entries = sWidgetViewControllerList;
    for (const auto& entry : entries)
    {
        if (!entry.first)
            continue;
        if (widget_service_trigger_update(kWidgetId, entry.first->c_str(), nullptr, force) !=
            WIDGET_ERROR_NONE)
            WIDGET_LOG("widget_service_trigger_update failed");
    }
}

void WidgetMain::CancelAutoRefresh()
{
    if (!sAutoRefreshTimer)
        return;
    ecore_timer_del(sAutoRefreshTimer);
    sAutoRefreshTimer = nullptr;
}

void WidgetMain::Unregister(const WidgetViewControllerPtr& controller)
{
    for (auto it = sWidgetViewControllerList.begin(); it != sWidgetViewControllerList.end();)
        it = it->second == controller ? sWidgetViewControllerList.erase(it) : it + 1;
}

}  // namespace NSWeatherWidget

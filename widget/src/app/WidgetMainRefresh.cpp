// Refresh coordination: the refreshing mark in the settings row, the
// automatic refresh on resume with its one-shot timer, the current-location
// request and the reaction to network changes.
#include <cstdint>

#include "AppLauncher.h"
#include "CallbackTrampoline.h"
#include "DBController.h"
#include "Location.h"
#include "WeatherDefine.h"
#include "SettingDBController.h"
#include "WidgetLog.h"
#include "WidgetMain.h"
#include "WidgetViewData.h"

namespace NSWeatherWidget
{

namespace
{
const uint32_t kStaleMarkSeconds = 90;
const uint32_t kSecondsPerHour = 3600;
const double kAutoRefreshDelay = 1.0;

// The stored times are compared as the phone's 32-bit clock does, so a
// time in the future wraps and reads as long ago.
uint32_t Elapsed(time_t now, time_t then)
{
    return static_cast<uint32_t>(now) - static_cast<uint32_t>(then);
}
}  // namespace

// Read, changed and written in one transaction: a row the agent or the
// weather application writes meanwhile is never undone.
void WidgetMain::SetIsNowRefreshing(bool refreshing)
{
    WIDGET_LOG("SetIsNowRefreshing as:%d", refreshing);
    time_t now = Now();
    NSWeather::SettingPtr settingPtr = NSWeather::SettingDBController().SelectAndUpdate(
        [refreshing, now](const NSWeather::SettingPtr& s)
        {
            if (refreshing)
                s->SetRefreshingStartTime(now);
            s->SetIsNowRefreshing(refreshing);
        });
    if (!settingPtr)
        return;
    mSettingPtr = settingPtr;
    RequestUpdateForEachInstances(1);
}

bool WidgetMain::GetIsNowRefreshing()
{
    NSWeather::SettingPtr settingPtr = NSWeather::SettingDBController().Select();
    bool refreshing = settingPtr && settingPtr->GetIsNowRefreshing() &&
                      static_cast<uint32_t>(Now()) <
                          static_cast<uint32_t>(settingPtr->GetRefreshingStartTime()) + kStaleMarkSeconds;
    WIDGET_LOG("GetIsNowRefreshing :%d", refreshing);
    return refreshing;
}

int WidgetMain::AutoRefresh()
{
    NSWeather::AppLauncher appLauncher;
    if (appLauncher.RequestRefreshToAgent() == NSWeather::ERR_OK)
        return 0;
    if (appLauncher.RequestRefreshToAgent() != NSWeather::ERR_OK)
        WIDGET_LOG("RequestRefreshToAgent failed");
    return -1;
}

Eina_Bool WidgetMain::AutoRefreshTimerCb(void* data)
{
    WIDGET_LOG("AutoRefreshTimerCb");
    return NSWeather::ForwardCallback<WidgetMain>(
        data,
        [](WidgetMain& self)
        {
            // Returning CANCEL deletes the timer: forget it first.
            self.sAutoRefreshTimer = nullptr;
            self.SetIsNowRefreshing(true);
            if (self.AutoRefresh() != 0)
                WIDGET_LOG("auto refresh request failed");
            return static_cast<Eina_Bool>(ECORE_CALLBACK_CANCEL);
        },
        WIDGET_CALLBACK_SITE, static_cast<Eina_Bool>(ECORE_CALLBACK_CANCEL));
}

void WidgetMain::RequestCurrentLocationIfNeeded()
{
    bool isNetworkAvailable = IsNetworkAvailable();
    bool isLocationEnabled = NSWeather::Location().IsLocationEnabled();
    NSWeather::SettingPtr settingPtr = mSettingPtr;
    if (!settingPtr || !settingPtr->GetUseCurrentLocationOn() || !settingPtr->GetShowCurrentCityAgreement())
        return;
    if (GetIsNowRefreshing() || IsCurrentLocationExist() || !isLocationEnabled || !isNetworkAvailable)
        return;
    NSWeather::AppLauncher appLauncher;
    if (appLauncher.RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent(kPortName) ==
        NSWeather::ERR_OK)
        SetIsNowRefreshing(true);
    else
        WIDGET_LOG("RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent failed");
}

bool WidgetMain::IsNetworkAvailable()
{
    if (!mNetworkConnectionPtr)
        mNetworkConnectionPtr = std::make_shared<NSWeather::NetworkConnection>();
    return mNetworkConnectionPtr->IsNetworkAvailable();
}

bool WidgetMain::CanRefreshOnThisNetwork()
{
    bool ok = true;
    if (NSWeather::DBController().IsCurrentLocationExist() && !NSWeather::Location().IsLocationEnabled())
    {
        WIDGET_LOG("IsLocationEnabled failed");
        ok = false;
    }
    if (!IsNetworkAvailable())
    {
        WIDGET_LOG("IsNetworkAvailable failed");
        ok = false;
    }
    return ok;
}

void WidgetMain::StartAutoRefreshIfNeeded(const WidgetViewDataPtr& widgetViewDataPtr,
                                          const NSWeather::SettingPtr& settingPtr)
{
    WIDGET_RET_IF(widgetViewDataPtr->GetNumberOfCities() <= 0);
    WIDGET_RET_IF(settingPtr == NULL);
    NSWeather::CityPtrVectorPtr cityPtrVector = GetWeatherInfo();
    WIDGET_RET_IF(!cityPtrVector);
    WIDGET_RET_IF(cityPtrVector->size() < 1);
    bool checkLocationAndNetwork = CanRefreshOnThisNetwork();
    WIDGET_RET_IF(checkLocationAndNetwork == false);

    time_t now = Now();
    time_t last = 0;
    for (const NSWeather::CityPtr& cityPtr : *cityPtrVector)
        if (cityPtr && cityPtr->GetRefreshedTime() > last)
            last = cityPtr->GetRefreshedTime();
    uint32_t hours = static_cast<uint32_t>(settingPtr->GetAutoRefreshInterval());
    if (hours == 0 || Elapsed(now, last) <= hours * kSecondsPerHour)
    {
        WIDGET_LOG("we don't need to refresh");
        return;
    }
    if (settingPtr->GetIsNowRefreshing() &&
        Elapsed(now, settingPtr->GetRefreshingStartTime()) <= kStaleMarkSeconds)
    {
        WIDGET_LOG("already requested for refreshing");
        return;
    }
    CancelAutoRefresh();
    WIDGET_LOG("ecore_timer_add. AutoRefreshTimerCb will be called after 1 sec");
    sAutoRefreshTimer = ecore_timer_add(kAutoRefreshDelay, AutoRefreshTimerCb, this);
}

void WidgetMain::OnNetworkConnectionStateChanged(int state, void*)
{
    WIDGET_LOG("OnNetworkConnectionStateChanged state:%d", state);
    LoadAllWeatherInformation();
    NSWeather::SettingPtr settingPtr = mSettingPtr;
    if (state == CONNECTION_TYPE_DISCONNECTED)
    {
        SetIsNowRefreshing(false);
        RequestUpdateForEachInstances(1);
        return;
    }
    if (state != CONNECTION_TYPE_WIFI && state != CONNECTION_TYPE_CELLULAR)
        return;
    bool isLocationEnabled = NSWeather::Location().IsLocationEnabled();
    if (!settingPtr || !settingPtr->GetUseCurrentLocationOn() || !settingPtr->GetShowCurrentCityAgreement() ||
        settingPtr->GetIsNowRefreshing() || !isLocationEnabled || IsCurrentLocationExist())
        return;
    NSWeather::AppLauncher appLauncher;
    if (appLauncher.RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent(kPortName) !=
        NSWeather::ERR_OK)
    {
        WIDGET_LOG("RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent failed");
        return;
    }
    SetIsNowRefreshing(true);
    RequestUpdateForEachInstances(1);
}

}  // namespace NSWeatherWidget

#ifndef NSWEATHERWIDGET_WIDGET_MAIN_H
#define NSWEATHERWIDGET_WIDGET_MAIN_H

#include <Ecore.h>
#include <app_common.h>
#include <bundle.h>
#include <vconf.h>
#include <widget_app.h>

#include <ctime>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "City.h"
#include "NetworkConnection.h"
#include "NetworkConnectionStateEventListner.h"
#include "Setting.h"

namespace NSWeatherWidget
{

class WidgetViewController;
using WidgetViewControllerPtr = std::shared_ptr<WidgetViewController>;
class WidgetViewData;
using WidgetViewDataPtr = std::shared_ptr<WidgetViewData>;

// The widget process: the shared data as last loaded and the registry of
// instances. One class spread over several files, one per concern:
// WidgetMain.cpp (object and data), WidgetMainInstance.cpp (instance
// callbacks), WidgetMainApp.cpp (application create and terminate),
// WidgetMainRefresh.cpp (refresh decisions and the timer),
// WidgetMainSystem.cpp (system changes), WidgetMainPort.cpp (the agent's
// message port). Main loop only.
class WidgetMain : public NSWeather::NetworkConnectionStateEventListner
{
public:
    static const char* const kWidgetId;
    static const char* const kPortName;
    // Where the phone keeps the link to the device's zone file.
    static const char* const kTimeZoneLinkPath;

    using ClockFn = time_t (*)();

    static WidgetMain* GetInstance();

    // Application callbacks handed to widget_app_main.
    static widget_class_h CreateWidget(void* pThis);
    static void TerminateWidget(void* pThis);

    // Instance callbacks of the widget class.
    static int CreateWidgetInstance(widget_context_h context, bundle* content, int w, int h, void* userData);
    static int DestroyWidgetInstance(widget_context_h context, widget_app_destroy_type_e reason,
                                     bundle* content, void* userData);
    static int PauseWidgetInstance(widget_context_h context, void* userData);
    static int ResumeWidgetInstance(widget_context_h context, void* userData);
    static int ResizeWidgetInstance(widget_context_h context, int w, int h, void* userData);
    static int UpdateWidgetInstance(widget_context_h context, bundle* content, int force, void* userData);

    NSWeather::SettingPtr GetSettingPtr() const { return mSettingPtr; }
    void LoadAllWeatherInformation();
    NSWeather::CityPtrVectorPtr GetWeatherInfo();
    // The city at `position` in the list as last loaded (positions equal
    // page indexes unless the store has a gap); empty when none.
    NSWeather::CityPtr GetCityPtr(int position) const;
    bool IsCurrentLocationExist() const;
    WidgetViewControllerPtr FindWidgetObject(const std::string& idString) const;
    void RequestUpdateForEachInstances(int force);

    // Refresh coordination.
    void SetIsNowRefreshing(bool refreshing);
    bool GetIsNowRefreshing();
    int AutoRefresh();
    static Eina_Bool AutoRefreshTimerCb(void* data);
    void OnNetworkConnectionStateChanged(int state, void* userData) override;
    bool HasPendingAutoRefresh() const { return sAutoRefreshTimer != nullptr; }
    // The two checks a resume runs around the view's own resume.
    void RequestCurrentLocationIfNeeded();
    void StartAutoRefreshIfNeeded(const WidgetViewDataPtr& widgetViewDataPtr,
                                  const NSWeather::SettingPtr& settingPtr);
    void CancelAutoRefresh();

    // System changes.
    static void LanguageChangedCb(app_event_info_h eventInfo, void* userData);
    static void RegionFormatChangedCb(app_event_info_h eventInfo, void* userData);
    static void SystemTimeChangedCb(keynode_t* node, void* userData);
    static void SettingApplicationTimezoneIdChangedCb(keynode_t* node, void* userData);
    static void SettingApplicationDateFormatChangedCb(keynode_t* node, void* userData);
    static void SettingApplicationRegionFormatTime1224ChangedCb(keynode_t* node, void* userData);
    static void OnThemeColorChangedCb(void* userData);
    static void OnThemeFontChangedCb(void* userData);
    // The zone id named by the link at `linkPath` (the part after
    // "zoneinfo/"), else the system key's; empty when neither is known.
    static std::string GetTimeZone(const std::string& linkPath = kTimeZoneLinkPath);
    void ResetDefaultTimeZone();

    static void MessagePortCallback(int localPortId, const char* remoteAppId, const char* remotePort,
                                    bool trustedRemotePort, bundle* message, void* userData);

    // Seams for tests: the wall clock and the zone link.
    static void SetClock(ClockFn clock) { sClock = clock ? clock : DefaultClock; }
    static void SetTimeZoneLinkPath(const std::string& path) { sTimeZoneLinkPath = path; }

private:
    using WidgetViewControllerList =
        std::vector<std::pair<std::shared_ptr<std::string>, WidgetViewControllerPtr>>;

    WidgetMain() = default;
    ~WidgetMain() override;
    WidgetMain(const WidgetMain&) = delete;
    WidgetMain& operator=(const WidgetMain&) = delete;

    static std::string GetIdString(widget_context_h context);
    static int CreateOrResizeView(const WidgetViewControllerPtr& controller, widget_context_h context,
                                  int type);
    void Unregister(const WidgetViewControllerPtr& controller);
    static time_t DefaultClock();
    static time_t Now() { return sClock(); }

    void RegisterListeners();
    void UnregisterListeners();
    bool CanRefreshOnThisNetwork();
    bool IsNetworkAvailable();
    static void OnTimeChanged(const char* handler);

    NSWeather::SettingPtr mSettingPtr;
    NSWeather::CityPtrVectorPtr mWeatherInfo;
    int mMessagePortId = 0;
    time_t mLastRefreshedTime = 0;
    NSWeather::NetworkConnectionPtr mNetworkConnectionPtr;
    WidgetViewControllerList sWidgetViewControllerList;
    // The one pending automatic refresh, owned here.
    Ecore_Timer* sAutoRefreshTimer = nullptr;
    std::vector<app_event_handler_h> mEventHandlers;

    static ClockFn sClock;
    static std::string sTimeZoneLinkPath;
};

}  // namespace NSWeatherWidget

#endif

// Application create and terminate: the usage log, the text domain, the
// databases, then every listener the process keeps until it ends.
#include <Elementary.h>
#include <libintl.h>
#include <message_port.h>
#include <uxt_theme.h>

#include "CallbackTrampoline.h"
#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "QuorvexLogManager.h"
#include "TimeUtil.h"
#include "WeatherDefine.h"
#include "WidgetLog.h"
#include "WidgetMain.h"

namespace NSWeatherWidget
{

namespace
{
const int kFeatureWidgetState = 2008;
const int kFeatureWidgetAlive = 2009;
const int kDetailWidgetEmpty = 13;
const int kDetailWidgetAlive = 16;

void LowBatteryCb(app_event_info_h, void*)
{
    widget_app_exit();
}

void LowMemoryCb(app_event_info_h, void*) {}
}  // namespace

widget_class_h WidgetMain::CreateWidget(void* pThis)
{
    WIDGET_RETV_IF(pThis == NULL, nullptr);
    auto* logManager = NSWeather::QuorvexLogManager::GetInstance();
    logManager->Create();
    logManager->CollectLogByFeature(kFeatureWidgetState, kDetailWidgetEmpty,
                                    NSWeather::QuorvexLogManager::URI_TYPE_APP_STATUS_SURVEY, -1);
    logManager->CollectLogByFeature(kFeatureWidgetAlive, kDetailWidgetAlive,
                                    NSWeather::QuorvexLogManager::URI_TYPE_FEATURE_SURVEY, 1);
    std::string resDir = NSWeather::FileUtil::GetResourceDirectoryPath();
    if (!resDir.empty())
    {
        bindtextdomain("weather-m", (resDir + "/locale").c_str());
        bind_textdomain_codeset("weather-m", "UTF-8");
    }
    if (NSWeather::DataStoreInitializer::Run() != NSWeather::ERR_OK)
        WIDGET_LOG("dbController initialize failed");
    static_cast<WidgetMain*>(pThis)->RegisterListeners();
    widget_instance_lifecycle_callback_s callbacks = {CreateWidgetInstance, DestroyWidgetInstance,
                                                      PauseWidgetInstance,  ResumeWidgetInstance,
                                                      ResizeWidgetInstance, UpdateWidgetInstance};
    return widget_app_class_create(callbacks, nullptr);
}

void WidgetMain::RegisterListeners()
{
    using NSWeather::TimeUtil;
    if (TimeUtil::RegisterSystemTimeChangedCb(SystemTimeChangedCb, this) != 0)
        WIDGET_LOG("NotifySystemTimeChangedCb failed");
    if (TimeUtil::RegisterTimezoneIdChangedCb(SettingApplicationTimezoneIdChangedCb, this) != 0)
        WIDGET_LOG("NotifySettingsApplicationTimezoneIDChangedCb failed");
    if (TimeUtil::RegisterDateFormatChangedCb(SettingApplicationDateFormatChangedCb, this) != 0)
        WIDGET_LOG("NotifySettingsApplicationDateFormatChangedCb failed");
    if (TimeUtil::RegisterRegionFormatTime1224ChangedCb(SettingApplicationRegionFormatTime1224ChangedCb,
                                                        this) != 0)
        WIDGET_LOG("NotifySettingsApplicationRegionFormatTime1224ChangedCb failed");

    int portId = message_port_register_local_port(kPortName, MessagePortCallback, nullptr);
    if (portId < 0)
        WIDGET_LOG("message_port_register_local_port failed(%d)", portId);
    else
        mMessagePortId = portId;

    if (!mNetworkConnectionPtr)
        mNetworkConnectionPtr = std::make_shared<NSWeather::NetworkConnection>();
    mNetworkConnectionPtr->SetNetworkConnectionStateChangedCb(this, this);

    const std::pair<app_event_type_e, app_event_cb> events[] = {
        {APP_EVENT_LANGUAGE_CHANGED, LanguageChangedCb},
        {APP_EVENT_LOW_BATTERY, LowBatteryCb},
        {APP_EVENT_LOW_MEMORY, LowMemoryCb},
        {APP_EVENT_REGION_FORMAT_CHANGED, RegionFormatChangedCb}};
    for (const auto& event : events)
    {
        app_event_handler_h handler = nullptr;
        if (widget_app_add_event_handler(&handler, event.first, event.second, this) != 0)
            WIDGET_LOG("widget_app_add_event_handler failed(%d)", event.first);
        else
            mEventHandlers.push_back(handler);
    }

    if (uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, OnThemeColorChangedCb, this) != 0)
        WIDGET_LOG("uxt_theme_add_changed_callback failed(color)");
    if (uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_FONT, OnThemeFontChangedCb, this) != 0)
        WIDGET_LOG("uxt_theme_add_changed_callback failed(font)");
}

void WidgetMain::TerminateWidget(void* pThis)
{
    WIDGET_RET_IF(pThis == NULL);
    auto* logManager = NSWeather::QuorvexLogManager::GetInstance();
    logManager->CollectLogByFeature(kFeatureWidgetState, kDetailWidgetEmpty,
                                    NSWeather::QuorvexLogManager::URI_TYPE_APP_STATUS_SURVEY, -1);
    logManager->CollectLogByFeature(kFeatureWidgetAlive, kDetailWidgetAlive,
                                    NSWeather::QuorvexLogManager::URI_TYPE_FEATURE_SURVEY, 0);
    logManager->Destroy();
    static_cast<WidgetMain*>(pThis)->UnregisterListeners();
}

void WidgetMain::UnregisterListeners()
{
    using NSWeather::TimeUtil;
    if (TimeUtil::UnregisterSystemTimeChangedCb(SystemTimeChangedCb) != 0)
        WIDGET_LOG("IgnoreSystemTimeChangedCb failed");
    if (TimeUtil::UnregisterTimezoneIdChangedCb(SettingApplicationTimezoneIdChangedCb) != 0)
        WIDGET_LOG("IgnoreSettingsApplicationTimezoneIDChangedCb failed");
    if (TimeUtil::UnregisterDateFormatChangedCb(SettingApplicationDateFormatChangedCb) != 0)
        WIDGET_LOG("IgnoreSettingsApplicationDateFormatChangedCb failed");
    if (TimeUtil::UnregisterRegionFormatTime1224ChangedCb(SettingApplicationRegionFormatTime1224ChangedCb) !=
        0)
        WIDGET_LOG("IgnoreSettingsApplicationRegionFormatTime1224ChangedCb failed");
    uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, OnThemeColorChangedCb);
    uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_FONT, OnThemeFontChangedCb);
    // The loop has ended: a timer left now would never fire.
    CancelAutoRefresh();
}

}  // namespace NSWeatherWidget

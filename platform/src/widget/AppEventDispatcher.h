#ifndef PLATFORM_WIDGET_APP_EVENT_DISPATCHER_H
#define PLATFORM_WIDGET_APP_EVENT_DISPATCHER_H

#include <memory>
#include <string>
#include <vector>

#include "ListenerList.h"
#include "app_common.h"
#include "vconf.h"

struct app_event_handler
{
    app_event_type_e type;
    app_event_cb callback;
    void* userData;
};

struct app_event_info
{
    app_event_type_e type;
    std::string text;  // language or region format
    int status;        // low battery or low memory status
};

namespace platform
{

// The application events of the widget process, driven by system keys:
// language, region format, low battery (value <= 2) and low memory (soft
// warning). Handlers run on the main loop.
class AppEventDispatcher
{
public:
    static AppEventDispatcher& GetInstance();

    int AddHandler(app_event_handler_h* handler, app_event_type_e type, app_event_cb callback,
                   void* userData);
    int RemoveHandler(app_event_handler_h handler);
    // Removes every handler and key watch (the process ends its host).
    void Clear();

    // Raises an event from the keys' current values, as if they had changed.
    int Raise(app_event_type_e type);

    // Brings LANGUAGE and LC_TIME in line with the language and region keys.
    static void ApplyStartupKeys();
    // "ko_KR.UTF-8" -> "ko_KR:ko", the form LANGUAGE takes; empty for C/POSIX.
    static std::string LanguageList(const std::string& locale);
    static void ApplyLanguage(const std::string& locale);
    // False (and LC_TIME unchanged) when the locale is not installed.
    static bool ApplyRegionFormat(const std::string& locale);
    // Points the process's local time (TZ) at an IANA zone id; false, and
    // TZ unchanged, for a text that is not one.
    static bool ApplyTimeZone(const std::string& zoneId);
    // While on, the process's local time follows the time-zone key; the
    // watch comes before the application's own, so its listeners see the
    // new zone.
    void FollowTimeZone(bool on);

private:
    // One callback an event type; its user data does not tell two apart.
    struct Listener
    {
        app_event_cb callback;
        void* userData;
        bool operator==(const Listener& other) const { return callback == other.callback; }
    };
    typedef NSWeather::ListenerList<Listener> Listeners;

    AppEventDispatcher() = default;
    Listeners& GetListeners(app_event_type_e type);

    void Dispatch(const app_event_info& info);
    bool Watch(app_event_type_e type, bool on);
    void OnLanguage(const std::string& value);
    void OnRegionFormat(const std::string& value);
    void OnBattery(int value);
    void OnMemory(int value);

    static void LanguageKeyCb(keynode_t* node, void* data);
    static void RegionKeyCb(keynode_t* node, void* data);
    static void BatteryKeyCb(keynode_t* node, void* data);
    static void MemoryKeyCb(keynode_t* node, void* data);
    static void TimeZoneKeyCb(keynode_t* node, void* data);

    // The handles given out; the listeners of each type are called.
    std::vector<std::unique_ptr<app_event_handler>> mHandlers;
    Listeners mListeners[APP_EVENT_REGION_FORMAT_CHANGED + 1];
};

}  // namespace platform

#endif

#include "widget/AppEventDispatcher.h"

#include <Elementary.h>

#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <cstring>
#include <locale.h>
#include <sys/stat.h>
#include <time.h>

#include "core/ApiGuard.h"
#include "dlog.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";
const char* const kZoneInfoDir = "/usr/share/zoneinfo/";

struct KeyWatch
{
    app_event_type_e type;
    const char* key;
    vconf_callback_fn callback;
};

std::string ReadString(const char* key)
{
    char* value = vconf_get_str(key);
    std::string text = value ? value : "";
    free(value);
    return text;
}

std::string TextOf(keynode_t* node)
{
    const char* value = node ? vconf_keynode_get_str(node) : nullptr;
    return value ? value : "";
}

bool IsBatteryLow(int value)
{
    return value == APP_EVENT_LOW_BATTERY_POWER_OFF || value == APP_EVENT_LOW_BATTERY_CRITICAL_LOW;
}

}  // namespace

AppEventDispatcher& AppEventDispatcher::GetInstance()
{
    static AppEventDispatcher dispatcher;
    return dispatcher;
}

int AppEventDispatcher::AddHandler(app_event_handler_h* handler, app_event_type_e type, app_event_cb callback,
                                   void* userData)
{
    if (!handler || !callback)
        return APP_ERROR_INVALID_PARAMETER;
    if (type == APP_EVENT_DEVICE_ORIENTATION_CHANGED)
        return TIZEN_ERROR_NOT_SUPPORTED;
    if (type < APP_EVENT_LOW_MEMORY || type > APP_EVENT_REGION_FORMAT_CHANGED)
        return APP_ERROR_INVALID_PARAMETER;
    if (GetListeners(type).Contains({callback, userData}))
        return APP_ERROR_INVALID_PARAMETER;
    if (!Watch(type, true))
        dlog_print(DLOG_ERROR, kLogTag, "no key watch for event %d; it is raised only by the host", type);
    GetListeners(type).Add({callback, userData});
    mHandlers.push_back(std::make_unique<app_event_handler>(app_event_handler{type, callback, userData}));
    *handler = mHandlers.back().get();
    return APP_ERROR_NONE;
}

int AppEventDispatcher::RemoveHandler(app_event_handler_h handler)
{
    auto found = std::find_if(mHandlers.begin(), mHandlers.end(),
                              [handler](const auto& item) { return item.get() == handler; });
    if (!handler || found == mHandlers.end())
        return APP_ERROR_INVALID_PARAMETER;
    Listeners& listeners = GetListeners(handler->type);
    listeners.Remove({handler->callback, nullptr});
    if (listeners.IsEmpty())
        Watch(handler->type, false);
    mHandlers.erase(found);
    return APP_ERROR_NONE;
}

void AppEventDispatcher::Clear()
{
    while (!mHandlers.empty()) RemoveHandler(mHandlers.back().get());
}

bool AppEventDispatcher::Watch(app_event_type_e type, bool on)
{
    static const KeyWatch kWatches[] = {
        {APP_EVENT_LANGUAGE_CHANGED, VCONFKEY_LANGSET, LanguageKeyCb},
        {APP_EVENT_REGION_FORMAT_CHANGED, VCONFKEY_REGIONFORMAT, RegionKeyCb},
        {APP_EVENT_LOW_BATTERY, VCONFKEY_SYSMAN_BATTERY_STATUS_LOW, BatteryKeyCb},
        {APP_EVENT_LOW_MEMORY, VCONFKEY_SYSMAN_LOW_MEMORY, MemoryKeyCb},
    };
    bool alreadyWatched = !GetListeners(type).IsEmpty();
    for (const auto& watch : kWatches)
    {
        if (watch.type != type)
            continue;
        if (!on)
            return vconf_ignore_key_changed(watch.key, watch.callback) == VCONF_OK;
        if (alreadyWatched)
            return true;
        return vconf_notify_key_changed(watch.key, watch.callback, this) == VCONF_OK;
    }
    return false;
}

void AppEventDispatcher::Dispatch(const app_event_info& info)
{
    // A handler may remove another one (or itself) while we go.
    GetListeners(info.type).Notify(
        [&info](const Listener& listener)
        { listener.callback(const_cast<app_event_info*>(&info), listener.userData); });
}

AppEventDispatcher::Listeners& AppEventDispatcher::GetListeners(app_event_type_e type)
{
    return mListeners[type];
}

int AppEventDispatcher::Raise(app_event_type_e type)
{
    switch (type)
    {
        case APP_EVENT_LANGUAGE_CHANGED:
            OnLanguage(ReadString(VCONFKEY_LANGSET));
            return APP_ERROR_NONE;
        case APP_EVENT_REGION_FORMAT_CHANGED:
            OnRegionFormat(ReadString(VCONFKEY_REGIONFORMAT));
            return APP_ERROR_NONE;
        case APP_EVENT_LOW_BATTERY:
        {
            int value = 0;
            if (vconf_get_int(VCONFKEY_SYSMAN_BATTERY_STATUS_LOW, &value) != VCONF_OK || !IsBatteryLow(value))
                value = APP_EVENT_LOW_BATTERY_CRITICAL_LOW;
            OnBattery(value);
            return APP_ERROR_NONE;
        }
        case APP_EVENT_LOW_MEMORY:
            OnMemory(APP_EVENT_LOW_MEMORY_SOFT_WARNING);
            return APP_ERROR_NONE;
        default:
            return APP_ERROR_INVALID_PARAMETER;
    }
}

void AppEventDispatcher::OnLanguage(const std::string& value)
{
    if (!value.empty())
        ApplyLanguage(value);
    else
        dlog_print(DLOG_ERROR, kLogTag, "language key is unset; language left as it was");
    Dispatch({APP_EVENT_LANGUAGE_CHANGED, value, 0});
}

void AppEventDispatcher::OnRegionFormat(const std::string& value)
{
    if (!value.empty())
        ApplyRegionFormat(value);
    Dispatch({APP_EVENT_REGION_FORMAT_CHANGED, value, 0});
}

void AppEventDispatcher::OnBattery(int value)
{
    if (!IsBatteryLow(value))
    {
        if (value < APP_EVENT_LOW_BATTERY_POWER_OFF)
            dlog_print(DLOG_ERROR, kLogTag, "odd battery status %d ignored", value);
        return;
    }
    Dispatch({APP_EVENT_LOW_BATTERY, std::string(), value});
}

void AppEventDispatcher::OnMemory(int value)
{
    if (value == APP_EVENT_LOW_MEMORY_SOFT_WARNING)
        Dispatch({APP_EVENT_LOW_MEMORY, std::string(), value});
}

std::string AppEventDispatcher::LanguageList(const std::string& locale)
{
    std::string name = locale.substr(0, locale.find_first_of(".@"));
    if (name.empty() || name == "C" || name == "POSIX")
        return std::string();
    size_t underscore = name.find('_');
    if (underscore == std::string::npos)
        return name;
    return name + ":" + name.substr(0, underscore);
}

void AppEventDispatcher::ApplyLanguage(const std::string& locale)
{
    std::string list = LanguageList(locale);
    if (list.empty())
    {
        unsetenv("LANGUAGE");
        elm_language_set("");
        return;
    }
    setenv("LANGUAGE", list.c_str(), 1);
    // Setting a locale category is what makes gettext drop its cached catalogues.
    setlocale(LC_MESSAGES, "");
    elm_language_set(list.c_str());
}

bool AppEventDispatcher::ApplyRegionFormat(const std::string& locale)
{
    locale_t probe = newlocale(LC_TIME_MASK, locale.c_str(), static_cast<locale_t>(0));
    if (!probe)
    {
        dlog_print(DLOG_ERROR, kLogTag, "region format %s is not installed; LC_TIME unchanged",
                   locale.c_str());
        return false;
    }
    freelocale(probe);
    setenv("LC_TIME", locale.c_str(), 1);
    setlocale(LC_TIME, "");
    return true;
}

bool AppEventDispatcher::ApplyTimeZone(const std::string& zoneId)
{
    static const size_t kMaxZoneId = 64;
    bool usable =
        !zoneId.empty() && zoneId.size() <= kMaxZoneId && zoneId[0] != '/' &&
        zoneId.find("..") == std::string::npos &&
        zoneId.find_first_not_of("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789/_+-") ==
            std::string::npos;
    struct stat st;
    if (!usable || stat((std::string(kZoneInfoDir) + zoneId).c_str(), &st) != 0 || !S_ISREG(st.st_mode))
    {
        dlog_print(DLOG_ERROR, kLogTag, "time zone \"%.64s\" is not a known zone; local time unchanged",
                   zoneId.c_str());
        return false;
    }
    setenv("TZ", (":" + zoneId).c_str(), 1);
    tzset();
    return true;
}

void AppEventDispatcher::FollowTimeZone(bool on)
{
    if (on)
        vconf_notify_key_changed(VCONFKEY_SETAPPL_TIMEZONE_ID, TimeZoneKeyCb, this);
    else
        vconf_ignore_key_changed(VCONFKEY_SETAPPL_TIMEZONE_ID, TimeZoneKeyCb);
}

void AppEventDispatcher::ApplyStartupKeys()
{
    std::string language = ReadString(VCONFKEY_LANGSET);
    std::string list = LanguageList(language);
    if (!list.empty())
        setenv("LANGUAGE", list.c_str(), 1);
    std::string region = ReadString(VCONFKEY_REGIONFORMAT);
    if (!region.empty())
    {
        locale_t probe = newlocale(LC_TIME_MASK, region.c_str(), static_cast<locale_t>(0));
        if (probe)
        {
            freelocale(probe);
            setenv("LC_TIME", region.c_str(), 1);
        }
    }
    std::string zone = ReadString(VCONFKEY_SETAPPL_TIMEZONE_ID);
    if (!zone.empty())
        ApplyTimeZone(zone);
}

void AppEventDispatcher::LanguageKeyCb(keynode_t* node, void* data)
{
    NSWeather::ForwardCallback<AppEventDispatcher>(
        data, [node](AppEventDispatcher& self) { self.OnLanguage(TextOf(node)); },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

void AppEventDispatcher::RegionKeyCb(keynode_t* node, void* data)
{
    NSWeather::ForwardCallback<AppEventDispatcher>(
        data, [node](AppEventDispatcher& self) { self.OnRegionFormat(TextOf(node)); },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

void AppEventDispatcher::BatteryKeyCb(keynode_t* node, void* data)
{
    NSWeather::ForwardCallback<AppEventDispatcher>(
        data, [node](AppEventDispatcher& self) { self.OnBattery(node ? vconf_keynode_get_int(node) : -1); },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

void AppEventDispatcher::MemoryKeyCb(keynode_t* node, void* data)
{
    NSWeather::ForwardCallback<AppEventDispatcher>(
        data, [node](AppEventDispatcher& self) { self.OnMemory(node ? vconf_keynode_get_int(node) : -1); },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

void AppEventDispatcher::TimeZoneKeyCb(keynode_t* node, void* data)
{
    NSWeather::ForwardCallback<AppEventDispatcher>(
        data, [node](AppEventDispatcher&) { ApplyTimeZone(TextOf(node)); }, PLATFORM_CALLBACK_SITE(kLogTag));
}

}  // namespace platform

extern "C" int app_event_get_low_memory_status(app_event_info_h event_info,
                                               app_event_low_memory_status_e* status)
{
    if (!event_info || !status)
        return APP_ERROR_INVALID_PARAMETER;
    if (event_info->type != APP_EVENT_LOW_MEMORY)
        return APP_ERROR_INVALID_CONTEXT;
    *status = static_cast<app_event_low_memory_status_e>(event_info->status);
    return APP_ERROR_NONE;
}

extern "C" int app_event_get_low_battery_status(app_event_info_h event_info,
                                                app_event_low_battery_status_e* status)
{
    if (!event_info || !status)
        return APP_ERROR_INVALID_PARAMETER;
    if (event_info->type != APP_EVENT_LOW_BATTERY)
        return APP_ERROR_INVALID_CONTEXT;
    *status = static_cast<app_event_low_battery_status_e>(event_info->status);
    return APP_ERROR_NONE;
}

static int CopyEventText(app_event_info_h event_info, app_event_type_e type, char** text)
{
    if (!event_info || !text)
        return APP_ERROR_INVALID_PARAMETER;
    if (event_info->type != type)
        return APP_ERROR_INVALID_CONTEXT;
    *text = strdup(event_info->text.c_str());
    return *text ? APP_ERROR_NONE : APP_ERROR_OUT_OF_MEMORY;
}

extern "C" int app_event_get_language(app_event_info_h event_info, char** lang)
{
    return CopyEventText(event_info, APP_EVENT_LANGUAGE_CHANGED, lang);
}

extern "C" int app_event_get_region_format(app_event_info_h event_info, char** region)
{
    return CopyEventText(event_info, APP_EVENT_REGION_FORMAT_CHANGED, region);
}

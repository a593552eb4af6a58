// Reactions to system changes: each brings the process-wide caches (the
// toolkit language, the default i18n time zone) up to date and redraws
// every instance with force.
#include <Elementary.h>
#include <unistd.h>
#include <utils_i18n.h>
#include <vconf-keys.h>

#include <cstdlib>
#include <cstring>

#include "CallbackTrampoline.h"
#include "WidgetLog.h"
#include "WidgetMain.h"

namespace NSWeatherWidget
{

namespace
{
const size_t kLinkTargetMax = 1023;
const char* const kZoneDirectory = "zoneinfo/";

std::string TakeString(char* text)
{
    std::string copy = text ? text : "";
    free(text);
    return copy;
}
}  // namespace

void WidgetMain::LanguageChangedCb(app_event_info_h, void* userData)
{
    NSWeather::ForwardCallback<WidgetMain>(
        userData,
        [](WidgetMain& self)
        {
            std::string language = TakeString(vconf_get_str(VCONFKEY_LANGSET));
            if (language.empty())
                WIDGET_LOG("language is null. we can't elm_language_set");
            else
                elm_language_set(language.c_str());
            self.RequestUpdateForEachInstances(1);
        },
        WIDGET_CALLBACK_SITE);
}

// The handlers below keep their own "widgetMain == NULL" line, which names
// the handler in the field logs.
void WidgetMain::OnTimeChanged(const char* handler)
{
    WidgetMain* widgetMain = GetInstance();
    if (widgetMain == NULL)
    {
        WIDGET_LOG("widgetMain == NULL (%s)", handler);
        return;
    }
    widgetMain->ResetDefaultTimeZone();
}

void WidgetMain::RegionFormatChangedCb(app_event_info_h, void*)
{
    WIDGET_LOG("RegionFormatChangedCb");
    OnTimeChanged("RegionFormatChangedCb");
}

void WidgetMain::SystemTimeChangedCb(keynode_t*, void*)
{
    OnTimeChanged("SystemTimeChangedCb");
}

void WidgetMain::SettingApplicationTimezoneIdChangedCb(keynode_t*, void*)
{
    OnTimeChanged("SettingApplicationTimezoneIdChangedCb");
}

void WidgetMain::SettingApplicationDateFormatChangedCb(keynode_t*, void*)
{
    OnTimeChanged("SettingApplicationDateFormatChangedCb");
}

void WidgetMain::SettingApplicationRegionFormatTime1224ChangedCb(keynode_t*, void*)
{
    OnTimeChanged("SettingApplicationRegionFormatTime1224ChangedCb");
}

void WidgetMain::OnThemeColorChangedCb(void* userData)
{
    NSWeather::ForwardCallback<WidgetMain>(
        userData, [](WidgetMain& self) { self.RequestUpdateForEachInstances(1); }, WIDGET_CALLBACK_SITE);
}

void WidgetMain::OnThemeFontChangedCb(void* userData)
{
    NSWeather::ForwardCallback<WidgetMain>(
        userData, [](WidgetMain& self) { self.RequestUpdateForEachInstances(1); }, WIDGET_CALLBACK_SITE);
}

// The link may be relative and the zone folder may lie anywhere: the id is
// whatever follows the zone folder, not a fixed number of characters.
std::string WidgetMain::GetTimeZone(const std::string& linkPath)
{
    char target[kLinkTargetMax + 1] = {0};
    ssize_t length = readlink(linkPath.c_str(), target, kLinkTargetMax);
    if (length <= 0)
        WIDGET_LOG("readlink() failed");
    else
    {
        std::string link(target, static_cast<size_t>(length));
        size_t at = link.find(kZoneDirectory);
        if (at != std::string::npos && at + strlen(kZoneDirectory) < link.size())
            return link.substr(at + strlen(kZoneDirectory));
        WIDGET_LOG("no zone folder in the time zone link");
    }
    return TakeString(vconf_get_str(VCONFKEY_SETAPPL_TIMEZONE_ID));
}

void WidgetMain::ResetDefaultTimeZone()
{
    std::string timeZoneId = GetTimeZone(sTimeZoneLinkPath);
    if (!timeZoneId.empty())
    {
        i18n_timezone_h timeZone = nullptr;
        int ret = i18n_timezone_create(&timeZone, timeZoneId.c_str());
        if (ret != I18N_ERROR_NONE)
            WIDGET_LOG("i18n_timezone_create failed(ret:%d)", ret);
        else
        {
            ret = i18n_timezone_set_default(timeZone);
            if (ret != I18N_ERROR_NONE)
                WIDGET_LOG("i18n_timezone_set_default failed(ret:%d)", ret);
            i18n_timezone_destroy(timeZone);
        }
    }
    RequestUpdateForEachInstances(1);
}

}  // namespace NSWeatherWidget

#include "ContentProvider.h"

#include "CommonLog.h"
#include "Setting.h"
#include "SettingDBController.h"

namespace NSWeather
{

namespace
{
int gScopeDepth = 0;
// Null: nothing read in the current scope.
SettingPtr gScopedSetting;
}  // namespace

ContentProvider::RebuildScope::RebuildScope()
{
    ++gScopeDepth;
}

ContentProvider::RebuildScope::~RebuildScope()
{
    if (--gScopeDepth == 0)
        gScopedSetting.reset();
}

SettingPtr ContentProvider::GetSetting()
{
    if (gScopeDepth > 0 && gScopedSetting)
        return gScopedSetting;
    SettingPtr settingPtr = SettingDBController().Select();
    if (gScopeDepth > 0)
        gScopedSetting = settingPtr;
    return settingPtr;
}

int ContentProvider::GetContentProvider()
{
    SettingPtr settingPtr = GetSetting();
    COMMON_RETV_IF(!settingPtr, CP_ACCUWEATHER);
    return GetContentProviderOfCpType(settingPtr->GetCpType());
}

int ContentProvider::GetContentProviderOfCpType(const std::string& cpType)
{
    if (cpType == "Kweather")
        return CP_KWEATHER;
    if (cpType == "cmaweather")
        return CP_CMAWEATHER;
    if (cpType == "weathernews_kr")
        return CP_WEATHERNEWS_KR;
    if (cpType == "WeatherNews")
        return CP_WEATHERNEWS;
    return CP_ACCUWEATHER;
}

std::string ContentProvider::GetCPLogoIconPath(int style)
{
    int cp = GetContentProvider();
    if (cp != CP_ACCUWEATHER && cp != CP_CMAWEATHER)
    {
        COMMON_LOG("we don't need to display the cp logo");
        return std::string();
    }
    if (style == 0)
        return "weather_logo_accuweather_02.png";
    if (style == 1)
        return "weather_logo_accuweather.png";
    return "weather_box_logo_accuweather.png";
}

}  // namespace NSWeather

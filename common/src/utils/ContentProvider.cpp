#include "ContentProvider.h"

#include "CommonLog.h"
#include "Setting.h"
#include "SettingDBController.h"

namespace NSWeather
{

namespace
{
int gScopeDepth = 0;
// -1: nothing read in the current scope.
int gScopedProvider = -1;
}  // namespace

ContentProvider::RebuildScope::RebuildScope()
{
    ++gScopeDepth;
}

ContentProvider::RebuildScope::~RebuildScope()
{
    if (--gScopeDepth == 0)
        gScopedProvider = -1;
}

int ContentProvider::GetContentProvider()
{
    if (gScopeDepth > 0 && gScopedProvider >= 0)
        return gScopedProvider;
    SettingDBController settingDBController;
    SettingPtr settingPtr = settingDBController.Select();
    COMMON_RETV_IF(!settingPtr, CP_ACCUWEATHER);
    int provider = GetContentProviderOfCpType(settingPtr->GetCpType());
    if (gScopeDepth > 0)
        gScopedProvider = provider;
    return provider;
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

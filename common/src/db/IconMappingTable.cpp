#include "IconMappingTable.h"

#include "CommonLog.h"
#include "ContentProvider.h"
#include "DBController.h"
#include "Setting.h"

namespace NSWeather
{

namespace
{
constexpr int KWEATHER_ICON_ID_MAX = 41;
constexpr int CMAWEATHER_ICON_ID_MAX = 54;
constexpr int ACCUWEATHER_ICON_ID_MAX = 45;

constexpr int KWEATHER_ICON_TABLE[KWEATHER_ICON_ID_MAX] = {
    0,  1,  2,  3,  3,  2,  2,  6,  6,  6,  4,  4,  4,  4,  4,  7,  7,  7,  12, 12, 12,
    12, 12, 11, 11, 11, 13, 13, 13, 13, 13, 13, 13, 13, 13, 13, 13, 13, 13, 8,  5};

constexpr int CMAWEATHER_ICON_TABLE[CMAWEATHER_ICON_ID_MAX] = {
    1,  3,  2,  7,  8,  20, 13, 4, 4, 21, 6, 6, 6, 11, 10, 10, 12, 14, 5, 13, 22, 4, 21, 21, 6, 6, 10,
    12, 12, 22, 22, 22, 0,  0,  0, 0, 0,  0, 0, 0, 0,  0,  0,  0,  0,  0, 0,  0,  0, 0,  0,  0, 0, 5};

constexpr int ACCUWEATHER_RI_DAEMON_ICON_TABLE[ACCUWEATHER_ICON_ID_MAX] = {
    0,  1,  1,  2,  2, 2, 3,  3,  3,  0,  0,  5,  6,  6,  7,  8, 8, 9, 4, 10, 10, 11, 12,
    12, 14, 14, 14, 0, 0, 13, 15, 16, 17, 18, 18, 19, 19, 19, 3, 6, 6, 8, 8,  10, 12};

constexpr int ACCUWEATHER_ICON_TABLE[ACCUWEATHER_ICON_ID_MAX] = {
    0,  1,  1,  2,  2, 2, 3,  3,  3,  0,  0,  5,  6,  6,  7,  8, 9, 9, 4, 10, 11, 11, 12,
    12, 14, 14, 14, 0, 0, 13, 15, 16, 17, 18, 19, 19, 19, 19, 3, 6, 6, 8, 8,  10, 12};

constexpr const char* RI_DAEMON = "RI_DAEMON";
}  // namespace

int IconMappingTable::GetMappingIconNum(int iconNum, bool isDayTime)
{
    int mapped = 0;
    switch (ContentProvider::GetContentProvider())
    {
        case CP_KWEATHER:
        case CP_WEATHERNEWS_KR:
            COMMON_RETV_IF(iconNum >= KWEATHER_ICON_ID_MAX || iconNum < 0, 0);
            mapped = KWEATHER_ICON_TABLE[iconNum];
            break;
        case CP_CMAWEATHER:
            COMMON_RETV_IF(iconNum >= CMAWEATHER_ICON_ID_MAX || iconNum < 0, 0);
            mapped = CMAWEATHER_ICON_TABLE[iconNum];
            break;
        case CP_WEATHERNEWS:
            // The shipped database already holds separate day and night numbers.
            return DBController().GetWeatherNewsIcon(iconNum, isDayTime);
        default:
        {
            COMMON_RETV_IF(iconNum >= ACCUWEATHER_ICON_ID_MAX || iconNum < 0, 0);
            SettingPtr settingPtr = ContentProvider::GetSetting();
            COMMON_RETV_IF(!settingPtr, 0);
            mapped = GetAccuWeatherIcon(iconNum, settingPtr->GetDaemonType());
            break;
        }
    }
    return ApplyDayNight(mapped, isDayTime);
}

int IconMappingTable::ApplyDayNight(int widgetIconNum, bool isDayTime)
{
    if (widgetIconNum == 1 || widgetIconNum == 18)
        return isDayTime ? 1 : 18;
    if (widgetIconNum == 2 || widgetIconNum == 19)
        return isDayTime ? 2 : 19;
    return widgetIconNum;
}

int IconMappingTable::GetAccuWeatherIcon(int iconNum, const std::string& daemonType)
{
    if (!daemonType.empty() && daemonType == RI_DAEMON)
        return ACCUWEATHER_RI_DAEMON_ICON_TABLE[iconNum];
    return ACCUWEATHER_ICON_TABLE[iconNum];
}

}  // namespace NSWeather

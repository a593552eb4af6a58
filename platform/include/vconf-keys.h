#ifndef PLATFORM_VCONF_KEYS_H
#define PLATFORM_VCONF_KEYS_H

/* The system keys that the suite reads, with the platform's values. */

#define VCONFKEY_NETWORK_STATUS "memory/dnet/status"
enum
{
    VCONFKEY_NETWORK_OFF = 0,
    VCONFKEY_NETWORK_CELLULAR = 1,
    VCONFKEY_NETWORK_WIFI = 2,
    VCONFKEY_NETWORK_ETHERNET = 3,
    VCONFKEY_NETWORK_BLUETOOTH = 4,
};

#define VCONFKEY_LOCATION_USE_MY_LOCATION "db/location/setting/Usemylocation"
#define VCONFKEY_LOCATION_ENABLED "db/location/setting/GpsEnabled"
#define VCONFKEY_LOCATION_NETWORK_ENABLED "db/location/setting/NetworkEnabled"

#define VCONFKEY_LANGSET "db/menu_widget/language"
#define VCONFKEY_REGIONFORMAT "db/menu_widget/regionformat"
#define VCONFKEY_REGIONFORMAT_TIME1224 "db/menu_widget/regionformat_time1224"
enum
{
    VCONFKEY_TIME_FORMAT_12 = 1,
    VCONFKEY_TIME_FORMAT_24 = 2,
};

#define VCONFKEY_SYSTEM_TIME_CHANGED "memory/system/timechanged"
#define VCONFKEY_SETAPPL_TIMEZONE_ID "db/setting/timezone_id"
#define VCONFKEY_SETAPPL_DATE_FORMAT_INT "db/setting/date_format"
enum
{
    SETTING_DATE_FORMAT_DD_MM_YYYY = 0,
    SETTING_DATE_FORMAT_MM_DD_YYYY = 1,
    SETTING_DATE_FORMAT_YYYY_MM_DD = 2,
    SETTING_DATE_FORMAT_YYYY_DD_MM = 3,
};

#define VCONFKEY_SYSMAN_BATTERY_STATUS_LOW "memory/sysman/battery_status_low"
enum
{
    VCONFKEY_SYSMAN_BAT_POWER_OFF = 1,
    VCONFKEY_SYSMAN_BAT_CRITICAL_LOW = 2,
    VCONFKEY_SYSMAN_BAT_WARNING_LOW = 3,
    VCONFKEY_SYSMAN_BAT_NORMAL = 4,
    VCONFKEY_SYSMAN_BAT_FULL = 5,
    VCONFKEY_SYSMAN_BAT_REAL_POWER_OFF = 6,
};

#define VCONFKEY_SYSMAN_LOW_MEMORY "memory/sysman/low_memory"
enum
{
    VCONFKEY_SYSMAN_LOW_MEMORY_NORMAL = 1,
    VCONFKEY_SYSMAN_LOW_MEMORY_SOFT_WARNING = 2,
    VCONFKEY_SYSMAN_LOW_MEMORY_HARD_WARNING = 4,
};

#endif

#ifndef PLATFORM_APP_COMMON_H
#define PLATFORM_APP_COMMON_H

#include <stdbool.h>
#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef enum
    {
        APP_ERROR_NONE = TIZEN_ERROR_NONE,
        APP_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        APP_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        APP_ERROR_INVALID_CONTEXT = TIZEN_ERROR_APPLICATION | 0x01,
        APP_ERROR_NO_SUCH_FILE = TIZEN_ERROR_NO_SUCH_FILE,
        APP_ERROR_ALREADY_RUNNING = TIZEN_ERROR_ALREADY_IN_PROGRESS,
        APP_ERROR_PERMISSION_DENIED = TIZEN_ERROR_PERMISSION_DENIED,
    } app_error_e;

    typedef enum
    {
        APP_EVENT_LOW_MEMORY = 0,
        APP_EVENT_LOW_BATTERY = 1,
        APP_EVENT_LANGUAGE_CHANGED = 2,
        APP_EVENT_DEVICE_ORIENTATION_CHANGED = 3,
        APP_EVENT_REGION_FORMAT_CHANGED = 4,
    } app_event_type_e;

    typedef enum
    {
        APP_EVENT_LOW_MEMORY_NORMAL = 0x01,
        APP_EVENT_LOW_MEMORY_SOFT_WARNING = 0x02,
        APP_EVENT_LOW_MEMORY_HARD_WARNING = 0x04,
    } app_event_low_memory_status_e;

    typedef enum
    {
        APP_EVENT_LOW_BATTERY_POWER_OFF = 1,
        APP_EVENT_LOW_BATTERY_CRITICAL_LOW = 2,
    } app_event_low_battery_status_e;

    typedef struct app_event_handler* app_event_handler_h;
    typedef struct app_event_info* app_event_info_h;
    typedef void (*app_event_cb)(app_event_info_h event_info, void* user_data);

    int app_event_get_low_memory_status(app_event_info_h event_info, app_event_low_memory_status_e* status);
    int app_event_get_low_battery_status(app_event_info_h event_info, app_event_low_battery_status_e* status);
    int app_event_get_language(app_event_info_h event_info, char** lang);
    int app_event_get_region_format(app_event_info_h event_info, char** region);

    /* "<root>/apps/<own id>/res/"; malloc'd, the caller frees it. NULL (with
     * get_last_result) when the process has no application id. */
    char* app_get_resource_path(void);
    /* The calling process's application id; malloc'd, the caller frees it. */
    int app_get_id(char** id);

    /* Our extension: the process's own application id. It is taken from
     * PLATFORM_APP_ID unless set here (the launcher and the widget host do). */
    int app_set_own_id(const char* id);

#ifdef __cplusplus
}
#endif

#endif

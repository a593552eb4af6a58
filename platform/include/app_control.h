#ifndef PLATFORM_APP_CONTROL_H
#define PLATFORM_APP_CONTROL_H

#include <stdbool.h>
#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef struct app_control_s* app_control_h;

    typedef enum
    {
        APP_CONTROL_ERROR_NONE = TIZEN_ERROR_NONE,
        APP_CONTROL_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        APP_CONTROL_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        APP_CONTROL_ERROR_APP_NOT_FOUND = TIZEN_ERROR_APPLICATION | 0x21,
        APP_CONTROL_ERROR_KEY_NOT_FOUND = TIZEN_ERROR_KEY_NOT_AVAILABLE,
        APP_CONTROL_ERROR_KEY_REJECTED = TIZEN_ERROR_KEY_REJECTED,
        APP_CONTROL_ERROR_INVALID_DATA_TYPE = TIZEN_ERROR_APPLICATION | 0x22,
        APP_CONTROL_ERROR_LAUNCH_REJECTED = TIZEN_ERROR_APPLICATION | 0x23,
        APP_CONTROL_ERROR_PERMISSION_DENIED = TIZEN_ERROR_PERMISSION_DENIED,
        APP_CONTROL_ERROR_LAUNCH_FAILED = TIZEN_ERROR_APPLICATION | 0x24,
        APP_CONTROL_ERROR_TIMED_OUT = TIZEN_ERROR_TIMED_OUT,
        APP_CONTROL_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    } app_control_error_e;

    typedef enum
    {
        APP_CONTROL_RESULT_APP_STARTED = 1,
        APP_CONTROL_RESULT_SUCCEEDED = 0,
        APP_CONTROL_RESULT_FAILED = -1,
        APP_CONTROL_RESULT_CANCELED = -2,
    } app_control_result_e;

    typedef enum
    {
        APP_CONTROL_LAUNCH_MODE_SINGLE = 0,
        APP_CONTROL_LAUNCH_MODE_GROUP = 1,
    } app_control_launch_mode_e;

#define APP_CONTROL_OPERATION_DEFAULT "http://tizen.org/appcontrol/operation/default"
#define APP_CONTROL_OPERATION_VIEW "http://tizen.org/appcontrol/operation/view"
#define APP_CONTROL_OPERATION_SETTING_LOCATION "http://tizen.org/appcontrol/operation/setting/location"

    typedef void (*app_control_reply_cb)(app_control_h request, app_control_h reply,
                                         app_control_result_e result, void* user_data);
    typedef bool (*app_control_extra_data_cb)(app_control_h app_control, const char* key, void* user_data);

    int app_control_create(app_control_h* app_control);
    int app_control_destroy(app_control_h app_control);
    int app_control_set_operation(app_control_h app_control, const char* operation);
    int app_control_get_operation(app_control_h app_control, char** operation); /* free(); NULL when unset */
    int app_control_set_uri(app_control_h app_control, const char* uri);
    int app_control_get_uri(app_control_h app_control, char** uri); /* free(); NULL when unset */
    int app_control_set_app_id(app_control_h app_control, const char* app_id);
    int app_control_get_app_id(app_control_h app_control, char** app_id); /* free(); NULL when unset */
    /* Replaces an existing key. Empty key or value: INVALID_PARAMETER; keys
     * starting with "__APP_SVC" or "__AUL_" are the system's: KEY_REJECTED. */
    int app_control_add_extra_data(app_control_h app_control, const char* key, const char* value);
    int app_control_get_extra_data(app_control_h app_control, const char* key,
                                   char** value); /* free(*value) */
    /* Calls back for each extra key in the order of addition; stops on false. */
    int app_control_foreach_extra_data(app_control_h app_control, app_control_extra_data_cb callback,
                                       void* user_data);

    /* Starts the target detached and returns once it runs (exec succeeded):
     * the app id's program from <root>/apps/<id>/app.conf ("exec=<program>"),
     * or, without an app id, the application that handles the operation:
     * "view-uri=<scheme>,..." for VIEW with a URI, "operation=<op>,..." for
     * others. Each launch appends one JSON line to <root>/log/launch.log.
     * APP_NOT_FOUND when no application matches, LAUNCH_FAILED when its
     * program cannot be started. This platform has no reply channel: a reply
     * callback is accepted but never called. */
    int app_control_send_launch_request(app_control_h app_control, app_control_reply_cb callback,
                                        void* user_data);

#ifdef __cplusplus
}
#endif

#endif

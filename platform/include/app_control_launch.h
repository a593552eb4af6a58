#ifndef PLATFORM_APP_CONTROL_LAUNCH_H
#define PLATFORM_APP_CONTROL_LAUNCH_H

#include "app_control.h"

#ifdef __cplusplus
extern "C"
{
#endif

/* Our extension: the launcher hands the request to the started program in
 * the environment variable PLATFORM_LAUNCH_REQUEST (an encoded bundle),
 * next to PLATFORM_ROOT and PLATFORM_APP_ID. */
#define APP_CONTROL_LAUNCH_REQUEST_ENV "PLATFORM_LAUNCH_REQUEST"

/* Stand-ins that platform-setup registers: the location settings (it
 * handles APP_CONTROL_OPERATION_SETTING_LOCATION) and the web browser
 * (VIEW of http and https URIs). */
#define APP_CONTROL_LOCATION_SETTING_APP_ID "org.tizen.setting-location"
#define APP_CONTROL_BROWSER_APP_ID "org.tizen.browser"

    /* The request this process was started with, as a new handle that the
     * caller destroys. KEY_NOT_FOUND when the process was not started by a
     * launch request, INVALID_PARAMETER when the request is malformed. */
    int app_control_get_launch_request(app_control_h* app_control);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_APP_RESOURCE_MANAGER_H
#define PLATFORM_APP_RESOURCE_MANAGER_H

#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef enum
    {
        APP_RESOURCE_TYPE_IMAGE = 0,
        APP_RESOURCE_TYPE_LAYOUT = 1,
        APP_RESOURCE_TYPE_SOUND = 2,
        APP_RESOURCE_TYPE_BIN = 3,
        APP_RESOURCE_TYPE_MIN = APP_RESOURCE_TYPE_IMAGE,
        APP_RESOURCE_TYPE_MAX = APP_RESOURCE_TYPE_BIN,
    } app_resource_e;

    typedef enum
    {
        APP_RESOURCE_ERROR_NONE = TIZEN_ERROR_NONE,
        APP_RESOURCE_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        APP_RESOURCE_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        APP_RESOURCE_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    } app_resource_error_e;

    /* NONE also when already initialised. */
    int app_resource_manager_init(void);

    /* Resolves a resource id of the calling application to a readable file.
     * Each type has a folder prefix ("images/", "edje/", "sounds/", "bin/")
     * that is dropped from the id: "edje/<name>" gives "<own res>/<name>".
     * The device's resolution folder "<own res>/720x1280/<name>" wins when it
     * holds the file. IO_ERROR when no file exists; INVALID_PARAMETER for an
     * id that is empty, absolute or climbs with "..". The caller frees *path.
     * Initialises the manager when needed. */
    int app_resource_manager_get(app_resource_e type, const char* id, char** path);

    int app_resource_manager_release(void);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_QUORVEX_LOG_MANAGER_H
#define PLATFORM_QUORVEX_LOG_MANAGER_H

#include "bundle.h"
#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    /* Client of the device's usage-log service. On this platform a record is
     * one JSON line {"uri":..., "data":{key:value,...}} appended to
     * <root>/log/usage.log. */

#define QUORVEX_LOG_AUTHORITY "com.quorvex.log"

    typedef enum
    {
        QUORVEX_LOG_MANAGER_ERROR_NONE = TIZEN_ERROR_NONE,
        QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        QUORVEX_LOG_MANAGER_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        QUORVEX_LOG_MANAGER_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
    } quorvex_log_manager_error_e;

    typedef struct quorvex_log_manager_s* quorvex_log_manager_h;

    /* Called on the Ecore main loop once the record is stored. */
    typedef void (*quorvex_log_manager_insert_cb)(int request_id, const char* uri, void* user_data);

    int quorvex_log_manager_create(quorvex_log_manager_h* manager);
    /* Completions not yet delivered are dropped. */
    int quorvex_log_manager_destroy(quorvex_log_manager_h manager);

    /* Stores the string values of `data` (the caller keeps it) under `uri`.
     * Returns the request id (> 0) or a negative error: INVALID_PARAMETER for
     * a missing handle, an empty URI or an empty record, IO_ERROR when the log
     * cannot be written. `callback` may be NULL. */
    int quorvex_log_manager_insert(quorvex_log_manager_h manager, const char* uri, bundle* data,
                                   quorvex_log_manager_insert_cb callback, void* user_data);

#ifdef __cplusplus
}
#endif

#endif

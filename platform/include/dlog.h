#ifndef PLATFORM_DLOG_H
#define PLATFORM_DLOG_H

#include <stdarg.h>

#ifdef __cplusplus
extern "C"
{
#endif

    typedef enum
    {
        DLOG_UNKNOWN = 0,
        DLOG_DEFAULT,
        DLOG_VERBOSE,
        DLOG_DEBUG,
        DLOG_INFO,
        DLOG_WARN,
        DLOG_ERROR,
        DLOG_FATAL,
        DLOG_SILENT,
        DLOG_PRIO_MAX,
    } log_priority;

    typedef enum
    {
        DLOG_ERROR_NONE = 0,
        DLOG_ERROR_INVALID_PARAMETER = -22,
        DLOG_ERROR_NOT_PERMITTED = -1,
    } dlog_error_e;

    /* Appends "P/<tag>(<pid>): <text>" to <root>/log/dlog.log (and stderr when
     * DLOG_STDERR=1). Returns the bytes of the text, or a negative error. */
    int dlog_print(log_priority prio, const char* tag, const char* fmt, ...)
        __attribute__((format(printf, 3, 4)));
    int dlog_vprint(log_priority prio, const char* tag, const char* fmt, va_list ap);

    /* Our extension for tests: every line is also handed to this hook, in the
     * calling thread. NULL removes it. */
    typedef void (*dlog_capture_cb)(log_priority prio, const char* tag, const char* text, void* user_data);
    void dlog_set_capture(dlog_capture_cb cb, void* user_data);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_MESSAGE_PORT_H
#define PLATFORM_MESSAGE_PORT_H

#include <stdbool.h>
#include "bundle.h"
#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef enum
    {
        MESSAGE_PORT_ERROR_NONE = TIZEN_ERROR_NONE,
        MESSAGE_PORT_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
        MESSAGE_PORT_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        MESSAGE_PORT_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        MESSAGE_PORT_ERROR_PORT_NOT_FOUND = TIZEN_ERROR_MESSAGE_PORT | 0x01,
        MESSAGE_PORT_ERROR_CERTIFICATE_NOT_MATCH = TIZEN_ERROR_MESSAGE_PORT | 0x02,
        MESSAGE_PORT_ERROR_MAX_EXCEEDED = TIZEN_ERROR_MESSAGE_PORT | 0x03,
        MESSAGE_PORT_ERROR_RESOURCE_UNAVAILABLE = TIZEN_ERROR_MESSAGE_PORT | 0x04,
    } message_port_error_e;

    /* Runs on the Ecore main loop. `remote_app_id` is "" when the sender has
     * no application id; `remote_port` is NULL when the message was sent
     * without a local port. `message` belongs to the platform: bundle_dup it to
     * keep it. */
    typedef void (*message_port_message_cb)(int local_port_id, const char* remote_app_id,
                                            const char* remote_port, bool trusted_remote_port,
                                            bundle* message, void* user_data);

    /* A Unix datagram socket <root>/run/msgport/<local_port>.sock (mode 0600)
     * watched on the Ecore main loop. Returns the port id (> 0) or a negative
     * error; registering a name again returns the same id and replaces the
     * callback. RESOURCE_UNAVAILABLE when another live process holds the name. */
    int message_port_register_local_port(const char* local_port, message_port_message_cb callback,
                                         void* user_data);
    int message_port_unregister_local_port(int local_port_id);

    /* The caller keeps `message`. PORT_NOT_FOUND when nobody listens on the
     * port, MAX_EXCEEDED for a message over 16 KiB once encoded,
     * RESOURCE_UNAVAILABLE when the receiver's queue is full. */
    int message_port_send_message(const char* remote_app_id, const char* remote_port, bundle* message);
    int message_port_send_message_with_local_port(const char* remote_app_id, const char* remote_port,
                                                  bundle* message, int local_port_id);

#ifdef __cplusplus
}
#endif

#endif

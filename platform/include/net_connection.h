#ifndef PLATFORM_NET_CONNECTION_H
#define PLATFORM_NET_CONNECTION_H

#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef void* connection_h;

    typedef enum
    {
        CONNECTION_TYPE_DISCONNECTED = 0,
        CONNECTION_TYPE_WIFI = 1,
        CONNECTION_TYPE_CELLULAR = 2,
        CONNECTION_TYPE_ETHERNET = 3,
        CONNECTION_TYPE_BT = 4,
    } connection_type_e;

    typedef enum
    {
        CONNECTION_ERROR_NONE = TIZEN_ERROR_NONE,
        CONNECTION_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        CONNECTION_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        CONNECTION_ERROR_INVALID_OPERATION = TIZEN_ERROR_INVALID_OPERATION,
        CONNECTION_ERROR_ADDRESS_FAMILY_NOT_SUPPORTED = TIZEN_ERROR_ADDRESS_FAMILY_NOT_SUPPORTED,
        CONNECTION_ERROR_OPERATION_FAILED = TIZEN_ERROR_CONNECTION | 0x0401,
        CONNECTION_ERROR_ITERATOR_END = TIZEN_ERROR_CONNECTION | 0x0402,
        CONNECTION_ERROR_NO_CONNECTION = TIZEN_ERROR_CONNECTION | 0x0403,
        CONNECTION_ERROR_NOW_IN_PROGRESS = TIZEN_ERROR_NOW_IN_PROGRESS,
        CONNECTION_ERROR_ALREADY_EXISTS = TIZEN_ERROR_CONNECTION | 0x0404,
        CONNECTION_ERROR_OPERATION_ABORTED = TIZEN_ERROR_CONNECTION | 0x0405,
        CONNECTION_ERROR_DHCP_FAILED = TIZEN_ERROR_CONNECTION | 0x0406,
        CONNECTION_ERROR_INVALID_KEY = TIZEN_ERROR_CONNECTION | 0x0407,
        CONNECTION_ERROR_NO_REPLY = TIZEN_ERROR_CONNECTION | 0x0408,
        CONNECTION_ERROR_PERMISSION_DENIED = TIZEN_ERROR_PERMISSION_DENIED,
        CONNECTION_ERROR_NOT_SUPPORTED = TIZEN_ERROR_NOT_SUPPORTED,
    } connection_error_e;

    typedef void (*connection_type_changed_cb)(connection_type_e type, void* user_data);

    /* The connection type is the system key memory/dnet/status; its changes are
     * delivered on the Ecore main loop. */
    int connection_create(connection_h* connection);
    int connection_destroy(connection_h connection);
    int connection_get_type(connection_h connection, connection_type_e* type);
    int connection_set_type_changed_cb(connection_h connection, connection_type_changed_cb callback,
                                       void* user_data);
    int connection_unset_type_changed_cb(connection_h connection);

#ifdef __cplusplus
}
#endif

#endif

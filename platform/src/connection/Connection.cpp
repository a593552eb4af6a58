#include "net_connection.h"

#include <algorithm>
#include <new>
#include <vector>

#include "dlog.h"
#include "vconf.h"

namespace
{

const char* const kLogTag = "CAPI_NETWORK_CONNECTION";

struct Connection
{
    connection_type_changed_cb cb = nullptr;
    void* userData = nullptr;
};

// Handles of this process; those with a callback share one key watch.
std::vector<Connection*>& LiveHandles()
{
    static auto* handles = new std::vector<Connection*>();
    return *handles;
}

bool gWatching = false;

Connection* FindHandle(connection_h handle)
{
    auto& handles = LiveHandles();
    auto it = std::find(handles.begin(), handles.end(), static_cast<Connection*>(handle));
    return it == handles.end() ? nullptr : *it;
}

connection_type_e TypeOfStatus(int status)
{
    switch (status)
    {
    case VCONFKEY_NETWORK_WIFI:
        return CONNECTION_TYPE_WIFI;
    case VCONFKEY_NETWORK_CELLULAR:
        return CONNECTION_TYPE_CELLULAR;
    case VCONFKEY_NETWORK_ETHERNET:
        return CONNECTION_TYPE_ETHERNET;
    case VCONFKEY_NETWORK_BLUETOOTH:
        return CONNECTION_TYPE_BT;
    default:
        return CONNECTION_TYPE_DISCONNECTED;
    }
}

bool AnyCallbackSet()
{
    for (Connection* handle : LiveHandles())
        if (handle->cb)
            return true;
    return false;
}

void NetworkStatusChangedCb(keynode_t* node, void*)
{
    if (!node)
        return;
    connection_type_e type = TypeOfStatus(vconf_keynode_get_int(node));
    // A callback may destroy handles or unset callbacks: look each up again.
    std::vector<Connection*> snapshot = LiveHandles();
    for (Connection* handle : snapshot)
    {
        Connection* live = FindHandle(handle);
        if (live && live->cb)
            live->cb(type, live->userData);
    }
}

void UpdateWatch()
{
    bool wanted = AnyCallbackSet();
    if (wanted && !gWatching)
        gWatching = vconf_notify_key_changed(VCONFKEY_NETWORK_STATUS, NetworkStatusChangedCb, nullptr) == VCONF_OK;
    else if (!wanted && gWatching)
    {
        vconf_ignore_key_changed(VCONFKEY_NETWORK_STATUS, NetworkStatusChangedCb);
        gWatching = false;
    }
}

}  // namespace

extern "C" int connection_create(connection_h* connection)
{
    if (!connection)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    auto* handle = new (std::nothrow) Connection();
    if (!handle)
        return CONNECTION_ERROR_OUT_OF_MEMORY;
    LiveHandles().push_back(handle);
    *connection = handle;
    return CONNECTION_ERROR_NONE;
}

extern "C" int connection_destroy(connection_h connection)
{
    Connection* handle = FindHandle(connection);
    if (!handle)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    auto& handles = LiveHandles();
    handles.erase(std::find(handles.begin(), handles.end(), handle));
    delete handle;
    UpdateWatch();
    return CONNECTION_ERROR_NONE;
}

extern "C" int connection_get_type(connection_h connection, connection_type_e* type)
{
    if (!FindHandle(connection) || !type)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    int status = VCONFKEY_NETWORK_OFF;
    if (vconf_get_int(VCONFKEY_NETWORK_STATUS, &status) != VCONF_OK)
    {
        dlog_print(DLOG_ERROR, kLogTag, "network status cannot be read");
        return CONNECTION_ERROR_OPERATION_FAILED;
    }
    *type = TypeOfStatus(status);
    return CONNECTION_ERROR_NONE;
}

extern "C" int connection_set_type_changed_cb(connection_h connection, connection_type_changed_cb callback,
                                              void* user_data)
{
    Connection* handle = FindHandle(connection);
    if (!handle || !callback)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    handle->cb = callback;
    handle->userData = user_data;
    UpdateWatch();
    if (!gWatching)
    {
        handle->cb = nullptr;
        handle->userData = nullptr;
        return CONNECTION_ERROR_OPERATION_FAILED;
    }
    return CONNECTION_ERROR_NONE;
}

extern "C" int connection_unset_type_changed_cb(connection_h connection)
{
    Connection* handle = FindHandle(connection);
    if (!handle)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    handle->cb = nullptr;
    handle->userData = nullptr;
    UpdateWatch();
    return CONNECTION_ERROR_NONE;
}

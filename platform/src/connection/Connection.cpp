#include "net_connection.h"

#include <memory>

#include "ListenerList.h"
#include "core/ApiGuard.h"
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

typedef NSWeather::ListenerList<Connection*> HandleList;

// Handles of this process.
HandleList& LiveHandles()
{
    static auto* handles = new HandleList();
    return *handles;
}

// The handles with a callback; they share one key watch.
HandleList& Watchers()
{
    static auto* watchers = new HandleList();
    return *watchers;
}

bool gWatching = false;
// The type last reported (or found when the watch began); -1 when unknown.
// Writers rewrite the status key with the same value: only a new type is
// news to the callbacks.
int gLastType = -1;

Connection* FindHandle(connection_h handle)
{
    auto* connection = static_cast<Connection*>(handle);
    return LiveHandles().Contains(connection) ? connection : nullptr;
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

void NetworkStatusChangedCb(keynode_t* node, void*)
{
    if (!node)
        return;
    connection_type_e type = TypeOfStatus(vconf_keynode_get_int(node));
    if (type == gLastType)
        return;
    gLastType = type;
    // A callback may destroy handles or unset callbacks.
    Watchers().Notify([type](Connection* handle) { handle->cb(type, handle->userData); });
}

void UpdateWatch()
{
    bool wanted = !Watchers().IsEmpty();
    if (wanted && !gWatching)
    {
        int status = 0;
        gLastType = vconf_get_int(VCONFKEY_NETWORK_STATUS, &status) == VCONF_OK ? TypeOfStatus(status) : -1;
        gWatching =
            vconf_notify_key_changed(VCONFKEY_NETWORK_STATUS, NetworkStatusChangedCb, nullptr) == VCONF_OK;
    }
    else if (!wanted && gWatching)
    {
        vconf_ignore_key_changed(VCONFKEY_NETWORK_STATUS, NetworkStatusChangedCb);
        gWatching = false;
    }
}

int ConnectionCreate(connection_h* connection)
{
    if (!connection)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    auto handle = std::make_unique<Connection>();
    LiveHandles().Add(handle.get());
    *connection = handle.release();
    return CONNECTION_ERROR_NONE;
}

int ConnectionDestroy(connection_h connection)
{
    Connection* handle = FindHandle(connection);
    if (!handle)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    LiveHandles().Remove(handle);
    Watchers().Remove(handle);
    delete handle;
    UpdateWatch();
    return CONNECTION_ERROR_NONE;
}

int ConnectionGetType(connection_h connection, connection_type_e* type)
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

int ConnectionSetTypeChangedCb(connection_h connection, connection_type_changed_cb callback, void* user_data)
{
    Connection* handle = FindHandle(connection);
    if (!handle || !callback)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    handle->cb = callback;
    handle->userData = user_data;
    Watchers().Add(handle);
    UpdateWatch();
    if (!gWatching)
    {
        Watchers().Remove(handle);
        handle->cb = nullptr;
        handle->userData = nullptr;
        return CONNECTION_ERROR_OPERATION_FAILED;
    }
    return CONNECTION_ERROR_NONE;
}

int ConnectionUnsetTypeChangedCb(connection_h connection)
{
    Connection* handle = FindHandle(connection);
    if (!handle)
        return CONNECTION_ERROR_INVALID_PARAMETER;
    Watchers().Remove(handle);
    handle->cb = nullptr;
    handle->userData = nullptr;
    UpdateWatch();
    return CONNECTION_ERROR_NONE;
}

}  // namespace

extern "C" int connection_create(connection_h* connection)
{
    return platform::GuardedCall(kLogTag, CONNECTION_ERROR_OUT_OF_MEMORY,
                                 [&] { return ConnectionCreate(connection); });
}

extern "C" int connection_destroy(connection_h connection)
{
    return platform::GuardedCall(kLogTag, CONNECTION_ERROR_OUT_OF_MEMORY,
                                 [&] { return ConnectionDestroy(connection); });
}

extern "C" int connection_get_type(connection_h connection, connection_type_e* type)
{
    return platform::GuardedCall(kLogTag, CONNECTION_ERROR_OUT_OF_MEMORY,
                                 [&] { return ConnectionGetType(connection, type); });
}

extern "C" int connection_set_type_changed_cb(connection_h connection, connection_type_changed_cb callback,
                                              void* user_data)
{
    return platform::GuardedCall(kLogTag, CONNECTION_ERROR_OUT_OF_MEMORY,
                                 [&] { return ConnectionSetTypeChangedCb(connection, callback, user_data); });
}

extern "C" int connection_unset_type_changed_cb(connection_h connection)
{
    return platform::GuardedCall(kLogTag, CONNECTION_ERROR_OUT_OF_MEMORY,
                                 [&] { return ConnectionUnsetTypeChangedCb(connection); });
}

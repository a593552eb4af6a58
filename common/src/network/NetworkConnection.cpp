#include "NetworkConnection.h"

#include <cstddef>
#include <exception>

#include "CommonLog.h"
#include "WeatherDefine.h"

namespace NSWeather
{

NetworkConnection::NetworkConnection() : mConnection(nullptr), mEventListener(nullptr), mUserData(nullptr) {}

NetworkConnection::~NetworkConnection()
{
    if (!mConnection)
        return;
    if (connection_unset_type_changed_cb(mConnection) != CONNECTION_ERROR_NONE)
        COMMON_LOG("connection_unset_type_changed_cb failed");
    if (connection_destroy(mConnection) != CONNECTION_ERROR_NONE)
        COMMON_LOG("connection_destroy failed");
    mConnection = nullptr;
}

bool NetworkConnection::EnsureConnection()
{
    if (mConnection)
        return true;
    int ret = connection_create(&mConnection);
    if (ret != CONNECTION_ERROR_NONE)
    {
        COMMON_LOG("[%s(): %d] connection_create failed(%d) [break]", __func__, __LINE__, ret);
        mConnection = nullptr;
        return false;
    }
    if (mConnection == NULL)
    {
        COMMON_LOG_BREAK("mConnection == NULL");
        return false;
    }
    return true;
}

bool NetworkConnection::IsNetworkAvailable()
{
    bool isAvailable = false;
    do
    {
        if (!EnsureConnection())
            break;
        connection_type_e type = CONNECTION_TYPE_DISCONNECTED;
        int ret = connection_get_type(mConnection, &type);
        if (ret != CONNECTION_ERROR_NONE)
        {
            COMMON_LOG("[%s(): %d] connection_get_type:%d [break]", __func__, __LINE__, ret);
            break;
        }
        if (type == CONNECTION_TYPE_DISCONNECTED || type == CONNECTION_TYPE_BT)
        {
            COMMON_LOG(
                "[%s(): %d] connection type disconnected or bt connection. network connection type:%d "
                "[break]",
                __func__, __LINE__, type);
            break;
        }
        isAvailable = true;
    } while (0);
    COMMON_LOG("network isAvailable:%d", isAvailable ? 1 : 0);
    return isAvailable;
}

int NetworkConnection::SetNetworkConnectionStateChangedCb(NetworkConnectionStateEventListner* eventListener,
                                                          void* userData)
{
    if (!eventListener)
    {
        COMMON_LOG("[%s(): %d] eventListener is null [break]", __func__, __LINE__);
        return ERR_FAIL;
    }
    mEventListener = eventListener;
    mUserData = userData;
    if (!EnsureConnection())
        return ERR_FAIL;
    int ret = connection_set_type_changed_cb(mConnection, NetworkStateChangedCb, this);
    if (ret != CONNECTION_ERROR_NONE)
    {
        COMMON_LOG("[%s(): %d] connection_set_type_changed_cb failed(%d) [break]", __func__, __LINE__, ret);
        return ERR_FAIL;
    }
    return ERR_OK;
}

void NetworkConnection::NetworkStateChangedCb(connection_type_e type, void* userData)
{
    ForwardCallback<NetworkConnection>(
        userData, [type](NetworkConnection& connection) { connection.OnNetworkStateChanged(type); },
        COMMON_CALLBACK_SITE);
}

void NetworkConnection::OnNetworkStateChanged(connection_type_e type)
{
    NetworkConnection* pThis = this;
    COMMON_RET_IF(pThis->mEventListener == NULL);
    pThis->mEventListener->OnNetworkConnectionStateChanged(type, pThis->mUserData);
}

}  // namespace NSWeather

#ifndef NSWEATHER_NETWORK_CONNECTION_H
#define NSWEATHER_NETWORK_CONNECTION_H

#include <net_connection.h>

#include <memory>

#include "NetworkConnectionStateEventListner.h"

namespace NSWeather
{

// Whether a usable data connection exists, and changes of the connection
// type forwarded to one listener on the main loop.
class NetworkConnection
{
public:
    NetworkConnection();
    virtual ~NetworkConnection();
    NetworkConnection(const NetworkConnection&) = delete;
    NetworkConnection& operator=(const NetworkConnection&) = delete;

    // False when disconnected, on a Bluetooth tether only, or unknown.
    bool IsNetworkAvailable();
    // 0, or -1 without a listener or when the platform refuses. The
    // listener is not owned and must outlive this object.
    int SetNetworkConnectionStateChangedCb(NetworkConnectionStateEventListner* eventListener, void* userData);

private:
    bool EnsureConnection();
    static void NetworkStateChangedCb(connection_type_e type, void* userData);
    void OnNetworkStateChanged(connection_type_e type);

    connection_h mConnection;
    NetworkConnectionStateEventListner* mEventListener;
    void* mUserData;
};

using NetworkConnectionPtr = std::shared_ptr<NetworkConnection>;

}  // namespace NSWeather

#endif

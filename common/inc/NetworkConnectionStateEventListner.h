#ifndef NSWEATHER_NETWORK_CONNECTION_STATE_EVENT_LISTNER_H
#define NSWEATHER_NETWORK_CONNECTION_STATE_EVENT_LISTNER_H

namespace NSWeather
{

// Told of every change of the device's connection type.
class NetworkConnectionStateEventListner
{
public:
    virtual ~NetworkConnectionStateEventListner() = default;
    // `state` is the platform's connection type (0 disconnected, 1 Wi-Fi,
    // 2 cellular, ...); `userData` is what was registered with the listener.
    virtual void OnNetworkConnectionStateChanged(int state, void* userData) = 0;
};

}  // namespace NSWeather

#endif

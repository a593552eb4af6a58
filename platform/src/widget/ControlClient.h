#ifndef PLATFORM_WIDGET_CONTROL_CLIENT_H
#define PLATFORM_WIDGET_CONTROL_CLIENT_H

#include <string>

namespace platform
{

// The other end of a widget host's control socket, for widgetctl and tests.
class ControlClient
{
public:
    ControlClient() = default;
    ~ControlClient();
    ControlClient(const ControlClient&) = delete;
    ControlClient& operator=(const ControlClient&) = delete;

    // "<root>/run/widget/<widgetId>.ctl"
    static std::string SocketPath(const std::string& widgetId);

    bool Connect(const std::string& socketPath);
    bool GetIsConnected() const { return mFd >= 0; }
    void Disconnect();

    // Sends one command and returns the whole reply (for list, the "OK <n>"
    // line and the n lines after it, joined with '\n'). False when the host
    // is gone or did not answer within `timeoutSeconds`.
    bool Request(const std::string& command, std::string& reply, double timeoutSeconds = 30.0);

private:
    bool ReadLine(std::string& line, double deadline);

    int mFd = -1;
    std::string mBuffer;
};

}  // namespace platform

#endif

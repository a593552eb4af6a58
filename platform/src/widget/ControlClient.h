#ifndef PLATFORM_WIDGET_CONTROL_CLIENT_H
#define PLATFORM_WIDGET_CONTROL_CLIENT_H

#include <string>
#include <vector>

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
    // Sends `commands` in one write, so that the host handles them without
    // drawing in between, and reads one reply line each (not for list).
    bool RequestTogether(const std::vector<std::string>& commands, std::vector<std::string>& replies,
                         double timeoutSeconds = 30.0);

private:
    bool SendCommands(const std::vector<std::string>& commands);
    bool ReadLine(std::string& line, double deadline);

    int mFd = -1;
    std::string mBuffer;
};

}  // namespace platform

#endif

#ifndef WEATHER_TESTS_WIDGET_HOST_FIXTURE_H
#define WEATHER_TESTS_WIDGET_HOST_FIXTURE_H

#include <sys/types.h>

#include <string>
#include <vector>

#include "TestPlatform.h"
#include "widget/ControlClient.h"

namespace WeatherTest
{

// Runs the test widget application under the host on a fresh root and
// talks to it through the control socket.
class WidgetHostTest : public PlatformTest
{
protected:
    static const char* const kWidgetId;

    void TearDown() override;
    void StopHost();

    // Starts the host with extra arguments and waits for its socket; with a
    // display name its windows go to that X display.
    void StartHost(const std::vector<std::string>& args = {}, const std::string& display = std::string());
    // Starts a private X server with a window manager (Elementary paints no
    // window without one); its display name, or "" when either is missing.
    std::string StartXServer();
    // Starts a second process without waiting; returns its pid.
    pid_t Spawn(const std::vector<std::string>& args, const std::string& outputName,
                const std::string& display = std::string());
    // The reply to one command ("" when the host did not answer).
    std::string Send(const std::string& command);
    // "OK <id>" of a create, reduced to the id.
    std::string CreateInstance(const std::string& size);
    void WaitIdle();
    // Waits for the host to end by itself; its exit status, or -1.
    int WaitForExit(double seconds);

    // The recorded callback lines, and those starting with `prefix`.
    std::vector<std::string> Records() const;
    std::vector<std::string> Records(const std::string& prefix) const;
    std::string SocketPath() const;

    pid_t mHostPid = -1;
    pid_t mXServerPid = -1;
    pid_t mWindowManagerPid = -1;
    platform::ControlClient mClient;
};

// Words of a line split at spaces.
std::vector<std::string> Words(const std::string& line);

}  // namespace WeatherTest

#endif

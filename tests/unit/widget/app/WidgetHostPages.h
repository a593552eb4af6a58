#ifndef WEATHER_TESTS_WIDGET_HOST_PAGES_H
#define WEATHER_TESTS_WIDGET_HOST_PAGES_H

#include <sys/types.h>

#include <functional>
#include <string>
#include <vector>

#include "Setting.h"
#include "TestPlatform.h"
#include "widget/ControlClient.h"

namespace WeatherTest
{

// The real weather-widget under the host, on a fresh root with real
// database files and system keys, driven through the control socket.
class WidgetHostPagesTest : public PlatformTest
{
public:
    static const char* const kWidgetId;
    // Launch-log texts of the two agent requests.
    static const char* const kRefreshRequest;
    static const char* const kCurrentLocationRequest;
    // Where the refresh button of a 4x2 page (712x354) is tapped.
    static const char* const kRefreshButton;

    void SetUp() override;
    void TearDown() override;

    // Sample cities written through the store (see widget/samples).
    void WriteCities(int count, int days = 7, bool firstIsCurrentLocation = false);
    void ChangeSetting(const std::function<void(const NSWeather::SettingPtr&)>& change);
    NSWeather::SettingPtr ReadSetting();
    void SetKey(const char* key, int value);

    void StartHost(const std::vector<std::string>& sizes);
    std::string Send(const std::string& command);
    // One write: the host handles all of them before it draws again.
    std::vector<std::string> SendTogether(const std::vector<std::string>& commands);
    std::string Id(int n) const { return std::string(kWidgetId) + ":" + std::to_string(n); }
    void WaitIdle();
    // The JSON of one page slot ("centerLayout" ...) of an instance's dump.
    std::string Slot(const std::string& id, const std::string& slot);
    static std::string SlotOf(const std::string& dump, const std::string& slot);
    // The text of `part` in the centre page of an instance ("" if none).
    std::string CentreText(const std::string& id, const std::string& part);
    std::vector<std::string> Launches() const;
    // Launch-log lines that contain `part`.
    int CountLaunches(const std::string& part) const;
    // Lines of the widget process's log that contain `text`.
    int CountLog(const std::string& text) const;
    // Polls `done` (every 20 ms, up to `seconds`); its last answer. For
    // states the host's idle cannot tell: another process's work, or a page
    // whose progress animation keeps the host busy.
    static bool WaitUntil(const std::function<bool()>& done, double seconds = 30.0);

    pid_t mHostPid = -1;
    platform::ControlClient mClient;
};

}  // namespace WeatherTest

#endif

#include "WidgetHostPages.h"

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vconf.h>

#include <chrono>
#include <csignal>
#include <thread>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SampleCities.h"
#include "SettingDBController.h"
#include "TestFiles.h"
#include "WeatherDefine.h"

namespace WeatherTest
{

const char* const WidgetHostPagesTest::kWidgetId = "com.quorvex.weather-m-widget";
const char* const WidgetHostPagesTest::kRefreshRequest = "\"MESSAGE\":\"REQUEST_ALL_WEATHER_INFO\"";
const char* const WidgetHostPagesTest::kCurrentLocationRequest =
    "\"MESSAGE\":\"REQUEST_CURRENT_LOCATION_WEATHER_INFO_FOR_SIMPLE_ADD_PROCESS\"";
const char* const WidgetHostPagesTest::kRefreshButton = "658 312";

void WidgetHostPagesTest::SetUp()
{
    NSWeather::FileUtil::ClearCache();
    mRoot.UseBuildResources();
    mRoot.RegisterApp("com.quorvex.weather-m-agent", "exec=/bin/true\n");
    mRoot.RegisterApp("com.quorvex.weather-m", "exec=/bin/true\n");
    mRoot.RegisterApp("org.tizen.browser", "exec=/bin/true\nview-uri=http,https\n");
    SetKey("memory/dnet/status", 2);
    SetKey("db/location/setting/Usemylocation", 1);
    SetKey("db/location/setting/GpsEnabled", 1);
    ASSERT_EQ(vconf_set_str("db/menu_widget/language", "en_US.UTF-8"), 0);
    ASSERT_EQ(NSWeather::DataStoreInitializer::Run(), NSWeather::ERR_OK);
}

void WidgetHostPagesTest::TearDown()
{
    if (mHostPid <= 0)
        return;
    Send("exit");
    for (int i = 0; i < 500 && waitpid(mHostPid, nullptr, WNOHANG) == 0; ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    if (kill(mHostPid, 0) == 0)
    {
        kill(mHostPid, SIGKILL);
        waitpid(mHostPid, nullptr, 0);
        ADD_FAILURE() << "the widget did not end on exit";
    }
    // Under the sanitizers a fault in the widget shows in its output only.
    std::string output = ReadText(mRoot.Path("host.out"));
    EXPECT_EQ(output.find("ERROR: AddressSanitizer"), std::string::npos) << output;
    EXPECT_EQ(output.find("runtime error:"), std::string::npos) << output;
    unlink(mRoot.Path("host.out").c_str());
}

void WidgetHostPagesTest::WriteCities(int count, int days, bool firstIsCurrentLocation)
{
    ASSERT_EQ(
        NSWeatherWidget::SampleCities::WriteCities(count, time(nullptr) - 600, days, firstIsCurrentLocation),
        NSWeather::ERR_OK);
}

void WidgetHostPagesTest::ChangeSetting(const std::function<void(const NSWeather::SettingPtr&)>& change)
{
    NSWeather::SettingDBController controller;
    NSWeather::SettingPtr setting = controller.Select();
    ASSERT_TRUE(setting);
    change(setting);
    controller.Update(setting);
}

NSWeather::SettingPtr WidgetHostPagesTest::ReadSetting()
{
    return NSWeather::SettingDBController().Select();
}

void WidgetHostPagesTest::SetKey(const char* key, int value)
{
    ASSERT_EQ(vconf_set_int(key, value), 0) << key;
}

void WidgetHostPagesTest::StartHost(const std::vector<std::string>& sizes)
{
    std::vector<std::string> args = {WEATHER_WIDGET_PROGRAM};
    for (const std::string& size : sizes)
    {
        args.push_back("--instance");
        args.push_back(size);
    }
    std::string output = mRoot.Path("host.out");
    mHostPid = fork();
    if (mHostPid == 0)
    {
        int fd = open(output.c_str(), O_WRONLY | O_CREAT | O_APPEND, 0600);
        dup2(fd, 1);
        dup2(fd, 2);
        unsetenv("DISPLAY");
        unsetenv("WAYLAND_DISPLAY");
        setenv("PLATFORM_APP_ID", kWidgetId, 1);
        std::vector<char*> argv;
        for (auto& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        _exit(127);
    }
    ASSERT_GT(mHostPid, 0);
    std::string socket = platform::ControlClient::SocketPath(kWidgetId);
    for (int i = 0; !mClient.Connect(socket); ++i)
    {
        ASSERT_EQ(waitpid(mHostPid, nullptr, WNOHANG), 0) << ReadText(output);
        ASSERT_LT(i, 1000) << "no control socket";
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    }
    WaitIdle();
}

std::string WidgetHostPagesTest::Send(const std::string& command)
{
    std::string reply;
    return mClient.Request(command, reply, 30.0) ? reply : std::string();
}

std::vector<std::string> WidgetHostPagesTest::SendTogether(const std::vector<std::string>& commands)
{
    std::vector<std::string> replies;
    mClient.RequestTogether(commands, replies, 30.0);
    return replies;
}

void WidgetHostPagesTest::WaitIdle()
{
    EXPECT_EQ(Send("idle 10"), "OK");
}

// Braces inside texts would confuse this; the pages show none.
std::string WidgetHostPagesTest::Slot(const std::string& id, const std::string& slot)
{
    return SlotOf(Send("dump " + id), slot);
}

std::string WidgetHostPagesTest::SlotOf(const std::string& dump, const std::string& slot)
{
    size_t at = dump.find("\"" + slot + "\":");
    if (at == std::string::npos)
        return std::string();
    size_t begin = dump.find_first_of("{n", at + slot.size() + 3);
    if (begin == std::string::npos || dump[begin] == 'n')
        return std::string();
    int depth = 0;
    for (size_t i = begin; i < dump.size(); ++i)
    {
        depth += dump[i] == '{' ? 1 : dump[i] == '}' ? -1 : 0;
        if (depth == 0)
            return dump.substr(begin, i - begin + 1);
    }
    return std::string();
}

std::string WidgetHostPagesTest::CentreText(const std::string& id, const std::string& part)
{
    std::string centre = Slot(id, "centerLayout");
    std::string key = "\"" + part + "\":\"";
    size_t at = centre.find(key);
    if (at == std::string::npos)
        return std::string();
    at += key.size();
    return centre.substr(at, centre.find('"', at) - at);
}

std::vector<std::string> WidgetHostPagesTest::Launches() const
{
    return ReadLines(mRoot.Path("log/launch.log"));
}

int WidgetHostPagesTest::CountLaunches(const std::string& part) const
{
    int count = 0;
    for (const std::string& line : Launches()) count += line.find(part) != std::string::npos;
    return count;
}

bool WidgetHostPagesTest::WaitUntil(const std::function<bool()>& done, double seconds)
{
    auto end = std::chrono::steady_clock::now() + std::chrono::duration<double>(seconds);
    while (!done())
    {
        if (std::chrono::steady_clock::now() > end)
            return done();
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    }
    return true;
}

int WidgetHostPagesTest::CountLog(const std::string& text) const
{
    int count = 0;
    for (const std::string& line : ReadLines(mRoot.Path("log/dlog.log")))
        count += line.find(text) != std::string::npos;
    return count;
}

}  // namespace WeatherTest

// The widget program as the host runs it, measured from outside: a port
// message until every instance has been updated, process start until the
// first instance exists beside a bare Elementary window's first frame, and
// resident memory after flicks and updates beside that window's.
// WIDGET_BENCH_FLICKS sets the number of flicks (1000).
#include <benchmark/benchmark.h>
#include <bundle.h>
#include <message_port.h>
#include <fcntl.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vconf.h>

#include <chrono>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SampleCities.h"
#include "WidgetBenchRoot.h"
#include "widget/ControlClient.h"

namespace
{
const char* const kWidgetId = "com.quorvex.weather-m-widget";
const char* const kPort = "com.quorvex.weather-m-widget.message.port.local";
std::string gRoot;

void MakeRoot()
{
    gRoot = MakeWidgetBenchRoot("bench");
    unsetenv("DISPLAY");
    unsetenv("WAYLAND_DISPLAY");
    vconf_set_str("db/menu_widget/language", "en_US.UTF-8");
    if (NSWeather::DataStoreInitializer::Run() != 0 ||
        NSWeatherWidget::SampleCities::WriteCities(10, time(nullptr), 7, false) != 0)
        abort();
}

pid_t Spawn(const std::vector<std::string>& args, int* stdinFd = nullptr, int* stdoutFd = nullptr)
{
    int in[2];
    int out[2];
    if (pipe(in) != 0 || pipe(out) != 0)
        abort();
    pid_t pid = fork();
    if (pid == 0)
    {
        dup2(in[0], 0);
        dup2(stdoutFd ? out[1] : open("/dev/null", O_WRONLY), 1);
        // Only the parent may hold the write end: its close is the child's end.
        close(in[1]);
        close(out[0]);
        setenv("PLATFORM_APP_ID", kWidgetId, 1);
        std::vector<char*> argv;
        for (const std::string& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        _exit(127);
    }
    close(in[0]);
    close(out[1]);
    if (stdinFd)
        *stdinFd = in[1];
    else
        close(in[1]);
    if (stdoutFd)
        *stdoutFd = out[0];
    else
        close(out[0]);
    return pid;
}

void Stop(pid_t pid)
{
    kill(pid, SIGTERM);
    waitpid(pid, nullptr, 0);
}

// A widget process with `sizes` instances and a connected control client.
struct Widget
{
    pid_t pid = -1;
    platform::ControlClient client;

    explicit Widget(const std::vector<std::string>& sizes)
    {
        std::vector<std::string> args = {WEATHER_WIDGET_PROGRAM};
        for (const std::string& size : sizes)
        {
            args.push_back("--instance");
            args.push_back(size);
        }
        pid = Spawn(args);
        std::string socket = platform::ControlClient::SocketPath(kWidgetId);
        while (!client.Connect(socket)) std::this_thread::sleep_for(std::chrono::milliseconds(1));
    }
    ~Widget() { Stop(pid); }
    std::string Send(const std::string& command)
    {
        std::string reply;
        return client.Request(command, reply, 60.0) ? reply : std::string();
    }
};

int CountUpdates()
{
    std::ifstream log(gRoot + "/log/dlog.log");
    std::string line;
    int count = 0;
    while (std::getline(log, line)) count += line.find("UpdateWidgetInstance") != std::string::npos;
    return count;
}

long ResidentKiB(pid_t pid)
{
    std::ifstream status("/proc/" + std::to_string(pid) + "/status");
    std::string line;
    while (std::getline(status, line))
        if (line.compare(0, 6, "VmRSS:") == 0)
            return std::stol(line.substr(6));
    return -1;
}

void BM_PortMessageToEveryInstanceUpdated(benchmark::State& state)
{
    Widget widget({"4x2", "4x4"});
    widget.Send("idle 10");
    for (auto _ : state)
    {
        int target = CountUpdates() + 4;  // two rounds for two instances
        bundle* message = bundle_create();
        message_port_send_message(kWidgetId, kPort, message);
        bundle_free(message);
        // Each reply comes after the widget's loop has handled what was
        // queued before it, updates included.
        while (CountUpdates() < target) widget.Send("list");
        widget.Send("list");
    }
}
BENCHMARK(BM_PortMessageToEveryInstanceUpdated)->Unit(benchmark::kMillisecond)->Iterations(20);

using Clock = std::chrono::steady_clock;

double Seconds(Clock::time_point since)
{
    return std::chrono::duration<double>(Clock::now() - since).count();
}

// Until the host answers, which it does once the instances named on its
// command line exist with their pages.
void BM_StartToFirstInstance(benchmark::State& state)
{
    for (auto _ : state)
    {
        Clock::time_point start = Clock::now();
        Widget widget({"4x4"});
        widget.Send("list");
        state.SetIterationTime(Seconds(start));
    }
}
BENCHMARK(BM_StartToFirstInstance)->Unit(benchmark::kMillisecond)->Iterations(10)->UseManualTime();

void BM_StartToBareWindowDrawn(benchmark::State& state)
{
    for (auto _ : state)
    {
        Clock::time_point start = Clock::now();
        int out = -1;
        pid_t pid = Spawn({BARE_WINDOW_PROGRAM}, nullptr, &out);
        char buffer[16];
        if (read(out, buffer, sizeof(buffer)) <= 0)
            state.SkipWithError("bare window did not draw");
        state.SetIterationTime(Seconds(start));
        close(out);
        waitpid(pid, nullptr, 0);
    }
}
BENCHMARK(BM_StartToBareWindowDrawn)->Unit(benchmark::kMillisecond)->Iterations(10)->UseManualTime();

void BM_ResidentMemoryAfterFlicksAndUpdates(benchmark::State& state)
{
    const char* flicksText = getenv("WIDGET_BENCH_FLICKS");
    int flicks = flicksText ? atoi(flicksText) : 1000;
    for (auto _ : state)
    {
        int in = -1;
        int out = -1;
        pid_t bare = Spawn({BARE_WINDOW_PROGRAM, "--stay"}, &in, &out);
        char buffer[16];
        (void)read(out, buffer, sizeof(buffer));
        double bareKiB = ResidentKiB(bare);
        close(in);
        close(out);
        waitpid(bare, nullptr, 0);

        Widget widget({"4x2", "4x4"});
        widget.Send("idle 10");
        std::string ids[] = {std::string(kWidgetId) + ":1", std::string(kWidgetId) + ":2"};
        double halfwayKiB = 0;
        for (int i = 0; i < flicks; ++i)
        {
            const std::string& id = ids[i % 2];
            widget.Send("swipe " + id + " 300 300 300 50 120");
            widget.Send("update " + id);
            widget.Send("idle 10");
            if (i == flicks / 2)
                halfwayKiB = ResidentKiB(widget.pid);
        }
        double widgetKiB = ResidentKiB(widget.pid);
        state.counters["bare_KiB"] = bareKiB;
        state.counters["widget_KiB"] = widgetKiB;
        state.counters["halfway_KiB"] = halfwayKiB;
        state.counters["ratio"] = widgetKiB / bareKiB;
        state.counters["flicks"] = flicks;
    }
}
BENCHMARK(BM_ResidentMemoryAfterFlicksAndUpdates)->Unit(benchmark::kSecond)->Iterations(1);
}  // namespace

int main(int argc, char** argv)
{
    MakeRoot();
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    std::error_code error;
    std::filesystem::remove_all(gRoot, error);
    return error ? 1 : 0;
}

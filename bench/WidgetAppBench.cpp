// The widget program as the host runs it, measured from outside: a port
// message until every instance has been updated, one flick until the slide
// has ended and the slots have turned, process start until the first
// instance has drawn its first frame beside a bare Elementary window's, and memory
// (RSS and PSS) with two instances, settled and after flicks and updates,
// beside that window's. WIDGET_BENCH_FLICKS sets the number of flicks of the
// last one (1000).
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
#include <iterator>
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

// The widget's log from now on, in whole lines, followed through its
// rotation to "dlog.log.1".
class LogTail
{
public:
    LogTail() : mOffset(Size(Path())) {}

    // The lines written since the last call.
    std::string Read()
    {
        if (Size(Path()) < mOffset)
        {
            mPending += ReadFrom(Path() + ".1", mOffset);
            mOffset = 0;
        }
        std::string text = ReadFrom(Path(), mOffset);
        mOffset += static_cast<std::streamoff>(text.size());
        mPending += text;
        size_t end = mPending.rfind('\n');
        if (end == std::string::npos)
            return std::string();
        std::string lines = mPending.substr(0, end + 1);
        mPending.erase(0, end + 1);
        return lines;
    }

private:
    static std::string Path() { return gRoot + "/log/dlog.log"; }
    static std::streamoff Size(const std::string& path)
    {
        std::ifstream file(path, std::ios::binary | std::ios::ate);
        return file ? static_cast<std::streamoff>(file.tellg()) : 0;
    }
    static std::string ReadFrom(const std::string& path, std::streamoff offset)
    {
        std::ifstream file(path, std::ios::binary);
        file.seekg(offset);
        return std::string(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
    }

    std::streamoff mOffset;
    std::string mPending;
};

int CountLines(const std::string& lines, const std::string& text)
{
    int count = 0;
    for (size_t at = lines.find(text); at != std::string::npos; at = lines.find(text, at + text.size()))
        ++count;
    return count;
}

// The "<key> <n> kB" line of a /proc file of `pid`, or -1.
double ProcKiB(pid_t pid, const char* file, const std::string& key)
{
    std::ifstream status("/proc/" + std::to_string(pid) + "/" + file);
    std::string line;
    while (std::getline(status, line))
        if (line.compare(0, key.size(), key) == 0)
            return std::stod(line.substr(key.size()));
    return -1;
}

// CPU time of every thread of `pid` so far: on a loaded machine the wall
// time of a start-up says less than this.
double CpuMs(pid_t pid)
{
    double ms = 0;
    std::error_code error;
    for (const auto& task :
         std::filesystem::directory_iterator("/proc/" + std::to_string(pid) + "/task", error))
    {
        std::ifstream schedstat(task.path() / "schedstat");
        double ns = 0;
        if (schedstat >> ns)
            ms += ns / 1e6;
    }
    return ms;
}

struct Memory
{
    double rssKiB;
    // Shared pages divided among the processes that map them.
    double pssKiB;
};

Memory ReadMemory(pid_t pid)
{
    return {ProcKiB(pid, "status", "VmRSS:"), ProcKiB(pid, "smaps_rollup", "Pss:")};
}

// The bare window's memory once it has drawn its first frame.
Memory BareWindowMemory()
{
    int in = -1;
    int out = -1;
    pid_t bare = Spawn({BARE_WINDOW_PROGRAM, "--stay"}, &in, &out);
    char buffer[16];
    Memory memory = {-1, -1};
    if (read(out, buffer, sizeof(buffer)) > 0)
        memory = ReadMemory(bare);
    close(in);
    close(out);
    waitpid(bare, nullptr, 0);
    return memory;
}

void SetMemoryCounters(benchmark::State& state, const Memory& bare, const Memory& widget)
{
    state.counters["bare_rss_KiB"] = bare.rssKiB;
    state.counters["bare_pss_KiB"] = bare.pssKiB;
    state.counters["widget_rss_KiB"] = widget.rssKiB;
    state.counters["widget_pss_KiB"] = widget.pssKiB;
    state.counters["rss_ratio"] = widget.rssKiB / bare.rssKiB;
    state.counters["pss_ratio"] = widget.pssKiB / bare.pssKiB;
}

void BM_PortMessageToEveryInstanceUpdated(benchmark::State& state)
{
    Widget widget({"4x2", "4x4"});
    widget.Send("idle 10");
    for (auto _ : state)
    {
        LogTail log;
        bundle* message = bundle_create();
        message_port_send_message(kWidgetId, kPort, message);
        bundle_free(message);
        // Each reply comes after the widget's loop has handled what was
        // queued before it, updates included. Two rounds for two instances.
        for (int updates = 0; updates < 4;)
        {
            updates += CountLines(log.Read(), "UpdateWidgetInstance");
            if (updates < 4)
                widget.Send("list");
        }
        widget.Send("list");
    }
}
BENCHMARK(BM_PortMessageToEveryInstanceUpdated)->Unit(benchmark::kMillisecond)->Iterations(20);

using Clock = std::chrono::steady_clock;

double Seconds(Clock::time_point since)
{
    return std::chrono::duration<double>(Clock::now() - since).count();
}

// The city name shown in `slot` of the view, as a dump gives it.
std::string SlotCityName(const std::string& dump, const std::string& slot)
{
    const std::string name = "\"group\":\"cityName\",\"texts\":{\"name\":\"";
    size_t at = dump.find("\"" + slot + "\":{");
    at = at == std::string::npos ? at : dump.find(name, at);
    if (at == std::string::npos)
        return std::string();
    at += name.size();
    return dump.substr(at, dump.find('"', at) - at);
}

// An upward flick on the 4x2 instance until the next city's page has moved
// into the centre slot. The slide itself lasts 1 s.
void BM_FlickToSlotsRotated(benchmark::State& state)
{
    Widget widget({"4x2", "4x4"});
    widget.Send("idle 10");
    const std::string dump = "dump " + std::string(kWidgetId) + ":1";
    const std::string swipe = "swipe " + std::string(kWidgetId) + ":1 300 300 300 50 120";
    for (auto _ : state)
    {
        std::string next = SlotCityName(widget.Send(dump), "nextLayout");
        if (next.empty())
            state.SkipWithError("no next city");
        Clock::time_point start = Clock::now();
        if (widget.Send(swipe).compare(0, 2, "OK") != 0)
            state.SkipWithError("swipe refused");
        while (SlotCityName(widget.Send(dump), "centerLayout") != next && Seconds(start) < 10.0)
            std::this_thread::sleep_for(std::chrono::milliseconds(2));
        state.SetIterationTime(Seconds(start));
        widget.Send("idle 10");
    }
}
BENCHMARK(BM_FlickToSlotsRotated)->Unit(benchmark::kMillisecond)->Iterations(3)->UseManualTime();

// Waits until the log gets a line with `text`; false after 30 s.
bool WaitForLogLine(LogTail& log, const std::string& text)
{
    for (int polls = 0; polls < 60000; ++polls)
    {
        if (log.Read().find(text) != std::string::npos)
            return true;
        std::this_thread::sleep_for(std::chrono::microseconds(500));
    }
    return false;
}

// To the host's line for the instance's first frame, as the floor is
// measured to its first drawn frame.
void BM_StartToFirstInstance(benchmark::State& state)
{
    for (auto _ : state)
    {
        LogTail log;
        Clock::time_point start = Clock::now();
        Widget widget({"4x4"});
        if (!WaitForLogLine(log, "drew its first frame"))
            state.SkipWithError("the instance did not draw");
        state.SetIterationTime(Seconds(start));
        state.counters["cpu_ms"] = CpuMs(widget.pid);
    }
}
BENCHMARK(BM_StartToFirstInstance)->Unit(benchmark::kMillisecond)->Iterations(1)->UseManualTime();

// /0: the bare window; /1: the same with one line of text.
void BM_StartToBareWindowDrawn(benchmark::State& state)
{
    std::vector<std::string> args = {BARE_WINDOW_PROGRAM, "--stay"};
    if (state.range(0) != 0)
        args.push_back("--text");
    for (auto _ : state)
    {
        Clock::time_point start = Clock::now();
        int in = -1;
        int out = -1;
        pid_t pid = Spawn(args, &in, &out);
        char buffer[16];
        if (read(out, buffer, sizeof(buffer)) <= 0)
            state.SkipWithError("bare window did not draw");
        state.SetIterationTime(Seconds(start));
        state.counters["cpu_ms"] = CpuMs(pid);
        close(in);
        close(out);
        waitpid(pid, nullptr, 0);
    }
}
BENCHMARK(BM_StartToBareWindowDrawn)
    ->Arg(0)
    ->Arg(1)
    ->Unit(benchmark::kMillisecond)
    ->Iterations(1)
    ->UseManualTime();

// Two instances (4x2 and 4x4) over ten cities once settled, beside the bare
// window.
void BM_MemoryTwoInstances(benchmark::State& state)
{
    for (auto _ : state)
    {
        Memory bare = BareWindowMemory();
        Widget widget({"4x2", "4x4"});
        widget.Send("idle 10");
        SetMemoryCounters(state, bare, ReadMemory(widget.pid));
    }
}
BENCHMARK(BM_MemoryTwoInstances)->Unit(benchmark::kSecond)->Iterations(1);

void BM_ResidentMemoryAfterFlicksAndUpdates(benchmark::State& state)
{
    const char* flicksText = getenv("WIDGET_BENCH_FLICKS");
    int flicks = flicksText ? atoi(flicksText) : 1000;
    for (auto _ : state)
    {
        Memory bare = BareWindowMemory();
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
                halfwayKiB = ReadMemory(widget.pid).rssKiB;
        }
        SetMemoryCounters(state, bare, ReadMemory(widget.pid));
        state.counters["halfway_rss_KiB"] = halfwayKiB;
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

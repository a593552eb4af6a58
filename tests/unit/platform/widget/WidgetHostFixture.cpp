#include "WidgetHostFixture.h"

#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <sstream>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

#include "TestFiles.h"

namespace WeatherTest
{

const char* const WidgetHostTest::kWidgetId = "com.quorvex.test-widget";

namespace
{
const double kStartSeconds = 20.0;

// Ecore blocks SIGTERM and others in this process; a child keeps that mask
// across exec, and an X server or window manager would never see the TERM.
// Ecore's handlers go first, so that nothing pending reaches its pipe.
void UnblockSignals()
{
    for (int signal = 1; signal < NSIG; ++signal) std::signal(signal, SIG_DFL);
    sigset_t none;
    sigemptyset(&none);
    sigprocmask(SIG_SETMASK, &none, nullptr);
}
}  // namespace

std::vector<std::string> Words(const std::string& line)
{
    std::vector<std::string> words;
    std::istringstream stream(line);
    std::string word;
    while (stream >> word) words.push_back(word);
    return words;
}

std::string WidgetHostTest::SocketPath() const
{
    return mRoot.Path(std::string("run/widget/") + kWidgetId + ".ctl");
}

pid_t WidgetHostTest::Spawn(const std::vector<std::string>& args, const std::string& outputName,
                            const std::string& display)
{
    std::vector<std::string> all = {TEST_WIDGET_APP, "--widget-id", kWidgetId};
    all.insert(all.end(), args.begin(), args.end());
    std::string output = mRoot.Path(outputName);
    std::string record = mRoot.Path("record.log");
    pid_t pid = fork();
    if (pid == 0)
    {
        UnblockSignals();
        // EFL helpers keep inherited pipes open after exit: write to a file.
        int fd = open(output.c_str(), O_WRONLY | O_CREAT | O_APPEND, 0600);
        dup2(fd, 1);
        dup2(fd, 2);
        unsetenv("WAYLAND_DISPLAY");
        if (display.empty())
            unsetenv("DISPLAY");
        else
            setenv("DISPLAY", display.c_str(), 1);
        setenv("TEST_WIDGET_RECORD", record.c_str(), 1);
        std::vector<char*> argv;
        for (auto& arg : all) argv.push_back(const_cast<char*>(arg.c_str()));
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        _exit(127);
    }
    return pid;
}

std::string WidgetHostTest::StartXServer()
{
    const char* const server = "/usr/bin/Xvfb";
    const char* const manager = "/usr/bin/openbox";
    int fds[2];
    if (access(server, X_OK) != 0 || access(manager, X_OK) != 0 || pipe(fds) != 0)
        return std::string();
    mXServerPid = fork();
    if (mXServerPid == 0)
    {
        UnblockSignals();
        close(fds[0]);
        int out = open("/dev/null", O_WRONLY);
        dup2(out, 1);
        dup2(out, 2);
        std::string fd = std::to_string(fds[1]);
        execl(server, server, "-displayfd", fd.c_str(), "-screen", "0", "1280x1024x24", "-nolisten", "tcp",
              static_cast<char*>(nullptr));
        _exit(127);
    }
    close(fds[1]);
    // The server writes its display number once it accepts clients.
    std::string number;
    char c = 0;
    while (read(fds[0], &c, 1) == 1 && c != '\n') number += c;
    close(fds[0]);
    if (number.empty())
        return std::string();
    std::string display = ":" + number;
    std::string started = mRoot.Path("wm-started");
    mWindowManagerPid = fork();
    if (mWindowManagerPid == 0)
    {
        UnblockSignals();
        int out = open("/dev/null", O_WRONLY);
        dup2(out, 1);
        dup2(out, 2);
        setenv("DISPLAY", display.c_str(), 1);
        std::string startup = "touch " + started;
        execl(manager, manager, "--startup", startup.c_str(), static_cast<char*>(nullptr));
        _exit(127);
    }
    auto deadline = std::chrono::steady_clock::now() + std::chrono::duration<double>(kStartSeconds);
    while (access(started.c_str(), F_OK) != 0 && std::chrono::steady_clock::now() < deadline)
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    return access(started.c_str(), F_OK) == 0 ? display : std::string();
}

void WidgetHostTest::StartHost(const std::vector<std::string>& args, const std::string& display)
{
    mHostPid = Spawn(args, "host.out", display);
    ASSERT_GT(mHostPid, 0);
    auto deadline = std::chrono::steady_clock::now() + std::chrono::duration<double>(kStartSeconds);
    while (!mClient.Connect(SocketPath()))
    {
        int status = 0;
        ASSERT_EQ(waitpid(mHostPid, &status, WNOHANG), 0) << "the host ended before it listened";
        ASSERT_LT(std::chrono::steady_clock::now(), deadline) << "no control socket";
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    }
}

std::string WidgetHostTest::Send(const std::string& command)
{
    std::string reply;
    if (!mClient.Request(command, reply, 30.0))
        return std::string();
    return reply;
}

std::string WidgetHostTest::CreateInstance(const std::string& size)
{
    std::string reply = Send("create " + size);
    EXPECT_EQ(reply.compare(0, 3, "OK "), 0) << reply;
    return reply.size() > 3 ? reply.substr(3) : std::string();
}

void WidgetHostTest::WaitIdle()
{
    EXPECT_EQ(Send("idle 10"), "OK");
}

int WidgetHostTest::WaitForExit(double seconds)
{
    auto deadline = std::chrono::steady_clock::now() + std::chrono::duration<double>(seconds);
    while (std::chrono::steady_clock::now() < deadline)
    {
        int status = 0;
        if (waitpid(mHostPid, &status, WNOHANG) == mHostPid)
        {
            mHostPid = -1;
            int code = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
            // A sanitizer report ends the host with an exit code, not a signal.
            if (WIFSIGNALED(status) || code != 0)
            {
                std::string output = ReadText(mRoot.Path("host.out"));
                ADD_FAILURE() << "the host ended with " << (WIFSIGNALED(status) ? "signal " : "code ")
                              << (WIFSIGNALED(status) ? WTERMSIG(status) : code) << "; its output ends:\n"
                              << output.substr(output.size() > 4000 ? output.size() - 4000 : 0);
            }
            return code;
        }
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    }
    return -1;
}

void WidgetHostTest::TearDown()
{
    StopHost();
    for (pid_t pid : {mWindowManagerPid, mXServerPid})
    {
        if (pid > 0)
        {
            kill(pid, SIGTERM);
            waitpid(pid, nullptr, 0);
        }
    }
}

void WidgetHostTest::StopHost()
{
    if (mHostPid <= 0)
        return;
    if (mClient.GetIsConnected())
        Send("exit");
    if (WaitForExit(10.0) < 0 && mHostPid > 0)
    {
        kill(mHostPid, SIGKILL);
        waitpid(mHostPid, nullptr, 0);
        ADD_FAILURE() << "the host did not end on exit";
    }
}

std::vector<std::string> WidgetHostTest::Records() const
{
    return ReadLines(mRoot.Path("record.log"));
}

std::vector<std::string> WidgetHostTest::Records(const std::string& prefix) const
{
    std::vector<std::string> matching;
    for (auto& line : Records())
        if (line.compare(0, prefix.size(), prefix) == 0)
            matching.push_back(line);
    return matching;
}

}  // namespace WeatherTest

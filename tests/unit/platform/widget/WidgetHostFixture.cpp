#include "WidgetHostFixture.h"

#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <fstream>
#include <sstream>
#include <sys/wait.h>
#include <thread>
#include <unistd.h>

namespace WeatherTest
{

const char* const WidgetHostTest::kWidgetId = "com.quorvex.test-widget";

namespace
{
const double kStartSeconds = 20.0;
}

std::vector<std::string> Words(const std::string& line)
{
    std::vector<std::string> words;
    std::istringstream stream(line);
    std::string word;
    while (stream >> word)
        words.push_back(word);
    return words;
}

std::string WidgetHostTest::SocketPath() const
{
    return mRoot.Path(std::string("run/widget/") + kWidgetId + ".ctl");
}

pid_t WidgetHostTest::Spawn(const std::vector<std::string>& args, const std::string& outputName)
{
    std::vector<std::string> all = {TEST_WIDGET_APP, "--widget-id", kWidgetId};
    all.insert(all.end(), args.begin(), args.end());
    std::string output = mRoot.Path(outputName);
    std::string record = mRoot.Path("record.log");
    pid_t pid = fork();
    if (pid == 0)
    {
        // EFL helpers keep inherited pipes open after exit: write to a file.
        int fd = open(output.c_str(), O_WRONLY | O_CREAT | O_APPEND, 0600);
        dup2(fd, 1);
        dup2(fd, 2);
        unsetenv("DISPLAY");
        unsetenv("WAYLAND_DISPLAY");
        setenv("TEST_WIDGET_RECORD", record.c_str(), 1);
        std::vector<char*> argv;
        for (auto& arg : all)
            argv.push_back(const_cast<char*>(arg.c_str()));
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        _exit(127);
    }
    return pid;
}

void WidgetHostTest::StartHost(const std::vector<std::string>& args)
{
    mHostPid = Spawn(args, "host.out");
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
            return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
        }
        std::this_thread::sleep_for(std::chrono::milliseconds(20));
    }
    return -1;
}

void WidgetHostTest::TearDown()
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
    std::vector<std::string> lines;
    std::ifstream file(mRoot.Path("record.log"));
    std::string line;
    while (std::getline(file, line))
        lines.push_back(line);
    return lines;
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

#include <gtest/gtest.h>

#include <poll.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <unistd.h>

#include <chrono>
#include <dirent.h>
#include <fstream>
#include <sstream>
#include <thread>

#include "TestFiles.h"
#include "WidgetHostFixture.h"
#include "core/UnixSocket.h"

namespace WeatherTest
{

namespace
{
// A field of /proc/<pid>/status in KiB, or -1.
long StatusKiB(pid_t pid, const std::string& field)
{
    std::ifstream status("/proc/" + std::to_string(pid) + "/status");
    std::string line;
    while (std::getline(status, line))
        if (line.compare(0, field.size() + 1, field + ":") == 0)
            return std::stol(line.substr(field.size() + 1));
    return -1;
}

long OpenDescriptors(pid_t pid)
{
    DIR* dir = opendir(("/proc/" + std::to_string(pid) + "/fd").c_str());
    long count = 0;
    while (dir && readdir(dir)) ++count;
    if (dir)
        closedir(dir);
    return count - 2;  // "." and ".."
}

// User and system time of a process in clock ticks.
long CpuTicks(pid_t pid)
{
    std::ifstream stat("/proc/" + std::to_string(pid) + "/stat");
    std::string text((std::istreambuf_iterator<char>(stat)), std::istreambuf_iterator<char>());
    std::istringstream fields(text.substr(text.rfind(')') + 2));
    std::string field;
    long ticks = 0;
    for (int i = 3; i <= 15 && fields >> field; ++i)
        if (i >= 14)
            ticks += std::stol(field);
    return ticks;
}

// What the socket says within `seconds` (up to its end or the timeout).
std::string ReadSome(int fd, double seconds)
{
    std::string text;
    pollfd wanted = {fd, POLLIN, 0};
    char chunk[4096];
    while (poll(&wanted, 1, static_cast<int>(seconds * 1000)) > 0)
    {
        ssize_t got = recv(fd, chunk, sizeof(chunk), MSG_DONTWAIT);
        if (got <= 0)
            break;
        text.append(chunk, static_cast<size_t>(got));
    }
    return text;
}

class Sockets
{
public:
    ~Sockets()
    {
        for (int fd : mFds) close(fd);
    }
    int Add(int fd)
    {
        mFds.push_back(fd);
        return fd;
    }
    std::vector<int> mFds;
};
}  // namespace

TEST_F(WidgetHostTest, AClientThatNeverReadsStopsOnlyItself)
{
    StartHost();
    std::string id = CreateInstance("4x4");
    Sockets sockets;
    int greedy = sockets.Add(platform::ConnectUnixSocket(SocketPath(), SOCK_STREAM));
    ASSERT_GE(greedy, 0);
    // Far more dump replies than both socket buffers hold.
    std::string commands;
    for (int i = 0; i < 2000; ++i) commands += "dump " + id + "\n";
    ASSERT_GT(send(greedy, commands.data(), commands.size(), MSG_DONTWAIT | MSG_NOSIGNAL), 0);
    // Its first reply shows that the host is at its commands.
    pollfd replied = {greedy, POLLIN, 0};
    ASSERT_EQ(poll(&replied, 1, 10000), 1);
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x4\tTest 1\trunning");
    EXPECT_EQ(ReadSome(greedy, 1.0).compare(0, 3, "OK "), 0) << "the greedy client is served in turn";
}

TEST_F(WidgetHostTest, AHugeLineIsRefusedWithoutBeingHeldInMemory)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    // The tap's animation keeps the huge client's idle pending while its line arrives.
    ASSERT_EQ(Send("tap " + id + " 300 300").compare(0, 3, "OK "), 0);
    long peakBefore = StatusKiB(mHostPid, "VmHWM");
    Sockets sockets;
    int huge = sockets.Add(platform::ConnectUnixSocket(SocketPath(), SOCK_STREAM));
    ASSERT_GE(huge, 0);
    timeval timeout = {20, 0};
    setsockopt(huge, SOL_SOCKET, SO_SNDTIMEO, &timeout, sizeof(timeout));
    std::thread writer(
        [huge]
        {
            std::string line = "idle 5\n" + std::string(16 << 20, 'x');
            size_t done = 0;
            ssize_t sent = 0;
            while (done < line.size() &&
                   (sent = send(huge, line.data() + done, line.size() - done, MSG_NOSIGNAL)) > 0)
                done += static_cast<size_t>(sent);
        });
    writer.join();
    EXPECT_EQ(ReadSome(huge, 5.0), "OK\nERR line too long\n");
    EXPECT_LT(StatusKiB(mHostPid, "VmHWM") - peakBefore, 8 * 1024) << "KiB more at the peak";
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x2\tTest 1\trunning");
}

TEST_F(WidgetHostTest, ClientsBeyondTheCapAreToldSoAndTheOthersStillServed)
{
    StartHost();
    Sockets sockets;
    for (int i = 0; i < 200; ++i)
        ASSERT_GE(sockets.Add(platform::ConnectUnixSocket(SocketPath(), SOCK_STREAM)), 0) << i;
    EXPECT_EQ(Send("list"), "OK 0");
    EXPECT_EQ(ReadSome(sockets.mFds.back(), 5.0), "ERR too many clients\n");
    for (int fd : sockets.mFds) close(fd);
    sockets.mFds.clear();
    platform::ControlClient late;
    std::string reply;
    ASSERT_TRUE(late.Connect(SocketPath()));
    EXPECT_TRUE(late.Request("list", reply, 10.0));
    EXPECT_EQ(reply, "OK 0");
}

// Out of descriptors, the host waits for one instead of retrying at once.
TEST_F(WidgetHostTest, RunningOutOfDescriptorsDoesNotSpinTheHost)
{
    StartHost();
    long open = OpenDescriptors(mHostPid);
    rlimit saved = {};
    ASSERT_EQ(prlimit(mHostPid, RLIMIT_NOFILE, nullptr, &saved), 0);
    rlimit tight = {static_cast<rlim_t>(open + 1), saved.rlim_max};
    ASSERT_EQ(prlimit(mHostPid, RLIMIT_NOFILE, &tight, nullptr), 0);
    Sockets sockets;
    for (int i = 0; i < 4; ++i) sockets.Add(platform::ConnectUnixSocket(SocketPath(), SOCK_STREAM));
    long before = CpuTicks(mHostPid);
    std::this_thread::sleep_for(std::chrono::seconds(2));
    EXPECT_LT(CpuTicks(mHostPid) - before, sysconf(_SC_CLK_TCK) / 5) << "ticks in 2 s";
    ASSERT_EQ(prlimit(mHostPid, RLIMIT_NOFILE, &saved, nullptr), 0);
    EXPECT_EQ(Send("list"), "OK 0");
    EXPECT_NE(ReadText(mRoot.Path("log/dlog.log")).find("cannot accept a control client"), std::string::npos);
}

TEST_F(WidgetHostTest, ExitAndListTakeNoWords)
{
    StartHost();
    EXPECT_EQ(Send("exit now"), "ERR usage: exit");
    EXPECT_EQ(Send("list all"), "ERR usage: list");
    EXPECT_EQ(Send("list"), "OK 0");
}

}  // namespace WeatherTest

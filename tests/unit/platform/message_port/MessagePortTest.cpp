#include <message_port.h>

#include <Ecore.h>
#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <cstring>
#include <string>
#include <utility>
#include <vector>

#include "MainLoop.h"
#include "TestPlatform.h"
#include "message_port/MessageEnvelope.h"

extern char** environ;

namespace
{

const char* const kPort = "com.quorvex.weather-m-widget.message.port.local";
using Pairs = std::vector<std::pair<std::string, std::string>>;

struct Received
{
    int portId;
    std::string remoteAppId;
    bool hasRemotePort;
    std::string remotePort;
    Pairs message;
};

void CollectCb(const char* key, const char* value, void* data)
{
    static_cast<Pairs*>(data)->emplace_back(key, value);
}

void MessageCb(int portId, const char* remoteAppId, const char* remotePort, bool, bundle* message, void* data)
{
    Received received{portId,
                      remoteAppId ? remoteAppId : "(null)",
                      remotePort != nullptr,
                      remotePort ? remotePort : "",
                      {}};
    bundle_iterate(message, CollectCb, &received.message);
    static_cast<std::vector<Received>*>(data)->push_back(received);
}

// Runs the loop until `count` messages are in, or `seconds` pass.
void RunLoop(const std::vector<Received>& received, size_t count, double seconds)
{
    WeatherTest::RunLoopUntil([&received, count] { return received.size() >= count; }, seconds);
}

class MessagePortTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        ecore_init();
        setenv("PLATFORM_APP_ID", "test.sender", 1);
    }

    void TearDown() override
    {
        for (int id : mPortIds) message_port_unregister_local_port(id);
        unsetenv("PLATFORM_APP_ID");
        ecore_shutdown();
    }

    int Register(const char* name)
    {
        int id = message_port_register_local_port(name, MessageCb, &mReceived);
        if (id > 0)
            mPortIds.push_back(id);
        return id;
    }

    std::string SocketPath(const char* name) const
    {
        return mRoot.Path(std::string("run/msgport/") + name + ".sock");
    }

    // Writes raw bytes to the port's socket, as a broken sender would.
    void SendRaw(const char* name, const std::string& bytes) const
    {
        sockaddr_un address{};
        address.sun_family = AF_UNIX;
        strncpy(address.sun_path, SocketPath(name).c_str(), sizeof(address.sun_path) - 1);
        int fd = socket(AF_UNIX, SOCK_DGRAM, 0);
        ASSERT_EQ(static_cast<ssize_t>(bytes.size()),
                  sendto(fd, bytes.data(), bytes.size(), 0, reinterpret_cast<sockaddr*>(&address),
                         sizeof(address)));
        close(fd);
    }

    std::vector<Received> mReceived;
    std::vector<int> mPortIds;
};

TEST_F(MessagePortTest, MessageFromAnotherProcessReachesTheCallback)
{
    int id = Register(kPort);
    ASSERT_GT(id, 0);
    struct stat st;
    ASSERT_EQ(0, stat(SocketPath(kPort).c_str(), &st));
    EXPECT_TRUE(S_ISSOCK(st.st_mode));
    EXPECT_EQ(0600u, st.st_mode & 0777);

    std::vector<std::string> args = {
        MSGPORT_SEND_PATH, "com.quorvex.weather-m-widget", kPort, "RESULT=done", "empty=", "text=a=b c"};
    std::vector<char*> argv;
    for (std::string& arg : args) argv.push_back(&arg[0]);
    argv.push_back(nullptr);
    setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-agent", 1);
    pid_t child = 0;
    ASSERT_EQ(0, posix_spawn(&child, argv[0], nullptr, nullptr, argv.data(), environ));
    int status = 0;
    waitpid(child, &status, 0);
    ASSERT_TRUE(WIFEXITED(status));
    ASSERT_EQ(0, WEXITSTATUS(status));

    RunLoop(mReceived, 1, 5.0);
    ASSERT_EQ(1u, mReceived.size());
    EXPECT_EQ(id, mReceived[0].portId);
    EXPECT_EQ("com.quorvex.weather-m-agent", mReceived[0].remoteAppId);
    EXPECT_FALSE(mReceived[0].hasRemotePort);
    EXPECT_EQ((Pairs{{"RESULT", "done"}, {"empty", ""}, {"text", "a=b c"}}), mReceived[0].message);
}

TEST_F(MessagePortTest, ToolReportsMissingPortAndBadArguments)
{
    auto run = [](const std::vector<std::string>& args)
    {
        std::string command = MSGPORT_SEND_PATH;
        for (const std::string& arg : args) command += " '" + arg + "'";
        command += " 2>/dev/null";
        int status = system(command.c_str());
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    };
    EXPECT_EQ(1, run({"some.app", "nobody.listens"}));
    EXPECT_EQ(2, run({"some.app"}));
    EXPECT_EQ(2, run({"some.app", "port", "novalue"}));
    EXPECT_EQ(2, run({"some.app", "port", "=value"}));
}

TEST_F(MessagePortTest, SendWithLocalPortNamesTheSender)
{
    int receiver = Register(kPort);
    int local = Register("test.reply.port");
    ASSERT_GT(receiver, 0);
    ASSERT_GT(local, 0);
    EXPECT_NE(receiver, local);
    bundle* message = bundle_create();
    EXPECT_EQ(MESSAGE_PORT_ERROR_NONE,
              message_port_send_message_with_local_port("app", kPort, message, local));
    EXPECT_EQ(MESSAGE_PORT_ERROR_NONE, message_port_send_message("app", kPort, message));
    EXPECT_EQ(MESSAGE_PORT_ERROR_INVALID_PARAMETER,
              message_port_send_message_with_local_port("app", kPort, message, 9999));
    bundle_free(message);

    RunLoop(mReceived, 2, 5.0);
    ASSERT_EQ(2u, mReceived.size());
    EXPECT_EQ("test.sender", mReceived[0].remoteAppId);
    EXPECT_TRUE(mReceived[0].hasRemotePort);
    EXPECT_EQ("test.reply.port", mReceived[0].remotePort);
    EXPECT_TRUE(mReceived[0].message.empty());
    EXPECT_FALSE(mReceived[1].hasRemotePort);
}

TEST_F(MessagePortTest, MalformedDatagramsAreDroppedAndLaterMessagesStillArrive)
{
    ASSERT_GT(Register(kPort), 0);
    bundle* message = bundle_create();
    bundle_add_str(message, "k", "v");
    std::string valid = platform::EncodeEnvelope("test.agent", nullptr, message);
    bundle_free(message);

    SendRaw(kPort, "garbage that is no envelope");
    SendRaw(kPort, std::string());
    for (size_t length : {size_t(4), valid.size() / 2, valid.size() - 1})
        SendRaw(kPort, valid.substr(0, length));
    SendRaw(kPort, valid + "x");
    SendRaw(kPort, valid);

    RunLoop(mReceived, 1, 5.0);
    // Let any wrongly accepted datagram show up too.
    RunLoop(mReceived, 99, 0.2);
    ASSERT_EQ(1u, mReceived.size());
    EXPECT_EQ("test.agent", mReceived[0].remoteAppId);
    EXPECT_EQ((Pairs{{"k", "v"}}), mReceived[0].message);
    // One line at once; the other five are counted when the second is over.
    EXPECT_EQ(1, mLog.Count("dropped a malformed message", "MESSAGE_PORT")) << mLog.Dump();
    WeatherTest::RunLoopUntil([this] { return mLog.Contains("more like this"); }, 5.0);
    EXPECT_EQ(1, mLog.Count("5 more like this within 1 s: dropped a malformed message", "MESSAGE_PORT"))
        << mLog.Dump();
}

// Large bad datagrams are read a bounded amount of bytes per wake-up; the
// valid message behind them waits one more wake-up, not for the whole flood.
TEST_F(MessagePortTest, WorkPerWakeUpIsBoundedByBytes)
{
    ASSERT_GT(Register(kPort), 0);
    for (int i = 0; i < 8; ++i) SendRaw(kPort, std::string(60 * 1024, 'x'));
    bundle* message = bundle_create();
    EXPECT_EQ(MESSAGE_PORT_ERROR_NONE, message_port_send_message("app", kPort, message));
    bundle_free(message);
    int wakeUps = 0;
    while (mReceived.empty() && wakeUps < 10)
    {
        ecore_main_loop_iterate();
        ++wakeUps;
    }
    EXPECT_GE(wakeUps, 2);
    EXPECT_LE(wakeUps, 3);
    EXPECT_EQ(1u, mReceived.size());
}

TEST_F(MessagePortTest, SocketFolderIsPrivateAndNeverAPlantedLink)
{
    ASSERT_GT(Register(kPort), 0);
    struct stat st;
    ASSERT_EQ(0, stat(mRoot.Path("run/msgport").c_str(), &st));
    EXPECT_EQ(0700u, st.st_mode & 0777);
    message_port_unregister_local_port(mPortIds.back());
    mPortIds.pop_back();
    std::string elsewhere = mRoot.Path("elsewhere");
    ASSERT_EQ(0, mkdir(elsewhere.c_str(), 0755));
    ASSERT_EQ(0, rmdir(mRoot.Path("run/msgport").c_str()));
    ASSERT_EQ(0, symlink(elsewhere.c_str(), mRoot.Path("run/msgport").c_str()));
    EXPECT_EQ(MESSAGE_PORT_ERROR_IO_ERROR, Register(kPort));
    EXPECT_NE(0, lstat((elsewhere + "/" + kPort + ".sock").c_str(), &st));
    EXPECT_EQ(0, stat(elsewhere.c_str(), &st));
    EXPECT_EQ(0755u, st.st_mode & 0777);
}

TEST_F(MessagePortTest, SendErrors)
{
    bundle* message = bundle_create();
    EXPECT_EQ(MESSAGE_PORT_ERROR_PORT_NOT_FOUND, message_port_send_message("app", "nobody.listens", message));
    EXPECT_TRUE(mLog.Contains("sending to port nobody.listens failed", "MESSAGE_PORT"));
    EXPECT_EQ(MESSAGE_PORT_ERROR_INVALID_PARAMETER, message_port_send_message("app", "../escape", message));

    ASSERT_GT(Register(kPort), 0);
    bundle_add_str(message, "big", std::string(20000, 'x').c_str());
    EXPECT_EQ(MESSAGE_PORT_ERROR_MAX_EXCEEDED, message_port_send_message("app", kPort, message));
    bundle_free(message);
}

TEST_F(MessagePortTest, RegistrationRules)
{
    int id = Register(kPort);
    ASSERT_GT(id, 0);
    std::vector<Received> other;
    EXPECT_EQ(id, message_port_register_local_port(kPort, MessageCb, &other));

    bundle* message = bundle_create();
    EXPECT_EQ(MESSAGE_PORT_ERROR_NONE, message_port_send_message("app", kPort, message));
    RunLoop(other, 1, 5.0);
    EXPECT_EQ(1u, other.size());
    EXPECT_TRUE(mReceived.empty());

    EXPECT_EQ(MESSAGE_PORT_ERROR_INVALID_PARAMETER,
              message_port_register_local_port("a/b", MessageCb, nullptr));

    EXPECT_EQ(MESSAGE_PORT_ERROR_NONE, message_port_unregister_local_port(id));
    mPortIds.clear();
    EXPECT_EQ(MESSAGE_PORT_ERROR_PORT_NOT_FOUND, message_port_unregister_local_port(id));
    EXPECT_EQ(MESSAGE_PORT_ERROR_PORT_NOT_FOUND, message_port_send_message("app", kPort, message));
    bundle_free(message);
}

// Stale sockets are replaced (UnixSocketTest); a name someone still reads
// on is not taken over.
TEST_F(MessagePortTest, PortSomeoneStillReadsIsNotTakenOver)
{
    ASSERT_GT(Register("other.port"), 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    strncpy(address.sun_path, SocketPath("held.port").c_str(), sizeof(address.sun_path) - 1);
    int holder = socket(AF_UNIX, SOCK_DGRAM, 0);
    ASSERT_EQ(0, bind(holder, reinterpret_cast<sockaddr*>(&address), sizeof(address)));
    EXPECT_EQ(MESSAGE_PORT_ERROR_RESOURCE_UNAVAILABLE, Register("held.port"));
    close(holder);
}

TEST_F(MessagePortTest, CallbackMayUnregisterItsPort)
{
    struct Context
    {
        int id = 0;
        int calls = 0;
    } context;
    context.id = message_port_register_local_port(
        kPort,
        [](int, const char*, const char*, bool, bundle*, void* data)
        {
            auto* ctx = static_cast<Context*>(data);
            ++ctx->calls;
            message_port_unregister_local_port(ctx->id);
        },
        &context);
    ASSERT_GT(context.id, 0);
    bundle* message = bundle_create();
    message_port_send_message("app", kPort, message);
    message_port_send_message("app", kPort, message);
    bundle_free(message);
    RunLoop(mReceived, 1, 0.3);
    EXPECT_EQ(1, context.calls);
}

}  // namespace

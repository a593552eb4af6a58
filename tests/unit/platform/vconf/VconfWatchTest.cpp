#include <vconf.h>

#include <Ecore.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <string>
#include <sys/select.h>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

#include "MainLoop.h"
#include "TestPlatform.h"
#include "core/PlatformRoot.h"

namespace
{
using WeatherTest::RunLoopFor;
using WeatherTest::RunLoopUntil;

using Seen = std::vector<std::string>;

// Records "name=value" of int and string keys.
void Record(keynode_t* node, void* data)
{
    std::string value = vconf_keynode_get_type(node) == VCONF_TYPE_STRING
                            ? vconf_keynode_get_str(node)
                            : std::to_string(vconf_keynode_get_int(node));
    static_cast<Seen*>(data)->push_back(std::string(vconf_keynode_get_name(node)) + "=" + value);
}

void FirstCb(keynode_t* node, void* data)
{
    Record(node, data);
}

void SecondCb(keynode_t* node, void* data)
{
    Record(node, data);
}

void SelfRemovingCb(keynode_t* node, void* data)
{
    Record(node, data);
    vconf_ignore_key_changed(vconf_keynode_get_name(node), SelfRemovingCb);
}

std::string ToolPath()
{
    std::string path = WeatherTest::BuildDir() + "/platform/tools/vconftool/vconftool";
    return access(path.c_str(), X_OK) == 0 ? path : std::string(VCONFTOOL_BUILT_PATH);
}

int RunTool(std::vector<std::string> args)
{
    std::string tool = ToolPath();
    std::vector<char*> argv{&tool[0]};
    for (std::string& arg : args) argv.push_back(&arg[0]);
    argv.push_back(nullptr);
    pid_t pid = fork();
    if (pid == 0)
    {
        execv(argv[0], argv.data());
        _exit(127);
    }
    int status = 0;
    waitpid(pid, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

class VconfWatchTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override { ecore_init(); }
    void TearDown() override
    {
        vconf_ignore_key_changed("memory/dnet/status", FirstCb);
        vconf_ignore_key_changed("memory/dnet/status", SecondCb);
        vconf_ignore_key_changed("memory/dnet/other", SecondCb);
        ecore_shutdown();
    }
    Seen mSeen;
};

TEST_F(VconfWatchTest, EachWriteReachesTheCallbackOnTheMainLoop)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(vconf_set_int("memory/dnet/status", 2), VCONF_OK);
    EXPECT_TRUE(mSeen.empty());
    ASSERT_TRUE(RunLoopUntil([&] { return mSeen.size() == 1; }, 5.0));
    vconf_set_int("memory/dnet/status", 3);
    ASSERT_TRUE(RunLoopUntil([&] { return mSeen.size() == 2; }, 5.0));
    RunLoopFor(0.1);
    EXPECT_EQ(mSeen, (Seen{"memory/dnet/status=2", "memory/dnet/status=3"}));
}

TEST_F(VconfWatchTest, OnlyTheWatchedKeyOfAFolderIsReported)
{
    Seen other;
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/other", SecondCb, &other), VCONF_OK);
    vconf_set_str("memory/dnet/other", "x");
    vconf_set_int("memory/dnet/unwatched", 4);
    ASSERT_TRUE(RunLoopUntil([&] { return !other.empty(); }, 5.0));
    RunLoopFor(0.1);
    EXPECT_TRUE(mSeen.empty());
    EXPECT_EQ(other, Seen{"memory/dnet/other=x"});
}

TEST_F(VconfWatchTest, OneRegistrationPerKeyAndCallback)
{
    Seen second;
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    EXPECT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &second), VCONF_ERROR);
    EXPECT_EQ(errno, EALREADY);
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", SecondCb, &second), VCONF_OK);
    EXPECT_EQ(vconf_ignore_key_changed("memory/dnet/status", FirstCb), VCONF_OK);
    EXPECT_EQ(vconf_ignore_key_changed("memory/dnet/status", FirstCb), VCONF_ERROR);
    vconf_set_int("memory/dnet/status", 2);
    ASSERT_TRUE(RunLoopUntil([&] { return !second.empty(); }, 5.0));
    RunLoopFor(0.1);
    EXPECT_TRUE(mSeen.empty());
    EXPECT_EQ(second.size(), 1u);

    EXPECT_EQ(vconf_notify_key_changed("../outside", FirstCb, &mSeen), VCONF_ERROR);
    EXPECT_EQ(vconf_notify_key_changed("memory/dnet/status", nullptr, &mSeen), VCONF_ERROR);
    EXPECT_EQ(vconf_notify_key_changed(nullptr, FirstCb, &mSeen), VCONF_ERROR);
    EXPECT_TRUE(mLog.Contains("../outside", "VCONF"));
}

TEST_F(VconfWatchTest, CallbackMayRemoveItselfWhileChangesArePending)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", SelfRemovingCb, &mSeen), VCONF_OK);
    vconf_set_int("memory/dnet/status", 1);
    vconf_set_int("memory/dnet/status", 2);
    RunLoopFor(0.3);
    EXPECT_EQ(mSeen.size(), 1u);
}

TEST_F(VconfWatchTest, GarbageWriteIsLoggedAndNotDelivered)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_TRUE(platform::WriteFileAtomic(mRoot.Path("vconf/memory/dnet/status"), "int\nbroken\n"));
    ASSERT_TRUE(RunLoopUntil([&] { return mLog.Contains("memory/dnet/status", "VCONF"); }, 5.0));
    vconf_set_int("memory/dnet/status", 3);
    ASSERT_TRUE(RunLoopUntil([&] { return !mSeen.empty(); }, 5.0));
    EXPECT_EQ(mSeen, Seen{"memory/dnet/status=3"});
}

TEST_F(VconfWatchTest, WatchOutlivesItsFolderBeingRemoved)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    for (const char* removed : {"vconf/memory/dnet", "vconf/memory", "vconf"})
    {
        SCOPED_TRACE(removed);
        std::filesystem::remove_all(mRoot.Path(removed));
        // Seen removed or not yet: the next write is reported either way.
        RunLoopFor(0.05);
        mSeen.clear();
        ASSERT_EQ(vconf_set_int("memory/dnet/status", 3), VCONF_OK);
        ASSERT_TRUE(RunLoopUntil([&] { return !mSeen.empty(); }, 5.0));
        EXPECT_EQ(mSeen.back(), "memory/dnet/status=3");
    }
    // Without its root the watch says it stopped.
    {
        WeatherTest::TestPlatformRoot inner;
        ASSERT_EQ(vconf_notify_key_changed("memory/dnet/other", SecondCb, &mSeen), VCONF_OK);
    }
    EXPECT_TRUE(RunLoopUntil([&] { return mLog.Contains("memory/dnet/other is no longer watched"); }, 5.0));
}

TEST_F(VconfWatchTest, KeySetByToolInAnotherProcessReachesWatcher)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(RunTool({"set", "-t", "int", "memory/dnet/status", "3"}), 0);
    ASSERT_TRUE(RunLoopUntil([&] { return !mSeen.empty(); }, 5.0));
    EXPECT_EQ(mSeen.at(0), "memory/dnet/status=3");

    EXPECT_EQ(RunTool({"set", "-t", "bool", "db/test/b", "yes"}), 1);
    EXPECT_EQ(RunTool({"set", "-t", "int", "../escape", "1"}), 1);
    EXPECT_EQ(RunTool({"get", "db/test/none"}), 1);
}

TEST_F(VconfWatchTest, ToolWatchPrintsTheNewValueAndStopsAfterCount)
{
    FILE* out = popen((ToolPath() + " watch db/test/watched 1").c_str(), "r");
    ASSERT_NE(out, nullptr);
    // The watcher may not be listening yet: keep writing until it prints.
    int fd = fileno(out);
    bool printed = false;
    for (int attempt = 0; attempt < 100 && !printed; ++attempt)
    {
        vconf_set_str("db/test/watched", "new value");
        fd_set set;
        FD_ZERO(&set);
        FD_SET(fd, &set);
        struct timeval wait = {0, 50000};
        printed = select(fd + 1, &set, nullptr, nullptr, &wait) > 0;
    }
    ASSERT_TRUE(printed);
    std::string all;
    char line[64];
    while (fgets(line, sizeof(line), out)) all += line;
    EXPECT_EQ(pclose(out), 0);
    EXPECT_EQ(all, "new value\n");
}

}  // namespace

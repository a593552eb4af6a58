#include <vconf.h>

#include <Ecore.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <cstdio>
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
using WeatherTest::PlatformTest;
using WeatherTest::RunLoopFor;
using WeatherTest::RunLoopUntil;

struct Seen
{
    std::vector<std::string> names;
    std::vector<int> types;
    std::vector<std::string> values;
    vconf_callback_fn removeSelf = nullptr;
};

void RecordNode(keynode_t* node, Seen* seen)
{
    seen->names.push_back(vconf_keynode_get_name(node));
    int type = vconf_keynode_get_type(node);
    seen->types.push_back(type);
    if (type == VCONF_TYPE_STRING)
        seen->values.push_back(vconf_keynode_get_str(node));
    else if (type == VCONF_TYPE_INT)
        seen->values.push_back(std::to_string(vconf_keynode_get_int(node)));
    else if (type == VCONF_TYPE_BOOL)
        seen->values.push_back(std::to_string(vconf_keynode_get_bool(node)));
    else
        seen->values.push_back(std::to_string(vconf_keynode_get_dbl(node)));
}

void FirstCb(keynode_t* node, void* data)
{
    RecordNode(node, static_cast<Seen*>(data));
}

void SecondCb(keynode_t* node, void* data)
{
    RecordNode(node, static_cast<Seen*>(data));
}

void SelfRemovingCb(keynode_t* node, void* data)
{
    auto* seen = static_cast<Seen*>(data);
    RecordNode(node, seen);
    vconf_ignore_key_changed(vconf_keynode_get_name(node), SelfRemovingCb);
}

std::string ToolPath()
{
    std::string path = WeatherTest::BuildDir() + "/platform/tools/vconftool/vconftool";
    return access(path.c_str(), X_OK) == 0 ? path : std::string(VCONFTOOL_BUILT_PATH);
}

int RunTool(const std::vector<std::string>& args)
{
    pid_t pid = fork();
    if (pid == 0)
    {
        std::vector<char*> argv;
        std::string tool = ToolPath();
        argv.push_back(&tool[0]);
        std::vector<std::string> copy = args;
        for (std::string& arg : copy)
            argv.push_back(&arg[0]);
        argv.push_back(nullptr);
        execv(argv[0], argv.data());
        _exit(127);
    }
    int status = 0;
    waitpid(pid, &status, 0);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

class VconfWatchTest : public PlatformTest
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

TEST_F(VconfWatchTest, ChangeReachesCallbackOnMainLoopWithNewValue)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(vconf_set_int("memory/dnet/status", 2), VCONF_OK);
    // Nothing arrives outside the main loop.
    EXPECT_TRUE(mSeen.values.empty());
    ASSERT_TRUE(RunLoopUntil([&] { return !mSeen.values.empty(); }, 5.0));
    EXPECT_EQ(mSeen.names.at(0), "memory/dnet/status");
    EXPECT_EQ(mSeen.types.at(0), VCONF_TYPE_INT);
    EXPECT_EQ(mSeen.values.at(0), "2");
}

TEST_F(VconfWatchTest, EveryWriteIsOneCallback)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    vconf_set_int("memory/dnet/status", 1);
    ASSERT_TRUE(RunLoopUntil([&] { return mSeen.values.size() == 1; }, 5.0));
    vconf_set_int("memory/dnet/status", 3);
    ASSERT_TRUE(RunLoopUntil([&] { return mSeen.values.size() == 2; }, 5.0));
    RunLoopFor(0.1);
    EXPECT_EQ(mSeen.values, (std::vector<std::string>{"1", "3"}));
}

TEST_F(VconfWatchTest, OnlyTheWatchedKeyOfAFolderIsReported)
{
    Seen other;
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/other", SecondCb, &other), VCONF_OK);
    vconf_set_str("memory/dnet/other", "x");
    vconf_set_int("memory/dnet/unwatched", 4);
    ASSERT_TRUE(RunLoopUntil([&] { return !other.values.empty(); }, 5.0));
    RunLoopFor(0.1);
    EXPECT_TRUE(mSeen.values.empty());
    EXPECT_EQ(other.values, std::vector<std::string>{"x"});
}

TEST_F(VconfWatchTest, SameCallbackTwiceForOneKeyIsRefused)
{
    Seen second;
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    EXPECT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &second), VCONF_ERROR);
    EXPECT_EQ(errno, EALREADY);
    // A different callback on the same key is a registration of its own.
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", SecondCb, &second), VCONF_OK);
    vconf_set_int("memory/dnet/status", 2);
    ASSERT_TRUE(RunLoopUntil([&] { return mSeen.values.size() == 1 && second.values.size() == 1; }, 5.0));
    RunLoopFor(0.1);
    EXPECT_EQ(mSeen.values.size(), 1u);
    EXPECT_EQ(second.values.size(), 1u);
}

TEST_F(VconfWatchTest, IgnoredCallbackHearsNothingMore)
{
    Seen second;
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", SecondCb, &second), VCONF_OK);
    EXPECT_EQ(vconf_ignore_key_changed("memory/dnet/status", FirstCb), VCONF_OK);
    EXPECT_EQ(vconf_ignore_key_changed("memory/dnet/status", FirstCb), VCONF_ERROR);
    vconf_set_int("memory/dnet/status", 2);
    ASSERT_TRUE(RunLoopUntil([&] { return !second.values.empty(); }, 5.0));
    RunLoopFor(0.1);
    EXPECT_TRUE(mSeen.values.empty());
}

TEST_F(VconfWatchTest, CallbackMayRemoveItselfWhileChangesArePending)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", SelfRemovingCb, &mSeen), VCONF_OK);
    vconf_set_int("memory/dnet/status", 1);
    vconf_set_int("memory/dnet/status", 2);
    RunLoopFor(0.3);
    EXPECT_EQ(mSeen.values.size(), 1u);
    EXPECT_EQ(vconf_ignore_key_changed("memory/dnet/status", SelfRemovingCb), VCONF_ERROR);
}

TEST_F(VconfWatchTest, GarbageWriteIsLoggedAndNotDelivered)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_TRUE(platform::WriteFileAtomic(mRoot.Path("vconf/memory/dnet/status"), "int\nbroken\n"));
    ASSERT_TRUE(RunLoopUntil([&] { return mLog.Contains("memory/dnet/status", "VCONF"); }, 5.0))
        << mLog.Dump();
    vconf_set_int("memory/dnet/status", 3);
    ASSERT_TRUE(RunLoopUntil([&] { return !mSeen.values.empty(); }, 5.0));
    EXPECT_EQ(mSeen.values, std::vector<std::string>{"3"});
}

TEST_F(VconfWatchTest, BadRegistrationsAreRefused)
{
    EXPECT_EQ(vconf_notify_key_changed("../outside", FirstCb, &mSeen), VCONF_ERROR);
    EXPECT_EQ(vconf_notify_key_changed("memory/dnet/status", nullptr, &mSeen), VCONF_ERROR);
    EXPECT_EQ(vconf_notify_key_changed(nullptr, FirstCb, &mSeen), VCONF_ERROR);
    EXPECT_EQ(vconf_ignore_key_changed("memory/never/watched", FirstCb), VCONF_ERROR);
    EXPECT_TRUE(mLog.Contains("../outside", "VCONF"));
}

TEST_F(VconfWatchTest, KeySetByToolInAnotherProcessReachesWatcher)
{
    ASSERT_EQ(vconf_notify_key_changed("memory/dnet/status", FirstCb, &mSeen), VCONF_OK);
    ASSERT_EQ(RunTool({"set", "-t", "int", "memory/dnet/status", "3"}), 0);
    ASSERT_TRUE(RunLoopUntil([&] { return !mSeen.values.empty(); }, 5.0));
    EXPECT_EQ(mSeen.values.at(0), "3");
}

TEST_F(VconfWatchTest, ToolGetAndSetCheckTheirArguments)
{
    EXPECT_EQ(RunTool({"set", "-t", "bool", "db/test/b", "yes"}), 1);
    EXPECT_EQ(RunTool({"set", "-t", "float", "db/test/b", "1"}), 1);
    EXPECT_EQ(RunTool({"set", "-t", "int", "../escape", "1"}), 1);
    EXPECT_EQ(RunTool({"get", "db/test/none"}), 1);
    EXPECT_EQ(RunTool({"bogus"}), 2);
    ASSERT_EQ(RunTool({"set", "-t", "string", "db/menu_widget/language", "ko_KR.UTF-8"}), 0);
    char* text = vconf_get_str("db/menu_widget/language");
    ASSERT_NE(text, nullptr);
    EXPECT_STREQ(text, "ko_KR.UTF-8");
    free(text);
}

TEST_F(VconfWatchTest, ToolWatchPrintsTheNewValueAndStopsAfterCount)
{
    std::string command = ToolPath() + " watch db/test/watched 1";
    FILE* out = popen(command.c_str(), "r");
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
    while (fgets(line, sizeof(line), out))
        all += line;
    EXPECT_EQ(pclose(out), 0);
    EXPECT_EQ(all, "new value\n");
}

}  // namespace

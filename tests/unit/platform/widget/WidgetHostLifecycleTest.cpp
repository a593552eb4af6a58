#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/stat.h>

#include "WidgetHostFixture.h"
#include "vconf.h"
#include "widget_errno.h"

using ::testing::ElementsAre;
using ::testing::HasSubstr;

namespace WeatherTest
{

namespace
{
// The records that name one instance, in order, without their trailing
// details; the widget's own timer fires at its own pace and is left out.
std::vector<std::string> CallbacksOf(const std::vector<std::string>& records, const std::string& id)
{
    std::vector<std::string> names;
    for (auto& line : records)
    {
        auto words = Words(line);
        if (words.size() >= 2 && words[1] == id && words[0] != "timer")
            names.push_back(words[0]);
    }
    return names;
}
}  // namespace

TEST_F(WidgetHostTest, CreateGivesCreateResizeResumeAndListShowsTheInstance)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    WaitIdle();
    EXPECT_THAT(Records("create"), ElementsAre("create " + id + " 712 354 type=0x10 content=no"));
    EXPECT_THAT(CallbacksOf(Records(), id), ElementsAre("create", "resize", "resume"));
    EXPECT_THAT(Records("timer"), ElementsAre("timer " + id));
    EXPECT_EQ(Records().front(), "app-create");
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x2\tTest 1\trunning");
}

TEST_F(WidgetHostTest, InstancesFromTheCommandLineAndTheSocketLiveSideBySide)
{
    StartHost({"--instance", "4x2", "--instance", "4x4"});
    std::string third = CreateInstance("4x4");
    std::string list = Send("list");
    auto lines = Words(list);
    ASSERT_EQ(lines.size(), 2u + 3u * 5u) << list;
    EXPECT_EQ(lines[1], "3");
    EXPECT_THAT(Records("create"),
                ElementsAre(HasSubstr(" 712 354 type=0x10"), HasSubstr(" 712 712 type=0x40"),
                            "create " + third + " 712 712 type=0x40 content=no"));
    // Ids are unique texts.
    auto creates = Records("create");
    EXPECT_NE(Words(creates[0])[1], Words(creates[1])[1]);
    EXPECT_NE(Words(creates[1])[1], third);
}

TEST_F(WidgetHostTest, DestroyingOneInstanceLeavesTheOtherDrawn)
{
    StartHost();
    std::string first = CreateInstance("4x2");
    std::string second = CreateInstance("4x4");
    EXPECT_EQ(Send("destroy " + first), "OK");
    EXPECT_THAT(CallbacksOf(Records(), first), ElementsAre("create", "resize", "resume", "pause", "destroy"));
    EXPECT_THAT(Records("destroy"), ElementsAre("destroy " + first + " reason=0 content=yes tag=kept"));
    EXPECT_EQ(Send("list"), "OK 1\n" + second + "\t4x4\tTest 2\trunning");
    EXPECT_EQ(Send("tap " + first + " 10 10").compare(0, 4, "ERR "), 0);
    EXPECT_EQ(Send("tap " + second + " 10 10").compare(0, 3, "OK "), 0);
}

TEST_F(WidgetHostTest, UnknownIdsAndBadCommandsAreRefused)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    for (const std::string& bad : {std::string("nope"), id.substr(0, id.size() - 1), id + "0"})
    {
        for (const char* command : {"pause ", "resume ", "update ", "destroy ", "dump "})
            EXPECT_EQ(Send(command + bad), "ERR unknown instance " + bad) << command;
        EXPECT_EQ(Send("resize " + bad + " 4x4"), "ERR unknown instance " + bad);
        EXPECT_EQ(Send("tap " + bad + " 1 1"), "ERR unknown instance " + bad);
        EXPECT_EQ(Send("snapshot " + bad + " /tmp/x.png"), "ERR unknown instance " + bad);
    }
    for (const char* bad : {"create 3x3", "create 4x2 window", "create 4x2 nowindow 1"})
        EXPECT_THAT(Send(bad), HasSubstr("ERR usage")) << bad;
    EXPECT_THAT(Send("resize " + id + " 4x3"), HasSubstr("ERR usage"));
    EXPECT_THAT(Send("tap " + id + " 1x 2"), HasSubstr("ERR usage"));
    EXPECT_THAT(Send("idle -1"), HasSubstr("ERR usage"));
    EXPECT_THAT(Send("frobnicate"), HasSubstr("ERR unknown command"));
    EXPECT_THAT(Send(""), HasSubstr("ERR unknown command"));
    // Nothing reached the widget beyond the first instance's own callbacks.
    EXPECT_THAT(CallbacksOf(Records(), id), ElementsAre("create", "resize", "resume"));
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x2\tTest 1\trunning");
}

TEST_F(WidgetHostTest, PauseAndResumeFollowTheStateAndHoldBackUnforcedUpdates)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    EXPECT_EQ(Send("pause " + id), "OK");
    EXPECT_EQ(Send("pause " + id), "OK");
    EXPECT_EQ(Send("update " + id + " 0"), "OK");
    EXPECT_EQ(Records("update").size(), 0u);
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x2\tTest 1\tpaused");
    EXPECT_EQ(Send("resume " + id), "OK");
    EXPECT_EQ(Send("resume " + id), "OK");
    EXPECT_EQ(Send("update " + id), "OK");
    EXPECT_EQ(Send("resize " + id + " 4x4"), "OK");
    EXPECT_THAT(CallbacksOf(Records(), id),
                ElementsAre("create", "resize", "resume", "pause", "resume", "update", "update", "resize"));
    EXPECT_THAT(Records("update"),
                ElementsAre("update " + id + " force=0 reason=-", "update " + id + " force=1 reason=-"));
    EXPECT_THAT(Records("resize").back(), "resize " + id + " 712 712");
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x4\tTest 1\trunning");
}

// The buffer engine frees a window's pixels on a resize; a frame still being
// drawn into them crashed the host now and then.
TEST_F(WidgetHostTest, ResizingWhileTheWidgetDrawsKeepsTheHostAlive)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    ASSERT_EQ(Send("tap " + id + " 300 300").compare(0, 3, "OK "), 0);
    for (int i = 0; i < 40; ++i)
        ASSERT_EQ(Send("resize " + id + (i % 2 ? " 4x2" : " 4x4")), "OK") << "resize " << i;
    EXPECT_EQ(Send("list"), "OK 1\n" + id + "\t4x2\tTest 1\trunning");
}

TEST_F(WidgetHostTest, LanguageKeyUpdatesLanguageAndTriggerUpdateReachesEveryInstance)
{
    StartHost();
    std::string first = CreateInstance("4x2");
    std::string second = CreateInstance("4x4");
    ASSERT_EQ(vconf_set_str(VCONFKEY_LANGSET, "ko_KR.UTF-8"), VCONF_OK);
    WaitIdle();
    EXPECT_THAT(Records("event"), ElementsAre("event language ko_KR.UTF-8 LANGUAGE=ko_KR:ko"));
    EXPECT_THAT(Records("trigger"), ElementsAre("trigger 0"));
    EXPECT_THAT(Records("update"), ElementsAre("update " + first + " force=1 reason=language",
                                               "update " + second + " force=1 reason=language"));
}

TEST_F(WidgetHostTest, TriggerForOneInstanceUpdatesOnlyThatOne)
{
    StartHost();
    std::string first = CreateInstance("4x2");
    std::string second = CreateInstance("4x2");
    ASSERT_EQ(Send("tap " + second + " 300 300").compare(0, 3, "OK "), 0);
    WaitIdle();
    EXPECT_THAT(Records("trigger"), ElementsAre("trigger 0"));
    EXPECT_THAT(Records("update"), ElementsAre("update " + second + " force=0 reason=-"));
}

TEST_F(WidgetHostTest, StartupTakesLanguageFromItsKeyAndLeavesTheCLocale)
{
    ASSERT_EQ(vconf_set_str(VCONFKEY_LANGSET, "ko_KR.UTF-8"), VCONF_OK);
    ASSERT_EQ(vconf_set_str(VCONFKEY_REGIONFORMAT, "C.UTF-8"), VCONF_OK);
    const char* oldLang = getenv("LANG");
    std::string saved = oldLang ? oldLang : "";
    setenv("LANG", "C", 1);
    StartHost();
    if (oldLang)
        setenv("LANG", saved.c_str(), 1);
    else
        unsetenv("LANG");
    EXPECT_THAT(Records("env"), ElementsAre("env LANG=C.UTF-8 LANGUAGE=ko_KR:ko LC_TIME=C.UTF-8"));
}

TEST_F(WidgetHostTest, RegionAndLowMemoryKeysRaiseTheirEventsOnlyForQualifyingValues)
{
    StartHost();
    ASSERT_EQ(vconf_set_str(VCONFKEY_REGIONFORMAT, "C.UTF-8"), VCONF_OK);
    ASSERT_EQ(vconf_set_int(VCONFKEY_SYSMAN_LOW_MEMORY, VCONFKEY_SYSMAN_LOW_MEMORY_HARD_WARNING), VCONF_OK);
    ASSERT_EQ(vconf_set_int(VCONFKEY_SYSMAN_BATTERY_STATUS_LOW, VCONFKEY_SYSMAN_BAT_WARNING_LOW), VCONF_OK);
    WaitIdle();
    // Not a status the platform defines: ignored rather than read as "power off".
    ASSERT_EQ(vconf_set_int(VCONFKEY_SYSMAN_BATTERY_STATUS_LOW, 0), VCONF_OK);
    ASSERT_EQ(vconf_set_int(VCONFKEY_SYSMAN_LOW_MEMORY, VCONFKEY_SYSMAN_LOW_MEMORY_SOFT_WARNING), VCONF_OK);
    WaitIdle();
    // A region format that is not installed here is announced but leaves LC_TIME alone.
    ASSERT_EQ(vconf_set_str(VCONFKEY_REGIONFORMAT, "xx_YY.UTF-8"), VCONF_OK);
    WaitIdle();
    EXPECT_THAT(Records("event"), ElementsAre("event region C.UTF-8 LC_TIME=C.UTF-8", "event low-memory 2",
                                              "event region xx_YY.UTF-8 LC_TIME=C.UTF-8"));
    EXPECT_EQ(Send("event low-memory"), "OK");
    EXPECT_EQ(Records("event low-memory").size(), 2u);
    EXPECT_THAT(Send("event orientation"), HasSubstr("ERR usage"));
    EXPECT_EQ(Send("list"), "OK 0") << "the host should still run";
}

TEST_F(WidgetHostTest, WidgetCanWalkItsContextsAndEndOneOfThem)
{
    StartHost();
    std::string first = CreateInstance("4x2");
    std::string second = CreateInstance("4x4");
    EXPECT_EQ(Send("event low-memory"), "OK");
    WaitIdle();
    EXPECT_THAT(Records("contexts"), ElementsAre("contexts " + first + " " + second +
                                                 " all=0 stopped=" + std::to_string(WIDGET_ERROR_CANCELED)));
    EXPECT_THAT(Records("terminate"), ElementsAre("terminate " + first + " 0"));
    EXPECT_THAT(CallbacksOf(Records(), first),
                ElementsAre("create", "resize", "resume", "contexts", "terminate", "pause", "destroy"));
    EXPECT_THAT(Records("destroy"), ElementsAre("destroy " + first + " reason=0 content=yes tag=kept"));
    EXPECT_EQ(Send("list"), "OK 1\n" + second + "\t4x4\tTest 2\trunning");
}

TEST_F(WidgetHostTest, ClosingAWindowEndsItsInstance)
{
    StartHost();
    std::string first = CreateInstance("4x2");
    std::string second = CreateInstance("4x2");
    ASSERT_EQ(Send("tap " + first + " 10 10 1000").compare(0, 3, "OK "), 0);
    WaitIdle();
    EXPECT_THAT(Records("close-request"), ElementsAre("close-request " + first));
    EXPECT_THAT(Records("destroy"), ElementsAre("destroy " + first + " reason=0 content=yes tag=kept"));
    EXPECT_EQ(Send("list"), "OK 1\n" + second + "\t4x2\tTest 2\trunning");
}

TEST_F(WidgetHostTest, LowBatteryEndsTheProcessAfterDestroyingItsInstances)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    ASSERT_EQ(vconf_set_int(VCONFKEY_SYSMAN_BATTERY_STATUS_LOW, VCONFKEY_SYSMAN_BAT_CRITICAL_LOW), VCONF_OK);
    EXPECT_EQ(WaitForExit(10.0), 0);
    auto records = Records();
    ASSERT_GE(records.size(), 4u);
    EXPECT_THAT(
        std::vector<std::string>(records.end() - 5, records.end()),
        ElementsAre("event low-battery 2", "pause " + id, "destroy " + id + " reason=5 content=yes tag=kept",
                    "app-terminate", "main-returned 0"));
    struct stat info;
    EXPECT_NE(stat(SocketPath().c_str(), &info), 0) << "the socket outlived its host";
}

TEST_F(WidgetHostTest, ControlSocketIsPrivateAndASecondHostIsRefused)
{
    StartHost();
    struct stat info;
    ASSERT_EQ(stat(SocketPath().c_str(), &info), 0);
    EXPECT_TRUE(S_ISSOCK(info.st_mode));
    EXPECT_EQ(info.st_mode & 0777, 0600u);
    pid_t second = Spawn({}, "second.out");
    int status = 0;
    ASSERT_EQ(waitpid(second, &status, 0), second);
    EXPECT_EQ(Records("main-returned"),
              std::vector<std::string>{"main-returned " + std::to_string(WIDGET_ERROR_ALREADY_STARTED)});
    EXPECT_EQ(Send("list"), "OK 0");
}

TEST_F(WidgetHostTest, WidgetctlExitCodesTellOkErrAndNoHost)
{
    StartHost();
    auto run = [this](const std::string& args)
    {
        std::string command =
            std::string(WIDGETCTL_PROGRAM) + " --widget-id " + args + " > " + mRoot.Path("ctl.out") + " 2>&1";
        int status = system(command.c_str());
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    };
    EXPECT_EQ(run(std::string(kWidgetId) + " create 4x2"), 0);
    EXPECT_EQ(Records("create").size(), 1u);
    EXPECT_EQ(run(std::string(kWidgetId) + " pause nope"), 1);
    EXPECT_EQ(run("com.quorvex.absent-widget list"), 2);
}

}  // namespace WeatherTest

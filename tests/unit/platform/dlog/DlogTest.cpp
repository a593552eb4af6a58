#include <dlog.h>

#include <Ecore.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <functional>
#include <string>

#include "MainLoop.h"
#include "TestFiles.h"
#include "TestPlatform.h"
#include "core/PlatformRoot.h"
#include "dlog/LogLimiter.h"

namespace
{
using WeatherTest::PlatformTest;
using WeatherTest::ReadText;
using WeatherTest::WriteText;

class DlogTest : public PlatformTest
{
};

TEST_F(DlogTest, AppendsPhoneFormatLinesToRootLog)
{
    EXPECT_EQ(dlog_print(DLOG_ERROR, "weather-common", "value %d", 42), 8);
    dlog_print(DLOG_INFO, "other", "second");
    std::string content;
    ASSERT_TRUE(platform::ReadFile(mRoot.Path("log/dlog.log"), content));
    std::string pid = std::to_string(getpid());
    EXPECT_EQ(content, "E/weather-common(" + pid + "): value 42\nI/other(" + pid + "): second\n");
}

TEST_F(DlogTest, CaptureSeesTagAndWholeText)
{
    std::string longText(5000, 'x');
    dlog_print(DLOG_ERROR, "weather-widget", "hello %s", "world");
    EXPECT_EQ(dlog_print(DLOG_INFO, "t", "%s", longText.c_str()), 5000);
    ASSERT_EQ(mLog.GetLines().size(), 2u);
    EXPECT_EQ(mLog.GetLines()[0].tag, "weather-widget");
    EXPECT_EQ(mLog.GetLines()[0].text, "hello world");
    EXPECT_EQ(mLog.GetLines()[0].prio, DLOG_ERROR);
    EXPECT_EQ(mLog.GetLines()[1].text, longText);
}

TEST_F(DlogTest, RejectsBadArguments)
{
    EXPECT_EQ(dlog_print(DLOG_ERROR, nullptr, "x"), DLOG_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(dlog_print(static_cast<log_priority>(42), "t", "x"), DLOG_ERROR_INVALID_PARAMETER);
    EXPECT_TRUE(mLog.GetLines().empty());
}

off_t SizeOf(const std::string& path)
{
    struct stat info;
    return lstat(path.c_str(), &info) == 0 ? info.st_size : -1;
}

mode_t ModeOf(const std::string& path)
{
    struct stat info;
    return lstat(path.c_str(), &info) == 0 ? info.st_mode & 0777 : 0;
}

TEST_F(DlogTest, AFullLogBecomesTheOneOldFile)
{
    std::string text(1000, 'x');
    off_t written = 0;
    for (int i = 0; i < 5000; ++i) written += dlog_print(DLOG_INFO, "t", "%s", text.c_str());
    dlog_print(DLOG_INFO, "t", "last");
    std::string current = mRoot.Path("log/dlog.log");
    EXPECT_GT(SizeOf(current + ".1"), 0);
    EXPECT_LT(SizeOf(current + ".1"), written / 2);
    EXPECT_LE(SizeOf(current), SizeOf(current + ".1"));
    EXPECT_EQ(SizeOf(current + ".2"), -1);
    std::string content = ReadText(current);
    EXPECT_EQ(content.substr(content.size() - 5), "last\n");
    EXPECT_EQ(ModeOf(current), 0600u);
    EXPECT_EQ(ModeOf(current + ".1"), 0600u);
}

// Each case on a root whose log file was set up before the first line.
TEST(DlogRootTest, WritesOnlyItsOwnRegularFile)
{
    struct Case
    {
        const char* name;
        std::function<void(const std::string& log, const std::string& victim)> plant;
        bool isWritten;
    };
    const Case cases[] = {
        {"link",
         [](const std::string& log, const std::string& victim) { symlink(victim.c_str(), log.c_str()); },
         false},
        // Opening a FIFO for writing would wait for a reader forever.
        {"fifo", [](const std::string& log, const std::string&) { mkfifo(log.c_str(), 0600); }, false},
        {"loose mode",
         [](const std::string& log, const std::string&)
         {
             WriteText(log, "old\n");
             chmod(log.c_str(), 0644);
         },
         true},
    };
    for (const Case& item : cases)
    {
        WeatherTest::TestPlatformRoot root;
        std::string log = root.Path("log/dlog.log");
        std::string victim = root.Path("victim");
        WriteText(victim, "precious\n");
        ASSERT_TRUE(platform::MakeDirs(root.Path("log")));
        item.plant(log, victim);
        EXPECT_EQ(dlog_print(DLOG_ERROR, "t", "line"), 4) << item.name;
        EXPECT_EQ(ReadText(victim), "precious\n") << item.name;
        if (item.isWritten)
        {
            EXPECT_NE(ReadText(log).find("line"), std::string::npos) << item.name;
            EXPECT_EQ(ModeOf(log), 0600u) << item.name;
        }
    }
}

TEST_F(DlogTest, LimiterLetsOneLineThroughThenCountsTheRest)
{
    ecore_init();
    {
        platform::LogLimiter limiter(DLOG_WARN, "limited", 0.05);
        for (int i = 0; i < 100; ++i) limiter.Log("same " + std::to_string(i));
        EXPECT_EQ(mLog.Count("", "limited"), 1);
        WeatherTest::RunLoopUntil([this] { return mLog.Count("", "limited") >= 2; }, 5.0);
        EXPECT_EQ(mLog.Count("99 more like this within 0.05 s: same 99", "limited"), 1) << mLog.Dump();
        // A quiet interval ends the burst; the next line goes out at once.
        WeatherTest::RunLoopFor(0.2);
        limiter.Log("again");
        EXPECT_TRUE(mLog.Contains("again", "limited"));
        limiter.Log("held");
    }
    EXPECT_TRUE(mLog.Contains("1 more like this within 0.05 s: held", "limited")) << mLog.Dump();
    ecore_shutdown();
}

TEST(DlogRootTest, FollowsRootChanges)
{
    std::string firstLog;
    {
        WeatherTest::TestPlatformRoot first;
        dlog_print(DLOG_ERROR, "t", "one");
        ASSERT_TRUE(platform::ReadFile(first.Path("log/dlog.log"), firstLog));
        WeatherTest::TestPlatformRoot second;
        dlog_print(DLOG_ERROR, "t", "two");
        std::string secondLog;
        ASSERT_TRUE(platform::ReadFile(second.Path("log/dlog.log"), secondLog));
        EXPECT_NE(secondLog.find("two"), std::string::npos);
        EXPECT_EQ(secondLog.find("one"), std::string::npos);
    }
    EXPECT_EQ(firstLog.find("two"), std::string::npos);
}
}  // namespace

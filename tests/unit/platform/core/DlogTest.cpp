#include <dlog.h>

#include <gtest/gtest.h>
#include <unistd.h>

#include <string>

#include "TestPlatform.h"
#include "core/PlatformRoot.h"

namespace
{
using WeatherTest::PlatformTest;

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

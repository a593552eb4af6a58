#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <cstdlib>
#include <string>
#include <utility>

#include "TestFiles.h"
#include "TestPlatform.h"

namespace
{

struct Tool
{
    const char* path;
    const char* name;
};

const Tool kTools[] = {{PLATFORM_SETUP_PATH, "platform-setup"},
                       {VCONFTOOL_PATH, "vconftool"},
                       {MSGPORT_SEND_PATH, "msgport-send"},
                       {WIDGETCTL_PATH, "widgetctl"}};

class ToolUsageTest : public WeatherTest::PlatformTest
{
protected:
    // Runs the tool with `args`; its output streams are kept in mOut and mErr.
    int Run(const Tool& tool, const std::string& args)
    {
        std::string out = mRoot.Path("out.txt");
        std::string err = mRoot.Path("err.txt");
        std::string command = std::string(tool.path) + " " + args + " >'" + out + "' 2>'" + err + "'";
        int status = system(command.c_str());
        mOut = WeatherTest::ReadText(out);
        mErr = WeatherTest::ReadText(err);
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }

    std::string mOut;
    std::string mErr;
};

TEST_F(ToolUsageTest, BadUsageStillFailsOnTheErrorStream)
{
    for (const Tool& tool : kTools)
    {
        SCOPED_TRACE(tool.name);
        std::string args = tool.name == std::string("platform-setup") ? "--no-such-option" : "";
        EXPECT_NE(0, Run(tool, args));
        EXPECT_NE(std::string::npos, mErr.find(std::string("usage: ") + tool.name)) << mErr;
        EXPECT_EQ("", mOut);
    }
}

TEST_F(ToolUsageTest, RootThatOthersCanWriteStopsTheTools)
{
    std::string root = mRoot.Path("shared");
    ASSERT_EQ(0, mkdir(root.c_str(), 0777));
    ASSERT_EQ(0, chmod(root.c_str(), 0777));
    const std::pair<const Tool&, std::string> kRuns[] = {{kTools[0], "--reset"},
                                                         {kTools[1], "get db/menu_widget/language"}};
    for (const auto& [tool, args] : kRuns)
    {
        SCOPED_TRACE(tool.name);
        setenv("PLATFORM_ROOT", root.c_str(), 1);
        EXPECT_EQ(1, Run(tool, args));
        setenv("PLATFORM_ROOT", mRoot.GetPath().c_str(), 1);
        EXPECT_NE(std::string::npos, mErr.find(root + " is refused")) << mErr;
    }
    struct stat st;
    EXPECT_NE(0, stat((root + "/vconf").c_str(), &st));
}

TEST_F(ToolUsageTest, SetupHelpLeavesTheRootAlone)
{
    std::string root = mRoot.Path("fresh");
    ASSERT_EQ(0, Run(kTools[0], "--root '" + root + "' --help"));
    struct stat st;
    EXPECT_NE(0, stat(root.c_str(), &st)) << "help must not prepare a root";
}

}  // namespace

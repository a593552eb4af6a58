#include <app_control.h>
#include <app_control_launch.h>
#include <vconf.h>

#include <gtest/gtest.h>
#include <limits.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <utility>
#include <string>

#include "TestFiles.h"
#include "TestPlatform.h"

namespace
{

class PlatformSetupTest : public WeatherTest::PlatformTest
{
protected:
    int RunSetup(const std::string& options) const
    {
        std::string command = std::string(PLATFORM_SETUP_PATH) + " --root '" + mRoot.GetPath() + "' " +
                              options + " >/dev/null 2>&1";
        int status = system(command.c_str());
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }

    int GetInt(const char* key) const
    {
        int value = -1;
        EXPECT_EQ(VCONF_OK, vconf_get_int(key, &value)) << key;
        return value;
    }

    std::string GetStr(const char* key) const
    {
        char* value = vconf_get_str(key);
        std::string text = value ? value : "(none)";
        free(value);
        return text;
    }
};

TEST_F(PlatformSetupTest, FreshRootHasTheDefaultKeys)
{
    ASSERT_EQ(0, RunSetup(""));
    EXPECT_EQ("en_US.UTF-8", GetStr(VCONFKEY_LANGSET));
    EXPECT_EQ("en_US.UTF-8", GetStr(VCONFKEY_REGIONFORMAT));
    EXPECT_EQ(2, GetInt(VCONFKEY_REGIONFORMAT_TIME1224));
    EXPECT_EQ(2, GetInt(VCONFKEY_NETWORK_STATUS));
    EXPECT_EQ(1, GetInt(VCONFKEY_LOCATION_USE_MY_LOCATION));
    EXPECT_EQ(0, GetInt(VCONFKEY_SETAPPL_DATE_FORMAT_INT));
    EXPECT_EQ(4, GetInt(VCONFKEY_SYSMAN_BATTERY_STATUS_LOW));
    EXPECT_EQ(1, GetInt(VCONFKEY_SYSMAN_LOW_MEMORY));
    EXPECT_NE("(none)", GetStr(VCONFKEY_SETAPPL_TIMEZONE_ID));

    // A second run keeps what the user changed, unless asked to reset.
    vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, 1);
    ASSERT_EQ(0, RunSetup(""));
    EXPECT_EQ(1, GetInt(VCONFKEY_REGIONFORMAT_TIME1224));
    ASSERT_EQ(0, RunSetup("--reset"));
    EXPECT_EQ(2, GetInt(VCONFKEY_REGIONFORMAT_TIME1224));
}

TEST_F(PlatformSetupTest, RegisteredSuiteCanBeLaunched)
{
    std::string built = mRoot.Path("build-res");
    std::string widgetRes = built + "/com.quorvex.weather-m-widget/res";
    ASSERT_EQ(0, system(("mkdir -p '" + widgetRes + "'").c_str()));
    ASSERT_EQ(0, RunSetup("--agent " LAUNCH_RECORDER_PATH " --browser " LAUNCH_RECORDER_PATH " --res '" +
                          built + "'"));

    char target[PATH_MAX] = {};
    ASSERT_GT(
        readlink(mRoot.Path("apps/com.quorvex.weather-m-widget/res").c_str(), target, sizeof(target) - 1), 0);
    EXPECT_EQ(widgetRes, target);
    // Folders the build does not have stay plain folders.
    struct stat st;
    ASSERT_EQ(0, lstat(mRoot.Path("apps/com.quorvex.weather-m/res").c_str(), &st));
    EXPECT_TRUE(S_ISDIR(st.st_mode));

    app_control_h request = nullptr;
    app_control_create(&request);
    app_control_set_app_id(request, "com.quorvex.weather-m-agent");
    EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(request, nullptr, nullptr));
    app_control_set_app_id(request, nullptr);
    app_control_set_operation(request, APP_CONTROL_OPERATION_VIEW);
    app_control_set_uri(request, "https://www.accuweather.com");
    EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(request, nullptr, nullptr));
    app_control_set_operation(request, APP_CONTROL_OPERATION_SETTING_LOCATION);
    app_control_set_uri(request, nullptr);
    EXPECT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(request, nullptr, nullptr));
    // Without a program the weather application is not launchable.
    app_control_set_app_id(request, "com.quorvex.weather-m");
    EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_launch_request(request, nullptr, nullptr));
    app_control_destroy(request);

    // Both started programs report back before the root goes away.
    for (const char* appId : {"com.quorvex.weather-m-agent", APP_CONTROL_BROWSER_APP_ID})
    {
        std::string record = mRoot.Path(std::string("apps/") + appId + "/shared/data/launch-record.txt");
        for (int i = 0; i < 500 && access(record.c_str(), F_OK) != 0; ++i) usleep(10000);
        EXPECT_EQ(0, access(record.c_str(), F_OK)) << appId;
    }
}

std::string RealPath(const std::string& path)
{
    char resolved[PATH_MAX];
    return realpath(path.c_str(), resolved) ? resolved : "(missing) " + path;
}

TEST_F(PlatformSetupTest, InstalledCopyRegistersItsPrefixUnlessToldOtherwise)
{
    // A copy laid out as installed, with the agent beside it and not the app.
    std::string bin = mRoot.Path("prefix/bin");
    std::string res = bin + "/" PLATFORM_SETUP_RES_FROM_BIN;
    std::string other = mRoot.Path("other-res");
    const char* widgetRes = "/com.quorvex.weather-m-widget/res";
    ASSERT_EQ(0, system(("mkdir -p '" + res + widgetRes + "' '" + other + widgetRes +
                         "' && cp " PLATFORM_SETUP_PATH " '" + bin +
                         "/platform-setup' && cp " LAUNCH_RECORDER_PATH " '" + bin + "/weather-agent'")
                            .c_str()));
    const std::string besideAgent = "exec=" + RealPath(bin + "/weather-agent") + "\n";
    const struct
    {
        std::string options;
        std::string widgetRes;
        std::string agentConf;
    } kCases[] = {{"", RealPath(res) + widgetRes, besideAgent},
                  {"--agent /bin/sh", RealPath(res) + widgetRes, "exec=" + RealPath("/bin/sh") + "\n"},
                  // Resources named on the command line bring no programs of the prefix.
                  {"--res '" + other + "'", RealPath(other) + widgetRes, ""}};
    int n = 0;
    for (const auto& c : kCases)
    {
        SCOPED_TRACE(c.options);
        std::string root = mRoot.Path("root" + std::to_string(++n));
        ASSERT_EQ(
            0, system((bin + "/platform-setup --root '" + root + "' " + c.options + " >/dev/null").c_str()));
        EXPECT_EQ(c.widgetRes, RealPath(root + "/apps/com.quorvex.weather-m-widget/res"));
        EXPECT_EQ(c.agentConf, WeatherTest::ReadText(root + "/apps/com.quorvex.weather-m-agent/app.conf"));
        EXPECT_EQ("", WeatherTest::ReadText(root + "/apps/com.quorvex.weather-m/app.conf"));
    }
}

TEST_F(PlatformSetupTest, FreshRootIsOwnerOnly)
{
    std::string root = mRoot.Path("fresh");
    ASSERT_EQ(0, system((std::string(PLATFORM_SETUP_PATH) + " --root '" + root + "' >/dev/null").c_str()));
    const std::pair<const char*, unsigned> kModes[] = {{"", 0700},
                                                       {"/vconf/db", 0700},
                                                       {"/vconf/db/menu_widget/language", 0600},
                                                       {"/apps/org.tizen.browser/app.conf", 0600}};
    for (const auto& item : kModes)
    {
        struct stat st;
        ASSERT_EQ(0, lstat((root + item.first).c_str(), &st)) << item.first;
        EXPECT_EQ(item.second, st.st_mode & 07777) << item.first;
    }
}

TEST_F(PlatformSetupTest, BadValuesAndLinkedFoldersAreRefused)
{
    EXPECT_EQ(2, RunSetup("--bogus"));
    EXPECT_EQ(2, RunSetup("stray"));
    // A line break would add a line of the caller's choosing to app.conf.
    EXPECT_EQ(2, RunSetup("--agent \"$(printf '/bin/true\\noperation=x')\""));
    EXPECT_EQ(2, RunSetup("--browser \"$(printf '/bin/true\\rview-uri=x')\""));
    // A program that cannot run fails the setup instead of the first launch.
    WeatherTest::WriteText(mRoot.Path("plain.txt"), "not a program");
    for (const char* program : {"missing/agent", "plain.txt", "."})
        EXPECT_EQ(1, RunSetup(std::string("--agent ") + mRoot.Path(program))) << program;
    EXPECT_NE(0, access(mRoot.Path("apps/com.quorvex.weather-m-agent/app.conf").c_str(), F_OK));

    std::string elsewhere = mRoot.Path("elsewhere");
    ASSERT_EQ(0, mkdir(elsewhere.c_str(), 0700));
    std::string agent = mRoot.Path("apps/com.quorvex.weather-m-agent");
    ASSERT_EQ(0, system(("rm -r '" + agent + "'").c_str()));
    ASSERT_EQ(0, symlink(elsewhere.c_str(), agent.c_str()));
    EXPECT_EQ(1, RunSetup("--agent /bin/true"));
    EXPECT_EQ(0, rmdir(elsewhere.c_str())) << "nothing written through the link";
}

}  // namespace

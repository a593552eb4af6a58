#include <app_control.h>
#include <app_control_launch.h>

#include <Ecore.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <string>
#include <vector>

#include "TestFiles.h"
#include "TestPlatform.h"

namespace
{

const char* const kRecorderId = "test.recorder";

class AppControlTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        ecore_init();
        ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_create(&mRequest));
    }

    void TearDown() override
    {
        app_control_destroy(mRequest);
        ecore_shutdown();
    }

    void Register(const std::string& appId, const std::string& conf) const { mRoot.RegisterApp(appId, conf); }

    std::string RecordPath(const std::string& appId = kRecorderId) const
    {
        return mRoot.Path("apps/" + appId + "/shared/data/launch-record.txt");
    }

    std::vector<std::string> WaitForRecord(const std::string& appId = kRecorderId) const
    {
        std::string path = RecordPath(appId);
        EXPECT_TRUE(WeatherTest::WaitForFile(path, 10.0));
        return WeatherTest::ReadLines(path);
    }

    std::vector<std::string> LaunchLog() const
    {
        return WeatherTest::ReadLines(mRoot.Path("log/launch.log"));
    }

    app_control_h mRequest = nullptr;
};

TEST_F(AppControlTest, LaunchedProgramReceivesTheRequestInOrder)
{
    Register(kRecorderId, "# test program\nexec=" LAUNCH_RECORDER_PATH "\n");
    app_control_set_app_id(mRequest, kRecorderId);
    app_control_set_uri(mRequest, "file:///tmp/x");
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(mRequest, "PORT_ID", "some.port"));
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(mRequest, "MESSAGE", "first"));
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(mRequest, "locationId", "cityA, \"1\""));
    // A repeated key keeps its place and takes the new value.
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(mRequest, "MESSAGE", "REFRESH"));

    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(mRequest, nullptr, nullptr));

    std::vector<std::string> expected = {"app_id=test.recorder",
                                         "root=" + mRoot.GetPath(),
                                         "operation=(unset)",
                                         "uri=file:///tmp/x",
                                         "extra:PORT_ID=some.port",
                                         "extra:MESSAGE=REFRESH",
                                         "extra:locationId=cityA, \"1\""};
    EXPECT_EQ(expected, WaitForRecord());

    std::vector<std::string> log = LaunchLog();
    ASSERT_EQ(1u, log.size());
    std::string tail = log[0].substr(log[0].find("\"app_id\""));
    EXPECT_EQ(
        "\"app_id\":\"test.recorder\",\"operation\":\"\",\"uri\":\"file:///tmp/x\",\"extra\":"
        "{\"PORT_ID\":\"some.port\",\"MESSAGE\":\"REFRESH\",\"locationId\":\"cityA, \\\"1\\\"\"}}",
        tail);
}

TEST_F(AppControlTest, ViewGoesToTheRegisteredBrowser)
{
    Register("test.browser", "exec=" LAUNCH_RECORDER_PATH "\nview-uri=HTTP, https\n");
    Register("test.other", "exec=" LAUNCH_RECORDER_PATH "\nview-uri=mailto\n");
    app_control_set_operation(mRequest, APP_CONTROL_OPERATION_VIEW);
    app_control_set_uri(mRequest, "https://www.accuweather.com/?partner=x");
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(mRequest, nullptr, nullptr));
    std::vector<std::string> record = WaitForRecord("test.browser");
    ASSERT_GE(record.size(), 4u);
    EXPECT_EQ("operation=" APP_CONTROL_OPERATION_VIEW, record[2]);
    EXPECT_EQ("uri=https://www.accuweather.com/?partner=x", record[3]);

    app_control_set_uri(mRequest, "ftp://example.com");
    EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_launch_request(mRequest, nullptr, nullptr));
    app_control_set_uri(mRequest, "no scheme");
    EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_launch_request(mRequest, nullptr, nullptr));
    EXPECT_TRUE(mLog.Contains("no application handles", "APP_CONTROL")) << mLog.Dump();
    EXPECT_EQ(1u, LaunchLog().size());
}

TEST_F(AppControlTest, OperationHandlerIsFoundWithoutAppId)
{
    Register("test.location",
             "exec=" LAUNCH_RECORDER_PATH "\noperation=" APP_CONTROL_OPERATION_SETTING_LOCATION "\n");
    app_control_set_operation(mRequest, APP_CONTROL_OPERATION_SETTING_LOCATION);
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(mRequest, nullptr, nullptr));
    EXPECT_EQ("app_id=test.location", WaitForRecord("test.location").at(0));
}

TEST_F(AppControlTest, UnknownOrBrokenTargetsFailWithTheirCodes)
{
    app_control_set_app_id(mRequest, "no.such.app");
    EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_launch_request(mRequest, nullptr, nullptr));
    EXPECT_TRUE(mLog.Contains("application no.such.app is not registered", "APP_CONTROL"));

    // Registered folder without a program, and an id that climbs out of apps/.
    app_control_set_app_id(mRequest, "com.quorvex.weather-m-agent");
    EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_launch_request(mRequest, nullptr, nullptr));
    app_control_set_app_id(mRequest, "../apps");
    EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND, app_control_send_launch_request(mRequest, nullptr, nullptr));

    Register("test.missing", "exec=/nonexistent/program\n");
    app_control_set_app_id(mRequest, "test.missing");
    EXPECT_EQ(APP_CONTROL_ERROR_LAUNCH_FAILED, app_control_send_launch_request(mRequest, nullptr, nullptr));
    EXPECT_TRUE(mLog.Contains("cannot start test.missing", "APP_CONTROL"));

    // Executable bit set but not a program: exec itself fails.
    std::string script = mRoot.Path("not-a-program");
    std::ofstream(script) << "garbage";
    chmod(script.c_str(), 0755);
    Register("test.garbage", "exec=" + script + "\n");
    app_control_set_app_id(mRequest, "test.garbage");
    EXPECT_EQ(APP_CONTROL_ERROR_LAUNCH_FAILED, app_control_send_launch_request(mRequest, nullptr, nullptr));

    EXPECT_TRUE(LaunchLog().empty());
}

TEST_F(AppControlTest, PlantedRegistryEntriesAreRefused)
{
    // Each would start the recorder if the registry followed it or waited on it.
    mRoot.RegisterApp("test.real", "exec=" LAUNCH_RECORDER_PATH "\n");
    ASSERT_EQ(symlink(mRoot.Path("apps/test.real").c_str(), mRoot.Path("apps/test.linked-folder").c_str()),
              0);
    mRoot.RegisterApp("test.linked-conf");
    ASSERT_EQ(symlink(mRoot.Path("apps/test.real/app.conf").c_str(),
                      mRoot.Path("apps/test.linked-conf/app.conf").c_str()),
              0);
    mRoot.RegisterApp("test.fifo-conf");
    ASSERT_EQ(mkfifo(mRoot.Path("apps/test.fifo-conf/app.conf").c_str(), 0600), 0);
    for (const char* appId : {"test.linked-folder", "test.linked-conf", "test.fifo-conf"})
    {
        app_control_set_app_id(mRequest, appId);
        EXPECT_EQ(APP_CONTROL_ERROR_APP_NOT_FOUND,
                  app_control_send_launch_request(mRequest, nullptr, nullptr))
            << appId;
    }
    EXPECT_TRUE(LaunchLog().empty());
}

TEST_F(AppControlTest, LaunchLogIsPrivateValidJsonNeverWrittenThroughALink)
{
    Register(kRecorderId, "exec=" LAUNCH_RECORDER_PATH "\n");
    app_control_set_app_id(mRequest, kRecorderId);
    app_control_set_uri(mRequest, "file:///a\xFF!");
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(mRequest, "k\xC3", "v\xED\xA0\x80"));
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(mRequest, nullptr, nullptr));
    std::vector<std::string> log = LaunchLog();
    ASSERT_EQ(1u, log.size());
    const std::string r = "\xEF\xBF\xBD";
    EXPECT_NE(std::string::npos, log[0].find("\"uri\":\"file:///a" + r + "!\"")) << log[0];
    EXPECT_NE(std::string::npos, log[0].find("{\"k" + r + "\":\"v" + r + r + r + "\"}")) << log[0];
    struct stat st;
    ASSERT_EQ(0, stat(mRoot.Path("log/launch.log").c_str(), &st));
    EXPECT_EQ(0600u, st.st_mode & 0777);

    std::string target = mRoot.Path("target");
    WeatherTest::WriteText(target, "");
    unlink(mRoot.Path("log/launch.log").c_str());
    ASSERT_EQ(0, symlink(target.c_str(), mRoot.Path("log/launch.log").c_str()));
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_send_launch_request(mRequest, nullptr, nullptr));
    EXPECT_EQ("", WeatherTest::ReadText(target));
    EXPECT_TRUE(mLog.Contains("cannot write the launch log", "APP_CONTROL"));
    WaitForRecord();
}

TEST_F(AppControlTest, RequestWithoutTargetIsRefused)
{
    EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
              app_control_send_launch_request(mRequest, nullptr, nullptr));
    app_control_set_operation(mRequest, APP_CONTROL_OPERATION_DEFAULT);
    EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER,
              app_control_send_launch_request(mRequest, nullptr, nullptr));
}

TEST_F(AppControlTest, ExtraDataRules)
{
    EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(mRequest, "", "v"));
    EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_add_extra_data(mRequest, "k", ""));
    EXPECT_EQ(APP_CONTROL_ERROR_KEY_REJECTED, app_control_add_extra_data(mRequest, "__APP_SVC_PKG__", "x"));
    EXPECT_EQ(APP_CONTROL_ERROR_KEY_REJECTED,
              app_control_add_extra_data(mRequest, "__AUL_CALLER_APPID__", "x"));
    char* value = nullptr;
    EXPECT_EQ(APP_CONTROL_ERROR_KEY_NOT_FOUND, app_control_get_extra_data(mRequest, "k", &value));
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_add_extra_data(mRequest, "k", "v"));
    ASSERT_EQ(APP_CONTROL_ERROR_NONE, app_control_get_extra_data(mRequest, "k", &value));
    EXPECT_STREQ("v", value);
    free(value);
}

TEST_F(AppControlTest, LaunchRequestOfThisProcess)
{
    app_control_h request = nullptr;
    unsetenv(APP_CONTROL_LAUNCH_REQUEST_ENV);
    EXPECT_EQ(APP_CONTROL_ERROR_KEY_NOT_FOUND, app_control_get_launch_request(&request));
    EXPECT_EQ(nullptr, request);

    for (const char* garbage : {"%%%%", "QUJD", "UUJORAEAAAAB"})
    {
        setenv(APP_CONTROL_LAUNCH_REQUEST_ENV, garbage, 1);
        EXPECT_EQ(APP_CONTROL_ERROR_INVALID_PARAMETER, app_control_get_launch_request(&request)) << garbage;
        EXPECT_EQ(nullptr, request);
    }
    EXPECT_EQ(3, mLog.Count("malformed launch request", "APP_CONTROL"));
    unsetenv(APP_CONTROL_LAUNCH_REQUEST_ENV);
}

}  // namespace

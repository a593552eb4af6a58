#include <app_resource_manager.h>

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cstdlib>
#include <fstream>
#include <string>

#include "TestPlatform.h"

namespace
{

class AppResourceManagerTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override { setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-widget", 1); }
    void TearDown() override
    {
        unsetenv("PLATFORM_APP_ID");
        app_resource_manager_release();
    }

    std::string Res(const std::string& relative) const
    {
        return mRoot.Path("apps/com.quorvex.weather-m-widget/res/" + relative);
    }

    void MakeFile(const std::string& path) const
    {
        ASSERT_EQ(0, system(("mkdir -p \"$(dirname '" + path + "')\"").c_str()));
        std::ofstream(path) << "edje";
    }

    // The path found, or "error <code>".
    std::string Get(app_resource_e type, const char* id) const
    {
        char* path = nullptr;
        int ret = app_resource_manager_get(type, id, &path);
        std::string result =
            ret == APP_RESOURCE_ERROR_NONE ? std::string(path) : "error " + std::to_string(ret);
        free(path);
        return result;
    }
};

TEST_F(AppResourceManagerTest, LayoutIdResolvesInTheOwnResourceFolder)
{
    EXPECT_EQ(APP_RESOURCE_ERROR_NONE, app_resource_manager_init());
    EXPECT_EQ(APP_RESOURCE_ERROR_NONE, app_resource_manager_init());
    MakeFile(Res("widget/WidgetView.edj"));
    EXPECT_EQ(Res("widget/WidgetView.edj"), Get(APP_RESOURCE_TYPE_LAYOUT, "edje/widget/WidgetView.edj"));

    // The device's resolution folder wins when it has the file.
    MakeFile(Res("720x1280/widget/WidgetView.edj"));
    EXPECT_EQ(Res("720x1280/widget/WidgetView.edj"),
              Get(APP_RESOURCE_TYPE_LAYOUT, "edje/widget/WidgetView.edj"));

    MakeFile(Res("icon.png"));
    EXPECT_EQ(Res("icon.png"), Get(APP_RESOURCE_TYPE_IMAGE, "images/icon.png"));
}

TEST_F(AppResourceManagerTest, MissingFileIsAnIoError)
{
    EXPECT_EQ("error " + std::to_string(APP_RESOURCE_ERROR_IO_ERROR),
              Get(APP_RESOURCE_TYPE_LAYOUT, "edje/widget/Missing.edj"));
    EXPECT_TRUE(mLog.Contains("no file for resource \"edje/widget/Missing.edj\"", "RESOURCE_MANAGER"));
    // A folder of that name is no file either.
    ASSERT_EQ(0, system(("mkdir -p '" + Res("widget/Dir.edj") + "'").c_str()));
    EXPECT_EQ("error " + std::to_string(APP_RESOURCE_ERROR_IO_ERROR),
              Get(APP_RESOURCE_TYPE_LAYOUT, "edje/widget/Dir.edj"));
}

TEST_F(AppResourceManagerTest, UnsafeOrInvalidRequestsAreRefused)
{
    MakeFile(mRoot.Path("apps/com.quorvex.weather-m/res/secret.edj"));
    const std::string invalid = "error " + std::to_string(APP_RESOURCE_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(invalid, Get(APP_RESOURCE_TYPE_LAYOUT, "edje/../../com.quorvex.weather-m/res/secret.edj"));
    EXPECT_EQ(invalid, Get(APP_RESOURCE_TYPE_LAYOUT, "/etc/passwd"));
    EXPECT_EQ(invalid, Get(APP_RESOURCE_TYPE_LAYOUT, "edje/"));
    EXPECT_EQ(invalid, Get(APP_RESOURCE_TYPE_LAYOUT, nullptr));
    EXPECT_EQ(invalid, Get(static_cast<app_resource_e>(7), "edje/a.edj"));
    EXPECT_EQ(APP_RESOURCE_ERROR_INVALID_PARAMETER,
              app_resource_manager_get(APP_RESOURCE_TYPE_LAYOUT, "edje/a.edj", nullptr));
}

TEST_F(AppResourceManagerTest, ProcessWithoutApplicationIdHasNoResources)
{
    unsetenv("PLATFORM_APP_ID");
    EXPECT_EQ("error " + std::to_string(APP_RESOURCE_ERROR_IO_ERROR),
              Get(APP_RESOURCE_TYPE_LAYOUT, "edje/a.edj"));
    EXPECT_TRUE(mLog.Contains("no resource folder", "RESOURCE_MANAGER"));
}

}  // namespace

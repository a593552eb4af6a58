#include <app_common.h>
#include <app_manager.h>

#include <gtest/gtest.h>

#include <unistd.h>

#include <cstdlib>
#include <string>

#include "TestPlatform.h"

namespace
{
using WeatherTest::PlatformTest;

class AppPathsTest : public PlatformTest
{
protected:
    static std::string Take(char* path)
    {
        std::string copy = path ? path : "";
        free(path);
        return copy;
    }
};

TEST_F(AppPathsTest, SharedPathsOfRegisteredApp)
{
    char* path = nullptr;
    ASSERT_EQ(app_manager_get_shared_data_path("com.quorvex.weather-m", &path), APP_MANAGER_ERROR_NONE);
    EXPECT_EQ(Take(path), mRoot.Path("apps/com.quorvex.weather-m/shared/data/"));
    ASSERT_EQ(app_manager_get_shared_resource_path("com.quorvex.weather-m", &path), APP_MANAGER_ERROR_NONE);
    EXPECT_EQ(Take(path), mRoot.Path("apps/com.quorvex.weather-m/shared/res/"));
}

TEST_F(AppPathsTest, UnknownOrUnsafeIdsFail)
{
    char* path = reinterpret_cast<char*>(0x1);
    EXPECT_EQ(app_manager_get_shared_data_path("no.such.app", &path), APP_MANAGER_ERROR_NO_SUCH_APP);
    EXPECT_EQ(path, nullptr);
    EXPECT_EQ(app_manager_get_shared_data_path("../etc", &path), APP_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_manager_get_shared_data_path("", &path), APP_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_manager_get_shared_data_path(nullptr, &path), APP_MANAGER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_manager_get_shared_resource_path("com.quorvex.weather-m", nullptr),
              APP_MANAGER_ERROR_INVALID_PARAMETER);
    // A linked application folder could send our data anywhere.
    ASSERT_EQ(
        symlink(mRoot.Path("apps/com.quorvex.weather-m").c_str(), mRoot.Path("apps/test.linked").c_str()), 0);
    EXPECT_EQ(app_manager_get_shared_data_path("test.linked", &path), APP_MANAGER_ERROR_NO_SUCH_APP);
}

TEST_F(AppPathsTest, ResourcePathFollowsOwnId)
{
    setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-widget", 1);
    EXPECT_EQ(Take(app_get_resource_path()), mRoot.Path("apps/com.quorvex.weather-m-widget/res/"));
    char* id = nullptr;
    ASSERT_EQ(app_get_id(&id), APP_ERROR_NONE);
    EXPECT_EQ(Take(id), "com.quorvex.weather-m-widget");
    unsetenv("PLATFORM_APP_ID");
}
}  // namespace

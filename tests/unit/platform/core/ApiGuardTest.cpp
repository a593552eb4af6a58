#include <gtest/gtest.h>

#include <stdexcept>

#include "TestPlatform.h"
#include "core/ApiGuard.h"

namespace
{

class ApiGuardTest : public WeatherTest::PlatformTest
{
};

// A C caller must never see an exception; what went wrong is logged under
// the callback's own tag.
TEST_F(ApiGuardTest, CallbackProblemsStayOnThisSideAndAreLogged)
{
    int object = 1;
    auto fails = [](int&) -> int { throw std::runtime_error("disk gone"); };
    EXPECT_EQ(-1, NSWeather::ForwardCallback<int>(&object, fails, PLATFORM_CALLBACK_SITE("TEST_TAG"), -1));
    EXPECT_TRUE(mLog.Contains("exception caught: disk gone", "TEST_TAG")) << mLog.Dump();
    EXPECT_EQ(-1, NSWeather::ForwardCallback<int>(nullptr, fails, PLATFORM_CALLBACK_SITE("TEST_TAG"), -1));
    EXPECT_TRUE(mLog.Contains("callback without its object", "TEST_TAG")) << mLog.Dump();
}

}  // namespace

#include "Location.h"

#include <vconf.h>

#include <gtest/gtest.h>

#include <string>

#include "TestPlatform.h"

namespace
{
using NSWeather::Location;

class LocationTest : public WeatherTest::PlatformTest
{
};

TEST_F(LocationTest, FollowsTheUseMyLocationSetting)
{
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, 1), VCONF_OK);
    // GPS alone does not count: the combined method is what is asked.
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_ENABLED, 0), VCONF_OK);
    EXPECT_TRUE(Location().IsLocationEnabled());
    EXPECT_TRUE(mLog.Contains("enabled : 1", "weather-common"));
}

TEST_F(LocationTest, SwitchedOffIsFalseAndLogged)
{
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, 0), VCONF_OK);
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_ENABLED, 1), VCONF_OK);
    EXPECT_FALSE(Location().IsLocationEnabled());
    EXPECT_TRUE(mLog.Contains("enabled : 0", "weather-common")) << mLog.Dump();
    EXPECT_FALSE(mLog.Contains("location_manager_is_enabled_method failed"));
}

TEST_F(LocationTest, FailedQueryIsFalseWithTheCode)
{
    Location location;
    EXPECT_FALSE(location.IsLocationEnabled());
    std::string code = std::to_string(static_cast<int>(LOCATIONS_ERROR_SERVICE_NOT_AVAILABLE));
    EXPECT_TRUE(mLog.Contains("location_manager_is_enabled_method failed(" + code, "weather-common")) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("enabled : 0", "weather-common"));
}

}  // namespace

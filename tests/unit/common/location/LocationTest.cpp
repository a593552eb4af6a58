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

// The combined method is what is asked: the GPS key alone does not count.
TEST_F(LocationTest, FollowsTheUseMyLocationSetting)
{
    for (int useMyLocation : {1, 0})
    {
        mLog.Clear();
        ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, useMyLocation), VCONF_OK);
        ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_ENABLED, 1 - useMyLocation), VCONF_OK);
        EXPECT_EQ(Location().IsLocationEnabled(), useMyLocation == 1);
        EXPECT_TRUE(mLog.Contains("enabled : " + std::to_string(useMyLocation), "weather-common"))
            << mLog.Dump();
        EXPECT_FALSE(mLog.Contains("location_manager_is_enabled_method failed"));
    }
}

TEST_F(LocationTest, FailedQueryIsFalseWithTheCode)
{
    Location location;
    EXPECT_FALSE(location.IsLocationEnabled());
    std::string code = std::to_string(static_cast<int>(LOCATIONS_ERROR_SERVICE_NOT_AVAILABLE));
    EXPECT_TRUE(mLog.Contains("location_manager_is_enabled_method failed(" + code, "weather-common"))
        << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("enabled : 0", "weather-common"));
}

}  // namespace

#include <locations.h>
#include <vconf.h>

#include <gtest/gtest.h>

#include "TestPlatform.h"

namespace
{
using WeatherTest::PlatformTest;

class LocationManagerTest : public PlatformTest
{
};

TEST_F(LocationManagerTest, EachMethodReadsItsOwnSettingKey)
{
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, 1), VCONF_OK);
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_ENABLED, 0), VCONF_OK);
    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_NETWORK_ENABLED, 3), VCONF_OK);
    bool enabled = false;
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_HYBRID, &enabled), LOCATIONS_ERROR_NONE);
    EXPECT_TRUE(enabled);
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_GPS, &enabled), LOCATIONS_ERROR_NONE);
    EXPECT_FALSE(enabled);
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_WPS, &enabled), LOCATIONS_ERROR_NONE);
    EXPECT_TRUE(enabled);

    ASSERT_EQ(vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, 0), VCONF_OK);
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_HYBRID, &enabled), LOCATIONS_ERROR_NONE);
    EXPECT_FALSE(enabled);
}

TEST_F(LocationManagerTest, UnreadableSettingIsAFailureNotAnAnswer)
{
    bool enabled = true;
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_HYBRID, &enabled),
              LOCATIONS_ERROR_SERVICE_NOT_AVAILABLE);
    ASSERT_EQ(vconf_set_str(VCONFKEY_LOCATION_USE_MY_LOCATION, "on"), VCONF_OK);
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_HYBRID, &enabled),
              LOCATIONS_ERROR_SERVICE_NOT_AVAILABLE);
    EXPECT_TRUE(enabled);
    EXPECT_TRUE(mLog.Contains(VCONFKEY_LOCATION_USE_MY_LOCATION, "LOCATION_MANAGER")) << mLog.Dump();
}

TEST_F(LocationManagerTest, BadMethodsAndHandlesAreRefused)
{
    bool enabled = false;
    vconf_set_int(VCONFKEY_LOCATION_USE_MY_LOCATION, 1);
    EXPECT_EQ(location_manager_is_enabled_method(LOCATIONS_METHOD_NONE, &enabled),
              LOCATIONS_ERROR_INCORRECT_METHOD);
    EXPECT_EQ(location_manager_is_enabled_method(static_cast<location_method_e>(3), &enabled),
              LOCATIONS_ERROR_INCORRECT_METHOD);
    location_manager_h manager = nullptr;
    ASSERT_EQ(location_manager_create(LOCATIONS_METHOD_HYBRID, &manager), LOCATIONS_ERROR_NONE);
    ASSERT_NE(manager, nullptr);
    EXPECT_EQ(location_manager_destroy(manager), LOCATIONS_ERROR_NONE);
    EXPECT_EQ(location_manager_destroy(manager), LOCATIONS_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(location_manager_create(LOCATIONS_METHOD_NONE, &manager), LOCATIONS_ERROR_INCORRECT_METHOD);
}

}  // namespace

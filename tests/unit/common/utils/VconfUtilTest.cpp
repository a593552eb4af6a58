#include "VconfUtil.h"

#include <vconf.h>

#include <gtest/gtest.h>

#include "TestPlatform.h"

namespace
{
using NSWeather::VconfUtil;

class VconfUtilTest : public WeatherTest::PlatformTest
{
};

TEST_F(VconfUtilTest, StoredClockSettingOrTwelveHoursWithALinePerFailedRead)
{
    ASSERT_EQ(vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, VCONFKEY_TIME_FORMAT_24), VCONF_OK);
    EXPECT_EQ(VconfUtil::GetRegionFormatTime1224(), 2);
    EXPECT_EQ(mLog.Count("vconf_get_int", "weather-common"), 0);

    ASSERT_EQ(vconf_set_str(VCONFKEY_REGIONFORMAT_TIME1224, "24"), VCONF_OK);
    EXPECT_EQ(VconfUtil::GetRegionFormatTime1224(), 1);
    EXPECT_EQ(VconfUtil::GetRegionFormatTime1224(), 1);
    EXPECT_EQ(mLog.Count("vconf_get_int  failed(-1)", "weather-common"), 2) << mLog.Dump();
}

}  // namespace

#include "TimeUtil.h"

#include <Ecore.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>
#include <vector>

#include "ContentProvider.h"
#include "ICUUtil.h"
#include "MainLoop.h"
#include "TimeEnvironment.h"

namespace
{
using NSWeather::City;
using NSWeather::CityPtr;
using NSWeather::ICUUtil;
using NSWeather::TimeUtil;
using WeatherTest::kJuly14;

const time_t kHour = 3600;

CityPtr MakeCity(double gmtOffset, bool isSummerTime = false)
{
    CityPtr city = std::make_shared<City>();
    city->SetGmtOffset(gmtOffset);
    city->SetIsSummerTime(isSummerTime);
    return city;
}

class TimeUtilTest : public WeatherTest::TimeTest
{
protected:
    // The city's long text next to the text of now shifted by `shift`,
    // read within one minute so that both show the same clock.
    void ExpectLongTextShiftedBy(const CityPtr& city, int provider, time_t shift, int index)
    {
        for (int attempt = 0; attempt < 3; ++attempt)
        {
            time_t before = time(nullptr);
            std::string actual = TimeUtil::GetLocalTimeStringLong(city, provider);
            std::string expected = ICUUtil::GetDateTimeString(before + shift, index);
            if (time(nullptr) / 60 != before / 60)
                continue;
            EXPECT_FALSE(actual.empty());
            EXPECT_EQ(actual, expected);
            return;
        }
        FAIL() << "the clock kept crossing minutes";
    }
};

TEST_F(TimeUtilTest, CityTimeShiftsByTheDifferenceOfOffsets)
{
    EXPECT_EQ(TimeUtil::GetCityTime(kJuly14, 5.75), kJuly14 + 5 * kHour + 45 * 60);
    mTz.Set("<+01>-1");
    EXPECT_EQ(TimeUtil::GetCityTime(kJuly14, -3.5), kJuly14 - 4 * kHour - 30 * 60);
}

// Offsets and times a damaged weather database can hold.
TEST_F(TimeUtilTest, OffsetsOfNoPlaceAndTimesAtTheLimitsAreTakenSafely)
{
    vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, VCONFKEY_TIME_FORMAT_24);
    const double kHuge = 1e300;
    for (double offset : {std::nan(""), HUGE_VAL, -HUGE_VAL, kHuge, -kHuge, 24.5})
    {
        EXPECT_EQ(TimeUtil::GetCityTime(kJuly14, offset), kJuly14) << offset;
        ExpectLongTextShiftedBy(MakeCity(offset), NSWeather::CP_ACCUWEATHER, 0,
                                ICUUtil::SKELETON_EEEdMMM_HHmm);
    }
    const time_t kMax = std::numeric_limits<time_t>::max();
    EXPECT_EQ(TimeUtil::GetCityTime(kMax, 1.0), kMax);
    EXPECT_EQ(TimeUtil::GetCityTime(std::numeric_limits<time_t>::min(), -1.0),
              std::numeric_limits<time_t>::min());
}

TEST_F(TimeUtilTest, LocalTimeOfACityAtFiveAndThreeQuarterHours)
{
    vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, VCONFKEY_TIME_FORMAT_24);
    const time_t shift = 5 * kHour + 45 * 60;
    ExpectLongTextShiftedBy(MakeCity(5.75), NSWeather::CP_ACCUWEATHER, shift, ICUUtil::SKELETON_EEEdMMM_HHmm);
    ExpectLongTextShiftedBy(MakeCity(5.75), NSWeather::CP_KWEATHER, shift, ICUUtil::SKELETON_EEEdMMM_HHmm);
    // Summer time adds an hour for every provider but the default one.
    ExpectLongTextShiftedBy(MakeCity(5.75, true), NSWeather::CP_KWEATHER, shift + kHour,
                            ICUUtil::SKELETON_EEEdMMM_HHmm);
    ExpectLongTextShiftedBy(MakeCity(5.75, true), NSWeather::CP_ACCUWEATHER, shift,
                            ICUUtil::SKELETON_EEEdMMM_HHmm);
}

TEST_F(TimeUtilTest, LocalTimeFollowsTheClockSetting)
{
    vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, VCONFKEY_TIME_FORMAT_12);
    ExpectLongTextShiftedBy(MakeCity(0.0), NSWeather::CP_ACCUWEATHER, 0, ICUUtil::SKELETON_EEEdMMM_hhmm);
    vconf_set_int(VCONFKEY_REGIONFORMAT_TIME1224, VCONFKEY_TIME_FORMAT_24);
    ExpectLongTextShiftedBy(MakeCity(0.0), NSWeather::CP_ACCUWEATHER, 0, ICUUtil::SKELETON_EEEdMMM_HHmm);
    // A device away from UTC still shows the city's own clock.
    mTz.Set("<+09>-9");
    ExpectLongTextShiftedBy(MakeCity(2.0), NSWeather::CP_ACCUWEATHER, -7 * kHour,
                            ICUUtil::SKELETON_EEEdMMM_HHmm);
}

TEST_F(TimeUtilTest, MissingCityGivesEmptyTextAndNight)
{
    EXPECT_EQ(TimeUtil::GetLocalTimeStringLong(CityPtr(), NSWeather::CP_ACCUWEATHER), "");
    EXPECT_FALSE(TimeUtil::GetIsDay(CityPtr(), kJuly14));
    EXPECT_EQ(mLog.Count("(!cityPtr) [return]", "weather-common"), 2) << mLog.Dump();

    CityPtr city = MakeCity(0.0);
    city->SetExtraPtr(nullptr);
    EXPECT_FALSE(TimeUtil::GetIsDay(city, kJuly14 + 12 * kHour));
    EXPECT_TRUE(mLog.Contains("(!extraPtr) [return]", "weather-common")) << mLog.Dump();
}

TEST_F(TimeUtilTest, DayStartsAtSunriseAndEndsAtSunset)
{
    CityPtr city = MakeCity(0.0);
    city->GetExtraPtr()->SetSunriseTime(kJuly14 + 6 * kHour);
    city->GetExtraPtr()->SetSunsetTime(kJuly14 + 18 * kHour + 30 * 60);
    EXPECT_TRUE(TimeUtil::GetIsDay(city, kJuly14 + 6 * kHour));
    EXPECT_FALSE(TimeUtil::GetIsDay(city, kJuly14 + 18 * kHour + 30 * 60));
    EXPECT_FALSE(TimeUtil::GetIsDay(city, kJuly14 + 5 * kHour + 59 * 60));
    EXPECT_TRUE(TimeUtil::GetIsDay(city, kJuly14 + 18 * kHour + 29 * 60));
    // Only the clock counts: another day's sunrise and sunset serve as well.
    EXPECT_TRUE(TimeUtil::GetIsDay(city, kJuly14 + 3 * 24 * kHour + 12 * kHour));
}

TEST_F(TimeUtilTest, DayIsJudgedOnTheCitysClockWhereverTheDeviceIs)
{
    // Seoul (UTC+9): sunrise 05:30 and sunset 19:50 local.
    CityPtr seoul = MakeCity(9.0);
    seoul->GetExtraPtr()->SetSunriseTime(kJuly14 - 9 * kHour + 5 * kHour + 30 * 60);
    seoul->GetExtraPtr()->SetSunsetTime(kJuly14 - 9 * kHour + 19 * kHour + 50 * 60);
    time_t seoulNoon = kJuly14 + 3 * kHour;
    time_t seoulMidnight = kJuly14 + 15 * kHour;
    for (const char* deviceZone : {"UTC", "<-05>5", "<+0530>-5:30"})
    {
        SCOPED_TRACE(deviceZone);
        mTz.Set(deviceZone);
        EXPECT_TRUE(TimeUtil::GetIsDay(seoul, seoulNoon));
        EXPECT_FALSE(TimeUtil::GetIsDay(seoul, seoulMidnight));
    }
}

void KeyChangedCb(keynode_t* node, void* data)
{
    static_cast<std::vector<std::string>*>(data)->push_back(vconf_keynode_get_name(node));
}

TEST_F(TimeUtilTest, EachTimeKeyChangeReachesItsCallback)
{
    ecore_init();
    std::vector<std::string> keys;
    ASSERT_EQ(TimeUtil::RegisterSystemTimeChangedCb(KeyChangedCb, &keys), VCONF_OK);
    ASSERT_EQ(TimeUtil::RegisterTimezoneIdChangedCb(KeyChangedCb, &keys), VCONF_OK);
    ASSERT_EQ(TimeUtil::RegisterDateFormatChangedCb(KeyChangedCb, &keys), VCONF_OK);
    ASSERT_EQ(TimeUtil::RegisterRegionFormatTime1224ChangedCb(KeyChangedCb, &keys), VCONF_OK);
    const std::vector<std::string> kKeys = {VCONFKEY_REGIONFORMAT_TIME1224, VCONFKEY_SETAPPL_DATE_FORMAT_INT,
                                            VCONFKEY_SETAPPL_TIMEZONE_ID, VCONFKEY_SYSTEM_TIME_CHANGED};
    for (const std::string& key : kKeys) vconf_set_int(key.c_str(), 2);
    EXPECT_TRUE(WeatherTest::RunLoopUntil([&] { return keys.size() == 4; }, 5.0));
    std::sort(keys.begin(), keys.end());
    EXPECT_EQ(keys, kKeys);

    EXPECT_EQ(TimeUtil::UnregisterSystemTimeChangedCb(KeyChangedCb), VCONF_OK);
    EXPECT_EQ(TimeUtil::UnregisterTimezoneIdChangedCb(KeyChangedCb), VCONF_OK);
    EXPECT_EQ(TimeUtil::UnregisterDateFormatChangedCb(KeyChangedCb), VCONF_OK);
    EXPECT_EQ(TimeUtil::UnregisterRegionFormatTime1224ChangedCb(KeyChangedCb), VCONF_OK);
    vconf_set_str(VCONFKEY_SETAPPL_TIMEZONE_ID, "Europe/Paris");
    WeatherTest::RunLoopFor(0.2);
    EXPECT_EQ(keys.size(), 4u);
    ecore_shutdown();
}

}  // namespace

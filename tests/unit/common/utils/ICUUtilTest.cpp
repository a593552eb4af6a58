#include "ICUUtil.h"

#include <utils_i18n.h>

#include <gtest/gtest.h>

#include <string>

#include "TimeEnvironment.h"

namespace
{
using NSWeather::ICUUtil;
using WeatherTest::kJuly14;

class ICUUtilTest : public WeatherTest::TimeTest
{
};

TEST_F(ICUUtilTest, TextsAreInTheDeviceOffsetNamedAsGmtZone)
{
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(5 * 3600 + 30 * 60), "GMT+5:30");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(-(3 * 3600 + 30 * 60)), "GMT-3:30");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(0), "GMT+0:00");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(-(12 * 3600 + 45 * 60)), "GMT-12:45");
    const struct
    {
        const char* tz;
        int offset;
        const char* clock;
    } kDevices[] = {{"<+0530>-5:30", 19800, "05:30"}, {"<-0330>3:30", -12600, "20:30"}, {"UTC", 0, "00:00"}};
    for (const auto& device : kDevices)
    {
        mTz.Set(device.tz);
        EXPECT_EQ(ICUUtil::GetTmGmtOff(), device.offset);
        EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM), device.clock);
    }
}

TEST_F(ICUUtilTest, TwelveAndTwentyFourHourClocks)
{
    time_t afternoon = kJuly14 + 13 * 3600 + 5 * 60;
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_HHMM), "13:05");
    // ICU puts a narrow no-break space before the day period.
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_hhmm), "1:05\xE2\x80\xAFPM");
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_EEEdMMM_HHmm), "Tue, Jul 14, 13:05");
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_EEE), "Tue");
    mLcTime.Set("ko_KR.UTF-8");
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_hhmm), "\xEC\x98\xA4\xED\x9B\x84 1:05");
}

TEST_F(ICUUtilTest, MonthAndDayHasFixedPatternsForKoreanAndLao)
{
    const std::pair<const char*, const char*> kCases[] = {{"ko_KR.UTF-8", "07/14"},
                                                          {"lo_LA.UTF-8", "14/07"},
                                                          {"en_US.UTF-8", "07/14"},
                                                          {"de_DE.UTF-8", "14.07."}};
    for (const auto& item : kCases)
    {
        mLcTime.Set(item.first);
        EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_MMdd), item.second) << item.first;
    }
    // The fixed patterns belong to that one skeleton only.
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM), "00:00");
}

TEST_F(ICUUtilTest, LocaleTextWithoutEncoding)
{
    ASSERT_EQ(i18n_ulocale_set_default("ko_KR.UTF-8"), I18N_ERROR_NONE);
    EXPECT_EQ(ICUUtil::GetLocaleStr(), "ko_KR");
    // Formatting switches to the region format's locale.
    mLcTime.Set("lo_LA.UTF-8");
    ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM);
    EXPECT_EQ(ICUUtil::GetLocaleStr(), "lo_LA");
    EXPECT_FALSE(mLog.Contains("token == NULL"));
}

TEST_F(ICUUtilTest, IndexOutsideTheTableGivesEmptyText)
{
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, -1), "");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_COUNT), "");
    EXPECT_EQ(mLog.Count("[return]", "weather-common"), 2) << mLog.Dump();
    EXPECT_EQ(ICUUtil::GetSkeleton(25), "MMMdd hhmm");
}

// The cached patterns and formatters never outlive the locale or zone
// they were made for: each switch, back and forth, gives that setting's text.
TEST_F(ICUUtilTest, CachedFormatsFollowLocaleAndZoneChanges)
{
    const struct
    {
        const char* lcTime;
        const char* tz;
        int skeleton;
        const char* text;
    } kSteps[] = {
        {"en_US.UTF-8", "UTC", ICUUtil::SKELETON_hhmm,
         "12:00\xE2\x80\xAF"
         "AM"},
        {"ko_KR.UTF-8", "UTC", ICUUtil::SKELETON_hhmm, "\xEC\x98\xA4\xEC\xA0\x84 12:00"},
        {"ko_KR.UTF-8", "<+0530>-5:30", ICUUtil::SKELETON_hhmm, "\xEC\x98\xA4\xEC\xA0\x84 5:30"},
        {"ko_KR.UTF-8", "<+0530>-5:30", ICUUtil::SKELETON_HHMM, "05:30"},
        {"en_US.UTF-8", "UTC", ICUUtil::SKELETON_hhmm,
         "12:00\xE2\x80\xAF"
         "AM"},
        {"de_DE.UTF-8", "UTC", ICUUtil::SKELETON_MMdd, "14.07."},
    };
    for (bool cleared : {false, true})
    {
        for (const auto& step : kSteps)
        {
            mLcTime.Set(step.lcTime);
            mTz.Set(step.tz);
            EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, step.skeleton), step.text)
                << step.lcTime << " " << step.tz << (cleared ? " after ClearCache" : "");
        }
        ICUUtil::ClearCache();
    }
}

}  // namespace

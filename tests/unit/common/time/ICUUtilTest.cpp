#include "ICUUtil.h"

#include <utils_i18n.h>

#include <gtest/gtest.h>

#include <string>

#include "TimeEnvironment.h"

namespace
{
using NSWeather::ICUUtil;
using WeatherTest::kJuly14;

// ICU puts a narrow no-break space before the day period in English.
const std::string kNnbsp = "\xE2\x80\xAF";

class ICUUtilTest : public WeatherTest::TimeTest
{
};

TEST_F(ICUUtilTest, ZoneIdentifierOfAnOffset)
{
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(5 * 3600 + 30 * 60), "GMT+5:30");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(-(3 * 3600 + 30 * 60)), "GMT-3:30");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(0), "GMT+0:00");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(9 * 3600), "GMT+9:00");
    EXPECT_EQ(ICUUtil::MakeTimeZoneId(-(12 * 3600 + 45 * 60)), "GMT-12:45");
}

TEST_F(ICUUtilTest, TextsFollowTheDeviceOffset)
{
    mTz.Set("<+0530>-5:30");
    EXPECT_EQ(ICUUtil::GetTmGmtOff(), 19800);
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM), "05:30");
    mTz.Set("<-0330>3:30");
    EXPECT_EQ(ICUUtil::GetTmGmtOff(), -12600);
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM), "20:30");
    mTz.Set("UTC");
    EXPECT_EQ(ICUUtil::GetTmGmtOff(), 0);
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM), "00:00");
}

TEST_F(ICUUtilTest, TwelveAndTwentyFourHourClocks)
{
    time_t afternoon = kJuly14 + 13 * 3600 + 5 * 60;
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_HHMM), "13:05");
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_hhmm), "1:05" + kNnbsp + "PM");
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_EEEdMMM_HHmm), "Tue, Jul 14, 13:05");
    mLcTime.Set("ko_KR.UTF-8");
    // "오후 1:05"
    EXPECT_EQ(ICUUtil::GetDateTimeString(afternoon, ICUUtil::SKELETON_hhmm), "\xEC\x98\xA4\xED\x9B\x84 1:05");
}

TEST_F(ICUUtilTest, MonthAndDayHasFixedPatternsForKoreanAndLao)
{
    mLcTime.Set("ko_KR.UTF-8");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_MMdd), "07/14");
    mLcTime.Set("lo_LA.UTF-8");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_MMdd), "14/07");
    mLcTime.Set("en_US.UTF-8");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_MMdd), "07/14");
    // Other locales take the generator's pattern.
    mLcTime.Set("de_DE.UTF-8");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_MMdd), "14.07.");
    // The fixed patterns belong to that one skeleton only.
    mLcTime.Set("ko_KR.UTF-8");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM), "00:00");
}

TEST_F(ICUUtilTest, WeekdayName)
{
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_EEE), "Tue");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14 + 86400, ICUUtil::SKELETON_EEE), "Wed");
}

TEST_F(ICUUtilTest, IndexOutsideTheTableGivesEmptyText)
{
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, -1), "");
    EXPECT_EQ(ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_COUNT), "");
    EXPECT_EQ(mLog.Count("[return]", "weather-common"), 2) << mLog.Dump();
    EXPECT_EQ(ICUUtil::GetSkeleton(ICUUtil::SKELETON_EEEdMMM_hhmm), "EEEdMMM hhmm");
    EXPECT_EQ(ICUUtil::GetSkeleton(25), "MMMdd hhmm");
    EXPECT_EQ(ICUUtil::GetSkeleton(26), "");
}

TEST_F(ICUUtilTest, LocaleTextWithoutEncoding)
{
    ASSERT_EQ(i18n_ulocale_set_default("ko_KR.UTF-8"), I18N_ERROR_NONE);
    EXPECT_EQ(ICUUtil::GetLocaleStr(), "ko_KR");
    ASSERT_EQ(i18n_ulocale_set_default("en_GB"), I18N_ERROR_NONE);
    EXPECT_EQ(ICUUtil::GetLocaleStr(), "en_GB");
    EXPECT_FALSE(mLog.Contains("token == NULL"));
    // The region format's locale wins over whatever was set before.
    mLcTime.Set("lo_LA.UTF-8");
    ICUUtil::GetDateTimeString(kJuly14, ICUUtil::SKELETON_HHMM);
    EXPECT_EQ(ICUUtil::GetLocaleStr(), "lo_LA");
}

}  // namespace

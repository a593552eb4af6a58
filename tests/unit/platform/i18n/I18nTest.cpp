#include <utils_i18n.h>

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <string>

#include <unicode/timezone.h>
#include <unicode/uloc.h>

#include "i18n/I18nError.h"

namespace
{

std::u16string ToU16(const char* text)
{
    i18n_uchar buffer[128] = {0};
    i18n_ustring_copy_ua_n(buffer, text, 127);
    return std::u16string(reinterpret_cast<const char16_t*>(buffer));
}

const i18n_uchar* U(const std::u16string& text)
{
    return reinterpret_cast<const i18n_uchar*>(text.c_str());
}

std::string ToUtf8(const i18n_uchar* text)
{
    char buffer[256] = {0};
    i18n_ustring_copy_au_n(buffer, text, 255);
    return buffer;
}

std::string Format(const char* zone, const char* pattern, double millis)
{
    std::u16string zoneText = zone ? ToU16(zone) : std::u16string();
    std::u16string patternText = ToU16(pattern);
    i18n_udate_format_h format = nullptr;
    int ret = i18n_udate_create(I18N_UDATE_PATTERN, I18N_UDATE_PATTERN, "en_US", zone ? U(zoneText) : nullptr,
                                -1, U(patternText), -1, &format);
    if (ret != I18N_ERROR_NONE)
        return "create failed " + std::to_string(ret);
    i18n_uchar result[64] = {0};
    int32_t needed = 0;
    ret = i18n_udate_format_date(format, millis, result, 64, nullptr, &needed);
    i18n_udate_destroy(format);
    return ret == I18N_ERROR_NONE ? ToUtf8(result) : "format failed " + std::to_string(ret);
}

class I18nTest : public ::testing::Test
{
protected:
    void SetUp() override { mZone.reset(icu::TimeZone::createDefault()); }
    void TearDown() override
    {
        uloc_setDefault(mLocale.c_str(), &mStatus);
        icu::TimeZone::setDefault(*mZone);
    }
    std::string mLocale = uloc_getDefault();
    UErrorCode mStatus = U_ZERO_ERROR;
    std::unique_ptr<icu::TimeZone> mZone;
};

TEST(I18nStringTest, CopiesAreUtf8AndBoundedByN)
{
    const char* korean = "\xEC\x98\xA4\xED\x9B\x84 5:30";  // "오후 5:30"
    EXPECT_EQ(ToU16(korean), u"\uc624\ud6c4 5:30");
    EXPECT_EQ(ToUtf8(U(ToU16(korean))), korean);

    i18n_uchar wide[4] = {0xFFFF, 0xFFFF, 0xFFFF, 0xFFFF};
    ASSERT_EQ(i18n_ustring_copy_ua_n(wide, "GMT+5:30", 3), wide);
    EXPECT_EQ(wide[2], 'T');
    EXPECT_EQ(wide[3], 0xFFFF);
    char narrow[4] = {'x', 'x', 'x', 'x'};
    ASSERT_EQ(i18n_ustring_copy_au_n(narrow, U(u"abcde"), 2), narrow);
    EXPECT_EQ(std::string(narrow, 4), "abxx");

    EXPECT_EQ(i18n_ustring_copy_ua_n(nullptr, "a", 4), nullptr);
    EXPECT_EQ(get_last_result(), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_ustring_copy_au_n(narrow, wide, -1), nullptr);
}

TEST_F(I18nTest, BestPatternFollowsTheLocaleAndReportsOverflow)
{
    for (const auto& item : {std::make_pair("en_US", "MM/dd"), std::make_pair("ko_KR", "MM. dd.")})
    {
        i18n_udatepg_h generator = nullptr;
        ASSERT_EQ(i18n_udatepg_create(item.first, &generator), I18N_ERROR_NONE);
        i18n_uchar pattern[64] = {0};
        int32_t length = 0;
        EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, U(u"MMdd"), -1, pattern, 64, &length),
                  I18N_ERROR_NONE);
        EXPECT_EQ(ToUtf8(pattern), item.second);
        EXPECT_EQ(length, static_cast<int32_t>(strlen(item.second)));
        EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, U(u"MMdd"), -1, pattern, 2, &length),
                  I18N_ERROR_BUFFER_OVERFLOW);
        EXPECT_EQ(length, static_cast<int32_t>(strlen(item.second)));
        EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, nullptr, -1, pattern, 4, &length),
                  I18N_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(i18n_udatepg_destroy(generator), I18N_ERROR_NONE);
    }
    EXPECT_EQ(i18n_udatepg_destroy(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

TEST_F(I18nTest, FormatsInTheGivenZoneOrTheDefaultOne)
{
    EXPECT_EQ(Format("GMT+5:30", "HH:mm", 0.0), "05:30");
    EXPECT_EQ(Format("GMT-3:30", "HH:mm", 0.0), "20:30");
    EXPECT_EQ(Format("GMT+0:00", "EEE d MMM HH:mm", 86400000.0), "Fri 2 Jan 00:00");
    i18n_timezone_h zone = nullptr;
    ASSERT_EQ(i18n_timezone_create(&zone, "Asia/Seoul"), I18N_ERROR_NONE);
    ASSERT_EQ(i18n_timezone_set_default(zone), I18N_ERROR_NONE);
    // The default is a copy: the handle may go.
    EXPECT_EQ(i18n_timezone_destroy(zone), I18N_ERROR_NONE);
    EXPECT_EQ(Format(nullptr, "HH:mm", 0.0), "09:00");
    EXPECT_EQ(i18n_timezone_create(nullptr, "Asia/Seoul"), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_timezone_set_default(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

TEST_F(I18nTest, FormatChecksItsArgumentsAndBuffer)
{
    i18n_udate_format_h format = nullptr;
    EXPECT_EQ(
        i18n_udate_create(I18N_UDATE_SHORT, I18N_UDATE_NONE, "en_US", nullptr, -2, nullptr, -1, &format),
        I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(format, nullptr);
    ASSERT_EQ(
        i18n_udate_create(I18N_UDATE_SHORT, I18N_UDATE_NONE, "en_US", nullptr, -1, nullptr, -1, &format),
        I18N_ERROR_NONE);
    i18n_uchar result[2];
    int32_t needed = 0;
    EXPECT_EQ(i18n_udate_format_date(format, 0.0, result, 2, nullptr, nullptr), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_udate_format_date(format, 0.0, result, 2, nullptr, &needed), I18N_ERROR_BUFFER_OVERFLOW);
    EXPECT_GT(needed, 2);
    EXPECT_EQ(i18n_udate_destroy(format), I18N_ERROR_NONE);
    EXPECT_EQ(i18n_udate_destroy(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

}  // namespace

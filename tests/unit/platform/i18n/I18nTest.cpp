#include <utils_i18n.h>

#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include <unicode/timezone.h>
#include <unicode/uloc.h>

#include "i18n/I18nError.h"

namespace
{

std::u16string ToU16(const std::string& text)
{
    i18n_uchar buffer[128] = {0};
    i18n_ustring_copy_ua_n(buffer, text.c_str(), 127);
    return std::u16string(reinterpret_cast<const char16_t*>(buffer));
}

std::string ToUtf8(const i18n_uchar* text)
{
    char buffer[256] = {0};
    i18n_ustring_copy_au_n(buffer, text, 255);
    return buffer;
}

std::string Format(const char* locale, const char* zone, const char* pattern, double millis)
{
    std::u16string zoneText = zone ? ToU16(zone) : std::u16string();
    std::u16string patternText = ToU16(pattern);
    i18n_udate_format_h format = nullptr;
    int ret = i18n_udate_create(I18N_UDATE_PATTERN, I18N_UDATE_PATTERN, locale,
                                zone ? reinterpret_cast<const i18n_uchar*>(zoneText.c_str()) : nullptr, -1,
                                reinterpret_cast<const i18n_uchar*>(patternText.c_str()), -1, &format);
    if (ret != I18N_ERROR_NONE)
        return "create failed " + std::to_string(ret);
    i18n_uchar result[64] = {0};
    int32_t needed = 0;
    ret = i18n_udate_format_date(format, millis, result, 64, nullptr, &needed);
    i18n_udate_destroy(format);
    if (ret != I18N_ERROR_NONE)
        return "format failed " + std::to_string(ret);
    return ToUtf8(result);
}

class RestoreIcuDefaults : public ::testing::Test
{
protected:
    void SetUp() override
    {
        mLocale = uloc_getDefault();
        mZone.reset(icu::TimeZone::createDefault());
    }
    void TearDown() override
    {
        i18n_ulocale_set_default(mLocale.c_str());
        icu::TimeZone::setDefault(*mZone);
    }
    std::string mLocale;
    std::unique_ptr<icu::TimeZone> mZone;
};

using I18nTest = RestoreIcuDefaults;

TEST(I18nErrorTest, IcuStatusMapsOntoPlatformCodes)
{
    using platform::i18n::ErrorOf;
    EXPECT_EQ(ErrorOf(U_ZERO_ERROR), I18N_ERROR_NONE);
    EXPECT_EQ(ErrorOf(U_USING_DEFAULT_WARNING), I18N_ERROR_NONE);
    EXPECT_EQ(ErrorOf(U_STRING_NOT_TERMINATED_WARNING), I18N_WARNING_STRING_NOT_TERMINATED);
    EXPECT_EQ(ErrorOf(U_ILLEGAL_ARGUMENT_ERROR), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(ErrorOf(U_MEMORY_ALLOCATION_ERROR), I18N_ERROR_OUT_OF_MEMORY);
    EXPECT_EQ(ErrorOf(U_BUFFER_OVERFLOW_ERROR), I18N_ERROR_BUFFER_OVERFLOW);
    EXPECT_EQ(ErrorOf(U_MISSING_RESOURCE_ERROR), I18N_ERROR_MISSING_RESOURCE);
    EXPECT_EQ(I18N_ERROR_BUFFER_OVERFLOW, -22020089);
    EXPECT_EQ(static_cast<unsigned>(I18N_ERROR_MISSING_RESOURCE), 0xFEB00001u);
}

TEST(I18nStringTest, CopiesAreUtf8WhateverTheCLocale)
{
    const char* korean = "\xEC\x98\xA4\xED\x9B\x84 5:30";  // "오후 5:30"
    std::u16string wide = ToU16(korean);
    EXPECT_EQ(wide, u"\uc624\ud6c4 5:30");
    EXPECT_EQ(ToUtf8(reinterpret_cast<const i18n_uchar*>(wide.c_str())), korean);
}

TEST(I18nStringTest, CopiesStopAtNAndTerminateOnlyWhenThereIsRoom)
{
    i18n_uchar wide[8];
    std::fill(std::begin(wide), std::end(wide), 0xFFFF);
    ASSERT_EQ(i18n_ustring_copy_ua_n(wide, "GMT+5:30", 3), wide);
    EXPECT_EQ(wide[0], 'G');
    EXPECT_EQ(wide[2], 'T');
    EXPECT_EQ(wide[3], 0xFFFF);
    ASSERT_EQ(i18n_ustring_copy_ua_n(wide, "ab", 8), wide);
    EXPECT_EQ(wide[2], 0);

    char narrow[4];
    memset(narrow, 'x', sizeof(narrow));
    const i18n_uchar source[] = {'a', 'b', 'c', 'd', 'e', 0};
    ASSERT_EQ(i18n_ustring_copy_au_n(narrow, source, 2), narrow);
    EXPECT_EQ(std::string(narrow, 4), "abxx");
}

TEST(I18nStringTest, BadArgumentsGiveNullAndLastResult)
{
    i18n_uchar wide[4];
    char narrow[4];
    EXPECT_EQ(i18n_ustring_copy_ua_n(nullptr, "a", 4), nullptr);
    EXPECT_EQ(get_last_result(), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_ustring_copy_ua_n(wide, nullptr, 4), nullptr);
    EXPECT_EQ(i18n_ustring_copy_au_n(narrow, nullptr, 4), nullptr);
    EXPECT_EQ(i18n_ustring_copy_au_n(narrow, wide, -1), nullptr);
    EXPECT_EQ(get_last_result(), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_NE(i18n_ustring_copy_ua_n(wide, "a", 4), nullptr);
    EXPECT_EQ(get_last_result(), I18N_ERROR_NONE);
}

TEST_F(I18nTest, DefaultLocaleFollowsSetDefault)
{
    ASSERT_EQ(i18n_ulocale_set_default("ko_KR.UTF-8"), I18N_ERROR_NONE);
    const char* locale = nullptr;
    ASSERT_EQ(i18n_ulocale_get_default(&locale), I18N_ERROR_NONE);
    ASSERT_NE(locale, nullptr);
    EXPECT_EQ(std::string(locale).substr(0, 5), "ko_KR");
    EXPECT_EQ(i18n_ulocale_get_default(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

TEST_F(I18nTest, BestPatternFollowsTheLocale)
{
    std::u16string skeleton = ToU16("MMdd");
    for (const auto& item : {std::make_pair("en_US", "MM/dd"), std::make_pair("ko_KR", "MM. dd.")})
    {
        SCOPED_TRACE(item.first);
        i18n_udatepg_h generator = nullptr;
        ASSERT_EQ(i18n_udatepg_create(item.first, &generator), I18N_ERROR_NONE);
        i18n_uchar pattern[64] = {0};
        int32_t length = 0;
        EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, reinterpret_cast<const i18n_uchar*>(skeleton.c_str()),
                                                -1, pattern, 64, &length),
                  I18N_ERROR_NONE);
        EXPECT_EQ(ToUtf8(pattern), item.second);
        EXPECT_EQ(length, static_cast<int32_t>(strlen(item.second)));
        EXPECT_EQ(i18n_udatepg_destroy(generator), I18N_ERROR_NONE);
    }
}

TEST_F(I18nTest, SmallPatternBufferReportsOverflowAndTheNeededLength)
{
    std::u16string skeleton = ToU16("EEEdMMM HHmm");
    i18n_udatepg_h generator = nullptr;
    ASSERT_EQ(i18n_udatepg_create("en_US", &generator), I18N_ERROR_NONE);
    i18n_uchar pattern[4];
    int32_t length = 0;
    EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, reinterpret_cast<const i18n_uchar*>(skeleton.c_str()), -1,
                                            pattern, 4, &length),
              I18N_ERROR_BUFFER_OVERFLOW);
    EXPECT_GT(length, 4);
    EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, nullptr, -1, pattern, 4, &length),
              I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_udatepg_get_best_pattern(generator, pattern, -1, pattern, 4, nullptr),
              I18N_ERROR_INVALID_PARAMETER);
    i18n_udatepg_destroy(generator);
    EXPECT_EQ(i18n_udatepg_destroy(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

TEST_F(I18nTest, FormatsInTheGivenZone)
{
    EXPECT_EQ(Format("en_US", "GMT+5:30", "HH:mm", 0.0), "05:30");
    EXPECT_EQ(Format("en_US", "GMT-3:30", "HH:mm", 0.0), "20:30");
    EXPECT_EQ(Format("en_US", "GMT+0:00", "EEE d MMM HH:mm", 86400000.0), "Fri 2 Jan 00:00");
}

TEST_F(I18nTest, DefaultZoneServesWhenNoneIsGiven)
{
    i18n_timezone_h zone = nullptr;
    ASSERT_EQ(i18n_timezone_create(&zone, "Asia/Seoul"), I18N_ERROR_NONE);
    ASSERT_EQ(i18n_timezone_set_default(zone), I18N_ERROR_NONE);
    // The default is a copy: the handle may go.
    EXPECT_EQ(i18n_timezone_destroy(zone), I18N_ERROR_NONE);
    EXPECT_EQ(Format("en_US", nullptr, "HH:mm", 0.0), "09:00");
    EXPECT_EQ(i18n_timezone_create(nullptr, "Asia/Seoul"), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_timezone_set_default(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

TEST_F(I18nTest, FormatChecksItsArguments)
{
    i18n_udate_format_h format = nullptr;
    EXPECT_EQ(i18n_udate_create(I18N_UDATE_PATTERN, I18N_UDATE_PATTERN, "en_US", nullptr, -1, nullptr, -1, nullptr),
              I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_udate_create(I18N_UDATE_SHORT, I18N_UDATE_NONE, "en_US", nullptr, -2, nullptr, -1, &format),
              I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(format, nullptr);
    ASSERT_EQ(i18n_udate_create(I18N_UDATE_SHORT, I18N_UDATE_NONE, "en_US", nullptr, -1, nullptr, -1, &format),
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

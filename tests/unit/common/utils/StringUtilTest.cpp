#include "StringUtil.h"

#include <gtest/gtest.h>

#include <climits>
#include <locale>

namespace
{
using NSWeather::StringUtil;

TEST(StringUtilTest, PlainDecimalText)
{
    EXPECT_EQ(StringUtil::IntToString(0), "0");
    EXPECT_EQ(StringUtil::IntToString(-3), "-3");
    EXPECT_EQ(StringUtil::IntToString(999), "999");
    EXPECT_EQ(StringUtil::IntToString(INT_MIN), "-2147483648");
    EXPECT_EQ(StringUtil::IntToString(INT_MAX), "2147483647");
}

struct Grouping : std::numpunct<char>
{
    std::string do_grouping() const override { return "\3"; }
    char do_thousands_sep() const override { return ','; }
};

TEST(StringUtilTest, IgnoresGlobalLocale)
{
    std::locale old = std::locale::global(std::locale(std::locale::classic(), new Grouping));
    EXPECT_EQ(StringUtil::IntToString(1830000), "1830000");
    std::locale::global(old);
}
}  // namespace

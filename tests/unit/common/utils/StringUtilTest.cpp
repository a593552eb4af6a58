#include "StringUtil.h"

#include <gtest/gtest.h>

#include <climits>
#include <locale>
#include <string>
#include <utility>

namespace
{
using NSWeather::StringUtil;

struct Grouping : std::numpunct<char>
{
    std::string do_grouping() const override { return "\3"; }
    char do_thousands_sep() const override { return ','; }
};

// A program locale with digit grouping must not reach the texts.
TEST(StringUtilTest, PlainDecimalTextWhateverTheGlobalLocale)
{
    std::locale old = std::locale::global(std::locale(std::locale::classic(), new Grouping));
    const std::pair<int, const char*> cases[] = {
        {0, "0"}, {-3, "-3"}, {1830000, "1830000"}, {INT_MIN, "-2147483648"}, {INT_MAX, "2147483647"}};
    for (const auto& [value, text] : cases) EXPECT_EQ(StringUtil::IntToString(value), text);
    std::locale::global(old);
}
}  // namespace

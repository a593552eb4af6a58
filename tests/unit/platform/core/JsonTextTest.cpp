#include "core/JsonText.h"

#include <gtest/gtest.h>

#include <string>

namespace
{

TEST(JsonTextTest, EveryStringBecomesValidJson)
{
    const std::string r = "\xEF\xBF\xBD";  // U+FFFD, one per bad byte
    const struct
    {
        std::string in;
        std::string out;
    } kCases[] = {
        {"plain \"q\" \\", "plain \\\"q\\\" \\\\"},
        {std::string("nul\0tab\t", 8), "nul\\u0000tab\\u0009"},
        {"Z\xC3\xBCrich \xE2\x82\xAC \xF0\x9F\x8C\xA7", "Z\xC3\xBCrich \xE2\x82\xAC \xF0\x9F\x8C\xA7"},
        {"a\xFF!", "a" + r + "!"},            // never valid
        {"\xC3", r},                          // cut short
        {"\xC0\xAF", r + r},                  // overlong
        {"\xED\xA0\x80", r + r + r},          // surrogate
        {"\xF4\x90\x80\x80", r + r + r + r},  // above U+10FFFF
    };
    for (const auto& item : kCases) EXPECT_EQ(platform::JsonString(item.in), "\"" + item.out + "\"");
}

}  // namespace

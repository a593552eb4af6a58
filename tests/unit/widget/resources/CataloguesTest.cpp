// Both catalogues of the text domain "weather-m" translate every text id the
// widget shows, and gettext finds them where the widget binds the domain.

#include <gtest/gtest.h>

#include <libintl.h>

#include <clocale>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <map>
#include <set>
#include <string>

#include "EdjeCanvas.h"
#include "TestFiles.h"

namespace
{

using WeatherTest::WidgetResDir;

const char* const kTextIds[] = {
    "IDS_DB_TAB_WEATHER",
    "IDS_DB_NPBODY_TAP_HERE_TO_ADD_A_CITY",
    "IDS_DB_POP_LOADING_ING",
    "IDS_IDLE_HEADER_NO_NETWORK_CONNECTION_ABB3",
    "IDS_AW_BODY_FAILED_TO_FIND_LOCATION_ABB2",
    "IDS_MF_BODY_M_DEGREE",
    // Read by screen readers.
    "IDS_WEATHER_ACCS_SUNNY",
    "IDS_WEATHER_ACCS_PARTLY_SUNNY",
    "IDS_WEATHER_ACCS_CLOUDY",
    "IDS_WEATHER_ACCS_RAIN",
    "IDS_WEATHER_ACCS_FOG",
    "IDS_WEATHER_ACCS_SHOWERS",
    "IDS_WEATHER_ACCS_PARTLY_SUNNY_WITH_SHOWERS",
    "IDS_WEATHER_ACCS_THUNDERSTORMS",
    "IDS_WEATHER_ACCS_PARTLY_SUNNY_WITH_THUNDER_SHOWERS",
    "IDS_WEATHER_ACCS_FLURRIES",
    "IDS_WEATHER_ACCS_PARTLY_SUNNY_WITH_FLURRIES",
    "IDS_WEATHER_ACCS_SNOW",
    "IDS_WEATHER_ACCS_RAIN_AND_SNOW",
    "IDS_WEATHER_ACCS_ICE",
    "IDS_WEATHER_ACCS_HOT",
    "IDS_WEATHER_ACCS_COLD",
    "IDS_WEATHER_ACCS_WINDY",
    "IDS_WEATHER_ACCS_CLEAR",
    "IDS_WEATHER_ACCS_MOSTLY_CLEAR",
    "IDS_WEATHER_ACCS_CURRENT_LOCATION",
    "IDS_WEATHER_ACCS_DEGREES_CELSIUS",
    "IDS_WEATHER_ACCS_DEGREES_FAHRENHEIT",
    "IDS_WEATHER_ACCS_UPDATED",
    "IDS_WEATHER_ACCS_LOCAL_TIME",
    "IDS_WEATHER_ACCS_OPEN_APP_DESCRIPTION",
    "IDS_WEATHER_ACCS_FORECAST_DAY",
    "IDS_WEATHER_ACCS_REFRESH",
    "IDS_WEATHER_ACCS_REFRESHING",
    "IDS_WEATHER_ACCS_REFRESH_DESCRIPTION",
    "IDS_WEATHER_ACCS_WEATHER_PROVIDER",
    "IDS_WEATHER_ACCS_PROVIDER_DESCRIPTION",
};

std::string CataloguePath(const std::string& lang)
{
    return WidgetResDir() + "locale/" + lang + "/LC_MESSAGES/weather-m.mo";
}

// Reads a GNU .mo file (either byte order) into id -> translation; the
// header entry has the empty id. Empty on any malformed input.
std::map<std::string, std::string> ReadCatalogue(const std::string& path)
{
    const std::string data = WeatherTest::ReadText(path);
    std::map<std::string, std::string> entries;
    if (data.size() < 28)
        return entries;
    uint32_t magic = 0;
    std::memcpy(&magic, data.data(), 4);
    const bool swap = magic == 0xde120495u;
    if (magic != 0x950412deu && !swap)
        return entries;
    auto word = [&](size_t offset) -> uint32_t
    {
        if (offset + 4 > data.size())
            return 0;
        uint32_t value = 0;
        std::memcpy(&value, data.data() + offset, 4);
        return swap ? __builtin_bswap32(value) : value;
    };
    auto text = [&](uint32_t table, uint32_t index) -> std::string
    {
        uint32_t length = word(table + index * 8);
        uint32_t offset = word(table + index * 8 + 4);
        if (uint64_t(offset) + length > data.size())
            return std::string();
        return data.substr(offset, length);
    };
    const uint32_t count = word(8);
    for (uint32_t i = 0; i < count; ++i) entries[text(word(12), i)] = text(word(16), i);
    return entries;
}

bool HasHangul(const std::string& utf8)
{
    // U+AC00..U+D7A3 are encoded as EA B0 80 .. ED 9E A3.
    for (unsigned char c : utf8)
    {
        if (c >= 0xEA && c <= 0xED)
            return true;
    }
    return false;
}

class CatalogueTest : public ::testing::TestWithParam<const char*>
{
};

TEST_P(CatalogueTest, TranslatesEveryTextIdUnderAUtf8Header)
{
    const auto entries = ReadCatalogue(CataloguePath(GetParam()));
    ASSERT_FALSE(entries.empty()) << CataloguePath(GetParam());
    for (const char* id : kTextIds)
    {
        auto found = entries.find(id);
        ASSERT_NE(found, entries.end()) << id;
        EXPECT_FALSE(found->second.empty()) << id;
        EXPECT_EQ(found->second.find("IDS_"), std::string::npos) << id;
    }
    auto header = entries.find("");
    ASSERT_NE(header, entries.end());
    EXPECT_NE(header->second.find("charset=UTF-8"), std::string::npos);
    EXPECT_NE(header->second.find(std::string("Language: ") + GetParam() + "\n"), std::string::npos);
}

INSTANTIATE_TEST_SUITE_P(Languages, CatalogueTest, ::testing::Values("en", "ko"),
                         [](const ::testing::TestParamInfo<const char*>& info)
                         { return std::string(info.param); });

TEST(KoreanCatalogueTest, SentencesAreInKorean)
{
    const auto entries = ReadCatalogue(CataloguePath("ko"));
    for (const char* id : kTextIds)
    {
        if (std::strcmp(id, "IDS_MF_BODY_M_DEGREE") == 0)
            continue;
        auto found = entries.find(id);
        ASSERT_NE(found, entries.end()) << id;
        EXPECT_TRUE(HasHangul(found->second)) << id << ": " << found->second;
    }
}

TEST(DegreeSignTest, BothLanguagesAppendADegreeSign)
{
    for (const char* lang : {"en", "ko"})
        EXPECT_EQ(ReadCatalogue(CataloguePath(lang))["IDS_MF_BODY_M_DEGREE"], "\xC2\xB0") << lang;
}

// A value whose placeholder a translation lost would not be read aloud.
TEST(PlaceholderTest, BothLanguagesKeepTheSamePlaceholders)
{
    auto placeholders = [](const std::string& text)
    {
        std::multiset<std::string> found;
        for (size_t at = text.find('%'); at != std::string::npos; at = text.find('%', at + 1))
            found.insert(text.substr(at, text.compare(at + 2, 1, "$") == 0 ? 4 : 2));
        return found;
    };
    const auto english = ReadCatalogue(CataloguePath("en"));
    const auto korean = ReadCatalogue(CataloguePath("ko"));
    int withPlaceholders = 0;
    for (const char* id : kTextIds)
    {
        EXPECT_EQ(placeholders(korean.at(id)), placeholders(english.at(id))) << id;
        withPlaceholders += placeholders(english.at(id)).empty() ? 0 : 1;
    }
    EXPECT_GT(withPlaceholders, 0);
}

TEST(MalformedCatalogueTest, ReaderRejectsFilesThatAreNotCatalogues)
{
    EXPECT_TRUE(ReadCatalogue(WidgetResDir() + "widget/LICENSE.weather-icons").empty());
    EXPECT_TRUE(ReadCatalogue(WidgetResDir() + "no-such-file.mo").empty());
}

// The way the widget finds its texts: the domain bound to <res>/locale,
// the language chosen by LANGUAGE under a UTF-8 locale.
TEST(GettextLookupTest, FindsTheKoreanTextsInTheResourceFolder)
{
    setenv("LANGUAGE", "ko", 1);
    setenv("LANG", "C.UTF-8", 1);
    unsetenv("LC_ALL");
    unsetenv("LC_MESSAGES");
    ASSERT_NE(setlocale(LC_ALL, ""), nullptr);
    ASSERT_NE(bindtextdomain("weather-m", (WidgetResDir() + "locale").c_str()), nullptr);
    bind_textdomain_codeset("weather-m", "UTF-8");
    EXPECT_STREQ(dgettext("weather-m", "IDS_DB_TAB_WEATHER"), "\xEB\x82\xA0\xEC\x94\xA8");
    EXPECT_STREQ(dgettext("weather-m", "IDS_UNKNOWN_TEXT"), "IDS_UNKNOWN_TEXT");
    setlocale(LC_ALL, "C");
}

}  // namespace

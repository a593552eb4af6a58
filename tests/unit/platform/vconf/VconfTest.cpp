#include <vconf.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <locale>
#include <string>

#include "TestPlatform.h"
#include "core/PlatformRoot.h"

namespace
{
using WeatherTest::PlatformTest;

class VconfTest : public PlatformTest
{
protected:
    void WriteRaw(const std::string& key, const std::string& content)
    {
        std::string path = mRoot.Path("vconf/" + key);
        ASSERT_TRUE(platform::MakeDirs(path.substr(0, path.rfind('/'))));
        ASSERT_TRUE(platform::WriteFileAtomic(path, content));
    }
    std::string ReadRaw(const std::string& key)
    {
        std::string content;
        platform::ReadFile(mRoot.Path("vconf/" + key), content);
        return content;
    }
};

TEST_F(VconfTest, EachTypeRoundTripsThroughItsFile)
{
    ASSERT_EQ(vconf_set_int("db/menu_widget/regionformat_time1224", 2), VCONF_OK);
    ASSERT_EQ(vconf_set_bool("db/test/flag", 5), VCONF_OK);
    ASSERT_EQ(vconf_set_dbl("db/test/ratio", -0.125), VCONF_OK);
    ASSERT_EQ(vconf_set_str("db/setting/timezone_id", "Asia/Seoul"), VCONF_OK);

    EXPECT_EQ(ReadRaw("db/menu_widget/regionformat_time1224"), "int\n2\n");
    EXPECT_EQ(ReadRaw("db/test/flag"), "bool\n1\n");
    EXPECT_EQ(ReadRaw("db/setting/timezone_id"), "string\nAsia/Seoul\n");

    int intValue = 0;
    int boolValue = 0;
    double dblValue = 0.0;
    EXPECT_EQ(vconf_get_int("db/menu_widget/regionformat_time1224", &intValue), VCONF_OK);
    EXPECT_EQ(intValue, 2);
    EXPECT_EQ(vconf_get_bool("db/test/flag", &boolValue), VCONF_OK);
    EXPECT_EQ(boolValue, 1);
    EXPECT_EQ(vconf_get_dbl("db/test/ratio", &dblValue), VCONF_OK);
    EXPECT_EQ(dblValue, -0.125);
    char* text = vconf_get_str("db/setting/timezone_id");
    ASSERT_NE(text, nullptr);
    EXPECT_STREQ(text, "Asia/Seoul");
    free(text);
}

TEST_F(VconfTest, StringsKeepBlanksNewlinesAndEmptiness)
{
    const char* odd = " two\nlines \n";
    ASSERT_EQ(vconf_set_str("db/test/odd", odd), VCONF_OK);
    char* text = vconf_get_str("db/test/odd");
    ASSERT_NE(text, nullptr);
    EXPECT_STREQ(text, odd);
    free(text);

    ASSERT_EQ(vconf_set_str("db/test/empty", ""), VCONF_OK);
    text = vconf_get_str("db/test/empty");
    ASSERT_NE(text, nullptr);
    EXPECT_STREQ(text, "");
    free(text);
}

TEST_F(VconfTest, ExtremeNumbersSurvive)
{
    ASSERT_EQ(vconf_set_int("db/test/min", -2147483647 - 1), VCONF_OK);
    ASSERT_EQ(vconf_set_dbl("db/test/third", 1.0 / 3.0), VCONF_OK);
    int intValue = 0;
    double dblValue = 0.0;
    EXPECT_EQ(vconf_get_int("db/test/min", &intValue), VCONF_OK);
    EXPECT_EQ(intValue, -2147483647 - 1);
    EXPECT_EQ(vconf_get_dbl("db/test/third", &dblValue), VCONF_OK);
    EXPECT_EQ(dblValue, 1.0 / 3.0);
}

TEST_F(VconfTest, WrongTypeIsAnErrorAndLeavesOutputAlone)
{
    ASSERT_EQ(vconf_set_str("db/menu_widget/language", "en_US.UTF-8"), VCONF_OK);
    ASSERT_EQ(vconf_set_int("memory/dnet/status", 2), VCONF_OK);
    int value = 77;
    EXPECT_EQ(vconf_get_int("db/menu_widget/language", &value), VCONF_ERROR);
    EXPECT_EQ(vconf_get_bool("memory/dnet/status", &value), VCONF_ERROR);
    EXPECT_EQ(value, 77);
    EXPECT_EQ(vconf_get_str("memory/dnet/status"), nullptr);
    EXPECT_TRUE(mLog.Contains("memory/dnet/status", "VCONF")) << mLog.Dump();
}

TEST_F(VconfTest, MissingKeyIsAnErrorWithALogLine)
{
    int value = 5;
    EXPECT_EQ(vconf_get_int("db/nothing/here", &value), VCONF_ERROR);
    EXPECT_EQ(value, 5);
    EXPECT_EQ(vconf_get_str("db/nothing/here"), nullptr);
    EXPECT_EQ(mLog.Count("db/nothing/here", "VCONF"), 2) << mLog.Dump();
}

TEST_F(VconfTest, GarbageContentIsRejected)
{
    const char* const kGarbage[] = {"", "int", "int\n", "int\nforty\n", "int\n42abc\n",
                                    "int\n99999999999\n", "bool\n2\n", "double\n1,5\n",
                                    "double\nnan\n", "float\n1\n", "\x01\x02\xff\n\n"};
    for (const char* content : kGarbage)
    {
        SCOPED_TRACE(content);
        WriteRaw("db/test/bad", content);
        mLog.Clear();
        int intValue = 3;
        double dblValue = 3.0;
        EXPECT_EQ(vconf_get_int("db/test/bad", &intValue), VCONF_ERROR);
        EXPECT_EQ(vconf_get_bool("db/test/bad", &intValue), VCONF_ERROR);
        EXPECT_EQ(vconf_get_dbl("db/test/bad", &dblValue), VCONF_ERROR);
        EXPECT_EQ(intValue, 3);
        EXPECT_EQ(mLog.Count("db/test/bad", "VCONF"), 3) << mLog.Dump();
    }
}

TEST_F(VconfTest, HandWrittenFilesAreAccepted)
{
    WriteRaw("db/test/hand", "int\n 7 \n");
    WriteRaw("db/test/nonl", "string\nno newline");
    int value = 0;
    EXPECT_EQ(vconf_get_int("db/test/hand", &value), VCONF_OK);
    EXPECT_EQ(value, 7);
    char* text = vconf_get_str("db/test/nonl");
    ASSERT_NE(text, nullptr);
    EXPECT_STREQ(text, "no newline");
    free(text);
}

struct CommaDecimal : std::numpunct<char>
{
    char do_decimal_point() const override { return ','; }
};

TEST_F(VconfTest, DoublesIgnoreTheProgramLocale)
{
    std::locale old = std::locale::global(std::locale(std::locale::classic(), new CommaDecimal));
    int setResult = vconf_set_dbl("db/test/pi", 3.5);
    double value = 0.0;
    int getResult = vconf_get_dbl("db/test/pi", &value);
    std::locale::global(old);
    EXPECT_EQ(setResult, VCONF_OK);
    EXPECT_EQ(getResult, VCONF_OK);
    EXPECT_EQ(value, 3.5);
    EXPECT_EQ(ReadRaw("db/test/pi"), "double\n3.5\n");
}

TEST_F(VconfTest, BadKeyNamesAreRejectedBeforeTouchingFiles)
{
    const char* const kBadKeys[] = {"", "/db/abs", "db//twice", "db/trailing/", "../escape",
                                    "db/../../escape", "db/./dot", "."};
    for (const char* key : kBadKeys)
    {
        SCOPED_TRACE(key);
        mLog.Clear();
        int value = 0;
        EXPECT_EQ(vconf_set_int(key, 1), VCONF_ERROR);
        EXPECT_EQ(vconf_get_int(key, &value), VCONF_ERROR);
        EXPECT_EQ(vconf_set_str(key, "x"), VCONF_ERROR);
        EXPECT_EQ(mLog.Count("invalid key name", "VCONF"), 3) << mLog.Dump();
    }
    EXPECT_EQ(vconf_set_int(nullptr, 1), VCONF_ERROR);
    EXPECT_EQ(vconf_get_str(nullptr), nullptr);
    std::string escaped;
    EXPECT_FALSE(platform::ReadFile(mRoot.Path("escape"), escaped));
    EXPECT_FALSE(platform::ReadFile(mRoot.GetPath() + "/../escape", escaped));
}

TEST_F(VconfTest, NullArgumentsAreErrors)
{
    ASSERT_EQ(vconf_set_int("db/test/n", 1), VCONF_OK);
    EXPECT_EQ(vconf_get_int("db/test/n", nullptr), VCONF_ERROR);
    EXPECT_EQ(vconf_set_str("db/test/s", nullptr), VCONF_ERROR);
    EXPECT_EQ(vconf_keynode_get_name(nullptr), nullptr);
    EXPECT_EQ(vconf_keynode_get_int(nullptr), -1);
    EXPECT_EQ(vconf_keynode_get_str(nullptr), nullptr);
}

TEST_F(VconfTest, SettingReplacesTheType)
{
    ASSERT_EQ(vconf_set_int("db/test/t", 1), VCONF_OK);
    ASSERT_EQ(vconf_set_str("db/test/t", "now text"), VCONF_OK);
    int value = 0;
    EXPECT_EQ(vconf_get_int("db/test/t", &value), VCONF_ERROR);
    char* text = vconf_get_str("db/test/t");
    ASSERT_NE(text, nullptr);
    EXPECT_STREQ(text, "now text");
    free(text);
}

}  // namespace

#include <vconf.h>

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <cmath>
#include <cstdlib>
#include <locale>
#include <string>

#include "TestFiles.h"
#include "TestPlatform.h"
#include "core/PlatformRoot.h"

namespace
{

class VconfTest : public WeatherTest::PlatformTest
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
    std::string GetStr(const char* key)
    {
        char* text = vconf_get_str(key);
        std::string copy = text ? text : "(null)";
        free(text);
        return copy;
    }
};

struct CommaDecimal : std::numpunct<char>
{
    char do_decimal_point() const override { return ','; }
};

TEST_F(VconfTest, EachTypeRoundTripsThroughItsFile)
{
    // A program locale with a decimal comma must not leak into the files.
    std::locale old = std::locale::global(std::locale(std::locale::classic(), new CommaDecimal));
    EXPECT_EQ(vconf_set_int("db/menu_widget/regionformat_time1224", -2147483647 - 1), VCONF_OK);
    EXPECT_EQ(vconf_set_bool("db/test/flag", 5), VCONF_OK);
    EXPECT_EQ(vconf_set_dbl("db/test/ratio", 3.5), VCONF_OK);
    EXPECT_EQ(vconf_set_str("db/test/odd", " two\nlines \n"), VCONF_OK);
    EXPECT_EQ(vconf_set_str("db/test/empty", ""), VCONF_OK);
    std::locale::global(old);

    EXPECT_EQ(ReadRaw("db/test/flag"), "bool\n1\n");
    EXPECT_EQ(ReadRaw("db/test/ratio"), "double\n3.5\n");
    int intValue = 0;
    int boolValue = 0;
    double dblValue = 0.0;
    EXPECT_EQ(vconf_get_int("db/menu_widget/regionformat_time1224", &intValue), VCONF_OK);
    EXPECT_EQ(intValue, -2147483647 - 1);
    EXPECT_EQ(vconf_get_bool("db/test/flag", &boolValue), VCONF_OK);
    EXPECT_EQ(boolValue, 1);
    EXPECT_EQ(vconf_get_dbl("db/test/ratio", &dblValue), VCONF_OK);
    EXPECT_EQ(dblValue, 3.5);
    EXPECT_EQ(GetStr("db/test/odd"), " two\nlines \n");
    EXPECT_EQ(GetStr("db/test/empty"), "");
}

TEST_F(VconfTest, HandWrittenFilesAreAccepted)
{
    WriteRaw("db/test/hand", "int\n 7 \n");
    WriteRaw("db/test/nonl", "string\nno newline");
    int value = 0;
    EXPECT_EQ(vconf_get_int("db/test/hand", &value), VCONF_OK);
    EXPECT_EQ(value, 7);
    EXPECT_EQ(GetStr("db/test/nonl"), "no newline");
}

TEST_F(VconfTest, WrongTypeOrMissingKeyIsAnErrorWithALogLine)
{
    ASSERT_EQ(vconf_set_str("db/menu_widget/language", "en_US.UTF-8"), VCONF_OK);
    int value = 77;
    EXPECT_EQ(vconf_get_int("db/menu_widget/language", &value), VCONF_ERROR);
    EXPECT_EQ(vconf_get_int("db/nothing/here", &value), VCONF_ERROR);
    EXPECT_EQ(vconf_get_int("db/menu_widget/language", nullptr), VCONF_ERROR);
    EXPECT_EQ(value, 77);
    EXPECT_EQ(GetStr("db/nothing/here"), "(null)");
    EXPECT_EQ(mLog.Count("db/menu_widget/language", "VCONF"), 1) << mLog.Dump();
    EXPECT_EQ(mLog.Count("db/nothing/here", "VCONF"), 2) << mLog.Dump();
    // Setting another type replaces the old one.
    ASSERT_EQ(vconf_set_int("db/menu_widget/language", 4), VCONF_OK);
    EXPECT_EQ(GetStr("db/menu_widget/language"), "(null)");
}

TEST_F(VconfTest, GarbageContentIsRejected)
{
    const char* const kGarbage[] = {"",
                                    "int",
                                    "int\n",
                                    "int\nforty\n",
                                    "int\n42abc\n",
                                    "int\n99999999999\n",
                                    "bool\n2\n",
                                    "double\n1,5\n",
                                    "double\nnan\n",
                                    "float\n1\n",
                                    "\x01\x02\xff\n\n"};
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

TEST_F(VconfTest, BadKeyNamesAreRejectedBeforeTouchingFiles)
{
    const char* const kBadKeys[] = {"",          "/db/abs",         "db//twice", "db/trailing/",
                                    "../escape", "db/../../escape", "db/./dot",  "."};
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
    EXPECT_EQ(vconf_set_str("db/test/s", nullptr), VCONF_ERROR);
    std::string escaped;
    EXPECT_FALSE(platform::ReadFile(mRoot.Path("escape"), escaped));
    EXPECT_FALSE(platform::ReadFile(mRoot.GetPath() + "/../escape", escaped));
}

TEST_F(VconfTest, KeyFilesThatAreNotPlainFilesAreRefused)
{
    std::string outside = mRoot.Path("outside");
    WeatherTest::WriteText(outside, "int\n5\n");
    std::string dir = mRoot.Path("vconf/db/test");
    ASSERT_TRUE(platform::MakeDirs(dir + "/folder"));
    ASSERT_EQ(symlink(outside.c_str(), (dir + "/link").c_str()), 0);
    ASSERT_EQ(mkfifo((dir + "/fifo").c_str(), 0600), 0);
    WeatherTest::MakeSparseFile(dir + "/huge", 64L * 1024 * 1024);
    long before = WeatherTest::BytesReadSoFar();
    for (const char* key : {"db/test/link", "db/test/fifo", "db/test/folder", "db/test/huge"})
    {
        int value = 0;
        EXPECT_EQ(vconf_get_int(key, &value), VCONF_ERROR) << key;
    }
    EXPECT_LT(WeatherTest::BytesReadSoFar() - before, 1024 * 1024);
    // A write replaces the planted link; what it pointed at stays as it was.
    ASSERT_EQ(vconf_set_int("db/test/link", 6), VCONF_OK);
    EXPECT_EQ(WeatherTest::ReadText(outside), "int\n5\n");
    struct stat st;
    ASSERT_EQ(lstat((dir + "/link").c_str(), &st), 0);
    EXPECT_TRUE(S_ISREG(st.st_mode));
    EXPECT_EQ(st.st_mode & 0777, 0600u);
}

TEST_F(VconfTest, SetRefusesWhatGetWouldRefuse)
{
    EXPECT_EQ(vconf_set_str("db/test/long", std::string(64 * 1024, 'x').c_str()), VCONF_ERROR);
    EXPECT_EQ(vconf_set_dbl("db/test/nan", std::nan("")), VCONF_ERROR);
    EXPECT_EQ(vconf_set_dbl("db/test/inf", HUGE_VAL), VCONF_ERROR);
    for (const char* key : {"db/test/long", "db/test/nan", "db/test/inf"})
        EXPECT_TRUE(ReadRaw(key).empty()) << key;
    EXPECT_EQ(vconf_set_str("db/test/long", std::string(60 * 1024, 'x').c_str()), VCONF_OK);
    EXPECT_EQ(GetStr("db/test/long").size(), 60u * 1024);
}

}  // namespace

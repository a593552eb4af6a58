#include <uxt_theme.h>

#include <Eina.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include "TestFiles.h"
#include "TestPlatform.h"

namespace
{

class ThemeTableFileTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override { eina_init(); }
    void TearDown() override { eina_shutdown(); }
};

TEST_F(ThemeTableFileTest, OnlyPlainFilesOfBoundedSizeAreRead)
{
    std::string table = mRoot.Path("colors.xml");
    WeatherTest::WriteText(
        table,
        "<ChangeableColorTable><Theme id=\"1\"><Color code=\"A\" normal=\"#FFFFFF\"/></Theme>"
        "</ChangeableColorTable>");
    // Installed tables may be links.
    ASSERT_EQ(0, symlink(table.c_str(), mRoot.Path("link.xml").c_str()));
    uxt_theme_color_table_h linked = uxt_theme_add_color_table(mRoot.Path("link.xml").c_str());
    EXPECT_NE(nullptr, linked);
    uxt_theme_delete_color_table(linked);

    ASSERT_EQ(0, mkfifo(mRoot.Path("fifo.xml").c_str(), 0600));
    WeatherTest::MakeSparseFile(mRoot.Path("huge.xml"), 64L * 1024 * 1024);
    const std::pair<const char*, int> kRefused[] = {{"fifo.xml", UXT_THEME_ERROR_IO_ERROR},
                                                    {"", UXT_THEME_ERROR_IO_ERROR},
                                                    {"huge.xml", UXT_THEME_ERROR_NO_DATA}};
    long before = WeatherTest::BytesReadSoFar();
    for (const auto& [name, error] : kRefused)
    {
        EXPECT_EQ(nullptr, uxt_theme_add_color_table(mRoot.Path(name).c_str())) << name;
        EXPECT_EQ(error, get_last_result()) << name;
        EXPECT_EQ(nullptr, uxt_theme_add_font_table(mRoot.Path(name).c_str())) << name;
    }
    EXPECT_LT(WeatherTest::BytesReadSoFar() - before, 8 * 1024 * 1024);
}

}  // namespace

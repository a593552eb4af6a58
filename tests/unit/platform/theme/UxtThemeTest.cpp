#include <uxt_theme.h>

#include <Elementary.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>
#include <vconf.h>

#include "TestPlatform.h"
#include "ThemeTestSupport.h"

namespace
{
using namespace ThemeTest;

class UxtThemeTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override { ASSERT_EQ(uxt_theme_set_changeable_ui_enabled(true), UXT_THEME_ERROR_NONE); }
    void TearDown() override { ResetTheme(); }

    std::string Table(const std::string& xml)
    {
        WriteText(mRoot.Path("table.xml"), xml);
        return mRoot.Path("table.xml");
    }
    uxt_theme_color_table_h AddColors(const std::string& xml)
    {
        return uxt_theme_add_color_table(Table(xml).c_str());
    }
};

TEST_F(UxtThemeTest, RejectsMissingAndMalformedTables)
{
    EXPECT_EQ(uxt_theme_add_color_table(nullptr), nullptr);
    EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_add_color_table(mRoot.Path("absent.xml").c_str()), nullptr);
    EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_IO_ERROR);

    const std::string open = "<ChangeableColorTable><Theme id=\"1\">";
    const std::string close = "</Theme></ChangeableColorTable>";
    const std::string broken[] = {
        "",
        "not xml",
        "<Other><Theme id=\"1\"><Color code=\"A\" normal=\"#FFFFFF\"/></Theme></Other>",
        "<ChangeableColorTable><Theme id=\"x\"><Color code=\"A\" normal=\"#FFFFFF\"/>" + close,
        "<ChangeableColorTable><Color code=\"A\" normal=\"#FFFFFF\"/></ChangeableColorTable>",
        open + "<Color code=\"A\" normal=\"#GGFFFF\"/>" + close,
        open + "<Color code=\"A\" normal=\"#FFF\"/>" + close,
        open + "<Color normal=\"#FFFFFF\"/>" + close,
        open + close,
    };
    for (const std::string& xml : broken)
    {
        EXPECT_EQ(AddColors(xml), nullptr) << xml;
        EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_NO_DATA) << xml;
    }
    EXPECT_EQ(uxt_theme_add_font_table(Table("<ChangeableFontTable/>").c_str()), nullptr);
    EXPECT_EQ(
        uxt_theme_add_font_table(
            Table("<ChangeableFontTable><Font code=\"T\" size=\"big\"/></ChangeableFontTable>").c_str()),
        nullptr);
}

TEST_F(UxtThemeTest, OnlyPlainFilesOfBoundedSizeAreRead)
{
    const std::string table = Table(
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

TEST_F(UxtThemeTest, AppliesThemeChosenByKeyThenStyle)
{
    uxt_theme_color_table_h table = AddColors(TwoThemeColorTable());
    ASSERT_NE(table, nullptr);
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME1_ACCENT) << "no key: the first theme";
    EXPECT_EQ(GetClassColor("AO803E1_press"), (Rgba{0x11, 0x22, 0x33, 0x44}));

    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 2), VCONF_OK);
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT);
    EXPECT_EQ(GetClassColor("W1511"), (Rgba{0, 0, 0, 255}));
    EXPECT_EQ(GetClassColor("AO803E1_press"), UNSET) << "theme 2 has no pressed colour";

    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_LIGHT), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME1_ACCENT) << "a style wins over the key at once";
    EXPECT_EQ(uxt_theme_set_style(static_cast<uxt_theme_style_e>(3)), UXT_THEME_ERROR_INVALID_PARAMETER);

    ASSERT_EQ(uxt_theme_set_changeable_ui_enabled(false), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("W1511"), UNSET) << "switching off gives the layouts their colours back";
    EXPECT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_INVALID_OPERATION);
    EXPECT_EQ(GetClassColor("W1511"), UNSET);

    ASSERT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_INVALID_PARAMETER);
}

TEST_F(UxtThemeTest, FontTableSetsTextClassesThatOutliveTheTable)
{
    uxt_theme_font_table_h fonts = uxt_theme_add_font_table(Table(OneFontTable()).c_str());
    ASSERT_NE(fonts, nullptr);
    ASSERT_EQ(uxt_theme_set_font_table(fonts), UXT_THEME_ERROR_NONE);
    const char* font = nullptr;
    Evas_Font_Size size = 0;
    ASSERT_TRUE(edje_text_class_get("T1511", &font, &size));
    EXPECT_STREQ(font, "Sans:style=Bold");
    EXPECT_EQ(size, 40);

    // Other views still show what a deleted table applied.
    ASSERT_EQ(uxt_theme_delete_font_table(fonts), UXT_THEME_ERROR_NONE);
    EXPECT_TRUE(HasFontClass("T1511"));
    ASSERT_EQ(uxt_theme_set_changeable_ui_enabled(false), UXT_THEME_ERROR_NONE);
    EXPECT_FALSE(HasFontClass("T1511"));
}

TEST_F(UxtThemeTest, ReplaceColorGivesObjectTheAppliedColourOfNewCode)
{
    uxt_theme_color_table_h table = AddColors(TwoThemeColorTable());
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    Evas_Object* win = elm_win_add(nullptr, "theme-test", ELM_WIN_BASIC);
    Evas_Object* edje = edje_object_add(evas_object_evas_get(win));
    Evas_Object* progress = elm_progressbar_add(win);

    Rgba c;
    int o[8];
    EXPECT_EQ(uxt_theme_object_replace_color(edje, "W157E1", "AO803E1"), UXT_THEME_ERROR_NONE);
    ASSERT_TRUE(edje_object_color_class_get(edje, "W157E1", &c[0], &c[1], &c[2], &c[3], &o[0], &o[1], &o[2],
                                            &o[3], &o[4], &o[5], &o[6], &o[7]));
    EXPECT_EQ(c, THEME1_ACCENT);
    EXPECT_EQ(uxt_theme_object_replace_color(progress, "W157E2", "AO803E1"), UXT_THEME_ERROR_NONE);
    EXPECT_TRUE(edje_object_color_class_get(elm_layout_edje_get(progress), "W157E2", &c[0], &c[1], &c[2],
                                            &c[3], &o[0], &o[1], &o[2], &o[3], &o[4], &o[5], &o[6], &o[7]));

    EXPECT_EQ(uxt_theme_object_replace_color(edje, "W157E1", "NOSUCHCODE"), UXT_THEME_ERROR_NO_DATA);
    EXPECT_EQ(uxt_theme_object_replace_color(nullptr, "W157E1", "AO803E1"),
              UXT_THEME_ERROR_INVALID_PARAMETER);
    evas_object_del(win);
    uxt_theme_delete_color_table(table);
}

int gColourCalls;
int gFontCalls;
void ColourCb(void*)
{
    ++gColourCalls;
}
void FontCb(void*)
{
    ++gFontCalls;
}

TEST_F(UxtThemeTest, ChangedCallbacksFollowTheirOwnKeysUntilRemoved)
{
    gColourCalls = gFontCalls = 0;
    ASSERT_EQ(uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ColourCb, nullptr),
              UXT_THEME_ERROR_NONE);
    ASSERT_EQ(uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_FONT, FontCb, nullptr),
              UXT_THEME_ERROR_NONE);
    EXPECT_EQ(uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ColourCb, nullptr),
              UXT_THEME_ERROR_INVALID_PARAMETER);

    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 2), VCONF_OK);
    EXPECT_TRUE(RunLoopUntil([] { return gColourCalls > 0; }));
    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_FONT_SIZE, 3), VCONF_OK);
    EXPECT_TRUE(RunLoopUntil([] { return gFontCalls > 0; }));
    EXPECT_EQ(gColourCalls, 1);

    EXPECT_EQ(uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ColourCb),
              UXT_THEME_ERROR_NONE);
    EXPECT_EQ(uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ColourCb),
              UXT_THEME_ERROR_INVALID_PARAMETER);
    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 1), VCONF_OK);
    ASSERT_EQ(vconf_set_str(UXT_THEME_KEY_FONT_NAME, "Serif"), VCONF_OK);
    EXPECT_TRUE(RunLoopUntil([] { return gFontCalls > 1; }));
    EXPECT_EQ(gColourCalls, 1);
    EXPECT_EQ(uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_FONT, FontCb), UXT_THEME_ERROR_NONE);
}

TEST_F(UxtThemeTest, ShippedTablesHoldTheCodesThePagesReplaceInEveryTheme)
{
    mRoot.UseBuildResources();
    std::string dir = mRoot.Path("apps/com.quorvex.weather-m/shared/res/tables/");
    uxt_theme_color_table_h colors = uxt_theme_add_color_table((dir + "changeableColorInfo.xml").c_str());
    ASSERT_NE(colors, nullptr) << "shipped colour table missing or malformed";
    uxt_theme_font_table_h fonts = uxt_theme_add_font_table((dir + "changeableColorInfo_font.xml").c_str());
    EXPECT_NE(fonts, nullptr) << "shipped font table missing or malformed";

    for (int theme : {1, 2})
    {
        ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, theme), VCONF_OK);
        uxt_theme_set_changeable_ui_enabled(false);  // forget the previous theme's colours
        uxt_theme_set_changeable_ui_enabled(true);
        ASSERT_EQ(uxt_theme_set_color_table(colors), UXT_THEME_ERROR_NONE);
        for (const char* code : {"AO803E1", "AO803E2", "AO803E3", "W157E1", "W1511"})
            EXPECT_NE(GetClassColor(code), UNSET) << code << " in theme " << theme;
    }
    uxt_theme_delete_color_table(colors);
    uxt_theme_delete_font_table(fonts);
}

}  // namespace

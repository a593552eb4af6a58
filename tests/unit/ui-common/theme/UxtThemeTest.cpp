#include <uxt_theme.h>

#include <Edje.h>
#include <Elementary.h>
#include <gtest/gtest.h>

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

    std::string Table(const std::string& name, const std::string& xml)
    {
        std::string path = mRoot.Path(name);
        WriteText(path, xml);
        return path;
    }

    uxt_theme_color_table_h AddColors(const std::string& xml)
    {
        return uxt_theme_add_color_table(Table("colors.xml", xml).c_str());
    }
};

TEST_F(UxtThemeTest, RejectsMissingAndMalformedTables)
{
    EXPECT_EQ(uxt_theme_add_color_table(nullptr), nullptr);
    EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_add_color_table(mRoot.Path("absent.xml").c_str()), nullptr);
    EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_IO_ERROR);

    const char* const broken[] = {
        "",
        "not xml at all",
        "<OtherRoot><Theme id=\"1\"><Color code=\"A\" normal=\"#FFFFFF\"/></Theme></OtherRoot>",
        "<ChangeableColorTable><Theme id=\"x\"><Color code=\"A\" "
        "normal=\"#FFFFFF\"/></Theme></ChangeableColorTable>",
        "<ChangeableColorTable><Theme id=\"1\"><Color code=\"A\" "
        "normal=\"#GGFFFF\"/></Theme></ChangeableColorTable>",
        "<ChangeableColorTable><Theme id=\"1\"><Color code=\"A\" "
        "normal=\"#FFF\"/></Theme></ChangeableColorTable>",
        "<ChangeableColorTable><Theme id=\"1\"><Color normal=\"#FFFFFF\"/></Theme></ChangeableColorTable>",
        "<ChangeableColorTable><Color code=\"A\" normal=\"#FFFFFF\"/></ChangeableColorTable>",
        "<ChangeableColorTable><Theme id=\"1\"></Theme></ChangeableColorTable>",
    };
    for (const char* xml : broken)
    {
        EXPECT_EQ(AddColors(xml), nullptr) << xml;
        EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_NO_DATA) << xml;
    }

    EXPECT_EQ(uxt_theme_add_font_table(Table("f.xml", "<ChangeableFontTable/>").c_str()), nullptr);
    EXPECT_EQ(uxt_theme_add_font_table(
                  Table("f.xml", "<ChangeableFontTable><Font code=\"T\" size=\"big\"/></ChangeableFontTable>")
                      .c_str()),
              nullptr);
    EXPECT_EQ(get_last_result(), UXT_THEME_ERROR_NO_DATA);
}

TEST_F(UxtThemeTest, AppliesThemeChosenByKeyThenStyle)
{
    uxt_theme_color_table_h table = AddColors(TwoThemeColorTable());
    ASSERT_NE(table, nullptr);

    // No key: the first theme of the file.
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("AO803E1"), (ClassColor{0x10, 0x20, 0x30, 0xFF}));
    EXPECT_EQ(GetClassColor("AO803E1_press"), (ClassColor{0x11, 0x22, 0x33, 0x44}));

    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 2), VCONF_OK);
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("AO803E1"), (ClassColor{0xA0, 0xB0, 0xC0, 0xD0}));
    EXPECT_EQ(GetClassColor("W1511"), (ClassColor{0, 0, 0, 255}));
    // Theme 2 has no pressed colour, so the one of theme 1 must not linger.
    EXPECT_EQ(GetClassColor("AO803E1_press"), ClassColor());

    // An explicit style wins over the key, and is applied at once.
    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_LIGHT), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("AO803E1"), (ClassColor{0x10, 0x20, 0x30, 0xFF}));
    EXPECT_EQ(uxt_theme_set_style(static_cast<uxt_theme_style_e>(3)), UXT_THEME_ERROR_INVALID_PARAMETER);

    EXPECT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_NONE);
}

TEST_F(UxtThemeTest, DisabledUiAppliesNothingAndSwitchingOffRestoresLayoutColours)
{
    uxt_theme_color_table_h table = AddColors(TwoThemeColorTable());
    ASSERT_NE(table, nullptr);
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    ASSERT_NE(GetClassColor("W1511"), ClassColor());

    ASSERT_EQ(uxt_theme_set_changeable_ui_enabled(false), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(GetClassColor("W1511"), ClassColor());
    EXPECT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_INVALID_OPERATION);
    EXPECT_EQ(GetClassColor("W1511"), ClassColor());
    EXPECT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_NONE);
}

TEST_F(UxtThemeTest, StaleOrForeignHandlesAreRefused)
{
    uxt_theme_color_table_h table = AddColors(TwoThemeColorTable());
    ASSERT_NE(table, nullptr);
    ASSERT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_set_color_table(nullptr), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_delete_font_table(reinterpret_cast<uxt_theme_font_table_h>(table)),
              UXT_THEME_ERROR_INVALID_PARAMETER);
}

TEST_F(UxtThemeTest, FontTableSetsTextClasses)
{
    uxt_theme_font_table_h fonts = uxt_theme_add_font_table(Table("fonts.xml", OneFontTable()).c_str());
    ASSERT_NE(fonts, nullptr);
    ASSERT_EQ(uxt_theme_set_font_table(fonts), UXT_THEME_ERROR_NONE);
    const char* font = nullptr;
    Evas_Font_Size size = 0;
    ASSERT_TRUE(edje_text_class_get("T1511", &font, &size));
    EXPECT_STREQ(font, "Sans:style=Bold");
    EXPECT_EQ(size, 40);

    // Deleting the table keeps what other views already show.
    ASSERT_EQ(uxt_theme_delete_font_table(fonts), UXT_THEME_ERROR_NONE);
    EXPECT_TRUE(edje_text_class_get("T1511", &font, &size));
    ASSERT_EQ(uxt_theme_set_changeable_ui_enabled(false), UXT_THEME_ERROR_NONE);
    EXPECT_FALSE(edje_text_class_get("T1511", &font, &size));
}

TEST_F(UxtThemeTest, ReplaceColorGivesObjectTheAppliedColourOfNewCode)
{
    uxt_theme_color_table_h table = AddColors(TwoThemeColorTable());
    ASSERT_NE(table, nullptr);
    ASSERT_EQ(uxt_theme_set_color_table(table), UXT_THEME_ERROR_NONE);
    Evas_Object* win = elm_win_add(nullptr, "theme-test", ELM_WIN_BASIC);
    ASSERT_NE(win, nullptr);
    Evas_Object* edje = edje_object_add(evas_object_evas_get(win));
    Evas_Object* progress = elm_progressbar_add(win);

    EXPECT_EQ(uxt_theme_object_replace_color(edje, "W157E1", "AO803E1"), UXT_THEME_ERROR_NONE);
    int c[12];
    ASSERT_TRUE(edje_object_color_class_get(edje, "W157E1", &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6],
                                            &c[7], &c[8], &c[9], &c[10], &c[11]));
    EXPECT_EQ((ClassColor{c[0], c[1], c[2], c[3]}), (ClassColor{0x10, 0x20, 0x30, 0xFF}));
    // A layout-based widget gets it on its Edje object.
    EXPECT_EQ(uxt_theme_object_replace_color(progress, "W157E2", "AO803E1"), UXT_THEME_ERROR_NONE);
    EXPECT_TRUE(edje_object_color_class_get(elm_layout_edje_get(progress), "W157E2", &c[0], &c[1], &c[2],
                                            &c[3], &c[4], &c[5], &c[6], &c[7], &c[8], &c[9], &c[10], &c[11]));

    EXPECT_EQ(uxt_theme_object_replace_color(edje, "W157E1", "NOSUCHCODE"), UXT_THEME_ERROR_NO_DATA);
    EXPECT_EQ(uxt_theme_object_replace_color(nullptr, "W157E1", "AO803E1"),
              UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(uxt_theme_object_replace_color(edje, nullptr, "AO803E1"), UXT_THEME_ERROR_INVALID_PARAMETER);
    evas_object_del(edje);
    evas_object_del(win);
    EXPECT_EQ(uxt_theme_delete_color_table(table), UXT_THEME_ERROR_NONE);
}

struct ChangeCounter
{
    int calls = 0;
    static void CountCb(void* data) { ++static_cast<ChangeCounter*>(data)->calls; }
    static void OtherCb(void* data) { ++static_cast<ChangeCounter*>(data)->calls; }
};

TEST_F(UxtThemeTest, ChangedCallbacksFollowTheirOwnKeys)
{
    ChangeCounter colour, font;
    ASSERT_EQ(uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ChangeCounter::CountCb, &colour),
              UXT_THEME_ERROR_NONE);
    ASSERT_EQ(uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_FONT, ChangeCounter::OtherCb, &font),
              UXT_THEME_ERROR_NONE);
    EXPECT_EQ(uxt_theme_add_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ChangeCounter::CountCb, &colour),
              UXT_THEME_ERROR_INVALID_PARAMETER);

    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 2), VCONF_OK);
    EXPECT_TRUE(RunLoopUntil([&] { return colour.calls > 0; }));
    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_FONT_SIZE, 3), VCONF_OK);
    EXPECT_TRUE(RunLoopUntil([&] { return font.calls > 0; }));
    EXPECT_EQ(colour.calls, 1);

    EXPECT_EQ(uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ChangeCounter::CountCb),
              UXT_THEME_ERROR_NONE);
    EXPECT_EQ(uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_COLOR, ChangeCounter::CountCb),
              UXT_THEME_ERROR_INVALID_PARAMETER);
    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 1), VCONF_OK);
    ASSERT_EQ(vconf_set_str(UXT_THEME_KEY_FONT_NAME, "Serif"), VCONF_OK);
    EXPECT_TRUE(RunLoopUntil([&] { return font.calls > 1; }));
    EXPECT_EQ(colour.calls, 1);
    EXPECT_EQ(uxt_theme_remove_changed_callback(UXT_THEME_CHANGED_TYPE_FONT, ChangeCounter::OtherCb),
              UXT_THEME_ERROR_NONE);
}

TEST_F(UxtThemeTest, ShippedTablesHoldTheCodesThePagesReplace)
{
    mRoot.UseBuildResources();
    std::string dir = mRoot.Path("apps/com.quorvex.weather-m/shared/res/tables/");
    uxt_theme_color_table_h colors = uxt_theme_add_color_table((dir + "changeableColorInfo.xml").c_str());
    ASSERT_NE(colors, nullptr) << "shipped colour table missing or malformed";
    uxt_theme_font_table_h fonts = uxt_theme_add_font_table((dir + "changeableColorInfo_font.xml").c_str());
    EXPECT_NE(fonts, nullptr) << "shipped font table missing or malformed";

    Evas_Object* win = elm_win_add(nullptr, "theme-test", ELM_WIN_BASIC);
    Evas_Object* edje = edje_object_add(evas_object_evas_get(win));
    for (int theme : {1, 2})
    {
        ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, theme), VCONF_OK);
        // Forget the colours of the previous theme so each theme is checked alone.
        uxt_theme_set_changeable_ui_enabled(false);
        uxt_theme_set_changeable_ui_enabled(true);
        ASSERT_EQ(uxt_theme_set_color_table(colors), UXT_THEME_ERROR_NONE);
        for (const char* code : {"AO803E1", "AO803E2", "AO803E3"})
            EXPECT_EQ(uxt_theme_object_replace_color(edje, "W157E1", code), UXT_THEME_ERROR_NONE)
                << code << " in theme " << theme;
    }
    evas_object_del(win);
    uxt_theme_delete_color_table(colors);
    if (fonts)
        uxt_theme_delete_font_table(fonts);
}

}  // namespace

#include "ChangeableTheme.h"

#include <Edje.h>
#include <gtest/gtest.h>

#include <sys/stat.h>

#include <memory>

#include "FileUtil.h"
#include "TestPlatform.h"
#include "ThemeTestSupport.h"

namespace
{
using namespace ThemeTest;
using NSWeather::ChangeableTheme;

const ClassColor THEME1_ACCENT{0x10, 0x20, 0x30, 0xFF};
const ClassColor THEME2_ACCENT{0xA0, 0xB0, 0xC0, 0xD0};

class ChangeableThemeTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        // FileUtil caches the shared resource folder of the previous root.
        NSWeather::FileUtil::ClearCache();
        mTableDir = mRoot.Path("apps/com.quorvex.weather-m/shared/res/tables/");
        mkdir(mTableDir.c_str(), 0755);
    }

    void TearDown() override
    {
        ResetTheme();
        NSWeather::FileUtil::ClearCache();
    }

    void WriteColorTable() { WriteText(mTableDir + "changeableColorInfo.xml", TwoThemeColorTable()); }
    void WriteFontTable() { WriteText(mTableDir + "changeableColorInfo_font.xml", OneFontTable()); }

    static bool HasFontClass()
    {
        const char* font = nullptr;
        Evas_Font_Size size = 0;
        return edje_text_class_get("T1511", &font, &size);
    }

    // Sets the theme key and waits until that change has been delivered
    // on the main loop, whoever else listens.
    void ChangeThemeKeyAndWait(int theme)
    {
        static int delivered;
        delivered = 0;
        auto controlCb = [](keynode_t*, void*) { ++delivered; };
        ASSERT_EQ(vconf_notify_key_changed(UXT_THEME_KEY_THEME, controlCb, nullptr), VCONF_OK);
        ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, theme), VCONF_OK);
        EXPECT_TRUE(RunLoopUntil([] { return delivered > 0; }));
        vconf_ignore_key_changed(UXT_THEME_KEY_THEME, controlCb);
    }

    static uxt_theme_style_e CurrentStyle()
    {
        uxt_theme_style_e style = UXT_THEME_STYLE_DEFAULT;
        EXPECT_EQ(uxt_theme_get_style(&style), UXT_THEME_ERROR_NONE);
        return style;
    }

    std::string mTableDir;
};

TEST_F(ChangeableThemeTest, InitLoadsAndAppliesBothTables)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    EXPECT_EQ(ChangeableTheme::GetColorTablePath(), mTableDir + "changeableColorInfo.xml");
    EXPECT_EQ(ChangeableTheme::GetFontTablePath(), mTableDir + "changeableColorInfo_font.xml");

    ASSERT_EQ(theme.InitChangeableTheme(), 0) << mLog.Dump();
    EXPECT_NE(theme.GetColorTable(), nullptr);
    EXPECT_NE(theme.GetFontTable(), nullptr);
    EXPECT_TRUE(uxt_theme_get_changeable_ui_enabled());
    EXPECT_EQ(GetClassColor("AO803E1"), THEME1_ACCENT);
    EXPECT_TRUE(HasFontClass());
    theme.DeinitChangeableTheme();
    EXPECT_EQ(theme.GetColorTable(), nullptr);
    EXPECT_EQ(theme.GetFontTable(), nullptr);
}

TEST_F(ChangeableThemeTest, MissingColorTableFailsBeforeFontTableIsLoaded)
{
    WriteFontTable();
    ChangeableTheme theme;
    EXPECT_EQ(theme.InitChangeableTheme(), -1);
    EXPECT_TRUE(mLog.Contains("(colorTable == NULL) [return]", "weather-ui-common")) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("(mColorTable == NULL) [return]", "weather-ui-common"));
    EXPECT_EQ(theme.GetFontTable(), nullptr);
    EXPECT_FALSE(HasFontClass());
}

TEST_F(ChangeableThemeTest, MissingFontTableKeepsColourTable)
{
    WriteColorTable();
    ChangeableTheme theme;
    EXPECT_EQ(theme.InitChangeableTheme(), -1);
    EXPECT_TRUE(mLog.Contains("(fontTable == NULL) [return]")) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("(mFontTable == NULL) [return]"));
    EXPECT_NE(theme.GetColorTable(), nullptr);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME1_ACCENT);
}

TEST_F(ChangeableThemeTest, UnknownSharedResourceFolderGivesEmptyPaths)
{
    std::string appDir = mRoot.Path("apps/com.quorvex.weather-m");
    ASSERT_EQ(system(("rm -rf '" + appDir + "'").c_str()), 0);
    EXPECT_EQ(ChangeableTheme::GetColorTablePath(), "");
    EXPECT_EQ(ChangeableTheme::GetFontTablePath(), "");
    EXPECT_EQ(mLog.Count("(ret.length() < 1) [return]", "weather-ui-common"), 2) << mLog.Dump();

    ChangeableTheme theme;
    EXPECT_EQ(theme.LoadColorTable(), nullptr);
    EXPECT_TRUE(mLog.Contains("(colorTablePath.length() < 1) [return]"));
    EXPECT_EQ(theme.LoadFontTable(), nullptr);
    EXPECT_TRUE(mLog.Contains("(fontTablePath.length() < 1) [return]"));
}

TEST_F(ChangeableThemeTest, UnloadingTwiceOnlyLogsTheSecondTime)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    uxt_theme_color_table_h colors = theme.GetColorTable();
    theme.UnloadColorTable();
    EXPECT_EQ(theme.GetColorTable(), nullptr);
    // The platform no longer knows the handle: it really was deleted.
    EXPECT_EQ(uxt_theme_set_color_table(colors), UXT_THEME_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(mLog.Count("(mColorTable == NULL) [return]"), 0);
    theme.UnloadColorTable();
    EXPECT_EQ(mLog.Count("(mColorTable == NULL) [return]"), 1);

    theme.DeinitChangeableTheme();
    theme.DeinitChangeableTheme();
    EXPECT_EQ(mLog.Count("(mColorTable == NULL) [return]"), 3);
    EXPECT_EQ(mLog.Count("(mFontTable == NULL) [return]"), 1);
}

TEST_F(ChangeableThemeTest, ThemeKeyChangeReappliesTheTables)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    ASSERT_EQ(GetClassColor("AO803E1"), THEME1_ACCENT);
    ChangeThemeKeyAndWait(2);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT);
}

TEST_F(ChangeableThemeTest, ChangeAfterFailedFontLoadReappliesColourAndStyleOnly)
{
    WriteColorTable();
    ChangeableTheme theme;
    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_LIGHT), UXT_THEME_ERROR_NONE);
    ASSERT_EQ(theme.InitChangeableTheme(), -1);
    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 2), VCONF_OK);

    ChangeableTheme::OnThemeChangedCb(nullptr, &theme);
    uxt_theme_style_e style = UXT_THEME_STYLE_LIGHT;
    ASSERT_EQ(uxt_theme_get_style(&style), UXT_THEME_ERROR_NONE);
    EXPECT_EQ(style, UXT_THEME_STYLE_DEFAULT);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT);
    EXPECT_FALSE(HasFontClass());
    EXPECT_FALSE(mLog.Contains("failed")) << mLog.Dump();
}

TEST_F(ChangeableThemeTest, CallbackWithoutObjectOnlyLogs)
{
    ChangeableTheme::OnThemeChangedCb(nullptr, nullptr);
    EXPECT_TRUE(mLog.Contains("(pThis == NULL) [return]", "weather-ui-common"));
}

TEST_F(ChangeableThemeTest, ThemeChangeAfterDeinitReachesNothing)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    theme.DeinitChangeableTheme();
    // A theme object that is reached resets the style to the default.
    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_DARK), UXT_THEME_ERROR_NONE);
    ChangeThemeKeyAndWait(2);
    EXPECT_EQ(CurrentStyle(), UXT_THEME_STYLE_DARK);

    // Nor a destroyed object that was never deinitialised.
    auto dropped = std::make_unique<ChangeableTheme>();
    ASSERT_EQ(dropped->InitChangeableTheme(), 0);
    dropped.reset();
    ChangeThemeKeyAndWait(1);
    EXPECT_EQ(CurrentStyle(), UXT_THEME_STYLE_DARK);
}

TEST_F(ChangeableThemeTest, EveryLiveThemeFollowsUntilItsOwnDeinit)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme first;
    ChangeableTheme second;
    ASSERT_EQ(first.InitChangeableTheme(), 0);
    ASSERT_EQ(second.InitChangeableTheme(), 0);
    first.DeinitChangeableTheme();

    ChangeThemeKeyAndWait(2);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT) << "the remaining view lost its registration";

    second.DeinitChangeableTheme();
    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_DARK), UXT_THEME_ERROR_NONE);
    ChangeThemeKeyAndWait(1);
    EXPECT_EQ(CurrentStyle(), UXT_THEME_STYLE_DARK);
}

TEST_F(ChangeableThemeTest, InitialisingTwiceDoesNotLeakTables)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    uxt_theme_color_table_h firstColors = theme.GetColorTable();
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    // While the first table lived, the second could not share its address.
    if (theme.GetColorTable() != firstColors)
    {
        EXPECT_EQ(uxt_theme_set_color_table(firstColors), UXT_THEME_ERROR_INVALID_PARAMETER);
    }
}

}  // namespace

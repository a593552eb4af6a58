#include "ChangeableTheme.h"

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

int gDelivered;
void DeliveredCb(keynode_t*, void*)
{
    ++gDelivered;
}

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

    // Sets the theme key and waits until the change has been delivered.
    static void ChangeThemeKeyAndWait(int theme)
    {
        gDelivered = 0;
        ASSERT_EQ(vconf_notify_key_changed(UXT_THEME_KEY_THEME, DeliveredCb, nullptr), VCONF_OK);
        ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, theme), VCONF_OK);
        EXPECT_TRUE(RunLoopUntil([] { return gDelivered > 0; }));
        vconf_ignore_key_changed(UXT_THEME_KEY_THEME, DeliveredCb);
    }

    // A theme object that a change reaches resets the style to the default.
    static uxt_theme_style_e CurrentStyle()
    {
        uxt_theme_style_e style = UXT_THEME_STYLE_DEFAULT;
        EXPECT_EQ(uxt_theme_get_style(&style), UXT_THEME_ERROR_NONE);
        return style;
    }

    std::string mTableDir;
};

TEST_F(ChangeableThemeTest, InitAppliesBothTablesAndKeyChangesApplyThemAgain)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0) << mLog.Dump();
    EXPECT_NE(theme.GetFontTable(), nullptr);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME1_ACCENT);
    EXPECT_TRUE(HasFontClass("T1511"));

    ChangeThemeKeyAndWait(2);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT);
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
    EXPECT_FALSE(HasFontClass("T1511"));
}

TEST_F(ChangeableThemeTest, ChangeAfterFailedFontLoadReappliesColourAndStyleOnly)
{
    WriteColorTable();
    ChangeableTheme theme;
    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_LIGHT), UXT_THEME_ERROR_NONE);
    ASSERT_EQ(theme.InitChangeableTheme(), -1);
    EXPECT_TRUE(mLog.Contains("(mFontTable == NULL) [return]")) << mLog.Dump();
    ASSERT_EQ(vconf_set_int(UXT_THEME_KEY_THEME, 2), VCONF_OK);

    ChangeableTheme::OnThemeChangedCb(nullptr, &theme);
    EXPECT_EQ(CurrentStyle(), UXT_THEME_STYLE_DEFAULT);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT);
    EXPECT_FALSE(HasFontClass("T1511"));
    EXPECT_FALSE(mLog.Contains("failed")) << mLog.Dump();

    ChangeableTheme::OnThemeChangedCb(nullptr, nullptr);
    EXPECT_TRUE(mLog.Contains("(pThis == NULL) [return]", "weather-ui-common"));
}

// Unload deletes the table; a second unload or deinit finds nothing to free.
TEST_F(ChangeableThemeTest, UnloadDeletesTheTablesOnce)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    uxt_theme_color_table_h colors = theme.GetColorTable();
    theme.UnloadColorTable();
    EXPECT_EQ(uxt_theme_set_color_table(colors), UXT_THEME_ERROR_INVALID_PARAMETER) << "not deleted";
    theme.UnloadColorTable();
    theme.DeinitChangeableTheme();
    theme.DeinitChangeableTheme();
    EXPECT_EQ(theme.GetFontTable(), nullptr);
}

// A change reaches every live theme, and none that was deinitialised or
// destroyed (ASan sees a callback into a freed one).
TEST_F(ChangeableThemeTest, OnlyLiveThemesFollowKeyChanges)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme first;
    auto second = std::make_unique<ChangeableTheme>();
    ASSERT_EQ(first.InitChangeableTheme(), 0);
    ASSERT_EQ(second->InitChangeableTheme(), 0);
    first.DeinitChangeableTheme();
    ChangeThemeKeyAndWait(2);
    EXPECT_EQ(GetClassColor("AO803E1"), THEME2_ACCENT) << "the remaining view lost its registration";

    second.reset();
    ASSERT_EQ(uxt_theme_set_style(UXT_THEME_STYLE_DARK), UXT_THEME_ERROR_NONE);
    ChangeThemeKeyAndWait(1);
    EXPECT_EQ(CurrentStyle(), UXT_THEME_STYLE_DARK);
}

TEST_F(ChangeableThemeTest, InitialisingTwiceReleasesTheFirstTables)
{
    WriteColorTable();
    WriteFontTable();
    ChangeableTheme theme;
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    uxt_theme_color_table_h first = theme.GetColorTable();
    ASSERT_EQ(theme.InitChangeableTheme(), 0);
    // While the first table lived, the second could not share its address.
    if (theme.GetColorTable() != first)
    {
        EXPECT_EQ(uxt_theme_set_color_table(first), UXT_THEME_ERROR_INVALID_PARAMETER);
    }
}

}  // namespace

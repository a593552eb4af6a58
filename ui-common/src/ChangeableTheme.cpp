#include "ChangeableTheme.h"

#include "FileUtil.h"
#include "ListenerList.h"
#include "UICommonLog.h"

namespace NSWeather
{

namespace
{
const char* const THEME_KEY = "db/setting/change_ui/theme";
const char* const TABLE_DIRECTORY = "tables/";
const char* const COLOR_TABLE_FILE = "changeableColorInfo.xml";
const char* const FONT_TABLE_FILE = "changeableColorInfo_font.xml";

// Theme objects between InitChangeableTheme and DeinitChangeableTheme.
// Every theme object with the theme key registered; a handler may end
// another theme object, which then is not called.
ListenerList<ChangeableTheme*>& LiveThemes()
{
    static ListenerList<ChangeableTheme*> themes;
    return themes;
}

std::string MakeTablePath(const char* fileName)
{
    std::string dir = FileUtil::GetSharedResourceDirectoryPath();
    if (dir.empty())
        return std::string();
    return dir + TABLE_DIRECTORY + fileName;
}
}  // namespace

ChangeableTheme::~ChangeableTheme()
{
    UnregisterThemeKey();
    UnloadTablesQuietly();
}

std::string ChangeableTheme::GetColorTablePath()
{
    std::string ret = MakeTablePath(COLOR_TABLE_FILE);
    UI_COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret;
}

std::string ChangeableTheme::GetFontTablePath()
{
    std::string ret = MakeTablePath(FONT_TABLE_FILE);
    UI_COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret;
}

int ChangeableTheme::InitChangeableTheme()
{
    int ret = uxt_theme_set_changeable_ui_enabled(true);
    if (ret != UXT_THEME_ERROR_NONE)
        UI_COMMON_LOG("uxt_theme_set_changeable_ui_enabled failed(%d)", ret);
    RegisterThemeKey();

    // A second initialisation must not leak the tables of the first.
    UnloadTablesQuietly();
    mColorTable = LoadColorTable();
    UI_COMMON_RETV_IF(mColorTable == NULL, -1);
    mFontTable = LoadFontTable();
    UI_COMMON_RETV_IF(mFontTable == NULL, -1);
    return 0;
}

void ChangeableTheme::DeinitChangeableTheme()
{
    UnregisterThemeKey();
    UnloadColorTable();
    UnloadFontTable();
}

uxt_theme_color_table_h ChangeableTheme::LoadColorTable()
{
    std::string colorTablePath = GetColorTablePath();
    UI_COMMON_RETV_IF(colorTablePath.length() < 1, nullptr);
    uxt_theme_color_table_h colorTable = uxt_theme_add_color_table(colorTablePath.c_str());
    UI_COMMON_RETV_IF(colorTable == NULL, nullptr);
    if (uxt_theme_set_color_table(colorTable) != UXT_THEME_ERROR_NONE)
        UI_COMMON_LOG("uxt_theme_set_color_table failed");
    return colorTable;
}

uxt_theme_font_table_h ChangeableTheme::LoadFontTable()
{
    std::string fontTablePath = GetFontTablePath();
    UI_COMMON_RETV_IF(fontTablePath.length() < 1, nullptr);
    uxt_theme_font_table_h fontTable = uxt_theme_add_font_table(fontTablePath.c_str());
    UI_COMMON_RETV_IF(fontTable == NULL, nullptr);
    if (uxt_theme_set_font_table(fontTable) != UXT_THEME_ERROR_NONE)
        UI_COMMON_LOG("uxt_theme_set_font_table failed");
    return fontTable;
}

void ChangeableTheme::UnloadColorTable()
{
    UI_COMMON_RET_IF(mColorTable == NULL);
    uxt_theme_delete_color_table(mColorTable);
    mColorTable = nullptr;
}

void ChangeableTheme::UnloadFontTable()
{
    UI_COMMON_RET_IF(mFontTable == NULL);
    uxt_theme_delete_font_table(mFontTable);
    mFontTable = nullptr;
}

void ChangeableTheme::UnloadTablesQuietly()
{
    if (mColorTable)
        UnloadColorTable();
    if (mFontTable)
        UnloadFontTable();
}

void ChangeableTheme::OnThemeChangedCb(keynode_t* node, void* data)
{
    (void)node;
    ForwardCallback<ChangeableTheme>(
        data, [](ChangeableTheme& theme) { theme.OnThemeChanged(); }, UI_COMMON_CALLBACK_SITE);
}

void ChangeableTheme::ThemeKeyChangedCb(keynode_t* node, void* data)
{
    (void)data;
    LiveThemes().Notify([node](ChangeableTheme* theme) { OnThemeChangedCb(node, theme); });
}

void ChangeableTheme::OnThemeChanged()
{
    if (mColorTable && uxt_theme_set_color_table(mColorTable) != UXT_THEME_ERROR_NONE)
        UI_COMMON_LOG("uxt_theme_set_color_table failed");
    if (mFontTable && uxt_theme_set_font_table(mFontTable) != UXT_THEME_ERROR_NONE)
        UI_COMMON_LOG("uxt_theme_set_font_table failed");
    if (uxt_theme_set_style(UXT_THEME_STYLE_DEFAULT) != UXT_THEME_ERROR_NONE)
        UI_COMMON_LOG("uxt_theme_set_style failed");
}

void ChangeableTheme::RegisterThemeKey()
{
    if (mIsThemeKeyRegistered)
        return;
    auto& themes = LiveThemes();
    if (themes.IsEmpty())
    {
        int ret = vconf_notify_key_changed(THEME_KEY, ThemeKeyChangedCb, nullptr);
        UI_COMMON_RET_IF(ret != VCONF_OK);
    }
    themes.Add(this);
    mIsThemeKeyRegistered = true;
}

void ChangeableTheme::UnregisterThemeKey()
{
    if (!mIsThemeKeyRegistered)
        return;
    auto& themes = LiveThemes();
    themes.Remove(this);
    mIsThemeKeyRegistered = false;
    if (themes.IsEmpty() && vconf_ignore_key_changed(THEME_KEY, ThemeKeyChangedCb) != VCONF_OK)
        UI_COMMON_LOG("vconf_ignore_key_changed failed");
}

}  // namespace NSWeather

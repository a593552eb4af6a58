#ifndef NSWEATHER_CHANGEABLE_THEME_H
#define NSWEATHER_CHANGEABLE_THEME_H

#include <memory>
#include <string>

#include <uxt_theme.h>
#include <vconf.h>

namespace NSWeather
{

// Makes a view follow the platform's colour theme: loads the weather
// application's colour and font tables, applies them and applies them
// again whenever the theme key changes, until DeinitChangeableTheme.
class ChangeableTheme
{
public:
    ChangeableTheme() = default;
    // Deinitialises if still initialised, so that no theme change can
    // reach a destroyed object.
    ~ChangeableTheme();
    ChangeableTheme(const ChangeableTheme&) = delete;
    ChangeableTheme& operator=(const ChangeableTheme&) = delete;

    // 0 on success, -1 when a table cannot be loaded.
    int InitChangeableTheme();
    void DeinitChangeableTheme();

    uxt_theme_color_table_h LoadColorTable();
    uxt_theme_font_table_h LoadFontTable();
    void UnloadColorTable();
    void UnloadFontTable();

    uxt_theme_color_table_h GetColorTable() const { return mColorTable; }
    uxt_theme_font_table_h GetFontTable() const { return mFontTable; }

    // Empty when the shared resource directory is unknown.
    static std::string GetColorTablePath();
    static std::string GetFontTablePath();

    // Re-applies the tables of the theme object `data`.
    static void OnThemeChangedCb(keynode_t* node, void* data);

private:
    // The theme key is watched once for the process: vconf keeps one
    // registration per (key, callback) and removes by that pair alone, so
    // per-object registrations would collide between widget instances.
    static void ThemeKeyChangedCb(keynode_t* node, void* data);
    void OnThemeChanged();
    void RegisterThemeKey();
    void UnregisterThemeKey();
    void UnloadTablesQuietly();

    uxt_theme_color_table_h mColorTable = nullptr;
    uxt_theme_font_table_h mFontTable = nullptr;
    bool mIsThemeKeyRegistered = false;
};

typedef std::shared_ptr<ChangeableTheme> ChangeableThemePtr;

}  // namespace NSWeather

#endif

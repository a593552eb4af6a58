#ifndef PLATFORM_THEME_THEME_STATE_H
#define PLATFORM_THEME_THEME_STATE_H

#include <map>
#include <set>
#include <string>
#include <vector>

#include "ListenerList.h"
#include "theme/ThemeTable.h"
#include "uxt_theme.h"
#include "vconf.h"

namespace platform
{
namespace theme
{

// The process's theme: which tables exist and which are current, the
// colours and fonts applied to Edje, and the change callbacks. Main loop
// only, like Edje itself.
class ThemeState
{
public:
    static ThemeState& GetInstance();

    int SetEnabled(bool enabled);
    bool GetIsEnabled() const { return mIsEnabled; }

    uxt_theme_color_table_h AddColorTable(const char* path);
    int DeleteColorTable(uxt_theme_color_table_h table);
    int SetColorTable(uxt_theme_color_table_h table);

    uxt_theme_font_table_h AddFontTable(const char* path);
    int DeleteFontTable(uxt_theme_font_table_h table);
    int SetFontTable(uxt_theme_font_table_h table);

    int SetStyle(int style);
    uxt_theme_style_e GetStyle() const { return mStyle; }

    int ReplaceObjectColor(Evas_Object* obj, const char* code, const char* newCode);

    int AddChangedCallback(int type, uxt_theme_changed_cb cb, void* userData);
    int RemoveChangedCallback(int type, uxt_theme_changed_cb cb);

private:
    // One callback a type; its user data does not tell two apart.
    struct Listener
    {
        uxt_theme_changed_cb cb;
        void* userData;
        bool operator==(const Listener& other) const { return cb == other.cb; }
    };

    ThemeState() = default;
    const ThemeSection* ChooseSection(const _uxt_theme_color_table& table) const;
    void ApplyColors(const _uxt_theme_color_table& table);
    void ApplyFonts(const _uxt_theme_font_table& table);
    void ClearAppliedColors();
    void ClearAppliedFonts();
    bool WatchKeys(int type, bool watch);
    NSWeather::ListenerList<Listener>& GetListeners(int type);
    void Notify(int type);
    static void ColorKeyChangedCb(keynode_t* node, void* data);
    static void FontKeyChangedCb(keynode_t* node, void* data);

    bool mIsEnabled = false;
    uxt_theme_style_e mStyle = UXT_THEME_STYLE_DEFAULT;
    std::set<uxt_theme_color_table_h> mColorTables;
    std::set<uxt_theme_font_table_h> mFontTables;
    uxt_theme_color_table_h mCurrentColorTable = nullptr;
    uxt_theme_font_table_h mCurrentFontTable = nullptr;
    // Kept after their table is deleted: other views still show them.
    std::map<std::string, ThemeColor> mAppliedColors;
    std::set<std::string> mAppliedFontCodes;
    NSWeather::ListenerList<Listener> mColorListeners;
    NSWeather::ListenerList<Listener> mFontListeners;
};

}  // namespace theme
}  // namespace platform

#endif

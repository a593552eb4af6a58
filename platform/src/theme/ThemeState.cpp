#include "theme/ThemeState.h"

#include <Edje.h>
#include <Elementary.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <memory>

#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

namespace platform
{
namespace theme
{

namespace
{
const char* const LOG_TAG = "platform-theme";
const char* const PRESSED_SUFFIX = "_press";
// Table files are a few kilobytes; anything far larger is not a table.
const size_t MAX_TABLE_BYTES = 1024 * 1024;

int ReadTable(const char* path, std::string& xml)
{
    if (!path || !*path)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    // Tables may be installed as links; FIFOs and devices are refused.
    if (ReadFile(path, xml, MAX_TABLE_BYTES, true))
        return UXT_THEME_ERROR_NONE;
    if (errno == EFBIG)
    {
        dlog_print(DLOG_ERROR, LOG_TAG, "theme table %s is larger than %zu bytes", path, MAX_TABLE_BYTES);
        return UXT_THEME_ERROR_NO_DATA;
    }
    dlog_print(DLOG_ERROR, LOG_TAG, "cannot read theme table %s (%s)", path, strerror(errno));
    return UXT_THEME_ERROR_IO_ERROR;
}

void SetColorClass(const std::string& name, const Rgba& c, const Rgba& o, const Rgba& s)
{
    edje_color_class_set(name.c_str(), c.r, c.g, c.b, c.a, o.r, o.g, o.b, o.a, s.r, s.g, s.b, s.a);
}

const char* StyleName(uxt_theme_style_e style)
{
    switch (style)
    {
        case UXT_THEME_STYLE_DARK:
            return "dark";
        case UXT_THEME_STYLE_LIGHT:
            return "light";
        default:
            return "";
    }
}

Evas_Object* EdjeOf(Evas_Object* obj)
{
    const char* type = evas_object_type_get(obj);
    if (type && strcmp(type, "edje") == 0)
        return obj;
    if (!elm_object_widget_check(obj))
        return nullptr;
    return elm_layout_edje_get(obj);
}
}  // namespace

ThemeState& ThemeState::GetInstance()
{
    static ThemeState state;
    return state;
}

int ThemeState::SetEnabled(bool enabled)
{
    if (mIsEnabled && !enabled)
    {
        ClearAppliedColors();
        ClearAppliedFonts();
    }
    mIsEnabled = enabled;
    return UXT_THEME_ERROR_NONE;
}

uxt_theme_color_table_h ThemeState::AddColorTable(const char* path)
{
    std::string xml;
    int ret = ReadTable(path, xml);
    auto table = std::make_unique<_uxt_theme_color_table>();
    if (ret == UXT_THEME_ERROR_NONE)
        ret = ParseColorTable(xml, *table);
    set_last_result(ret);
    if (ret != UXT_THEME_ERROR_NONE)
        return nullptr;
    mColorTables.insert(table.get());
    return table.release();
}

int ThemeState::DeleteColorTable(uxt_theme_color_table_h table)
{
    if (!mColorTables.erase(table))
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    if (mCurrentColorTable == table)
        mCurrentColorTable = nullptr;
    delete table;
    return UXT_THEME_ERROR_NONE;
}

int ThemeState::SetColorTable(uxt_theme_color_table_h table)
{
    if (!mColorTables.count(table))
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    if (!mIsEnabled)
        return UXT_THEME_ERROR_INVALID_OPERATION;
    mCurrentColorTable = table;
    ApplyColors(*table);
    return UXT_THEME_ERROR_NONE;
}

uxt_theme_font_table_h ThemeState::AddFontTable(const char* path)
{
    std::string xml;
    int ret = ReadTable(path, xml);
    auto table = std::make_unique<_uxt_theme_font_table>();
    if (ret == UXT_THEME_ERROR_NONE)
        ret = ParseFontTable(xml, *table);
    set_last_result(ret);
    if (ret != UXT_THEME_ERROR_NONE)
        return nullptr;
    mFontTables.insert(table.get());
    return table.release();
}

int ThemeState::DeleteFontTable(uxt_theme_font_table_h table)
{
    if (!mFontTables.erase(table))
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    if (mCurrentFontTable == table)
        mCurrentFontTable = nullptr;
    delete table;
    return UXT_THEME_ERROR_NONE;
}

int ThemeState::SetFontTable(uxt_theme_font_table_h table)
{
    if (!mFontTables.count(table))
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    if (!mIsEnabled)
        return UXT_THEME_ERROR_INVALID_OPERATION;
    mCurrentFontTable = table;
    ApplyFonts(*table);
    return UXT_THEME_ERROR_NONE;
}

int ThemeState::SetStyle(int style)
{
    if (style < UXT_THEME_STYLE_DEFAULT || style > UXT_THEME_STYLE_LIGHT)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    mStyle = static_cast<uxt_theme_style_e>(style);
    if (mIsEnabled && mCurrentColorTable)
        ApplyColors(*mCurrentColorTable);
    if (mIsEnabled && mCurrentFontTable)
        ApplyFonts(*mCurrentFontTable);
    return UXT_THEME_ERROR_NONE;
}

const ThemeSection* ThemeState::ChooseSection(const _uxt_theme_color_table& table) const
{
    if (table.sections.empty())
        return nullptr;
    auto begin = table.sections.begin();
    auto end = table.sections.end();
    auto found = end;
    if (mStyle != UXT_THEME_STYLE_DEFAULT)
    {
        std::string wanted = StyleName(mStyle);
        found = std::find_if(begin, end, [&](const ThemeSection& s) { return s.style == wanted; });
    }
    int themeId = 0;
    if (found == end && vconf_get_int(UXT_THEME_KEY_THEME, &themeId) == VCONF_OK)
        found = std::find_if(begin, end, [&](const ThemeSection& s) { return s.id == themeId; });
    return found == end ? &table.sections.front() : &*found;
}

void ThemeState::ApplyColors(const _uxt_theme_color_table& table)
{
    const ThemeSection* section = ChooseSection(table);
    if (!section)
        return;
    for (const auto& [code, color] : section->colors)
    {
        SetColorClass(code, color.normal, color.outline, color.shadow);
        if (color.hasPressed)
            SetColorClass(code + PRESSED_SUFFIX, color.pressed, color.outline, color.shadow);
        else if (mAppliedColors.count(code) && mAppliedColors[code].hasPressed)
            edje_color_class_del((code + PRESSED_SUFFIX).c_str());
        mAppliedColors[code] = color;
    }
}

void ThemeState::ApplyFonts(const _uxt_theme_font_table& table)
{
    for (const auto& [code, font] : table.fonts)
    {
        edje_text_class_set(code.c_str(), font.name.empty() ? nullptr : font.name.c_str(), font.size);
        mAppliedFontCodes.insert(code);
    }
}

void ThemeState::ClearAppliedColors()
{
    for (const auto& [code, color] : mAppliedColors)
    {
        edje_color_class_del(code.c_str());
        if (color.hasPressed)
            edje_color_class_del((code + PRESSED_SUFFIX).c_str());
    }
    mAppliedColors.clear();
}

void ThemeState::ClearAppliedFonts()
{
    for (const std::string& code : mAppliedFontCodes) edje_text_class_del(code.c_str());
    mAppliedFontCodes.clear();
}

int ThemeState::ReplaceObjectColor(Evas_Object* obj, const char* code, const char* newCode)
{
    if (!obj || !code || !*code || !newCode || !*newCode)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    auto it = mAppliedColors.find(newCode);
    if (it == mAppliedColors.end())
        return UXT_THEME_ERROR_NO_DATA;
    Evas_Object* edje = EdjeOf(obj);
    if (!edje)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    const ThemeColor& c = it->second;
    Eina_Bool ok = edje_object_color_class_set(edje, code, c.normal.r, c.normal.g, c.normal.b, c.normal.a,
                                               c.outline.r, c.outline.g, c.outline.b, c.outline.a, c.shadow.r,
                                               c.shadow.g, c.shadow.b, c.shadow.a);
    return ok ? UXT_THEME_ERROR_NONE : UXT_THEME_ERROR_INVALID_OPERATION;
}

int ThemeState::AddChangedCallback(int type, uxt_theme_changed_cb cb, void* userData)
{
    if ((type != UXT_THEME_CHANGED_TYPE_COLOR && type != UXT_THEME_CHANGED_TYPE_FONT) || !cb)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    auto& listeners = GetListeners(type);
    if (listeners.Contains({cb, userData}))
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    if (listeners.IsEmpty() && !WatchKeys(type, true))
        return UXT_THEME_ERROR_IO_ERROR;
    listeners.Add({cb, userData});
    return UXT_THEME_ERROR_NONE;
}

int ThemeState::RemoveChangedCallback(int type, uxt_theme_changed_cb cb)
{
    if (type != UXT_THEME_CHANGED_TYPE_COLOR && type != UXT_THEME_CHANGED_TYPE_FONT)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    auto& listeners = GetListeners(type);
    if (!listeners.Remove({cb, nullptr}))
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    if (listeners.IsEmpty())
        WatchKeys(type, false);
    return UXT_THEME_ERROR_NONE;
}

NSWeather::ListenerList<ThemeState::Listener>& ThemeState::GetListeners(int type)
{
    return type == UXT_THEME_CHANGED_TYPE_COLOR ? mColorListeners : mFontListeners;
}

bool ThemeState::WatchKeys(int type, bool watch)
{
    std::vector<const char*> keys;
    vconf_callback_fn cb = nullptr;
    if (type == UXT_THEME_CHANGED_TYPE_COLOR)
    {
        keys = {UXT_THEME_KEY_THEME};
        cb = ColorKeyChangedCb;
    }
    else
    {
        keys = {UXT_THEME_KEY_FONT_NAME, UXT_THEME_KEY_FONT_SIZE};
        cb = FontKeyChangedCb;
    }
    bool ok = true;
    for (size_t i = 0; i < keys.size(); ++i)
    {
        if (!watch)
        {
            vconf_ignore_key_changed(keys[i], cb);
            continue;
        }
        if (vconf_notify_key_changed(keys[i], cb, this) != VCONF_OK)
        {
            dlog_print(DLOG_ERROR, LOG_TAG, "cannot watch %s", keys[i]);
            for (size_t j = 0; j < i; ++j) vconf_ignore_key_changed(keys[j], cb);
            ok = false;
            break;
        }
    }
    return ok;
}

// A callback may remove itself or others.
void ThemeState::Notify(int type)
{
    GetListeners(type).Notify([](const Listener& listener) { listener.cb(listener.userData); });
}

void ThemeState::ColorKeyChangedCb(keynode_t*, void* data)
{
    NSWeather::ForwardCallback<ThemeState>(
        data, [](ThemeState& state) { state.Notify(UXT_THEME_CHANGED_TYPE_COLOR); },
        PLATFORM_CALLBACK_SITE(LOG_TAG));
}

void ThemeState::FontKeyChangedCb(keynode_t*, void* data)
{
    NSWeather::ForwardCallback<ThemeState>(
        data, [](ThemeState& state) { state.Notify(UXT_THEME_CHANGED_TYPE_FONT); },
        PLATFORM_CALLBACK_SITE(LOG_TAG));
}

}  // namespace theme
}  // namespace platform

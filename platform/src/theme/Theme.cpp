// The uxt_theme_* functions over the process's ThemeState.
#include "uxt_theme.h"

#include "core/ApiGuard.h"
#include "theme/ThemeState.h"

using platform::theme::ThemeState;

namespace
{
const char* const kLogTag = "platform-theme";

// No C++ exception may cross into C callers.
template <typename Result, typename Call>
Result Guarded(Result onFailure, Call call)
{
    return platform::GuardedCall(kLogTag, onFailure, call);
}
}  // namespace

extern "C" int uxt_theme_set_changeable_ui_enabled(bool enabled)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().SetEnabled(enabled); });
}

extern "C" bool uxt_theme_get_changeable_ui_enabled(void)
{
    return Guarded<bool>(false, [] { return ThemeState::GetInstance().GetIsEnabled(); });
}

extern "C" uxt_theme_color_table_h uxt_theme_add_color_table(const char* file_path)
{
    return Guarded<uxt_theme_color_table_h>(
        nullptr, [&] { return ThemeState::GetInstance().AddColorTable(file_path); });
}

extern "C" int uxt_theme_delete_color_table(uxt_theme_color_table_h table)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().DeleteColorTable(table); });
}

extern "C" int uxt_theme_set_color_table(uxt_theme_color_table_h table)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().SetColorTable(table); });
}

extern "C" uxt_theme_font_table_h uxt_theme_add_font_table(const char* file_path)
{
    return Guarded<uxt_theme_font_table_h>(nullptr,
                                           [&] { return ThemeState::GetInstance().AddFontTable(file_path); });
}

extern "C" int uxt_theme_delete_font_table(uxt_theme_font_table_h table)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().DeleteFontTable(table); });
}

extern "C" int uxt_theme_set_font_table(uxt_theme_font_table_h table)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().SetFontTable(table); });
}

extern "C" int uxt_theme_set_style(uxt_theme_style_e style)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().SetStyle(static_cast<int>(style)); });
}

extern "C" int uxt_theme_get_style(uxt_theme_style_e* style)
{
    if (!style)
        return UXT_THEME_ERROR_INVALID_PARAMETER;
    *style = Guarded<uxt_theme_style_e>(UXT_THEME_STYLE_DEFAULT,
                                        [] { return ThemeState::GetInstance().GetStyle(); });
    return UXT_THEME_ERROR_NONE;
}

extern "C" int uxt_theme_object_replace_color(Evas_Object* obj, const char* code, const char* new_code)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] { return ThemeState::GetInstance().ReplaceObjectColor(obj, code, new_code); });
}

extern "C" int uxt_theme_add_changed_callback(uxt_theme_changed_type_e type, uxt_theme_changed_cb callback,
                                              void* user_data)
{
    return Guarded<int>(UXT_THEME_ERROR_OUT_OF_MEMORY,
                        [&] {
                            return ThemeState::GetInstance().AddChangedCallback(static_cast<int>(type),
                                                                                callback, user_data);
                        });
}

extern "C" int uxt_theme_remove_changed_callback(uxt_theme_changed_type_e type, uxt_theme_changed_cb callback)
{
    return Guarded<int>(
        UXT_THEME_ERROR_OUT_OF_MEMORY,
        [&] { return ThemeState::GetInstance().RemoveChangedCallback(static_cast<int>(type), callback); });
}

#ifndef PLATFORM_UXT_THEME_H
#define PLATFORM_UXT_THEME_H

#include <stdbool.h>
#include <Evas.h>

#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

/*
 * Changeable colour and font themes.
 *
 * A colour table maps colour codes to colours; applying it sets one Edje
 * colour class per code (class name = code) for the whole process, and a
 * class "<code>_press" for codes that have a pressed colour. A font table
 * maps font codes to a font name and size; applying it sets one Edje text
 * class per code.
 *
 * Colour table file:
 *   <ChangeableColorTable>
 *     <Theme id="1" style="light">
 *       <Color code="AO803E1" normal="#2F7FD3FF" pressed="#1C5EA3FF"
 *              outline="#00000000" shadow="#0000007F"/>
 *     </Theme>
 *     <Theme id="2" style="dark"> ... </Theme>
 *   </ChangeableColorTable>
 * Colours are "#RRGGBB" or "#RRGGBBAA"; outline and shadow default to
 * opaque white, which keeps the layout's own (Edje multiplies). The theme applied is the one
 * whose id equals the int system key UXT_THEME_KEY_THEME under style
 * DEFAULT, the first one of the matching style under DARK or LIGHT, and
 * otherwise the first theme of the file.
 *
 * Font table file:
 *   <ChangeableFontTable>
 *     <Font code="T0311" name="Sans:style=Bold" size="34"/>
 *   </ChangeableFontTable>
 * Without a size, or with 0, each layout keeps its own size; a negative
 * size is a percentage of it (Edje text class sizes).
 */

/* System keys behind the change notifications. */
#define UXT_THEME_KEY_THEME "db/setting/change_ui/theme"             /* int: theme id */
#define UXT_THEME_KEY_FONT_NAME "db/setting/accessibility/font_name" /* string */
#define UXT_THEME_KEY_FONT_SIZE "db/setting/accessibility/font_size" /* int */

    typedef enum
    {
        UXT_THEME_ERROR_NONE = TIZEN_ERROR_NONE,
        UXT_THEME_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        UXT_THEME_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        UXT_THEME_ERROR_IO_ERROR = TIZEN_ERROR_IO_ERROR,
        UXT_THEME_ERROR_NO_DATA = TIZEN_ERROR_NO_DATA,
        UXT_THEME_ERROR_INVALID_OPERATION = TIZEN_ERROR_INVALID_OPERATION,
    } uxt_theme_error_e;

    typedef enum
    {
        UXT_THEME_STYLE_DEFAULT = 0,
        UXT_THEME_STYLE_DARK = 1,
        UXT_THEME_STYLE_LIGHT = 2,
    } uxt_theme_style_e;

    typedef enum
    {
        UXT_THEME_CHANGED_TYPE_COLOR = 0, /* fired on UXT_THEME_KEY_THEME */
        UXT_THEME_CHANGED_TYPE_FONT = 1,  /* fired on the font name and size keys */
    } uxt_theme_changed_type_e;

    typedef struct _uxt_theme_color_table* uxt_theme_color_table_h;
    typedef struct _uxt_theme_font_table* uxt_theme_font_table_h;

    /* Runs on the Ecore main loop after the theme keys changed. */
    typedef void (*uxt_theme_changed_cb)(void* user_data);

    /* Whether tables are applied to Edje at all; off at start. While off,
     * set_color_table/set_font_table give INVALID_OPERATION; switching off
     * removes the applied classes, so layouts show their own colours again. */
    int uxt_theme_set_changeable_ui_enabled(bool enabled);
    bool uxt_theme_get_changeable_ui_enabled(void);

    /* Parses a table file. NULL on failure, with get_last_result():
     * INVALID_PARAMETER (no path), IO_ERROR (unreadable), NO_DATA (malformed
     * or no entry). The caller deletes the table. A deleted or unknown
     * handle gives INVALID_PARAMETER everywhere. Main loop only. */
    uxt_theme_color_table_h uxt_theme_add_color_table(const char* file_path);
    int uxt_theme_delete_color_table(uxt_theme_color_table_h table);
    /* Applies the table's colours and keeps it as the current colour table
     * until it is deleted. */
    int uxt_theme_set_color_table(uxt_theme_color_table_h table);

    uxt_theme_font_table_h uxt_theme_add_font_table(const char* file_path);
    int uxt_theme_delete_font_table(uxt_theme_font_table_h table);
    int uxt_theme_set_font_table(uxt_theme_font_table_h table);

    /* Chooses the theme of the current tables by style and applies them
     * again. INVALID_PARAMETER for a value outside the enum. */
    int uxt_theme_set_style(uxt_theme_style_e style);
    int uxt_theme_get_style(uxt_theme_style_e* style);

    /* Gives the Edje object of `obj` (or of the layout `obj`) the colour of
     * `new_code` under the colour class `code`, taken from the colours last
     * applied. NO_DATA when `new_code` has no applied colour. */
    int uxt_theme_object_replace_color(Evas_Object* obj, const char* code, const char* new_code);

    /* A (type, callback) pair can be registered once; a second registration
     * gives INVALID_PARAMETER. Removing an unknown pair gives
     * INVALID_PARAMETER. */
    int uxt_theme_add_changed_callback(uxt_theme_changed_type_e type, uxt_theme_changed_cb callback,
                                       void* user_data);
    int uxt_theme_remove_changed_callback(uxt_theme_changed_type_e type, uxt_theme_changed_cb callback);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_THEME_THEME_TABLE_H
#define PLATFORM_THEME_THEME_TABLE_H

#include <map>
#include <string>
#include <vector>

#include "uxt_theme.h"

namespace platform
{
namespace theme
{

struct Rgba
{
    unsigned char r = 0, g = 0, b = 0, a = 0;
};

// One colour code: Edje's three colours of a class, and an optional
// pressed colour published as the class "<code>_press".
struct ThemeColor
{
    Rgba normal;
    // Edje multiplies a part's outline and shadow by these; opaque white
    // keeps the layout's own.
    Rgba outline{255, 255, 255, 255};
    Rgba shadow{255, 255, 255, 255};
    Rgba pressed;
    bool hasPressed = false;
};

struct ThemeSection
{
    int id = 0;
    std::string style;  // "", "dark" or "light"
    std::map<std::string, ThemeColor> colors;
};

struct FontEntry
{
    std::string name;  // empty: the layout's font
    int size = 0;      // 0: the layout's size; negative: a percentage of it
};

// Parses "#RRGGBB" or "#RRGGBBAA" (alpha 255 when omitted).
bool ParseRgba(const std::string& text, Rgba& out);

}  // namespace theme
}  // namespace platform

struct _uxt_theme_color_table
{
    std::vector<platform::theme::ThemeSection> sections;
};

struct _uxt_theme_font_table
{
    std::map<std::string, platform::theme::FontEntry> fonts;
};

namespace platform
{
namespace theme
{

// Both give a UXT_THEME_ERROR_* code; a table without any entry, a wrong
// root element or a malformed value gives NO_DATA.
int ParseColorTable(const std::string& xml, _uxt_theme_color_table& table);
int ParseFontTable(const std::string& xml, _uxt_theme_font_table& table);

}  // namespace theme
}  // namespace platform

#endif

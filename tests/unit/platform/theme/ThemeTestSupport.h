#ifndef WEATHER_TESTS_UI_COMMON_THEME_TEST_SUPPORT_H
#define WEATHER_TESTS_UI_COMMON_THEME_TEST_SUPPORT_H

#include <Ecore.h>
#include <Edje.h>

#include <array>
#include <functional>
#include <string>

#include <uxt_theme.h>

#include "MainLoop.h"
#include "TestFiles.h"

namespace ThemeTest
{
// r, g, b, a of a colour class; all -1 when the class is unset.
typedef std::array<int, 4> Rgba;
const Rgba UNSET{-1, -1, -1, -1};
// The two themes of TwoThemeColorTable differ in every colour.
const Rgba THEME1_ACCENT{0x10, 0x20, 0x30, 0xFF};
const Rgba THEME2_ACCENT{0xA0, 0xB0, 0xC0, 0xD0};

inline Rgba GetClassColor(const std::string& name)
{
    Rgba c;
    int o[8];
    if (!edje_color_class_get(name.c_str(), &c[0], &c[1], &c[2], &c[3], &o[0], &o[1], &o[2], &o[3], &o[4],
                              &o[5], &o[6], &o[7]))
        return UNSET;
    return c;
}

using WeatherTest::WriteText;

// Runs the main loop until `done` holds or three seconds pass.
inline bool RunLoopUntil(const std::function<bool()>& done)
{
    return WeatherTest::RunLoopUntil(done, 3.0);
}

inline std::string TwoThemeColorTable()
{
    return "<?xml version=\"1.0\"?>\n<ChangeableColorTable>\n"
           "  <Theme id=\"1\" style=\"light\">\n"
           "    <Color code=\"AO803E1\" normal=\"#102030FF\" pressed=\"#11223344\"/>\n"
           "    <Color code=\"W1511\" normal=\"#FFFFFF\"/>\n"
           "  </Theme>\n"
           "  <Theme id=\"2\" style=\"dark\">\n"
           "    <Color code=\"AO803E1\" normal=\"#A0B0C0D0\"/>\n"
           "    <Color code=\"W1511\" normal=\"#000000\"/>\n"
           "  </Theme>\n</ChangeableColorTable>\n";
}

inline std::string OneFontTable()
{
    return "<ChangeableFontTable><Font code=\"T1511\" name=\"Sans:style=Bold\" "
           "size=\"40\"/></ChangeableFontTable>";
}

inline bool HasFontClass(const char* code)
{
    const char* font = nullptr;
    Evas_Font_Size size = 0;
    return edje_text_class_get(code, &font, &size);
}

// Leaves the process-wide theme as a fresh process has it.
inline void ResetTheme()
{
    uxt_theme_set_style(UXT_THEME_STYLE_DEFAULT);
    uxt_theme_set_changeable_ui_enabled(false);
}

}  // namespace ThemeTest

#endif

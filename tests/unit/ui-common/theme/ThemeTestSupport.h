#ifndef WEATHER_TESTS_UI_COMMON_THEME_TEST_SUPPORT_H
#define WEATHER_TESTS_UI_COMMON_THEME_TEST_SUPPORT_H

#include <Ecore.h>
#include <Edje.h>

#include <fstream>
#include <functional>
#include <ostream>
#include <string>
#include <unistd.h>

#include <uxt_theme.h>

namespace ThemeTest
{

inline void WriteText(const std::string& path, const std::string& text)
{
    std::ofstream(path, std::ios::binary) << text;
}

// Runs the main loop until `done` holds or `seconds` pass.
inline bool RunLoopUntil(const std::function<bool()>& done, double seconds = 3.0)
{
    double end = ecore_time_get() + seconds;
    while (!done())
    {
        if (ecore_time_get() > end)
            return false;
        ecore_main_loop_iterate();
        usleep(2000);
    }
    return true;
}

struct ClassColor
{
    int r = -1, g = -1, b = -1, a = -1;
    bool operator==(const ClassColor& o) const { return r == o.r && g == o.g && b == o.b && a == o.a; }
    bool operator!=(const ClassColor& o) const { return !(*this == o); }
};

inline std::ostream& operator<<(std::ostream& out, const ClassColor& c)
{
    return out << "(" << c.r << ", " << c.g << ", " << c.b << ", " << c.a << ")";
}

// The normal colour of a process-wide colour class; all -1 when unset.
inline ClassColor GetClassColor(const std::string& name)
{
    ClassColor c;
    int ignored[8];
    if (!edje_color_class_get(name.c_str(), &c.r, &c.g, &c.b, &c.a, &ignored[0], &ignored[1], &ignored[2],
                              &ignored[3], &ignored[4], &ignored[5], &ignored[6], &ignored[7]))
        return ClassColor();
    return c;
}

// Two themes that differ in every colour, so a re-application is visible.
inline std::string TwoThemeColorTable()
{
    return "<?xml version=\"1.0\"?>\n"
           "<ChangeableColorTable>\n"
           "  <Theme id=\"1\" style=\"light\">\n"
           "    <Color code=\"AO803E1\" normal=\"#102030FF\" pressed=\"#11223344\"/>\n"
           "    <Color code=\"W1511\" normal=\"#FFFFFF\"/>\n"
           "  </Theme>\n"
           "  <Theme id=\"2\" style=\"dark\">\n"
           "    <Color code=\"AO803E1\" normal=\"#A0B0C0D0\"/>\n"
           "    <Color code=\"W1511\" normal=\"#000000\"/>\n"
           "  </Theme>\n"
           "</ChangeableColorTable>\n";
}

inline std::string OneFontTable()
{
    return "<ChangeableFontTable>\n"
           "  <Font code=\"T1511\" name=\"Sans:style=Bold\" size=\"40\"/>\n"
           "</ChangeableFontTable>\n";
}

// Leaves the process-wide theme as a fresh process has it.
inline void ResetTheme()
{
    uxt_theme_set_style(UXT_THEME_STYLE_DEFAULT);
    uxt_theme_set_changeable_ui_enabled(false);
}

}  // namespace ThemeTest

#endif

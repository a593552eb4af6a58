#ifndef NSWEATHERWIDGET_WIDGET_ACCESSIBLE_H
#define NSWEATHERWIDGET_WIDGET_ACCESSIBLE_H

#include <Evas.h>

#include <string>

namespace NSWeatherWidget
{

// What screen readers read of an object: name, role and description, set
// through Elementary's accessibility interface, and buttons they can
// press. The objects keep the strings and free them when they die.
class WidgetAccessible
{
public:
    enum Role
    {
        ROLE_PANEL,
        ROLE_BUTTON
    };

    // The signal a layout emits when one of its parts is tapped.
    struct TapSignal
    {
        const char* emission;
        const char* source;
    };

    // An empty name leaves the object out of what is read. A new name is
    // announced to the screen reader; the same one again is not.
    static void Set(Evas_Object* object, Role role, const std::string& name,
                    const std::string& description = std::string());
    static std::string GetName(const Evas_Object* object);

    // Makes `target`, a layout swallowed by another, a button for screen
    // readers: pressing it emits `tap` (which must outlive `target`) on the
    // holding layout, as a tap does. The button is a child of `target` and
    // dies with it; null on failure.
    static Evas_Object* AddButton(Evas_Object* target, const TapSignal& tap);
    // The button made over `target`, or null.
    static Evas_Object* GetButton(const Evas_Object* target);
};

}  // namespace NSWeatherWidget

#endif

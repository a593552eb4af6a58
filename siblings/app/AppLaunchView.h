#ifndef NSWEATHER_APP_LAUNCH_VIEW_H
#define NSWEATHER_APP_LAUNCH_VIEW_H

#include <Elementary.h>

#include <string>

#include "City.h"

namespace NSWeather
{

// The small window the weather application opens when the widget launches
// it: the requested city, or a prompt to add one. Closing it ends the
// main loop. The window owns everything drawn in it.
class AppLaunchView
{
public:
    AppLaunchView() = default;
    virtual ~AppLaunchView();
    AppLaunchView(const AppLaunchView&) = delete;
    AppLaunchView& operator=(const AppLaunchView&) = delete;

    // A null city shows the add-city prompt. False when no window could be
    // made (logged).
    bool Create(const CityPtr& cityPtr);

private:
    static void CloseCb(void* data, Evas_Object* obj, void* eventInfo);
    static std::string Describe(const CityPtr& cityPtr);
    void AddLine(Evas_Object* box, const std::string& markup);

    Evas_Object* mWindow = nullptr;
};

}  // namespace NSWeather

#endif

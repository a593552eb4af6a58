#ifndef NSWEATHERWIDGET_WIDGET_MAIN_H
#define NSWEATHERWIDGET_WIDGET_MAIN_H

#include <widget_app.h>

#include <ctime>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "City.h"
#include "Setting.h"

namespace NSWeatherWidget
{

class WidgetViewController;
using WidgetViewControllerPtr = std::shared_ptr<WidgetViewController>;

// The widget process: the shared data as last loaded and the registry of
// instances. One class spread over several files, one per concern:
// WidgetMain.cpp (object and data), WidgetMainInstance.cpp (instance
// callbacks), WidgetMainApp.cpp (application create and terminate).
// Main loop only.
class WidgetMain
{
public:
    static WidgetMain* GetInstance();

    // Application callbacks handed to widget_app_main.
    static widget_class_h CreateWidget(void* pThis);
    static void TerminateWidget(void* pThis);

    // Instance callbacks of the widget class.
    static int CreateWidgetInstance(widget_context_h context, bundle* content, int w, int h, void* userData);
    static int DestroyWidgetInstance(widget_context_h context, widget_app_destroy_type_e reason,
                                     bundle* content, void* userData);
    static int PauseWidgetInstance(widget_context_h context, void* userData);
    static int ResumeWidgetInstance(widget_context_h context, void* userData);
    static int ResizeWidgetInstance(widget_context_h context, int w, int h, void* userData);
    static int UpdateWidgetInstance(widget_context_h context, bundle* content, int force, void* userData);

    NSWeather::SettingPtr GetSettingPtr() const { return mSettingPtr; }
    void LoadAllWeatherInformation();
    NSWeather::CityPtrVectorPtr GetWeatherInfo();
    // The city at `position` in the list as last loaded (positions equal
    // page indexes unless the store has a gap); empty when none.
    NSWeather::CityPtr GetCityPtr(int position) const;
    bool IsCurrentLocationExist() const;
    WidgetViewControllerPtr FindWidgetObject(const std::string& idString) const;

private:
    using WidgetViewControllerList =
        std::vector<std::pair<std::shared_ptr<std::string>, WidgetViewControllerPtr>>;

    WidgetMain() = default;
    ~WidgetMain() = default;
    WidgetMain(const WidgetMain&) = delete;
    WidgetMain& operator=(const WidgetMain&) = delete;

    static std::string GetIdString(widget_context_h context);
    static int CreateOrResizeView(const WidgetViewControllerPtr& controller, widget_context_h context,
                                  int type);
    void Unregister(const WidgetViewControllerPtr& controller);

    NSWeather::SettingPtr mSettingPtr;
    NSWeather::CityPtrVectorPtr mWeatherInfo;
    time_t mLastRefreshedTime = 0;
    WidgetViewControllerList sWidgetViewControllerList;
};

}  // namespace NSWeatherWidget

#endif

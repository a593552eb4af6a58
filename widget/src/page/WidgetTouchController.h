#ifndef NSWEATHERWIDGET_WIDGET_TOUCH_CONTROLLER_H
#define NSWEATHERWIDGET_WIDGET_TOUCH_CONTROLLER_H

#include <Evas.h>

#include <memory>
#include <string>
#include <vector>

#include "WidgetTouchData.h"
#include "WidgetTouchEventListener.h"

namespace NSWeatherWidget
{

// Turns taps on a page's state layout into the page's actions. Every
// callback it registers is removed by its destructor, or dies with the
// object it was registered on.
class WidgetTouchController
{
public:
    // Taps stay within this many units and last less than this long.
    static constexpr int kTapDistance = 19;
    static constexpr unsigned int kTapDuration = 500;

    WidgetTouchController() = default;
    virtual ~WidgetTouchController();
    WidgetTouchController(const WidgetTouchController&) = delete;
    WidgetTouchController& operator=(const WidgetTouchController&) = delete;

    void Add(Evas_Object* parent, const std::string& attachingPart);
    // Not owned; the page that owns this controller.
    void SetWidgetTouchEventListener(WidgetTouchEventListener* listener)
    {
        mWidgetTouchEventListener = listener;
    }

    static bool IsTap(const WidgetTouchData& touchData, Evas_Event_Flags flags);

private:
    struct Registration
    {
        Evas_Object* object;
        bool isSignal;
    };

    void WatchMouse(Evas_Object* object);
    void Forget(Evas_Object* object);
    static void CPLogoClickedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
    static void RefreshButtonClickedCb(void* data, Evas_Object* obj, const char* emission,
                                       const char* source);
    static void MouseDownCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void MouseUpCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void ObjectDelCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);

    WidgetTouchEventListener* mWidgetTouchEventListener = nullptr;
    WidgetTouchDataPtr mWidgetTouchDataPtr;
    std::vector<Registration> mRegistrations;
};

using WidgetTouchControllerPtr = std::shared_ptr<WidgetTouchController>;

}  // namespace NSWeatherWidget

#endif

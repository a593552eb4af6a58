#ifndef NSWEATHERWIDGET_WIDGET_FLICK_CONTROLLER_H
#define NSWEATHERWIDGET_WIDGET_FLICK_CONTROLLER_H

#include <Ecore.h>
#include <Elementary.h>

#include <memory>
#include <string>

#include "WidgetFlickEventListener.h"

namespace NSWeatherWidget
{

// Turns a vertical swipe on the view into a one-second slide to the
// previous or next city, then tells the view from a main-loop job. One
// slide at a time in the whole process: the running transit is shared by
// every instance.
class WidgetFlickController
{
public:
    static constexpr unsigned int kFlickDuration = 500;
    static constexpr double kSlideSeconds = 1.0;
    enum Direction
    {
        DIRECTION_PREV = 0,
        DIRECTION_NEXT = 1,
        DIRECTION_NONE = 2
    };

    WidgetFlickController() = default;
    virtual ~WidgetFlickController();
    WidgetFlickController(const WidgetFlickController&) = delete;
    WidgetFlickController& operator=(const WidgetFlickController&) = delete;

    void Activate(const std::string& partName);
    // Not owned; the view that owns this controller.
    void SetWidgetFlickEventListener(WidgetFlickEventListener* listener)
    {
        mWidgetFlickEventListener = listener;
    }
    static bool GetIsTransiting() { return mIsTransiging; }

private:
    void OnMouseDown(const Evas_Event_Mouse_Down* ev);
    void OnMouseUp(const Evas_Event_Mouse_Up* ev, Evas_Object* obj);
    void StartFlick(Direction direction);
    void TransitStart();
    void OnTransitDeleted(Elm_Transit* transit);
    void ReleaseTouchObject();
    static void BackgroundMouseDownCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void BackgroundMouseUpCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void TouchObjectDelCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void TransitionEndCb(Elm_Transit_Effect* effect, Elm_Transit* transit);
    static void TransitionOpCb(Elm_Transit_Effect* effect, Elm_Transit* transit, double progress);
    static void TransitDeleteCb(void* data, Elm_Transit* transit);
    static void DisplayedCityJobCb(void* data);

    Evas_Object* mTouchObject = nullptr;
    int mDownX = 0;
    int mDownY = 0;
    int mUpX = 0;
    int mUpY = 0;
    unsigned int mDownTimestamp = 0;
    unsigned int mUpTimestamp = 0;
    bool mIsMouseDown = false;
    int mFlickDirection = DIRECTION_NONE;
    WidgetFlickEventListener* mWidgetFlickEventListener = nullptr;
    // The rotation that follows this controller's slide; owned here.
    Ecore_Job* mDisplayedCityJob = nullptr;

    // From the start of a slide until its rotation has run.
    static bool mIsTransiging;
    static Elm_Transit* sTransit;
    static WidgetFlickController* sTransitOwner;
};

using WidgetFlickControllerPtr = std::shared_ptr<WidgetFlickController>;

}  // namespace NSWeatherWidget

#endif

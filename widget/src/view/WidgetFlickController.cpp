#include "WidgetFlickController.h"

#include <cstdlib>

#include "CallbackTrampoline.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

bool WidgetFlickController::mIsTransiging = false;
Elm_Transit* WidgetFlickController::sTransit = nullptr;
WidgetFlickController* WidgetFlickController::sTransitOwner = nullptr;

namespace
{
const unsigned int kMinimumTimestamp = 1000;
}

WidgetFlickController::~WidgetFlickController()
{
    ReleaseTouchObject();
    if (mDisplayedCityJob)
    {
        ecore_job_del(mDisplayedCityJob);
        mDisplayedCityJob = nullptr;
        mIsTransiging = false;
    }
    if (sTransitOwner == this)
    {
        // Deleting the transit calls TransitDeleteCb, which must find no
        // owner left to queue a rotation for.
        Elm_Transit* transit = sTransit;
        sTransitOwner = nullptr;
        sTransit = nullptr;
        mIsTransiging = false;
        if (transit)
            elm_transit_del(transit);
    }
}

void WidgetFlickController::ReleaseTouchObject()
{
    if (!mTouchObject)
        return;
    evas_object_event_callback_del_full(mTouchObject, EVAS_CALLBACK_MOUSE_UP, BackgroundMouseUpCb, this);
    evas_object_event_callback_del_full(mTouchObject, EVAS_CALLBACK_MOUSE_DOWN, BackgroundMouseDownCb, this);
    evas_object_event_callback_del_full(mTouchObject, EVAS_CALLBACK_DEL, TouchObjectDelCb, this);
    mTouchObject = nullptr;
}

void WidgetFlickController::Activate(const std::string& partName)
{
    const char* part = partName.empty() ? NULL : partName.c_str();
    WIDGET_RET_IF(part == NULL);
    WIDGET_RET_IF(mWidgetFlickEventListener == NULL);
    Evas_Object* widgetBaseLayout = mWidgetFlickEventListener->OnGetBaseLayout();
    WIDGET_RET_IF(widgetBaseLayout == NULL);
    ReleaseTouchObject();
    mTouchObject =
        const_cast<Evas_Object*>(edje_object_part_object_get(elm_layout_edje_get(widgetBaseLayout), part));
    WIDGET_RET_IF(mTouchObject == NULL);
    evas_object_event_callback_add(mTouchObject, EVAS_CALLBACK_MOUSE_UP, BackgroundMouseUpCb, this);
    evas_object_event_callback_add(mTouchObject, EVAS_CALLBACK_MOUSE_DOWN, BackgroundMouseDownCb, this);
    evas_object_event_callback_add(mTouchObject, EVAS_CALLBACK_DEL, TouchObjectDelCb, this);
}

void WidgetFlickController::TouchObjectDelCb(void* data, Evas*, Evas_Object*, void*)
{
    NSWeather::ForwardCallback<WidgetFlickController>(
        data, [](WidgetFlickController& self) { self.mTouchObject = nullptr; }, WIDGET_CALLBACK_SITE);
}

void WidgetFlickController::BackgroundMouseDownCb(void* data, Evas*, Evas_Object*, void* eventInfo)
{
    NSWeather::ForwardCallback<WidgetFlickController>(
        data,
        [eventInfo](WidgetFlickController& self)
        { self.OnMouseDown(static_cast<Evas_Event_Mouse_Down*>(eventInfo)); },
        WIDGET_CALLBACK_SITE);
}

void WidgetFlickController::OnMouseDown(const Evas_Event_Mouse_Down* ev)
{
    WidgetFlickController* pThis = this;
    WIDGET_RET_IF(WidgetFlickController::mIsTransiging == true);
    WIDGET_RET_IF(pThis->mTouchObject == NULL);
    WIDGET_RET_IF(ev == NULL);
    mDownX = ev->canvas.x;
    mDownY = ev->canvas.y;
    mDownTimestamp = ev->timestamp;
    mIsMouseDown = true;
}

void WidgetFlickController::BackgroundMouseUpCb(void* data, Evas*, Evas_Object* obj, void* eventInfo)
{
    NSWeather::ForwardCallback<WidgetFlickController>(
        data,
        [eventInfo, obj](WidgetFlickController& self)
        { self.OnMouseUp(static_cast<Evas_Event_Mouse_Up*>(eventInfo), obj); },
        WIDGET_CALLBACK_SITE);
}

void WidgetFlickController::OnMouseUp(const Evas_Event_Mouse_Up* ev, Evas_Object* obj)
{
    WidgetFlickController* pThis = this;
    WIDGET_RET_IF(pThis->mWidgetFlickEventListener == NULL);
    WIDGET_RET_IF(WidgetFlickController::mIsTransiging == true);
    WIDGET_RET_IF(pThis->mTouchObject == NULL);
    WIDGET_RET_IF(ev == NULL);
    if (ev->timestamp > kMinimumTimestamp)
        mUpTimestamp = ev->timestamp;
    mUpX = ev->canvas.x;
    mUpY = ev->canvas.y;
    if (!mIsMouseDown)
    {
        WIDGET_LOG("Mouse touch down event is not Called");
        return;
    }
    int movedW = mDownX - mUpX;
    int movedH = mDownY - mUpY;  // positive: the finger went up
    if (std::abs(movedW) > std::abs(movedH))
    {
        WIDGET_LOG("abs(moved_w) > abs(moved_h). it consider swipe left/right");
        mIsMouseDown = false;
        return;
    }
    unsigned int duration = mUpTimestamp - mDownTimestamp;
    int h = 0;
    evas_object_geometry_get(obj, nullptr, nullptr, nullptr, &h);
    int t = h / 10;
    bool canFlick = !(ev->event_flags & EVAS_EVENT_FLAG_ON_HOLD) &&
                    mWidgetFlickEventListener->OnGetNumberOfCities() > 1 &&
                    mWidgetFlickEventListener->OnGetIndexOfDisplayCity() !=
                        mWidgetFlickEventListener->OnGetNextCityIndex();
    if (canFlick && (movedH > t || movedH < -t))
    {
        if (duration >= kFlickDuration)
            return;
        StartFlick(movedH > t ? DIRECTION_NEXT : DIRECTION_PREV);
        return;
    }
    if (-t < movedH && movedH < t && -t < movedW && movedW < t && duration < kFlickDuration)
        mIsMouseDown = false;
}

void WidgetFlickController::StartFlick(Direction direction)
{
    mFlickDirection = direction;
    mWidgetFlickEventListener->OnStartFlick(direction == DIRECTION_NEXT);
    TransitStart();
    mIsMouseDown = false;
}

void WidgetFlickController::TransitStart()
{
    WIDGET_RET_IF(mWidgetFlickEventListener == NULL);
    WIDGET_RET_IF(WidgetFlickController::mIsTransiging == true);
    Evas_Object* centerLayout = mWidgetFlickEventListener->OnGetCenterLayout();
    Evas_Object* prevLayout = mWidgetFlickEventListener->OnGetPrevLayout();
    Evas_Object* nextLayout = mWidgetFlickEventListener->OnGetNextLayout();
    WIDGET_RET_IF(centerLayout == NULL);
    WIDGET_RET_IF(prevLayout == NULL);
    WIDGET_RET_IF(nextLayout == NULL);
    int h = 0;
    evas_object_geometry_get(centerLayout, nullptr, nullptr, nullptr, &h);
    Elm_Transit* transit = elm_transit_add();
    WIDGET_RET_IF(transit == NULL);
    elm_transit_object_add(transit, centerLayout);
    elm_transit_object_add(transit, nextLayout);
    elm_transit_object_add(transit, prevLayout);
    elm_transit_effect_translation_add(transit, 0, 0, 0, mFlickDirection == DIRECTION_NEXT ? -h : h);
    elm_transit_effect_add(transit, TransitionOpCb, this, TransitionEndCb);
    elm_transit_tween_mode_set(transit, ELM_TRANSIT_TWEEN_MODE_DECELERATE);
    elm_transit_objects_final_state_keep_set(transit, EINA_TRUE);
    elm_transit_del_cb_set(transit, TransitDeleteCb, this);
    elm_transit_duration_set(transit, kSlideSeconds);
    mIsTransiging = true;
    sTransit = transit;
    sTransitOwner = this;
    elm_transit_go(transit);
}

void WidgetFlickController::TransitionOpCb(Elm_Transit_Effect*, Elm_Transit*, double) {}

// The transit frees itself once it has ended; deleting it here as well
// would free it twice.
void WidgetFlickController::TransitionEndCb(Elm_Transit_Effect*, Elm_Transit* transit)
{
    WIDGET_RET_IF(transit == NULL);
}

// Whatever the order of the end and delete callbacks, the delete callback
// is the one place that queues the rotation: exactly one per slide.
void WidgetFlickController::TransitDeleteCb(void* data, Elm_Transit* transit)
{
    NSWeather::ForwardCallback<WidgetFlickController>(
        data,
        [transit](WidgetFlickController& self)
        {
            if (sTransitOwner == &self && sTransit == transit)
                self.OnTransitDeleted(transit);
        },
        WIDGET_CALLBACK_SITE);
}

void WidgetFlickController::OnTransitDeleted(Elm_Transit*)
{
    sTransit = nullptr;
    sTransitOwner = nullptr;
    if (!mWidgetFlickEventListener)
    {
        WIDGET_LOG("mWidgetFlickEventListener is NULL");
        mIsTransiging = false;
        return;
    }
    if (!mDisplayedCityJob)
        mDisplayedCityJob = ecore_job_add(DisplayedCityJobCb, this);
}

void WidgetFlickController::DisplayedCityJobCb(void* data)
{
    NSWeather::ForwardCallback<WidgetFlickController>(
        data,
        [](WidgetFlickController& self)
        {
            self.mDisplayedCityJob = nullptr;
            mIsTransiging = false;
            if (!self.mWidgetFlickEventListener)
                return;
            if (self.mFlickDirection == DIRECTION_NEXT)
                self.mWidgetFlickEventListener->OnDisplayedNextCity();
            else
                self.mWidgetFlickEventListener->OnDisplayedPrevCity();
        },
        WIDGET_CALLBACK_SITE);
}

}  // namespace NSWeatherWidget

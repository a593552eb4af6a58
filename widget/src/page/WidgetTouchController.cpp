#include "WidgetTouchController.h"

#include <Edje.h>
#include <Elementary.h>

#include <algorithm>
#include <cstdlib>

#include "WeatherDefine.h"
#include "CallbackTrampoline.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

namespace
{
const int kForecastDays = 4;
}

WidgetTouchController::~WidgetTouchController()
{
    for (const Registration& registration : mRegistrations)
    {
        evas_object_event_callback_del_full(registration.object, EVAS_CALLBACK_DEL, ObjectDelCb, this);
        if (registration.isSignal)
        {
            edje_object_signal_callback_del_full(registration.object, "cpLogoClicked", "cpLogoEffect",
                                                 CPLogoClickedCb, this);
            edje_object_signal_callback_del_full(registration.object, "refreshIconClicked",
                                                 "refreshButtonEffect", RefreshButtonClickedCb, this);
            continue;
        }
        evas_object_event_callback_del_full(registration.object, EVAS_CALLBACK_MOUSE_DOWN, MouseDownCb, this);
        evas_object_event_callback_del_full(registration.object, EVAS_CALLBACK_MOUSE_UP, MouseUpCb, this);
    }
}

void WidgetTouchController::Add(Evas_Object* parent, const std::string& attachingPart)
{
    WIDGET_RET_IF(parent == NULL);
    WIDGET_RET_IF(attachingPart.length() < 1);
    Evas_Object* bottomLineLayout = elm_object_part_content_get(parent, "bottomLineSwallow");
    if (bottomLineLayout)
    {
        Evas_Object* edje = elm_layout_edje_get(bottomLineLayout);
        edje_object_signal_callback_add(edje, "cpLogoClicked", "cpLogoEffect", CPLogoClickedCb, this);
        edje_object_signal_callback_add(edje, "refreshIconClicked", "refreshButtonEffect",
                                        RefreshButtonClickedCb, this);
        evas_object_event_callback_add(edje, EVAS_CALLBACK_DEL, ObjectDelCb, this);
        mRegistrations.push_back({edje, true});
    }
    Evas_Object* forecastLayout = elm_object_part_content_get(parent, "weatherForecastSwallow");
    if (forecastLayout)
    {
        Evas_Object* edje = elm_layout_edje_get(forecastLayout);
        for (int n = 1; n <= kForecastDays; ++n)
        {
            std::string part = "forecast" + std::to_string(n);
            Evas_Object* forecastPressAreaObj =
                const_cast<Evas_Object*>(edje_object_part_object_get(edje, part.c_str()));
            WIDGET_RET_IF(forecastPressAreaObj == NULL);
            WatchMouse(forecastPressAreaObj);
        }
    }
    mWidgetTouchDataPtr = std::make_shared<WidgetTouchData>();
    Evas_Object* touchAreaObj = const_cast<Evas_Object*>(
        edje_object_part_object_get(elm_layout_edje_get(parent), attachingPart.c_str()));
    WIDGET_RET_IF(touchAreaObj == NULL);
    mWidgetTouchDataPtr->mTouchObject = touchAreaObj;
    WatchMouse(touchAreaObj);
}

void WidgetTouchController::WatchMouse(Evas_Object* object)
{
    evas_object_event_callback_add(object, EVAS_CALLBACK_MOUSE_DOWN, MouseDownCb, this);
    evas_object_event_callback_add(object, EVAS_CALLBACK_MOUSE_UP, MouseUpCb, this);
    evas_object_event_callback_add(object, EVAS_CALLBACK_DEL, ObjectDelCb, this);
    mRegistrations.push_back({object, false});
}

// A watched object died first: nothing is left to unregister on it.
void WidgetTouchController::ObjectDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
    NSWeather::ForwardCallback<WidgetTouchController>(
        data, [obj](WidgetTouchController& self) { self.Forget(obj); }, WIDGET_CALLBACK_SITE);
}

void WidgetTouchController::Forget(Evas_Object* object)
{
    mRegistrations.erase(std::remove_if(mRegistrations.begin(), mRegistrations.end(),
                                        [object](const Registration& r) { return r.object == object; }),
                         mRegistrations.end());
    if (mWidgetTouchDataPtr && mWidgetTouchDataPtr->mTouchObject == object)
        mWidgetTouchDataPtr->mTouchObject = nullptr;
}

bool WidgetTouchController::IsTap(const WidgetTouchData& touchData, Evas_Event_Flags flags)
{
    return std::abs(touchData.mUpX - touchData.mDownX) <= kTapDistance &&
           std::abs(touchData.mUpY - touchData.mDownY) <= kTapDistance &&
           touchData.mUpTimestamp - touchData.mDownTimestamp < kTapDuration &&
           !(flags & EVAS_EVENT_FLAG_ON_HOLD);
}

void WidgetTouchController::CPLogoClickedCb(void* data, Evas_Object*, const char*, const char*)
{
    NSWeather::ForwardCallback<WidgetTouchController>(
        data,
        [](WidgetTouchController& self)
        {
            WIDGET_RET_IF(self.mWidgetTouchEventListener == NULL);
            WIDGET_RET_IF(self.mWidgetTouchEventListener->RequestUrl() != NSWeather::ERR_OK);
        },
        WIDGET_CALLBACK_SITE);
}

void WidgetTouchController::RefreshButtonClickedCb(void* data, Evas_Object*, const char*, const char*)
{
    NSWeather::ForwardCallback<WidgetTouchController>(
        data,
        [](WidgetTouchController& self)
        {
            WIDGET_RET_IF(self.mWidgetTouchEventListener == NULL);
            WIDGET_RET_IF(self.mWidgetTouchEventListener->Refresh() != NSWeather::ERR_OK);
        },
        WIDGET_CALLBACK_SITE);
}

void WidgetTouchController::MouseDownCb(void* data, Evas*, Evas_Object*, void* eventInfo)
{
    auto* ev = static_cast<Evas_Event_Mouse_Down*>(eventInfo);
    NSWeather::ForwardCallback<WidgetTouchController>(
        data,
        [ev](WidgetTouchController& self)
        {
            WIDGET_RET_IF(ev == NULL);
            WIDGET_RET_IF(!self.mWidgetTouchDataPtr);
            self.mWidgetTouchDataPtr->mDownX = ev->canvas.x;
            self.mWidgetTouchDataPtr->mDownY = ev->canvas.y;
            self.mWidgetTouchDataPtr->mDownTimestamp = ev->timestamp;
        },
        WIDGET_CALLBACK_SITE);
}

void WidgetTouchController::MouseUpCb(void* data, Evas*, Evas_Object*, void* eventInfo)
{
    auto* ev = static_cast<Evas_Event_Mouse_Up*>(eventInfo);
    NSWeather::ForwardCallback<WidgetTouchController>(
        data,
        [ev](WidgetTouchController& self)
        {
            WIDGET_RET_IF(ev == NULL);
            WIDGET_RET_IF(!self.mWidgetTouchDataPtr);
            WidgetTouchData& touchData = *self.mWidgetTouchDataPtr;
            touchData.mUpX = ev->canvas.x;
            touchData.mUpY = ev->canvas.y;
            touchData.mUpTimestamp = ev->timestamp;
            if (!IsTap(touchData, ev->event_flags))
                return;
            WIDGET_RET_IF(self.mWidgetTouchEventListener == NULL);
            WIDGET_RET_IF(self.mWidgetTouchEventListener->LaunchApp() != NSWeather::ERR_OK);
        },
        WIDGET_CALLBACK_SITE);
}

}  // namespace NSWeatherWidget

#ifndef NSWEATHERWIDGET_WIDGET_FLICK_EVENT_LISTENER_H
#define NSWEATHERWIDGET_WIDGET_FLICK_EVENT_LISTENER_H

#include <Evas.h>

namespace NSWeatherWidget
{

// What the flick controller asks of the view it slides, and how it tells
// the view that a slide has ended. Implemented by WidgetView.
class WidgetFlickEventListener
{
public:
    virtual ~WidgetFlickEventListener() = default;
    virtual void OnDisplayedPrevCity() = 0;
    virtual void OnDisplayedNextCity() = 0;
    virtual void OnStartFlick(bool toNext) = 0;
    virtual Evas_Object* OnGetPrevLayout() = 0;
    virtual Evas_Object* OnGetCenterLayout() = 0;
    virtual Evas_Object* OnGetNextLayout() = 0;
    virtual Evas_Object* OnGetBaseLayout() = 0;
    virtual int OnGetPrevCityIndex() = 0;
    virtual int OnGetIndexOfDisplayCity() = 0;
    virtual int OnGetNextCityIndex() = 0;
    virtual int OnGetSizeType() = 0;
    virtual int OnGetNumberOfCities() = 0;
};

}  // namespace NSWeatherWidget

#endif

#ifndef NSWEATHERWIDGET_WIDGET_TOUCH_EVENT_LISTENER_H
#define NSWEATHERWIDGET_WIDGET_TOUCH_EVENT_LISTENER_H

namespace NSWeatherWidget
{

// The three actions a tap on a page can start; each returns ERR_OK or -1.
// Implemented by the pages.
class WidgetTouchEventListener
{
public:
    virtual ~WidgetTouchEventListener() = default;
    virtual int RequestUrl() = 0;
    virtual int Refresh() = 0;
    virtual int LaunchApp() = 0;
};

}  // namespace NSWeatherWidget

#endif

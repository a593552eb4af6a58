#ifndef NSWEATHERWIDGET_WIDGET_4x2_PAGE_CONTROLLER_H
#define NSWEATHERWIDGET_WIDGET_4x2_PAGE_CONTROLLER_H

#include "WidgetPageController.h"

namespace NSWeatherWidget
{

// Page controller of the 4x2 size.
class Widget4x2PageController : public WidgetPageController
{
public:
    Widget4x2PageController() = default;
    ~Widget4x2PageController() override = default;
    void Initialize() override;
};

}  // namespace NSWeatherWidget

#endif

#ifndef NSWEATHERWIDGET_WIDGET_4x4_PAGE_CONTROLLER_H
#define NSWEATHERWIDGET_WIDGET_4x4_PAGE_CONTROLLER_H

#include "WidgetPageController.h"

namespace NSWeatherWidget
{

// Page controller of the 4x4 size.
class Widget4x4PageController : public WidgetPageController
{
public:
    Widget4x4PageController() = default;
    ~Widget4x4PageController() override = default;
    void Initialize() override;
};

}  // namespace NSWeatherWidget

#endif

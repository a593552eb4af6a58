#ifndef NSWEATHERWIDGET_WIDGET_4x4_PAGE_DATA_H
#define NSWEATHERWIDGET_WIDGET_4x4_PAGE_DATA_H

#include "WidgetPageData.h"

namespace NSWeatherWidget
{

// Page data of the 4x4 size; differs only in its layout file.
class Widget4x4PageData : public WidgetPageData
{
public:
    Widget4x4PageData() = default;
    ~Widget4x4PageData() override;

    static std::string GetEdjPath() { return "widget/Widget4x4Page.edj"; }
};

}  // namespace NSWeatherWidget

#endif

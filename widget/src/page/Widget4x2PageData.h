#ifndef NSWEATHERWIDGET_WIDGET_4x2_PAGE_DATA_H
#define NSWEATHERWIDGET_WIDGET_4x2_PAGE_DATA_H

#include "WidgetPageData.h"

namespace NSWeatherWidget
{

// Page data of the 4x2 size; differs only in its layout file.
class Widget4x2PageData : public WidgetPageData
{
public:
    Widget4x2PageData() = default;
    ~Widget4x2PageData() override;

    static std::string GetEdjPath() { return "widget/Widget4x2Page.edj"; }
};

}  // namespace NSWeatherWidget

#endif

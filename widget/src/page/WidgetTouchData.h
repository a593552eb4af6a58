#ifndef NSWEATHERWIDGET_WIDGET_TOUCH_DATA_H
#define NSWEATHERWIDGET_WIDGET_TOUCH_DATA_H

#include <Evas.h>

#include <memory>

namespace NSWeatherWidget
{

// One gesture as seen by a page's touch controller: where and when the
// finger went down and came up.
class WidgetTouchData
{
public:
    WidgetTouchData() = default;
    virtual ~WidgetTouchData() = default;

    // Not owned: a part object of the page's state layout.
    Evas_Object* mTouchObject = nullptr;
    int mDownX = 0;
    int mDownY = 0;
    int mUpX = 0;
    int mUpY = 0;
    unsigned int mDownTimestamp = 0;
    unsigned int mUpTimestamp = 0;
};

using WidgetTouchDataPtr = std::shared_ptr<WidgetTouchData>;

}  // namespace NSWeatherWidget

#endif

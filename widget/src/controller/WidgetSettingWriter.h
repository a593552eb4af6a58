#ifndef NSWEATHERWIDGET_WIDGET_SETTING_WRITER_H
#define NSWEATHERWIDGET_WIDGET_SETTING_WRITER_H

#include <functional>

#include "Setting.h"

namespace NSWeatherWidget
{

// The widget's only way to change the shared settings row: the row is
// read, changed and written back whole in one transaction, so a change
// that another process makes meanwhile is never undone.
class WidgetSettingWriter
{
public:
    // The record as written, or null when nothing was written.
    static NSWeather::SettingPtr Change(const std::function<void(const NSWeather::SettingPtr&)>& change);
};

}  // namespace NSWeatherWidget

#endif

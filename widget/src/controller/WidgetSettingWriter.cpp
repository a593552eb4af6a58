#include "WidgetSettingWriter.h"

#include "SettingDBController.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

NSWeather::SettingPtr WidgetSettingWriter::Change(
    const std::function<void(const NSWeather::SettingPtr&)>& change)
{
    NSWeather::SettingDBController settingDBController;
    NSWeather::SettingPtr written = settingDBController.SelectAndUpdate(change);
    WIDGET_RETV_IF(!written, nullptr);
    return written;
}

}  // namespace NSWeatherWidget

#include "WidgetSettingWriter.h"

#include "SettingDBController.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

NSWeather::SettingPtr WidgetSettingWriter::Change(
    const std::function<void(const NSWeather::SettingPtr&)>& change)
{
    NSWeather::SettingDBController settingDBController;
    NSWeather::SettingPtr settingPtr = settingDBController.Select();
    WIDGET_RETV_IF(!settingPtr, nullptr);
    change(settingPtr);
    settingDBController.Update(settingPtr);
    return settingPtr;
}

}  // namespace NSWeatherWidget

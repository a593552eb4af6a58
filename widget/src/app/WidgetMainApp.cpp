// Application create and terminate. Today they prepare what the pages
// need (text domain, databases); listeners, the message port and the
// usage log come with the application's own start-up.
#include <libintl.h>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "WeatherDefine.h"
#include "WidgetLog.h"
#include "WidgetMain.h"

namespace NSWeatherWidget
{

widget_class_h WidgetMain::CreateWidget(void* pThis)
{
    WIDGET_RETV_IF(pThis == NULL, nullptr);
    std::string resDir = NSWeather::FileUtil::GetResourceDirectoryPath();
    if (!resDir.empty())
    {
        bindtextdomain("weather-m", (resDir + "/locale").c_str());
        bind_textdomain_codeset("weather-m", "UTF-8");
    }
    if (NSWeather::DataStoreInitializer::Run() != NSWeather::ERR_OK)
        WIDGET_LOG("dbController initialize failed");
    widget_instance_lifecycle_callback_s callbacks = {CreateWidgetInstance, DestroyWidgetInstance,
                                                      PauseWidgetInstance,  ResumeWidgetInstance,
                                                      ResizeWidgetInstance, UpdateWidgetInstance};
    return widget_app_class_create(callbacks, nullptr);
}

void WidgetMain::TerminateWidget(void* pThis)
{
    WIDGET_RET_IF(pThis == NULL);
}

}  // namespace NSWeatherWidget

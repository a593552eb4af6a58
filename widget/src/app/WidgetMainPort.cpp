// The local port on which the agent says that a refresh has ended. Any
// message ends it; its content and sender are not read.
#include "WidgetLog.h"
#include "WidgetMain.h"

namespace NSWeatherWidget
{

void WidgetMain::MessagePortCallback(int, const char*, const char*, bool, bundle*, void*)
{
    WidgetMain* widgetMain = GetInstance();
    WIDGET_RET_IF(widgetMain == NULL);
    widgetMain->SetIsNowRefreshing(false);
    widgetMain->LoadAllWeatherInformation();
    widgetMain->RequestUpdateForEachInstances(0);
}

}  // namespace NSWeatherWidget

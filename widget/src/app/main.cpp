// The weather widget program, started by the widget framework.
#include <widget_app.h>

#include "WidgetLog.h"
#include "WidgetMain.h"

int main(int argc, char** argv)
{
    using NSWeatherWidget::WidgetMain;
    WIDGET_LOG("WidgetMain");
    widget_app_lifecycle_callback_s callbacks = {WidgetMain::CreateWidget, WidgetMain::TerminateWidget};
    int result = widget_app_main(argc, argv, &callbacks, WidgetMain::GetInstance());
    if (result != 0)
        WIDGET_LOG("widget_app_main() is failed. err = %d", result);
    return result;
}

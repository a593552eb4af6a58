// The weather widget program, started by the widget framework.
#include <widget_app.h>

#include "WidgetMain.h"

int main(int argc, char** argv)
{
    using NSWeatherWidget::WidgetMain;
    widget_app_lifecycle_callback_s callbacks = {WidgetMain::CreateWidget, WidgetMain::TerminateWidget};
    return widget_app_main(argc, argv, &callbacks, WidgetMain::GetInstance());
}

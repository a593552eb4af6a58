#include "Widget4x4PageController.h"

#include "Widget4x4Page.h"
#include "Widget4x4PageData.h"

namespace NSWeatherWidget
{

void Widget4x4PageController::Initialize()
{
    mWidgetPagePtr = std::make_shared<Widget4x4Page>();
    mWidgetPageDataPtr = std::make_shared<Widget4x4PageData>();
}

}  // namespace NSWeatherWidget

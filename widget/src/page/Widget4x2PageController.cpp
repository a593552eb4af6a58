#include "Widget4x2PageController.h"

#include "Widget4x2Page.h"
#include "Widget4x2PageData.h"

namespace NSWeatherWidget
{

void Widget4x2PageController::Initialize()
{
    mWidgetPagePtr = std::make_shared<Widget4x2Page>();
    mWidgetPageDataPtr = std::make_shared<Widget4x2PageData>();
}

}  // namespace NSWeatherWidget

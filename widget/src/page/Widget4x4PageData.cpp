#include "Widget4x4PageData.h"

namespace NSWeatherWidget
{

Widget4x4PageData::~Widget4x4PageData() = default;

}  // namespace NSWeatherWidget

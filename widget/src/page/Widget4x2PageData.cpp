#include "Widget4x2PageData.h"

namespace NSWeatherWidget
{

Widget4x2PageData::~Widget4x2PageData() = default;

}  // namespace NSWeatherWidget

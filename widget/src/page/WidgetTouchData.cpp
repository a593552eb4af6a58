#include "WidgetTouchData.h"

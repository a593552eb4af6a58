#include "WidgetPage.h"

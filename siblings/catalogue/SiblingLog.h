#ifndef NSWEATHER_SIBLING_LOG_H
#define NSWEATHER_SIBLING_LOG_H

#include "WeatherLog.h"

// Each sibling target names its own tag (SIBLING_LOG_TAG) in its build rule.
#ifndef SIBLING_LOG_TAG
#define SIBLING_LOG_TAG "weather-siblings"
#endif

#define SIBLING_LOG(fmt, ...) WEATHER_LOG(SIBLING_LOG_TAG, fmt, ##__VA_ARGS__)
#define SIBLING_RETV_IF(cond, value) WEATHER_RETV_IF(SIBLING_LOG_TAG, cond, #cond, value)
#define SIBLING_RET_IF(cond) WEATHER_RET_IF(SIBLING_LOG_TAG, cond, #cond)

#endif

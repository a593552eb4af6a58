#ifndef NSWEATHER_UI_COMMON_LOG_H
#define NSWEATHER_UI_COMMON_LOG_H

#include "WeatherLog.h"

#define UI_COMMON_LOG_TAG "weather-ui-common"

#define UI_COMMON_LOG(fmt, ...) WEATHER_LOG(UI_COMMON_LOG_TAG, fmt, ##__VA_ARGS__)
#define UI_COMMON_RETV_IF(cond, value) WEATHER_RETV_IF(UI_COMMON_LOG_TAG, cond, #cond, value)
#define UI_COMMON_RET_IF(cond) WEATHER_RET_IF(UI_COMMON_LOG_TAG, cond, #cond)
#define UI_COMMON_BREAK_IF(cond) WEATHER_BREAK_IF(UI_COMMON_LOG_TAG, cond, #cond)
#define UI_COMMON_LOG_BREAK(condText) WEATHER_LOG_BREAK(UI_COMMON_LOG_TAG, condText)
#define UI_COMMON_CALLBACK_SITE WEATHER_CALLBACK_SITE(UI_COMMON_LOG_TAG)

#endif

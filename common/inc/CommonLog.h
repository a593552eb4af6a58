#ifndef NSWEATHER_COMMON_LOG_H
#define NSWEATHER_COMMON_LOG_H

#include "WeatherLog.h"

#define COMMON_LOG_TAG "weather-common"

#define COMMON_LOG(fmt, ...) WEATHER_LOG(COMMON_LOG_TAG, fmt, ##__VA_ARGS__)
#define COMMON_RETV_IF(cond, value) WEATHER_RETV_IF(COMMON_LOG_TAG, cond, #cond, value)
#define COMMON_RET_IF(cond) WEATHER_RET_IF(COMMON_LOG_TAG, cond, #cond)
#define COMMON_BREAK_IF(cond) WEATHER_BREAK_IF(COMMON_LOG_TAG, cond, #cond)
#define COMMON_LOG_BREAK(condText) WEATHER_LOG_BREAK(COMMON_LOG_TAG, condText)
#define COMMON_CALLBACK_SITE WEATHER_CALLBACK_SITE(COMMON_LOG_TAG)

#endif

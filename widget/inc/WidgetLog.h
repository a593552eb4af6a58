#ifndef NSWEATHERWIDGET_WIDGET_LOG_H
#define NSWEATHERWIDGET_WIDGET_LOG_H

#include "WeatherLog.h"

#define WIDGET_LOG_TAG "weather-widget"

#define WIDGET_LOG(fmt, ...) WEATHER_LOG(WIDGET_LOG_TAG, fmt, ##__VA_ARGS__)
#define WIDGET_RETV_IF(cond, value) WEATHER_RETV_IF(WIDGET_LOG_TAG, cond, #cond, value)
#define WIDGET_RET_IF(cond) WEATHER_RET_IF(WIDGET_LOG_TAG, cond, #cond)
#define WIDGET_BREAK_IF(cond) WEATHER_BREAK_IF(WIDGET_LOG_TAG, cond, #cond)
#define WIDGET_LOG_BREAK(condText) WEATHER_LOG_BREAK(WIDGET_LOG_TAG, condText)
#define WIDGET_CALLBACK_SITE WEATHER_CALLBACK_SITE(WIDGET_LOG_TAG)

#endif

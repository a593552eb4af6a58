#include "Widget4x4Page.h"

#include <Edje.h>
#include <Elementary.h>

#include "Widget4x4PageData.h"
#include "WidgetAccessible.h"
#include "WidgetAccessibleText.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

std::string Widget4x4Page::GetEdjPath() const
{
    std::string widget4x4pageEdjPath = Widget4x4PageData::GetEdjPath();
    WIDGET_RETV_IF(widget4x4pageEdjPath.length() < 1, std::string());
    return widget4x4pageEdjPath;
}

bool Widget4x4Page::AddCityExtras(Evas_Object* cityLayout)
{
    Evas_Object* weatherForecastLayout = LoadLayout(cityLayout, "weatherForecast");
    WIDGET_RETV_IF(weatherForecastLayout == NULL, false);
    elm_object_part_content_set(cityLayout, "weatherForecastSwallow", weatherForecastLayout);
    return true;
}

void Widget4x4Page::UpdateCityExtras(Evas_Object* cityLayout)
{
    Evas_Object* forecastLayout = elm_object_part_content_get(cityLayout, "weatherForecastSwallow");
    int days = UpdateWeekly(forecastLayout);
    if (forecastLayout && mWidgetPageDataPtr)
        WidgetAccessible::Set(forecastLayout, WidgetAccessible::ROLE_PANEL,
                              WidgetAccessibleText(*mWidgetPageDataPtr).GetForecastName(days));
}

void Widget4x4Page::EmitToday(const char* signal)
{
    Evas_Object* cityNameLayout = GetCityPart("cityNameSwallow");
    Evas_Object* iconAndTemperatureLayout = GetCityPart("iconAndTemperatureSwallow");
    Evas_Object* forecastLayout = GetCityPart("weatherForecastSwallow");
    WIDGET_RET_IF(cityNameLayout == NULL || iconAndTemperatureLayout == NULL || forecastLayout == NULL);
    Widget4x2Page::EmitToday(signal);
    elm_object_signal_emit(forecastLayout, signal, "weatherForecast");
}

// The first missing day ends the rows; it and the later rows stay empty.
int Widget4x4Page::UpdateWeekly(Evas_Object* weatherForecastLayout)
{
    WIDGET_RETV_IF(weatherForecastLayout == NULL, 0);
    WIDGET_RETV_IF(!mWidgetPageDataPtr, 0);
    std::string widgetResEdjPath = WidgetPageData::GetResourceEdjPath();
    WIDGET_RETV_IF(widgetResEdjPath.length() < 1, 0);
    for (int row = 1; row <= kForecastDays; ++row)
    {
        if (!UpdateDay(weatherForecastLayout, row))
        {
            ClearDays(weatherForecastLayout, row);
            return row - 1;
        }
    }
    return kForecastDays;
}

// A layout filled again for another city must not keep that city's days.
void Widget4x4Page::ClearDays(Evas_Object* forecastLayout, int firstRow)
{
    Evas_Object* edje = elm_layout_edje_get(forecastLayout);
    for (int row = firstRow; row <= kForecastDays; ++row)
    {
        std::string number = std::to_string(row);
        for (const char* text : {"weatherForecastHighTemp", "weatherForecastLowTemp", "weatherForecastWeek"})
            edje_object_part_text_set(edje, (text + number).c_str(), "");
        for (const char* image : {"weatherForecastIcon", "weatherForecastPressIcon"})
        {
            Evas_Object* old = elm_object_part_content_unset(forecastLayout, (image + number).c_str());
            if (old)
                evas_object_del(old);
        }
    }
}

bool Widget4x4Page::UpdateDay(Evas_Object* forecastLayout, int row)
{
    const WidgetPageData& data = *mWidgetPageDataPtr;
    NSWeather::CityPtr cityPtr = data.GetCityPtr();
    int day = row - 1;
    std::string number = std::to_string(row);
    Evas_Object* edje = elm_layout_edje_get(forecastLayout);
    std::string high = data.GetWeeklyHighTemperatureString(cityPtr, day);
    WIDGET_RETV_IF(high.length() < 1, false);
    edje_object_part_text_set(edje, ("weatherForecastHighTemp" + number).c_str(), high.c_str());
    std::string low = data.GetWeeklyLowTemperatureString(cityPtr, day);
    WIDGET_RETV_IF(low.length() < 1, false);
    edje_object_part_text_set(edje, ("weatherForecastLowTemp" + number).c_str(), low.c_str());
    std::string weekday = data.GetWeeklyWeekdayString(cityPtr, day);
    WIDGET_RETV_IF(weekday.length() < 1, false);
    edje_object_part_text_set(edje, ("weatherForecastWeek" + number).c_str(), weekday.c_str());
    bool fcstImage = SetPartImage(forecastLayout, ("weatherForecastIcon" + number).c_str(),
                                  data.GetWeeklyIconPath(cityPtr, day, false));
    WIDGET_RETV_IF(!fcstImage, false);
    bool fcstPressImage = SetPartImage(forecastLayout, ("weatherForecastPressIcon" + number).c_str(),
                                       data.GetWeeklyIconPath(cityPtr, day, true));
    WIDGET_RETV_IF(!fcstPressImage, false);
    return true;
}

}  // namespace NSWeatherWidget

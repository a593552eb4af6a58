#include "AppLaunchView.h"

#include <cstdio>

#include "SiblingLog.h"

namespace NSWeather
{

AppLaunchView::~AppLaunchView()
{
    if (mWindow)
        evas_object_del(mWindow);
}

void AppLaunchView::CloseCb(void* /*data*/, Evas_Object* /*obj*/, void* /*eventInfo*/)
{
    elm_exit();
}

std::string AppLaunchView::Describe(const CityPtr& cityPtr)
{
    if (!cityPtr)
        return "<b>Add a city</b><br>Run: weather-app add &lt;name&gt;";
    char temperature[32] = "--";
    CurrentPtr currentPtr = cityPtr->GetCurrentPtr();
    if (currentPtr && currentPtr->GetCurTemperature()->GetCelsius() != 999.0)
        snprintf(temperature, sizeof(temperature), "%.0f °C", currentPtr->GetCurTemperature()->GetCelsius());
    char* name = elm_entry_utf8_to_markup(cityPtr->GetCityName().c_str());
    char* country = elm_entry_utf8_to_markup(cityPtr->GetCountryName().c_str());
    std::string text = std::string("<b>") + (name ? name : "") + "</b>, " + (country ? country : "") +
                       "<br>" + temperature +
                       (currentPtr ? " " + currentPtr->GetWeatherStatus() : std::string());
    free(name);
    free(country);
    return text;
}

void AppLaunchView::AddLine(Evas_Object* box, const std::string& markup)
{
    Evas_Object* label = elm_label_add(box);
    elm_object_text_set(label, markup.c_str());
    evas_object_size_hint_weight_set(label, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_box_pack_end(box, label);
    evas_object_show(label);
}

bool AppLaunchView::Create(const CityPtr& cityPtr)
{
    mWindow = elm_win_util_standard_add("weather-app", "Weather");
    SIBLING_RETV_IF(!mWindow, false);
    evas_object_smart_callback_add(mWindow, "delete,request", CloseCb, this);
    Evas_Object* box = elm_box_add(mWindow);
    evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_win_resize_object_add(mWindow, box);
    AddLine(box, Describe(cityPtr));
    AddLine(box, "<i>Sample weather, not a forecast</i>");
    Evas_Object* button = elm_button_add(box);
    elm_object_text_set(button, "Close");
    evas_object_smart_callback_add(button, "clicked", CloseCb, this);
    elm_box_pack_end(box, button);
    evas_object_show(button);
    evas_object_show(box);
    evas_object_resize(mWindow, 360, 240);
    evas_object_show(mWindow);
    return true;
}

}  // namespace NSWeather

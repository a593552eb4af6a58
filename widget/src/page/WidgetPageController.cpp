#include "WidgetPageController.h"

#include <stdexcept>

#include "SettingDBController.h"
#include "WidgetLog.h"
#include "WidgetMain.h"

namespace NSWeatherWidget
{

Evas_Object* WidgetPageController::GetBaseLayout() const
{
    WIDGET_RETV_IF(!mWidgetPagePtr, nullptr);
    return mWidgetPagePtr->GetBaseLayout();
}

void WidgetPageController::SetSettingPtr(const NSWeather::SettingPtr& settingPtr)
{
    WIDGET_RET_IF(!mWidgetPageDataPtr);
    mWidgetPageDataPtr->SetSettingPtr(settingPtr);
}

Evas_Object* WidgetPageController::Create(Evas_Object* parent, int index)
{
    WIDGET_RETV_IF(parent == NULL, nullptr);
    WIDGET_RETV_IF(!mWidgetPagePtr, nullptr);
    WIDGET_RETV_IF(!mWidgetPageDataPtr, nullptr);
    NSWeather::SettingDBController settingDBController;
    NSWeather::SettingPtr settingPtr = settingDBController.Select();
    NSWeather::CityPtr cityPtr;
    try
    {
        WidgetMain* widgetMain = WidgetMain::GetInstance();
        if (!widgetMain)
            throw std::runtime_error("widgetMain == NULL");
        if (index >= 0)
            cityPtr = widgetMain->GetCityPtr(index);
    }
    catch (const std::exception& e)
    {
        WIDGET_LOG("exception caught: %s", e.what());
    }
    mWidgetPageDataPtr->SetCityPtr(cityPtr);
    mWidgetPageDataPtr->SetSettingPtr(settingPtr);
    return mWidgetPagePtr->Create(parent, mWidgetPageDataPtr);
}

void WidgetPageController::Resume(int index)
{
    WIDGET_RET_IF(!mWidgetPagePtr);
    WIDGET_RET_IF(!mWidgetPageDataPtr);
    WidgetMain* widgetMain = WidgetMain::GetInstance();
    WIDGET_RET_IF(!widgetMain);
    NSWeather::CityPtr cityPtr = widgetMain->GetCityPtr(index);
    WIDGET_RET_IF(!cityPtr);
    NSWeather::SettingPtr settingPtr = widgetMain->GetSettingPtr();
    WIDGET_RET_IF(!settingPtr);
    mWidgetPageDataPtr->SetCityPtr(cityPtr);
    mWidgetPageDataPtr->SetSettingPtr(settingPtr);
    mWidgetPagePtr->Resume();
}

void WidgetPageController::Pause()
{
    WIDGET_RET_IF(!mWidgetPagePtr);
    mWidgetPagePtr->Pause();
}

void WidgetPageController::Destroy()
{
    WIDGET_RET_IF(!mWidgetPagePtr);
    mWidgetPagePtr->Destroy();
}

void WidgetPageController::Click(int x, int y)
{
    WIDGET_RET_IF(!mWidgetPagePtr);
    mWidgetPagePtr->Click(x, y);
}

void WidgetPageController::TimeTick()
{
    WIDGET_RET_IF(!mWidgetPagePtr);
    mWidgetPagePtr->TimeTick();
}

void WidgetPageController::UpdateRefreshButton(bool stop)
{
    WIDGET_RET_IF(!mWidgetPagePtr);
    WIDGET_RET_IF(!mWidgetPageDataPtr);
    NSWeather::SettingDBController settingDBController;
    mWidgetPageDataPtr->SetSettingPtr(settingDBController.Select());
    mWidgetPagePtr->UpdateRefreshButton(stop);
}

}  // namespace NSWeatherWidget

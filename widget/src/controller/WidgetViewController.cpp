#include "WidgetViewController.h"

#include <stdexcept>

#include "DBController.h"
#include "WidgetLog.h"
#include "WidgetMain.h"
#include "WidgetView.h"

namespace NSWeatherWidget
{

void WidgetViewController::Initialize()
{
    mWidgetViewPtr = std::make_shared<WidgetView>();
    mWidgetViewDataPtr = std::make_shared<WidgetViewData>();
}

Evas_Object* WidgetViewController::Create(Evas_Object* parent)
{
    WIDGET_RETV_IF(parent == NULL, nullptr);
    WIDGET_RETV_IF(!mWidgetViewPtr, nullptr);
    WIDGET_RETV_IF(!mWidgetViewDataPtr, nullptr);
    try
    {
        WidgetMain* widgetMain = WidgetMain::GetInstance();
        if (!widgetMain)
            throw std::runtime_error("widgetMain == NULL");
        NSWeather::SettingPtr settingPtr = widgetMain->GetSettingPtr();
        NSWeather::DBController dbController;
        mWidgetViewDataPtr->SetCityPtrVector(dbController.SelectAllCityData());
        mWidgetViewDataPtr->SetSettingPtr(settingPtr);
        Evas_Object* layout = mWidgetViewPtr->Create(parent, mWidgetViewDataPtr);
        if (!layout)
            throw std::runtime_error("layout == NULL");
        mWidgetViewDataPtr->SetLastRefreshedTime(settingPtr ? settingPtr->GetLastRefreshedTime() : 0);
        return layout;
    }
    catch (const std::out_of_range&)
    {
        WIDGET_LOG("exception caught: out of range");
    }
    catch (const std::exception& e)
    {
        WIDGET_LOG("exception caught: %s", e.what());
    }
    return nullptr;
}

// The view compares the model's previous refreshed time with the
// settings, so the model learns the new time only after the view resumed.
void WidgetViewController::Resume(bool force)
{
    WIDGET_RET_IF(!mWidgetViewPtr);
    WIDGET_RET_IF(!mWidgetViewDataPtr);
    WidgetMain* widgetMain = WidgetMain::GetInstance();
    WIDGET_RET_IF(widgetMain == NULL);
    NSWeather::SettingPtr settingPtr = widgetMain->GetSettingPtr();
    time_t refreshedTime = settingPtr ? settingPtr->GetLastRefreshedTime() : 0;
    if (refreshedTime != mWidgetViewDataPtr->GetLastRefreshedTime())
    {
        NSWeather::DBController dbController;
        NSWeather::CityPtrVectorPtr cityPtrVector = dbController.SelectAllCityData();
        // A failed read leaves the pages as they are; the next resume reads again.
        if (cityPtrVector)
            mWidgetViewDataPtr->SetCityPtrVector(cityPtrVector);
        else
            refreshedTime = mWidgetViewDataPtr->GetLastRefreshedTime();
    }
    mWidgetViewDataPtr->SetSettingPtr(settingPtr);
    mWidgetViewPtr->Resume(force);
    mWidgetViewDataPtr->SetLastRefreshedTime(refreshedTime);
}

void WidgetViewController::Pause()
{
    WIDGET_RET_IF(!mWidgetViewPtr);
    mWidgetViewPtr->Pause();
}

void WidgetViewController::Destroy()
{
    WIDGET_RET_IF(!mWidgetViewPtr);
    mWidgetViewPtr->Destroy();
}

void WidgetViewController::Resize(Evas_Object* parent)
{
    WIDGET_RET_IF(!mWidgetViewPtr);
    mWidgetViewPtr->Resize(parent);
}

void WidgetViewController::ResizeWindow(int width, int height)
{
    WIDGET_RET_IF(!mWidgetViewPtr);
    mWidgetViewPtr->ResizeWindow(width, height);
}

void WidgetViewController::ResizeBaseLayout(int width, int height)
{
    WIDGET_RET_IF(!mWidgetViewPtr);
    mWidgetViewPtr->ResizeBaseLayout(width, height);
}

int WidgetViewController::GetSizeType() const
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, 0);
    return mWidgetViewDataPtr->GetSizeType();
}

void WidgetViewController::SetSizeType(int sizeType)
{
    WIDGET_RET_IF(!mWidgetViewDataPtr);
    mWidgetViewDataPtr->SetSizeType(sizeType);
}

std::shared_ptr<std::string> WidgetViewController::GetIdStringPtr() const
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, nullptr);
    return mWidgetViewDataPtr->GetIdStringPtr();
}

void WidgetViewController::SetIdStringPtr(const std::shared_ptr<std::string>& idStringPtr)
{
    WIDGET_RET_IF(!mWidgetViewDataPtr);
    mWidgetViewDataPtr->SetIdStringPtr(idStringPtr);
}

void WidgetViewController::SetLocationIdOfDisplayCity(const std::string& locationId)
{
    WIDGET_RET_IF(!mWidgetViewDataPtr);
    mWidgetViewDataPtr->SetLocationIdOfDisplayCity(locationId);
}

}  // namespace NSWeatherWidget

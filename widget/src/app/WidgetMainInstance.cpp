// The six instance callbacks of the widget class and the registry they
// keep; resume runs the two refresh checks (WidgetMainRefresh.cpp).
#include <Elementary.h>
#include <libintl.h>
#include <malloc.h>
#include <widget.h>
#include <widget_errno.h>
#include <widget_service.h>

#include "ContentProvider.h"
#include "QuorvexLogManager.h"
#include "WidgetLog.h"
#include "WidgetMain.h"
#include "WidgetViewController.h"
#include "WidgetViewData.h"

namespace NSWeatherWidget
{

namespace
{
const int kErrorInvalid = -22;
const double kAppBaseScale = 2.6;
const int kImageCacheKiB = 256;
const int kFeatureWidgetState = 2008;

int AddedWidgetDetail(int type)
{
    if (type == WIDGET_SIZE_TYPE_4x2)
        return 15;
    if (type == WIDGET_SIZE_TYPE_4x4)
        return 14;
    return 13;
}
}  // namespace

std::string WidgetMain::GetIdString(widget_context_h context)
{
    const char* id = widget_app_get_id(context);
    return id ? std::string(id) : std::string();
}

int WidgetMain::CreateWidgetInstance(widget_context_h context, bundle*, int w, int h, void*)
{
    WIDGET_LOG("CreateWidgetInstance");
    const char* id = widget_app_get_id(context);
    WIDGET_RETV_IF(id == NULL, kErrorInvalid);
    widget_size_type_e type = WIDGET_SIZE_TYPE_UNKNOWN;
    WIDGET_RETV_IF(widget_service_get_size_type(w, h, &type) != WIDGET_ERROR_NONE, kErrorInvalid);
    elm_app_base_scale_set(kAppBaseScale);
    auto idStringPtr = std::make_shared<std::string>(id);
    WidgetMain* widgetMain = GetInstance();
    WIDGET_RETV_IF(!widgetMain, kErrorInvalid);

    NSWeather::ContentProvider::RebuildScope providerReadOnce;
    widgetMain->LoadAllWeatherInformation();
    auto controller = std::make_shared<WidgetViewController>();
    controller->Initialize();
    controller->SetIdStringPtr(idStringPtr);
    std::string locationId =
        widgetMain->mSettingPtr ? widgetMain->mSettingPtr->GetCurrentCityLocationId() : "";
    if (locationId.empty())
    {
        WIDGET_LOG("cityPtr is NULL");
        locationId = "default";
    }
    controller->SetLocationIdOfDisplayCity(locationId);
    controller->SetSizeType(WidgetViewData::kSizeTypeUnknown);
    widgetMain->sWidgetViewControllerList.emplace_back(idStringPtr, controller);

    int result = CreateOrResizeView(controller, context, type);
    if (result != WIDGET_ERROR_NONE)
        return result;
    NSWeather::QuorvexLogManager::GetInstance()->CollectLogByFeature(
        kFeatureWidgetState, AddedWidgetDetail(controller->GetSizeType()),
        NSWeather::QuorvexLogManager::URI_TYPE_APP_STATUS_SURVEY, -1);
    WIDGET_LOG("WidgetMain Created");
    elm_cache_all_flush();
    malloc_trim(0);
    return 0;
}

// Makes the view on the first call with a window object, else follows a
// change of size type; then sizes the window and the base layout.
int WidgetMain::CreateOrResizeView(const WidgetViewControllerPtr& controller, widget_context_h context,
                                   int type)
{
    Evas_Object* parent = static_cast<Evas_Object*>(widget_get_evas_object(context));
    WIDGET_RETV_IF(!parent, WIDGET_ERROR_FAULT);
    if (controller->GetSizeType() == WidgetViewData::kSizeTypeUnknown)
    {
        controller->SetSizeType(type);
        controller->Create(parent);
        widget_set_extra_info(widget_app_get_id(context), NULL, dgettext("weather-m", "IDS_DB_TAB_WEATHER"),
                              NULL, NULL);
        WIDGET_LOG("WidgetView Created");
        // Pages are rebuilt on every flick and update; Elementary's default
        // cache (4 MB a window) would keep every image they ever decoded.
        // Set here, after the window: the setter flushes every cache, and
        // before the first window that made it read the theme file again.
        elm_config_cache_image_cache_size_set(kImageCacheKiB);
    }
    else if (controller->GetSizeType() != type)
    {
        controller->SetSizeType(type);
        controller->Resize(parent);
    }
    int width = 0;
    int height = 0;
    if (widget_service_get_size(static_cast<widget_size_type_e>(type), &width, &height) != WIDGET_ERROR_NONE)
        WIDGET_LOG("widget_service_get_size failed(type:%d, w:%d, h:%d)", type, width, height);
    controller->SetSizeType(type);
    controller->ResizeWindow(width, height);
    controller->ResizeBaseLayout(width, height);
    return WIDGET_ERROR_NONE;
}

int WidgetMain::ResizeWidgetInstance(widget_context_h context, int w, int h, void*)
{
    std::string id = GetIdString(context);
    if (id.empty())
        return WIDGET_ERROR_NOT_EXIST;
    WidgetMain* widgetMain = GetInstance();
    WIDGET_RETV_IF(!widgetMain, 0);
    WidgetViewControllerPtr widgetViewControllerPtr = widgetMain->FindWidgetObject(id);
    WIDGET_RETV_IF(!widgetViewControllerPtr, WIDGET_ERROR_NOT_EXIST);
    widget_size_type_e type = WIDGET_SIZE_TYPE_UNKNOWN;
    widget_service_get_size_type(w, h, &type);
    int result = CreateOrResizeView(widgetViewControllerPtr, context, type);
    return result == WIDGET_ERROR_NONE ? 0 : result;
}

int WidgetMain::PauseWidgetInstance(widget_context_h context, void*)
{
    std::string id = GetIdString(context);
    if (id.empty())
        return WIDGET_ERROR_NOT_EXIST;
    WidgetMain* widgetMain = GetInstance();
    WIDGET_RETV_IF(!widgetMain, 0);
    WidgetViewControllerPtr widgetViewControllerPtr = widgetMain->FindWidgetObject(id);
    if (!widgetViewControllerPtr)
        return WIDGET_ERROR_NOT_EXIST;
    widgetMain->CancelAutoRefresh();
    widgetViewControllerPtr->Pause();
    elm_cache_all_flush();
    malloc_trim(0);
    return 0;
}

int WidgetMain::ResumeWidgetInstance(widget_context_h context, void*)
{
    WIDGET_LOG("ResumeWidgetInstance");
    std::string id = GetIdString(context);
    WidgetMain* widgetMain = GetInstance();
    if (id.empty() || !widgetMain)
        return 0;
    NSWeather::ContentProvider::RebuildScope providerReadOnce;
    widgetMain->LoadAllWeatherInformation();
    WidgetViewControllerPtr widgetViewControllerPtr = widgetMain->FindWidgetObject(id);
    WIDGET_RETV_IF(!widgetViewControllerPtr, 0);
    WidgetViewDataPtr widgetViewDataPtr = widgetViewControllerPtr->GetWidgetViewData();
    WIDGET_RETV_IF(!widgetViewDataPtr, 0);
    NSWeather::SettingPtr settingPtr = widgetMain->mSettingPtr;
    widgetMain->RequestCurrentLocationIfNeeded();
    widgetViewControllerPtr->Resume(false);
    if (widgetViewDataPtr->GetIsFirstCreated() == true)
        WIDGET_LOG("[%s(): %d] (%s) [return]", __func__, __LINE__,
                   "widgetViewDataPtr->GetIsFirstCreated() == true");
    else
        widgetMain->StartAutoRefreshIfNeeded(widgetViewDataPtr, settingPtr);
    widgetViewDataPtr->SetIsFirstCreated(false);
    return 0;
}

int WidgetMain::UpdateWidgetInstance(widget_context_h context, bundle*, int, void*)
{
    WIDGET_LOG("UpdateWidgetInstance");
    std::string id = GetIdString(context);
    if (id.empty())
        return WIDGET_ERROR_NOT_EXIST;
    WidgetMain* widgetMain = GetInstance();
    WIDGET_RETV_IF(!widgetMain, 0);
    NSWeather::ContentProvider::RebuildScope providerReadOnce;
    widgetMain->LoadAllWeatherInformation();
    WidgetViewControllerPtr widgetViewControllerPtr = widgetMain->FindWidgetObject(id);
    if (!widgetViewControllerPtr)
        return WIDGET_ERROR_NOT_EXIST;
    widgetViewControllerPtr->Resume(true);
    return 0;
}

int WidgetMain::DestroyWidgetInstance(widget_context_h context, widget_app_destroy_type_e, bundle*, void*)
{
    WidgetMain* widgetMain = GetInstance();
    WIDGET_RETV_IF(!widgetMain, 0);
    std::string id = GetIdString(context);
    if (id.empty())
        return WIDGET_ERROR_NOT_EXIST;
    WidgetViewControllerPtr widgetViewControllerPtr = widgetMain->FindWidgetObject(id);
    WIDGET_RETV_IF(!widgetViewControllerPtr, WIDGET_ERROR_NOT_EXIST);
    widgetViewControllerPtr->Destroy();
    widgetMain->Unregister(widgetViewControllerPtr);
    return 0;
}

}  // namespace NSWeatherWidget

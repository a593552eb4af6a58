#include "AppLauncher.h"

#include <app_control_launch.h>

#include <stdexcept>

#include "QuorvexLogManager.h"
#include "UICommonLog.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{

const char* const ACCUWEATHER_DOMAIN = "accuweather.com";
const int FEATURE_ENTER_PROVIDER_SITE = 2005;
const int DETAIL_ENTER_ACCUWEATHER = 10;

}  // namespace

AppLauncher::AppLauncher() : mAppControl(nullptr), mReplyListener(nullptr) {}

AppLauncher::~AppLauncher() {}

void AppLauncher::AppControlCreate()
{
    int ret = app_control_create(&mAppControl);
    if (ret != APP_CONTROL_ERROR_NONE)
    {
        UI_COMMON_LOG("[Fail] app_control_create : %d", ret);
        mAppControl = nullptr;
        throw std::runtime_error("app_control_create failed");
    }
}

void AppLauncher::AppControlSetUrl(const std::string& uri)
{
    UI_COMMON_RET_IF(mAppControl == NULL);
    int ret = app_control_set_uri(mAppControl, uri.c_str());
    if (ret != APP_CONTROL_ERROR_NONE)
    {
        UI_COMMON_LOG("[Fail] app_control_set_uri : %d", ret);
        throw std::runtime_error("app_control_set_uri failed");
    }
}

void AppLauncher::AppControlSetAppID(const std::string& appId)
{
    UI_COMMON_RET_IF(mAppControl == NULL);
    int ret = app_control_set_app_id(mAppControl, appId.c_str());
    if (ret != APP_CONTROL_ERROR_NONE)
    {
        UI_COMMON_LOG("[Fail] app_control_set_app_id : %d", ret);
        throw std::runtime_error("app_control_set_app_id failed");
    }
}

void AppLauncher::AppControlAddExtraData(const std::string& key, const std::string& value)
{
    UI_COMMON_RET_IF(mAppControl == NULL);
    int ret = app_control_add_extra_data(mAppControl, key.c_str(), value.c_str());
    if (ret != APP_CONTROL_ERROR_NONE)
    {
        UI_COMMON_LOG("[Fail] app_control_add_extra_data(%d)", ret);
        throw std::runtime_error("app_control_add_extra_data failed: " + key);
    }
}

void AppLauncher::AppControlSetOperation(const std::string& operation)
{
    UI_COMMON_RET_IF(mAppControl == NULL);
    int ret = app_control_set_operation(mAppControl, operation.c_str());
    if (ret != APP_CONTROL_ERROR_NONE)
    {
        UI_COMMON_LOG("[Fail] app_control_set_operation : %d", ret);
        throw std::runtime_error("app_control_set_operation failed");
    }
}

void AppLauncher::AppControlSendLaunchRequest(app_control_reply_cb callback, void* userData)
{
    UI_COMMON_RET_IF(mAppControl == NULL);
    int ret = app_control_send_launch_request(mAppControl, callback, userData);
    if (ret != APP_CONTROL_ERROR_NONE)
    {
        UI_COMMON_LOG("[Fail] app_control_send_launch_request failed : %d", ret);
        throw std::runtime_error("app_control_send_launch_request failed");
    }
}

void AppLauncher::AppControlDestroy()
{
    UI_COMMON_RET_IF(mAppControl == NULL);
    int ret = app_control_destroy(mAppControl);
    if (ret != APP_CONTROL_ERROR_NONE)
        UI_COMMON_LOG("[Fail] app_control_destroy failed : %d", ret);
    mAppControl = nullptr;
}

int AppLauncher::SendRequest(const std::string& appId, const std::string& operation, const std::string& uri,
                             const ExtraDataList& extraData, app_control_reply_cb callback, void* userData)
{
    int result = -1;
    try
    {
        AppControlCreate();
        if (!appId.empty())
            AppControlSetAppID(appId);
        if (!operation.empty())
            AppControlSetOperation(operation);
        if (!uri.empty())
            AppControlSetUrl(uri);
        for (const auto& item : extraData) AppControlAddExtraData(item.first, item.second);
        AppControlSendLaunchRequest(callback, userData);
        result = 0;
    }
    catch (const std::exception& e)
    {
        UI_COMMON_LOG("[%s]", e.what());
    }
    AppControlDestroy();
    return result;
}

int AppLauncher::SendToAgent(const ExtraDataList& extraData)
{
    return SendRequest(WEATHER_AGENT_APP_ID, std::string(), std::string(), extraData);
}

int AppLauncher::RequestRefreshToAgent()
{
    return SendToAgent({{"MESSAGE", "REQUEST_ALL_WEATHER_INFO"}});
}

int AppLauncher::RequestWeatherInfoWithLocationIdToAgent(const std::string& locationId)
{
    return SendToAgent({{"MESSAGE", "REQUEST_WEATHER_INFO_WITH_LOCATION_ID"}, {"locationId", locationId}});
}

int AppLauncher::RequestWeatherInfoWithLocationIdForAddToAgent(const std::string& portName,
                                                               const std::string& locationId)
{
    return SendToAgent({{"PORT_ID", portName},
                        {"MESSAGE", "REQUEST_WEATHER_INFO_WITH_LOCATION_ID_FOR_ADD"},
                        {"locationId", locationId}});
}

int AppLauncher::RequestWeatherInfoWithCurrentLocationIdForAddToAgent(const std::string& portName,
                                                                      const std::string& locationId)
{
    return SendToAgent({{"PORT_ID", portName},
                        {"MESSAGE", "REQUEST_WEATHER_INFO_WITH_CURRENT_LOCATION_ID_FOR_ADD"},
                        {"locationId", locationId}});
}

int AppLauncher::RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent(const std::string& portName)
{
    return SendToAgent(
        {{"PORT_ID", portName}, {"MESSAGE", "REQUEST_CURRENT_LOCATION_WEATHER_INFO_FOR_SIMPLE_ADD_PROCESS"}});
}

int AppLauncher::RequestSetNowRefreshingToAgent(bool refreshing)
{
    return SendToAgent({{"MESSAGE", "SET_NOW_REFRESHING"}, {"refreshing", refreshing ? "true" : "false"}});
}

int AppLauncher::RequestSetLocationIdOfDisplayCityToAgent(const std::string& locationId)
{
    UI_COMMON_RETV_IF(locationId.length() < 1, -1);
    return SendToAgent({{"MESSAGE", "SET_LOCATIONID_OF_DISPLAY_CITY"}, {"locationId", locationId}});
}

int AppLauncher::RequestCancelAllRequest()
{
    return SendToAgent({{"MESSAGE", "REQUEST_CANCEL_ALL_REQUEST"}});
}

int AppLauncher::RequestLaunchApplication()
{
    return SendRequest(WEATHER_APP_ID, std::string(), std::string(), {});
}

int AppLauncher::RequestLaunchApplicationWithLocationId(const std::string& locationId)
{
    ExtraDataList extraData;
    if (!locationId.empty())
        extraData.emplace_back("LOCATION_ID", locationId);
    return SendRequest(WEATHER_APP_ID, std::string(), std::string(), extraData);
}

int AppLauncher::RequestLaunchApplicationForAddCity()
{
    return SendRequest(WEATHER_APP_ID, std::string(), std::string(), {{"MODE", "ADD_CITY"}});
}

int AppLauncher::RequestLaunchingBrowserWithUrl(const std::string& url)
{
    UI_COMMON_LOG("RequestLaunchingBrowserWithUrl : %s", url.c_str());
    if (url.find(ACCUWEATHER_DOMAIN) != std::string::npos)
        QuorvexLogManager::GetInstance()->CollectLogByFeature(FEATURE_ENTER_PROVIDER_SITE,
                                                              DETAIL_ENTER_ACCUWEATHER,
                                                              QuorvexLogManager::URI_TYPE_FEATURE_SURVEY, -1);
    return SendRequest(std::string(), APP_CONTROL_OPERATION_VIEW, url, {});
}

int AppLauncher::LaunchSetting(const std::string& appId, const std::string& operation)
{
    UI_COMMON_RETV_IF(operation.length() < 1, -1);
    return SendRequest(appId, operation, std::string(), {});
}

int AppLauncher::LaunchGPSSetting()
{
    // The launcher is usually a local object: hand out a pointer to it only
    // when someone waits for the reply.
    app_control_reply_cb callback = mReplyListener ? &AppLauncher::ReplyCB : nullptr;
    void* userData = mReplyListener ? this : nullptr;
    return SendRequest(APP_CONTROL_LOCATION_SETTING_APP_ID, APP_CONTROL_OPERATION_SETTING_LOCATION,
                       std::string(), {}, callback, userData);
}

void AppLauncher::ReplyCB(app_control_h request, app_control_h reply, app_control_result_e, void* userData)
{
    ForwardCallback<AppLauncher>(
        userData,
        [request, reply](AppLauncher& launcher)
        {
            if (launcher.mReplyListener)
                launcher.mReplyListener->OnAppControlReply(request, reply);
        },
        UI_COMMON_CALLBACK_SITE);
}

}  // namespace NSWeather

#include "QuorvexLogManager.h"

#include <bundle.h>

#include <algorithm>
#include <climits>

#include "CommonLog.h"
#include "StringUtil.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{

// Records name the weather application's package, whichever process sends.
const char* const APP_ID = WEATHER_APP_ID;

const char* const kDetailFeatureNames[] = {
    "use_current_location_option",
    "use_current_location_button_click",
    "search_city_list_click",
    "forecast_hourly_click",
    "forecast_daily_click",
    "auto_refresh_option_every_1_hour",
    "auto_refresh_option_every_3_hours",
    "auto_refresh_option_every_6_hours",
    "auto_refresh_option_every_12_hours",
    "auto_refresh_option_never",
    "enter_accuweather",
    "use_lock_screen_option",
    "number_of_registered_city",
    "widget_empty",
    "added_widget_4x4",
    "added_widget_4x2",
    "widget_alive",
};

// Negative values count as 0; the upper bound keeps value * 1000 in range.
int ClampValue(int value)
{
    return std::min(std::max(value, 0), INT_MAX / 1000);
}

}  // namespace

QuorvexLogManager* QuorvexLogManager::GetInstance()
{
    // Never destroyed: completions may still arrive while the process ends.
    static QuorvexLogManager* instance = new QuorvexLogManager();
    return instance;
}

QuorvexLogManager::QuorvexLogManager() : mQuorvexLogManager(nullptr) {}

void QuorvexLogManager::Create()
{
    COMMON_RET_IF(mQuorvexLogManager != NULL);
    int ret = quorvex_log_manager_create(&mQuorvexLogManager);
    if (ret != QUORVEX_LOG_MANAGER_ERROR_NONE)
        COMMON_LOG("quorvex_log_manager_create failed");
    if (mQuorvexLogManager == NULL)
        COMMON_LOG("mQuorvexLogManager is NULL");
}

void QuorvexLogManager::Destroy()
{
    if (mQuorvexLogManager == NULL)
        return;
    quorvex_log_manager_destroy(mQuorvexLogManager);
    mQuorvexLogManager = nullptr;
}

void QuorvexLogManager::CollectLogByFeature(int feature, int detailFeatureNumber, int uriType)
{
    CollectLogByFeature(feature, detailFeatureNumber, uriType, -1);
}

void QuorvexLogManager::CollectLogByFeature(int feature, int detailFeatureNumber, int uriType, int rawValue)
{
    COMMON_RET_IF(mQuorvexLogManager == NULL);
    bundle* logData = bundle_create();
    std::string featureStr = StringUtil::IntToString(feature);
    std::string extraStr = GetExtraStringByDetailFeatureNumber(detailFeatureNumber);
    std::string uri = GetUri(uriType);
    COMMON_RET_IF(logData == NULL);
    int value = ClampValue(rawValue);
    do
    {
        // The conditions are logged as written; keep their spelling.
        // clang-format off
        COMMON_BREAK_IF(bundle_add_str(logData, "app_id", APP_ID) != BUNDLE_ERROR_NONE);
        COMMON_BREAK_IF(bundle_add_str(logData, "feature", featureStr.c_str())!= BUNDLE_ERROR_NONE);
        COMMON_BREAK_IF(bundle_add_str(logData, "extra", extraStr.c_str())!= BUNDLE_ERROR_NONE);
        COMMON_BREAK_IF(bundle_add_str(logData, "value", StringUtil::IntToString(value * 1000).c_str()) != BUNDLE_ERROR_NONE);
        // clang-format on
        int requestId = quorvex_log_manager_insert(mQuorvexLogManager, uri.c_str(), logData,
                                                   &QuorvexLogManager::OnQuorvexLogManagerInsertCb, this);
        if (requestId < 0)
            COMMON_LOG("quorvex_log_manager_insert failed : %d", requestId);
    } while (0);
    bundle_free(logData);
}

std::string QuorvexLogManager::GetExtraStringByDetailFeatureNumber(int detailFeatureNumber)
{
    const int count = static_cast<int>(sizeof(kDetailFeatureNames) / sizeof(kDetailFeatureNames[0]));
    if (detailFeatureNumber < 0 || detailFeatureNumber >= count)
    {
        COMMON_LOG("Default error : %d", detailFeatureNumber);
        return std::string();
    }
    return kDetailFeatureNames[detailFeatureNumber];
}

std::string QuorvexLogManager::GetUri(int uriType)
{
    const std::string base = std::string("content://") + QUORVEX_LOG_AUTHORITY;
    switch (uriType)
    {
        case URI_TYPE_FEATURE_SURVEY:
            return base + "/log/use_app_feature_survey";
        case URI_TYPE_APP_STATUS_SURVEY:
            return base + "/log/report_app_status_survey";
        default:
            return std::string();
    }
}

void QuorvexLogManager::OnQuorvexLogManagerInsertCb(int requestId, const char* uri, void* userData)
{
    ForwardCallback<QuorvexLogManager>(
        userData, [requestId, uri](QuorvexLogManager& manager) { manager.OnInsertCompleted(requestId, uri); },
        COMMON_CALLBACK_SITE);
}

void QuorvexLogManager::OnInsertCompleted(int requestId, const char* uri)
{
    COMMON_LOG("Insert request:%d completed, uri:%s\n", requestId, uri ? uri : "");
}

}  // namespace NSWeather

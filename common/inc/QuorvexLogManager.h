#ifndef NSWEATHER_QUORVEX_LOG_MANAGER_H
#define NSWEATHER_QUORVEX_LOG_MANAGER_H

#include <string>

#include <quorvex_log_manager.h>

namespace NSWeather
{

// Reports usage events of the suite to the device's usage-log service.
// One per process, used on the main loop only.
class QuorvexLogManager
{
public:
    enum UriType
    {
        URI_TYPE_FEATURE_SURVEY = 0,
        URI_TYPE_APP_STATUS_SURVEY = 1,
    };

    static QuorvexLogManager* GetInstance();

    void Create();
    void Destroy();
    void CollectLogByFeature(int feature, int detailFeatureNumber, int uriType, int value);
    void CollectLogByFeature(int feature, int detailFeatureNumber, int uriType);

    static std::string GetExtraStringByDetailFeatureNumber(int detailFeatureNumber);
    // Empty for an unknown type.
    static std::string GetUri(int uriType);

private:
    QuorvexLogManager();
    QuorvexLogManager(const QuorvexLogManager&) = delete;
    QuorvexLogManager& operator=(const QuorvexLogManager&) = delete;

    static void OnQuorvexLogManagerInsertCb(int requestId, const char* uri, void* userData);
    void OnInsertCompleted(int requestId, const char* uri);

    quorvex_log_manager_h mQuorvexLogManager;
};

}  // namespace NSWeather

#endif

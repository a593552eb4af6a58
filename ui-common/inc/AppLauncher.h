#ifndef NSWEATHER_APP_LAUNCHER_H
#define NSWEATHER_APP_LAUNCHER_H

#include <string>
#include <utility>
#include <vector>

#include <app_control.h>

namespace NSWeather
{

// Receives the reply of a request that asks for one (LaunchGPSSetting).
class AppLauncherReplyListener
{
public:
    virtual ~AppLauncherReplyListener() = default;
    virtual void OnAppControlReply(app_control_h request, app_control_h reply) = 0;
};

// Launch requests to the weather agent, the weather application, the
// browser and the settings. A short-lived value: each request builds its
// own platform handle and destroys it before returning 0 (accepted by the
// platform) or -1.
class AppLauncher
{
public:
    AppLauncher();
    ~AppLauncher();

    int RequestRefreshToAgent();
    int RequestWeatherInfoWithLocationIdToAgent(const std::string& locationId);
    int RequestWeatherInfoWithLocationIdForAddToAgent(const std::string& portName,
                                                      const std::string& locationId);
    int RequestWeatherInfoWithCurrentLocationIdForAddToAgent(const std::string& portName,
                                                             const std::string& locationId);
    int RequestCurrentLocationWeatherInfoForSimpleAddProcessToAgent(const std::string& portName);
    int RequestSetNowRefreshingToAgent(bool refreshing);
    int RequestSetLocationIdOfDisplayCityToAgent(const std::string& locationId);
    int RequestCancelAllRequest();
    int RequestLaunchApplication();
    int RequestLaunchApplicationWithLocationId(const std::string& locationId);
    int RequestLaunchApplicationForAddCity();
    int RequestLaunchingBrowserWithUrl(const std::string& url);
    int LaunchSetting(const std::string& appId, const std::string& operation);
    // Asks for a reply only while a listener is attached; the listener and
    // this launcher must then outlive the reply.
    int LaunchGPSSetting();

    // Not owned.
    void SetReplyListener(AppLauncherReplyListener* listener) { mReplyListener = listener; }

private:
    using ExtraDataList = std::vector<std::pair<std::string, std::string>>;

    AppLauncher(const AppLauncher&) = delete;
    AppLauncher& operator=(const AppLauncher&) = delete;

    // Building blocks: each throws std::runtime_error when the platform
    // refuses the step.
    void AppControlCreate();
    void AppControlSetUrl(const std::string& uri);
    void AppControlSetAppID(const std::string& appId);
    void AppControlAddExtraData(const std::string& key, const std::string& value);
    void AppControlSetOperation(const std::string& operation);
    void AppControlSendLaunchRequest(app_control_reply_cb callback, void* userData);
    void AppControlDestroy();

    int SendRequest(const std::string& appId, const std::string& operation, const std::string& uri,
                    const ExtraDataList& extraData, app_control_reply_cb callback = nullptr,
                    void* userData = nullptr);
    int SendToAgent(const ExtraDataList& extraData);

    static void ReplyCB(app_control_h request, app_control_h reply, app_control_result_e result,
                        void* userData);

    app_control_h mAppControl;
    AppLauncherReplyListener* mReplyListener;
};

}  // namespace NSWeather

#endif

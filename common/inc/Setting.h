#ifndef NSWEATHER_SETTING_H
#define NSWEATHER_SETTING_H

#include <ctime>
#include <memory>
#include <string>
#include <vector>

namespace NSWeather
{
// The suite's settings: one row of the setting database, each field named
// after its column.
class Setting
{
public:
    Setting();
    virtual ~Setting();

    int GetCurrentCityIndex() const;
    void SetCurrentCityIndex(int currentCityIndex);
    std::string GetCurrentCityLocationId() const;
    void SetCurrentCityLocationId(const std::string& currentCityLocationId);
    // 1 = Celsius, any other value = Fahrenheit.
    int GetTemperatureUnit() const;
    void SetTemperatureUnit(int temperatureUnit);
    time_t GetLastRefreshedTime() const;
    void SetLastRefreshedTime(time_t lastRefreshedTime);
    time_t GetCurrentLocationAreaRefreshedTime() const;
    void SetCurrentLocationAreaRefreshedTime(time_t currentLocationAreaRefreshedTime);
    bool GetIsFirstLaunch() const;
    void SetIsFirstLaunch(bool isFirstLaunch);
    bool GetAutoRefreshOn() const;
    void SetAutoRefreshOn(bool autoRefreshOn);
    // In hours.
    int GetAutoRefreshInterval() const;
    void SetAutoRefreshInterval(int autoRefreshInterval);
    bool GetUseCurrentLocationOn() const;
    void SetUseCurrentLocationOn(bool useCurrentLocationOn);
    bool GetShowCurrentCityAgreement() const;
    void SetShowCurrentCityAgreement(bool showCurrentCityAgreement);
    bool GetRefreshOnOpeningOn() const;
    void SetRefreshOnOpeningOn(bool refreshOnOpeningOn);
    bool GetRefreshOnOpeningOnAgreement() const;
    void SetRefreshOnOpeningOnAgreement(bool refreshOnOpeningOnAgreement);
    bool GetNotificationOn() const;
    void SetNotificationOn(bool notificationOn);
    time_t GetNotificationTime() const;
    void SetNotificationTime(time_t notificationTime);
    bool GetNetworkPositionPopupAgreement() const;
    void SetNetworkPositionPopupAgreement(bool networkPositionPopupAgreement);
    bool GetShowNetworkPopup() const;
    void SetShowNetworkPopup(bool showNetworkPopup);
    bool GetChinaDataGPSPerformPopupOn() const;
    void SetChinaDataGPSPerformPopupOn(bool chinaDataGPSPerformPopupOn);
    bool GetAutoScrollOn() const;
    void SetAutoScrollOn(bool autoScrollOn);
    int GetAutoScrollInterval() const;
    void SetAutoScrollInterval(int autoScrollInterval);
    std::string GetLastUpdateLanguageCode() const;
    void SetLastUpdateLanguageCode(const std::string& lastUpdateLanguageCode);
    std::string GetCpType() const;
    void SetCpType(const std::string& cpType);
    std::string GetDaemonType() const;
    void SetDaemonType(const std::string& daemonType);
    // A refresh request to the agent is outstanding.
    bool GetIsNowRefreshing() const;
    void SetIsNowRefreshing(bool isNowRefreshing);
    bool GetIsSupportManualRefresh() const;
    void SetIsSupportManualRefresh(bool isSupportManualRefresh);
    time_t GetRefreshingStartTime() const;
    void SetRefreshingStartTime(time_t refreshingStartTime);

private:
    int mCurrentCityIndex;
    std::string mCurrentCityLocationId;
    int mTemperatureUnit;
    time_t mLastRefreshedTime;
    time_t mCurrentLocationAreaRefreshedTime;
    bool mIsFirstLaunch;
    bool mAutoRefreshOn;
    int mAutoRefreshInterval;
    bool mUseCurrentLocationOn;
    bool mShowCurrentCityAgreement;
    bool mRefreshOnOpeningOn;
    bool mRefreshOnOpeningOnAgreement;
    bool mNotificationOn;
    time_t mNotificationTime;
    bool mNetworkPositionPopupAgreement;
    bool mShowNetworkPopup;
    bool mChinaDataGPSPerformPopupOn;
    bool mAutoScrollOn;
    int mAutoScrollInterval;
    std::string mLastUpdateLanguageCode;
    std::string mCpType;
    std::string mDaemonType;
    bool mIsNowRefreshing;
    bool mIsSupportManualRefresh;
    time_t mRefreshingStartTime;
};

using SettingPtr = std::shared_ptr<Setting>;
using SettingPtrVector = std::vector<SettingPtr>;
using SettingPtrVectorPtr = std::shared_ptr<SettingPtrVector>;
}  // namespace NSWeather

#endif

#include "Setting.h"

namespace NSWeather
{

Setting::Setting()
    : mCurrentCityIndex(0),
      mCurrentCityLocationId(),
      mTemperatureUnit(1),
      mLastRefreshedTime(0),
      mCurrentLocationAreaRefreshedTime(0),
      mIsFirstLaunch(true),
      mAutoRefreshOn(true),
      mAutoRefreshInterval(6),
      mUseCurrentLocationOn(false),
      mShowCurrentCityAgreement(false),
      mRefreshOnOpeningOn(false),
      mRefreshOnOpeningOnAgreement(false),
      mNotificationOn(false),
      mNotificationTime(0),
      mNetworkPositionPopupAgreement(false),
      mShowNetworkPopup(false),
      mChinaDataGPSPerformPopupOn(false),
      mAutoScrollOn(false),
      mAutoScrollInterval(0),
      mLastUpdateLanguageCode("en"),
      mCpType("Accuweather"),
      mDaemonType("RI_DAEMON"),
      mIsNowRefreshing(false),
      mIsSupportManualRefresh(false),
      mRefreshingStartTime(0)
{
}

Setting::~Setting() = default;

int Setting::GetCurrentCityIndex() const
{
    return mCurrentCityIndex;
}

void Setting::SetCurrentCityIndex(int currentCityIndex)
{
    mCurrentCityIndex = currentCityIndex;
}

std::string Setting::GetCurrentCityLocationId() const
{
    return mCurrentCityLocationId;
}

void Setting::SetCurrentCityLocationId(const std::string& currentCityLocationId)
{
    mCurrentCityLocationId = currentCityLocationId;
}

int Setting::GetTemperatureUnit() const
{
    return mTemperatureUnit;
}

void Setting::SetTemperatureUnit(int temperatureUnit)
{
    mTemperatureUnit = temperatureUnit;
}

time_t Setting::GetLastRefreshedTime() const
{
    return mLastRefreshedTime;
}

void Setting::SetLastRefreshedTime(time_t lastRefreshedTime)
{
    mLastRefreshedTime = lastRefreshedTime;
}

time_t Setting::GetCurrentLocationAreaRefreshedTime() const
{
    return mCurrentLocationAreaRefreshedTime;
}

void Setting::SetCurrentLocationAreaRefreshedTime(time_t currentLocationAreaRefreshedTime)
{
    mCurrentLocationAreaRefreshedTime = currentLocationAreaRefreshedTime;
}

bool Setting::GetIsFirstLaunch() const
{
    return mIsFirstLaunch;
}

void Setting::SetIsFirstLaunch(bool isFirstLaunch)
{
    mIsFirstLaunch = isFirstLaunch;
}

bool Setting::GetAutoRefreshOn() const
{
    return mAutoRefreshOn;
}

void Setting::SetAutoRefreshOn(bool autoRefreshOn)
{
    mAutoRefreshOn = autoRefreshOn;
}

int Setting::GetAutoRefreshInterval() const
{
    return mAutoRefreshInterval;
}

void Setting::SetAutoRefreshInterval(int autoRefreshInterval)
{
    mAutoRefreshInterval = autoRefreshInterval;
}

bool Setting::GetUseCurrentLocationOn() const
{
    return mUseCurrentLocationOn;
}

void Setting::SetUseCurrentLocationOn(bool useCurrentLocationOn)
{
    mUseCurrentLocationOn = useCurrentLocationOn;
}

bool Setting::GetShowCurrentCityAgreement() const
{
    return mShowCurrentCityAgreement;
}

void Setting::SetShowCurrentCityAgreement(bool showCurrentCityAgreement)
{
    mShowCurrentCityAgreement = showCurrentCityAgreement;
}

bool Setting::GetRefreshOnOpeningOn() const
{
    return mRefreshOnOpeningOn;
}

void Setting::SetRefreshOnOpeningOn(bool refreshOnOpeningOn)
{
    mRefreshOnOpeningOn = refreshOnOpeningOn;
}

bool Setting::GetRefreshOnOpeningOnAgreement() const
{
    return mRefreshOnOpeningOnAgreement;
}

void Setting::SetRefreshOnOpeningOnAgreement(bool refreshOnOpeningOnAgreement)
{
    mRefreshOnOpeningOnAgreement = refreshOnOpeningOnAgreement;
}

bool Setting::GetNotificationOn() const
{
    return mNotificationOn;
}

void Setting::SetNotificationOn(bool notificationOn)
{
    mNotificationOn = notificationOn;
}

time_t Setting::GetNotificationTime() const
{
    return mNotificationTime;
}

void Setting::SetNotificationTime(time_t notificationTime)
{
    mNotificationTime = notificationTime;
}

bool Setting::GetNetworkPositionPopupAgreement() const
{
    return mNetworkPositionPopupAgreement;
}

void Setting::SetNetworkPositionPopupAgreement(bool networkPositionPopupAgreement)
{
    mNetworkPositionPopupAgreement = networkPositionPopupAgreement;
}

bool Setting::GetShowNetworkPopup() const
{
    return mShowNetworkPopup;
}

void Setting::SetShowNetworkPopup(bool showNetworkPopup)
{
    mShowNetworkPopup = showNetworkPopup;
}

bool Setting::GetChinaDataGPSPerformPopupOn() const
{
    return mChinaDataGPSPerformPopupOn;
}

void Setting::SetChinaDataGPSPerformPopupOn(bool chinaDataGPSPerformPopupOn)
{
    mChinaDataGPSPerformPopupOn = chinaDataGPSPerformPopupOn;
}

bool Setting::GetAutoScrollOn() const
{
    return mAutoScrollOn;
}

void Setting::SetAutoScrollOn(bool autoScrollOn)
{
    mAutoScrollOn = autoScrollOn;
}

int Setting::GetAutoScrollInterval() const
{
    return mAutoScrollInterval;
}

void Setting::SetAutoScrollInterval(int autoScrollInterval)
{
    mAutoScrollInterval = autoScrollInterval;
}

std::string Setting::GetLastUpdateLanguageCode() const
{
    return mLastUpdateLanguageCode;
}

void Setting::SetLastUpdateLanguageCode(const std::string& lastUpdateLanguageCode)
{
    mLastUpdateLanguageCode = lastUpdateLanguageCode;
}

std::string Setting::GetCpType() const
{
    return mCpType;
}

void Setting::SetCpType(const std::string& cpType)
{
    mCpType = cpType;
}

std::string Setting::GetDaemonType() const
{
    return mDaemonType;
}

void Setting::SetDaemonType(const std::string& daemonType)
{
    mDaemonType = daemonType;
}

bool Setting::GetIsNowRefreshing() const
{
    return mIsNowRefreshing;
}

void Setting::SetIsNowRefreshing(bool isNowRefreshing)
{
    mIsNowRefreshing = isNowRefreshing;
}

bool Setting::GetIsSupportManualRefresh() const
{
    return mIsSupportManualRefresh;
}

void Setting::SetIsSupportManualRefresh(bool isSupportManualRefresh)
{
    mIsSupportManualRefresh = isSupportManualRefresh;
}

time_t Setting::GetRefreshingStartTime() const
{
    return mRefreshingStartTime;
}

void Setting::SetRefreshingStartTime(time_t refreshingStartTime)
{
    mRefreshingStartTime = refreshingStartTime;
}

}  // namespace NSWeather

#include "SettingDBController.h"

#include "CityDBController.h"
#include "CommonLog.h"
#include "DBCycleCloser.h"
#include "DBStatement.h"
#include "FileUtil.h"
#include "QueryGenernator.h"
#include "TableQuery.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{
constexpr const char* SETTING_TABLE = "SETTING_TABLE";

constexpr const char* SETTING_CREATE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (CurrentCityIndex INT, CurrentCityLocationId TEXT,TemperatureUnit INT, "
    "LastRefreshedTime INT64, CurrentLocationAreaRefreshedTime INT64, IsFirstLaunch INT, AutoRefreshOn INT, "
    "AutoRefreshInterval INT, UseCurrentLocationOn INT, ShowCurrentCityAgreement INT, RefreshOnOpeningOn "
    "INT, "
    "RefreshOnOpeningOnAgreement INT, NotificationOn INT, NotificationTime INT64, "
    "NetworkPositionPopupAgreement "
    "INT, ShowNetworkPopup INT, ChinaDataGPSPerformPopupOn INT, AutoScrollOn INT, AutoScrollInterval INT, "
    "LastUpdateLanguageCode TEXT, CpType TEXT, DaemonType TEXT, IsNowRefreshing INT, IsSupportManualRefresh "
    "INT, "
    "RefreshingStartTime INT64);";

constexpr const char* SETTING_COLUMNS =
    "CurrentCityIndex, CurrentCityLocationId, TemperatureUnit, LastRefreshedTime, "
    "CurrentLocationAreaRefreshedTime, IsFirstLaunch, AutoRefreshOn, AutoRefreshInterval, "
    "UseCurrentLocationOn, "
    "ShowCurrentCityAgreement, RefreshOnOpeningOn, RefreshOnOpeningOnAgreement, NotificationOn, "
    "NotificationTime, "
    "NetworkPositionPopupAgreement, ShowNetworkPopup, ChinaDataGPSPerformPopupOn, AutoScrollOn, "
    "AutoScrollInterval, "
    "LastUpdateLanguageCode, CpType, DaemonType, IsNowRefreshing, IsSupportManualRefresh, "
    "RefreshingStartTime";

constexpr const char* SETTING_PLACEHOLDERS =
    "?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?";

constexpr const char* SETTING_ASSIGNMENTS =
    "CurrentCityIndex = ?, CurrentCityLocationId = ?, TemperatureUnit = ?, LastRefreshedTime = ?, "
    "CurrentLocationAreaRefreshedTime = ?, IsFirstLaunch = ?, AutoRefreshOn = ?, AutoRefreshInterval = ?, "
    "UseCurrentLocationOn = ?, ShowCurrentCityAgreement = ?, RefreshOnOpeningOn = ?, "
    "RefreshOnOpeningOnAgreement = ?, NotificationOn = ?, NotificationTime = ?, "
    "NetworkPositionPopupAgreement = ?, ShowNetworkPopup = ?, ChinaDataGPSPerformPopupOn = ?, AutoScrollOn = "
    "?, "
    "AutoScrollInterval = ?, LastUpdateLanguageCode = ?, CpType = ?, DaemonType = ?, IsNowRefreshing = ?, "
    "IsSupportManualRefresh = ?, RefreshingStartTime = ?";

std::string GetSettingDBFilePath()
{
    return FileUtil::GetSettingDBFilePath();
}
}  // namespace

SettingDBController::SettingDBController() = default;

SettingDBController::~SettingDBController() = default;

int SettingDBController::Initialize()
{
    DBCycleCloser cycle(GetSettingDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    if (IsSettingTableExist())
        return ERR_OK;
    // A foreign table of that name takes no row; say so instead of
    // reporting a settings row that is not there.
    bool hasRow = CreateTable() && Insert(std::make_shared<Setting>()) == ERR_OK && IsSettingTableExist();
    COMMON_RETV_IF(cycle.Close(hasRow) == false, ERR_FAIL);
    return ERR_OK;
}

bool SettingDBController::IsSettingTableExist()
{
    return TableQuery::IsTableExist(SETTING_TABLE);
}

bool SettingDBController::CreateTable()
{
    return TableQuery::CreateTable(SETTING_CREATE_FORMAT, SETTING_TABLE);
}

int SettingDBController::Insert(const SettingPtr& settingPtr)
{
    COMMON_RETV_IF(!settingPtr, ERR_FAIL);
    DBStatement statement(
        QueryGenernator().MakeInsertQuery(SETTING_TABLE, SETTING_COLUMNS, SETTING_PLACEHOLDERS));
    BindSetting(statement, settingPtr);
    return statement.Execute() ? ERR_OK : ERR_FAIL;
}

int SettingDBController::Update(const SettingPtr& settingPtr)
{
    COMMON_RETV_IF(!settingPtr, ERR_FAIL);
    DBCycleCloser cycle(GetSettingDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    return cycle.Close(UpdateRow(settingPtr)) ? ERR_OK : ERR_FAIL;
}

int SettingDBController::UpdateLocationIdOfDisplayCity(const std::string& locationId)
{
    DBCycleCloser cycle(GetSettingDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    bool isDone = false;
    {
        DBStatement statement(QueryGenernator().MakeUpdateQuery(SETTING_TABLE, "CurrentCityLocationId = ?"));
        statement.BindText(1, locationId);
        isDone = statement.Execute();
    }
    return cycle.Close(isDone) ? ERR_OK : ERR_FAIL;
}

SettingPtr SettingDBController::Select()
{
    DBCycleCloser cycle(GetSettingDBFilePath(), DBCycleCloser::Mode::READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    return SelectRow();
}

SettingPtr SettingDBController::SelectAndUpdate(const std::function<void(const SettingPtr&)>& change)
{
    COMMON_RETV_IF(!change, nullptr);
    DBCycleCloser cycle(GetSettingDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    return ChangeRow(cycle, change);
}

SettingPtr SettingDBController::SelectAndUpdateWithCities(
    const std::function<void(const SettingPtr&, const CityPtrVector&)>& change)
{
    COMMON_RETV_IF(!change, nullptr);
    DBCycleCloser cycle(GetSettingDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    COMMON_RETV_IF(cycle.Attach(FileUtil::GetWeatherDBFilePath()) == false, nullptr);
    CityPtrVector cityPtrVector;
    for (const auto& row : CityDBController().SelectAllInPageOrder()) cityPtrVector.push_back(row.second);
    return ChangeRow(cycle, [&](const SettingPtr& settingPtr) { change(settingPtr, cityPtrVector); });
}

SettingPtr SettingDBController::ChangeRow(DBCycleCloser& cycle,
                                          const std::function<void(const SettingPtr&)>& change)
{
    SettingPtr settingPtr = SelectRow();
    COMMON_RETV_IF(!settingPtr, nullptr);
    change(settingPtr);
    COMMON_RETV_IF(UpdateRow(settingPtr) == false, nullptr);
    COMMON_RETV_IF(cycle.Close() == false, nullptr);
    return settingPtr;
}

void SettingDBController::UpgradeDB(double /*currentVersion*/) {}

bool SettingDBController::UpdateRow(const SettingPtr& settingPtr)
{
    DBStatement statement(QueryGenernator().MakeUpdateQuery(SETTING_TABLE, SETTING_ASSIGNMENTS));
    BindSetting(statement, settingPtr);
    return statement.Execute();
}

SettingPtr SettingDBController::SelectRow()
{
    DBStatement statement(QueryGenernator().MakeSelectQuery(SETTING_TABLE, SETTING_COLUMNS));
    int result = statement.Step();
    if (result != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", result);
        return nullptr;
    }
    return ReadSetting(statement);
}

void SettingDBController::BindSetting(DBStatement& statement, const SettingPtr& settingPtr)
{
    const Setting& s = *settingPtr;
    statement.BindInt(1, s.GetCurrentCityIndex());
    statement.BindText(2, s.GetCurrentCityLocationId());
    statement.BindInt(3, s.GetTemperatureUnit());
    statement.BindInt64(4, s.GetLastRefreshedTime());
    statement.BindInt64(5, s.GetCurrentLocationAreaRefreshedTime());
    statement.BindInt(6, s.GetIsFirstLaunch() ? 1 : 0);
    statement.BindInt(7, s.GetAutoRefreshOn() ? 1 : 0);
    statement.BindInt(8, s.GetAutoRefreshInterval());
    statement.BindInt(9, s.GetUseCurrentLocationOn() ? 1 : 0);
    statement.BindInt(10, s.GetShowCurrentCityAgreement() ? 1 : 0);
    statement.BindInt(11, s.GetRefreshOnOpeningOn() ? 1 : 0);
    statement.BindInt(12, s.GetRefreshOnOpeningOnAgreement() ? 1 : 0);
    statement.BindInt(13, s.GetNotificationOn() ? 1 : 0);
    statement.BindInt64(14, s.GetNotificationTime());
    statement.BindInt(15, s.GetNetworkPositionPopupAgreement() ? 1 : 0);
    statement.BindInt(16, s.GetShowNetworkPopup() ? 1 : 0);
    statement.BindInt(17, s.GetChinaDataGPSPerformPopupOn() ? 1 : 0);
    statement.BindInt(18, s.GetAutoScrollOn() ? 1 : 0);
    statement.BindInt(19, s.GetAutoScrollInterval());
    statement.BindText(20, s.GetLastUpdateLanguageCode());
    statement.BindText(21, s.GetCpType());
    statement.BindText(22, s.GetDaemonType());
    statement.BindInt(23, s.GetIsNowRefreshing() ? 1 : 0);
    statement.BindInt(24, s.GetIsSupportManualRefresh() ? 1 : 0);
    statement.BindInt64(25, s.GetRefreshingStartTime());
}

SettingPtr SettingDBController::ReadSetting(const DBStatement& statement)
{
    SettingPtr settingPtr = std::make_shared<Setting>();
    Setting& s = *settingPtr;
    s.SetCurrentCityIndex(statement.ColumnInt(0));
    s.SetCurrentCityLocationId(statement.ColumnText(1));
    s.SetTemperatureUnit(statement.ColumnInt(2));
    s.SetLastRefreshedTime(static_cast<time_t>(statement.ColumnInt64(3)));
    s.SetCurrentLocationAreaRefreshedTime(static_cast<time_t>(statement.ColumnInt64(4)));
    s.SetIsFirstLaunch(statement.ColumnInt(5) != 0);
    s.SetAutoRefreshOn(statement.ColumnInt(6) != 0);
    s.SetAutoRefreshInterval(statement.ColumnInt(7));
    s.SetUseCurrentLocationOn(statement.ColumnInt(8) != 0);
    s.SetShowCurrentCityAgreement(statement.ColumnInt(9) != 0);
    s.SetRefreshOnOpeningOn(statement.ColumnInt(10) != 0);
    s.SetRefreshOnOpeningOnAgreement(statement.ColumnInt(11) != 0);
    s.SetNotificationOn(statement.ColumnInt(12) != 0);
    s.SetNotificationTime(static_cast<time_t>(statement.ColumnInt64(13)));
    s.SetNetworkPositionPopupAgreement(statement.ColumnInt(14) != 0);
    s.SetShowNetworkPopup(statement.ColumnInt(15) != 0);
    s.SetChinaDataGPSPerformPopupOn(statement.ColumnInt(16) != 0);
    s.SetAutoScrollOn(statement.ColumnInt(17) != 0);
    s.SetAutoScrollInterval(statement.ColumnInt(18));
    s.SetLastUpdateLanguageCode(statement.ColumnText(19));
    s.SetCpType(statement.ColumnText(20));
    s.SetDaemonType(statement.ColumnText(21));
    s.SetIsNowRefreshing(statement.ColumnInt(22) != 0);
    s.SetIsSupportManualRefresh(statement.ColumnInt(23) != 0);
    s.SetRefreshingStartTime(static_cast<time_t>(statement.ColumnInt64(24)));
    return settingPtr;
}

}  // namespace NSWeather

#include "DBController.h"

#include <algorithm>
#include <climits>
#include <cstdint>
#include <ctime>
#include <map>
#include <utility>

#include "CityDBController.h"
#include "CommonLog.h"
#include "CurrentWeatherDBController.h"
#include "DBCycleCloser.h"
#include "ExtraWeatherDBController.h"
#include "FileUtil.h"
#include "HourlyWeatherDBController.h"
#include "MoonPhaseDBController.h"
#include "SettingDBController.h"
#include "WeatherDefine.h"
#include "WeatherNewsIconDBController.h"
#include "WeeklyWeatherDBController.h"

namespace NSWeather
{

namespace
{
constexpr DBCycleCloser::Mode READ = DBCycleCloser::Mode::READ;
constexpr DBCycleCloser::Mode WRITE = DBCycleCloser::Mode::WRITE;

std::string GetWeatherDBFilePath()
{
    return FileUtil::GetWeatherDBFilePath();
}

int ResultOf(DBCycleCloser& cycle, bool isDone)
{
    return cycle.Close(isDone) ? ERR_OK : ERR_FAIL;
}

template <typename T>
T FindOr(const std::map<int, T>& values, int key, T fallback)
{
    auto found = values.find(key);
    return found != values.end() ? found->second : fallback;
}
}  // namespace

DBController::DBController() {}

DBController::~DBController() {}

int DBController::Initialize()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    bool isDone = CityDBController().CreateTable() && CurrentWeatherDBController().CreateTable() &&
                  WeeklyWeatherDBController().CreateTable() && HourlyWeatherDBController().CreateTable() &&
                  ExtraWeatherDBController().CreateTable() && MoonPhaseDBController().CreateTable();
    return ResultOf(cycle, isDone);
}

CityPtr DBController::SelectDataWithPrimaryKey(CityDBController& cityDBController, int primaryKey)
{
    CityPtr cityPtr = cityDBController.Select(primaryKey);
    if (!cityPtr)
    {
        COMMON_LOG("!cityPtr");
        return nullptr;
    }
    CurrentPtr currentPtr = CurrentWeatherDBController().Select(primaryKey);
    WeeklyPtrVectorPtr weeklyPtrVector = WeeklyWeatherDBController().Select(primaryKey);
    HourlyPtrVectorPtr hourlyPtrVector = HourlyWeatherDBController().Select(primaryKey);
    ExtraPtr extraPtr = ExtraWeatherDBController().Select(primaryKey);
    MoonPhasePtrVectorPtr moonPhasePtrVector = MoonPhaseDBController().Select(primaryKey);
    cityPtr->SetCurrentPtr(currentPtr);
    cityPtr->SetWeeklyPtrVector(weeklyPtrVector);
    cityPtr->SetHourlyPtrVector(hourlyPtrVector);
    cityPtr->SetExtraPtr(extraPtr);
    cityPtr->SetMoonPhasePtrVector(moonPhasePtrVector);
    return cityPtr;
}

// Same result as selecting page 0, 1, ... one city at a time, but with one
// statement per table: the child tables have no index on FK_ID, so a
// per-city select scans them all for every city.
CityPtrVectorPtr DBController::SelectAllCities(CityDBController& cityDBController)
{
    CityPtrVectorPtr cityPtrVector = std::make_shared<CityPtrVector>();
    if (cityDBController.GetNumberOfCities() <= 0)
        return cityPtrVector;
    std::vector<std::pair<int, CityPtr>> rows = cityDBController.SelectAllInPageOrder();
    std::map<int, CurrentPtr> currentMap = CurrentWeatherDBController().SelectAll();
    std::map<int, WeeklyPtrVectorPtr> weeklyMap = WeeklyWeatherDBController().SelectAll();
    std::map<int, HourlyPtrVectorPtr> hourlyMap = HourlyWeatherDBController().SelectAll();
    std::map<int, ExtraPtr> extraMap = ExtraWeatherDBController().SelectAll();
    std::map<int, MoonPhasePtrVectorPtr> moonPhaseMap = MoonPhaseDBController().SelectAll();
    // Every stored page in page order. A gap in the page indexes (another
    // writer mid-change) is skipped, never filled with a null city, and the
    // cities after it stay in the list: stopping at the row count would
    // drop the last ones.
    // Wide enough for the page after the largest index a file can hold.
    int64_t expectedPageIndex = 0;
    for (const auto& row : rows)
    {
        int primaryKey = row.first;
        CityPtr cityPtr = row.second;
        if (cityPtr->GetPageIndex() != expectedPageIndex)
            COMMON_LOG("!cityPtr");
        expectedPageIndex = static_cast<int64_t>(cityPtr->GetPageIndex()) + 1;
        cityPtr->SetCurrentPtr(FindOr(currentMap, primaryKey, CurrentPtr()));
        cityPtr->SetWeeklyPtrVector(FindOr(weeklyMap, primaryKey, std::make_shared<WeeklyPtrVector>()));
        cityPtr->SetHourlyPtrVector(FindOr(hourlyMap, primaryKey, std::make_shared<HourlyPtrVector>()));
        cityPtr->SetExtraPtr(FindOr(extraMap, primaryKey, ExtraPtr()));
        cityPtr->SetMoonPhasePtrVector(
            FindOr(moonPhaseMap, primaryKey, std::make_shared<MoonPhasePtrVector>()));
        cityPtrVector->push_back(cityPtr);
    }
    return cityPtrVector;
}

CityPtrVectorPtr DBController::SelectAllCityData()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    CityDBController cityDBController;
    CityPtrVectorPtr cityPtrVector = SelectAllCities(cityDBController);
    // A read that failed part way would pass for fewer cities, or cities
    // without their forecasts.
    COMMON_RETV_IF(cycle.Close() == false, nullptr);
    return cityPtrVector;
}

CityPtr DBController::SelectCityData(int pageIndex)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    CityDBController cityDBController;
    return SelectDataWithPrimaryKey(cityDBController, cityDBController.GetPrimaryKey(pageIndex));
}

CityPtr DBController::SelectCityData(const std::string& locationID)
{
    COMMON_RETV_IF(locationID.length() < 1, nullptr);
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    CityDBController cityDBController;
    return SelectDataWithPrimaryKey(cityDBController, cityDBController.GetPrimaryKey(locationID));
}

StringVectorPtr DBController::SelectAllLocationIDData()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    CityDBController cityDBController;
    StringVectorPtr locationIdVector = std::make_shared<StringVector>();
    int count = cityDBController.GetNumberOfCities();
    for (int pageIndex = 0; pageIndex < count; ++pageIndex)
        locationIdVector->push_back(cityDBController.GetLocationIDWithPageIndex(pageIndex));
    return locationIdVector;
}

StringVectorPtr DBController::SelectNeedToUpdateLocationIDData()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    CityDBController cityDBController;
    StringVectorPtr locationIdVector = std::make_shared<StringVector>();
    int count = cityDBController.GetNumberOfCities();
    for (int pageIndex = 0; pageIndex < count; ++pageIndex)
    {
        // Only the city row is needed here, not its forecasts.
        CityPtr cityPtr = cityDBController.Select(cityDBController.GetPrimaryKey(pageIndex));
        if (cityPtr && cityPtr->GetNeedToUpdate())
            locationIdVector->push_back(cityPtr->GetLocationId());
    }
    return locationIdVector;
}

int DBController::GetNumberOfCities()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, -1);
    return CityDBController().GetNumberOfCities();
}

int DBController::GetPageIndexOfCurrentCity()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, -1);
    return CityDBController().GetPageIndexOfCurrentCity();
}

int DBController::GetPageIndexWithLocationID(const std::string& locationID)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, -1);
    return CityDBController().GetPageIndexWithLocationID(locationID);
}

std::string DBController::GetLocationIdOfCurrentCity()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, std::string());
    return CityDBController().GetLocationIdOfCurrentCity();
}

bool DBController::IsCurrentLocationExist()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, false);
    return CityDBController().IsCurrentLocationExist();
}

DBController::InsertResult DBController::InsertIfNew(CityDBController& cityDBController, CityPtr cityPtr)
{
    // Compared as it will be stored, so a current-location city is found
    // again once its id carries ":C".
    std::string locationId = cityPtr->GetLocationId();
    if (cityPtr->GetIsCurrentLocation() && locationId.find(":C") == std::string::npos)
        locationId += ":C";
    for (const auto& row : cityDBController.SelectAll())
    {
        if (row.second->GetLocationId() == locationId &&
            row.second->GetIsCurrentLocation() == cityPtr->GetIsCurrentLocation())
        {
            COMMON_LOG("There is a same city in DB");
            return InsertResult::ALREADY_STORED;
        }
    }
    return InsertDataWithCityPtr(cityDBController, cityPtr) ? InsertResult::INSERTED : InsertResult::FAILED;
}

bool DBController::InsertDataWithCityPtr(CityDBController& cityDBController, CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, false);
    int count = cityDBController.GetNumberOfCities();
    COMMON_RETV_IF(count < 0, false);
    if (count > cityPtr->GetPageIndex())
        cityPtr->SetPageIndex(count);
    COMMON_RETV_IF(cityDBController.Insert(cityPtr) == false, false);
    int primaryKey = cityDBController.GetLastInsertedPrimaryKey();
    COMMON_RETV_IF(primaryKey < 1, false);
    return CurrentWeatherDBController().Insert(primaryKey, cityPtr->GetCurrentPtr()) &&
           WeeklyWeatherDBController().Insert(primaryKey, cityPtr->GetWeeklyPtrVector()) &&
           HourlyWeatherDBController().Insert(primaryKey, cityPtr->GetHourlyPtrVector()) &&
           ExtraWeatherDBController().Insert(primaryKey, cityPtr->GetExtraPtr());
}

int DBController::InsertCityData(CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, ERR_FAIL);
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    return ResultOf(cycle, InsertIfNew(cityDBController, cityPtr) == InsertResult::INSERTED);
}

int DBController::ResolvePrimaryKey(CityDBController& cityDBController, const CityPtr& cityPtr)
{
    if (cityPtr->GetPageIndex() < 0)
        cityPtr->SetPageIndex(cityDBController.GetPageIndexWithLocationID(cityPtr->GetLocationId()));
    return cityDBController.GetPrimaryKey(cityPtr->GetPageIndex());
}

bool DBController::UpdateDataWithCityPtr(CityDBController& cityDBController, CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, false);
    int primaryKey = ResolvePrimaryKey(cityDBController, cityPtr);
    // Without a city row the forecast inserts below would leave orphan rows.
    COMMON_RETV_IF(primaryKey < 1, false);
    HourlyWeatherDBController hourlyDBController;
    return cityDBController.Update(cityPtr, primaryKey) &&
           CurrentWeatherDBController().Update(primaryKey, cityPtr->GetCurrentPtr()) &&
           WeeklyWeatherDBController().Update(primaryKey, cityPtr->GetWeeklyPtrVector()) &&
           hourlyDBController.Delete(primaryKey) &&
           hourlyDBController.Insert(primaryKey, cityPtr->GetHourlyPtrVector()) &&
           ExtraWeatherDBController().Update(primaryKey, cityPtr->GetExtraPtr());
}

int DBController::UpdateCityData(CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, ERR_FAIL);
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    return ResultOf(cycle, UpdateDataWithCityPtr(cityDBController, cityPtr));
}

int DBController::UpdateOnlyWidgetReferenceCount(const std::string& locationID, bool isIncrease)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    CityPtr cityPtr = cityDBController.Select(locationID);
    COMMON_RETV_IF(!cityPtr, ERR_FAIL);
    int count = cityPtr->GetWidgetReferenceCount();
    // A count read from the file may already be at the limit.
    count = isIncrease ? (count < INT_MAX ? count + 1 : count) : std::max(count - 1, 0);
    return ResultOf(cycle, cityDBController.UpdateOnlyWidgetReferenceCount(locationID, count));
}

int DBController::UpdateOnlyMobileLink(CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, ERR_FAIL);
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    int primaryKey = ResolvePrimaryKey(cityDBController, cityPtr);
    COMMON_RETV_IF(primaryKey < 1, ERR_FAIL);
    return ResultOf(cycle, cityDBController.UpdateOnlyMobileLink(cityPtr, primaryKey));
}

int DBController::ReorderCityData(CityPtrVectorPtr reorderPtrVector)
{
    COMMON_RETV_IF(!reorderPtrVector, ERR_FAIL);
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    return ResultOf(cycle, CityDBController().Reorder(reorderPtrVector));
}

std::string DBController::MoveCityData(int fromPosition, int toPosition)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, std::string());
    CityDBController cityDBController;
    CityPtrVectorPtr orderPtrVector = std::make_shared<CityPtrVector>();
    for (const auto& row : cityDBController.SelectAllInPageOrder()) orderPtrVector->push_back(row.second);
    int count = static_cast<int>(orderPtrVector->size());
    COMMON_RETV_IF(fromPosition < 0 || fromPosition >= count, std::string());
    COMMON_RETV_IF(toPosition < 0 || toPosition >= count, std::string());
    CityPtr movedPtr = (*orderPtrVector)[fromPosition];
    orderPtrVector->erase(orderPtrVector->begin() + fromPosition);
    orderPtrVector->insert(orderPtrVector->begin() + toPosition, movedPtr);
    COMMON_RETV_IF(cycle.Close(cityDBController.Reorder(orderPtrVector)) == false, std::string());
    return movedPtr->GetLocationId();
}

bool DBController::DeleteDataWithPrimaryKey(CityDBController& cityDBController, int primaryKey)
{
    return cityDBController.Delete(primaryKey) && CurrentWeatherDBController().Delete(primaryKey) &&
           WeeklyWeatherDBController().Delete(primaryKey) && HourlyWeatherDBController().Delete(primaryKey) &&
           ExtraWeatherDBController().Delete(primaryKey);
}

int DBController::DeleteCityData(int pageIndex)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    return ResultOf(cycle,
                    DeleteDataWithPrimaryKey(cityDBController, cityDBController.GetPrimaryKey(pageIndex)));
}

int DBController::DeleteCityData(const std::string& locationID)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    return ResultOf(cycle,
                    DeleteDataWithPrimaryKey(cityDBController, cityDBController.GetPrimaryKey(locationID)));
}

int DBController::DeleteCurrentLocationCityData()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    int pageIndex = cityDBController.GetPageIndexOfCurrentCity();
    if (pageIndex < 0)
        return ResultOf(cycle, true);
    return ResultOf(cycle,
                    DeleteDataWithPrimaryKey(cityDBController, cityDBController.GetPrimaryKey(pageIndex)));
}

bool DBController::DeleteAll(CityDBController& cityDBController)
{
    COMMON_LOG("DeleteAllCityData");
    return cityDBController.DeleteAll() && CurrentWeatherDBController().DeleteAll() &&
           WeeklyWeatherDBController().DeleteAll() && HourlyWeatherDBController().DeleteAll() &&
           ExtraWeatherDBController().DeleteAll();
}

int DBController::DeleteAllCityData()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    return ResultOf(cycle, DeleteAll(cityDBController));
}

int DBController::DeleteAllCityDataAndInsertCityPtrVector(CityPtrVectorPtr cityPtrVector)
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    bool isDone = DeleteAll(cityDBController);
    if (cityPtrVector)
    {
        // A duplicate is left out; a failed insert undoes the whole change.
        for (size_t i = 0; isDone && i < cityPtrVector->size(); ++i)
        {
            if ((*cityPtrVector)[i])
                isDone = InsertIfNew(cityDBController, (*cityPtrVector)[i]) != InsertResult::FAILED;
        }
    }
    return ResultOf(cycle, isDone);
}

int DBController::UpdateOnlyMoonPhaseData(CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, ERR_FAIL);
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    int primaryKey = ResolvePrimaryKey(cityDBController, cityPtr);
    COMMON_RETV_IF(primaryKey < 1, ERR_FAIL);
    MoonPhaseDBController moonPhaseDBController;
    return ResultOf(cycle, moonPhaseDBController.Delete(cityPtr->GetLocationId()) &&
                               moonPhaseDBController.Insert(primaryKey, cityPtr->GetMoonPhasePtrVector()));
}

int DBController::DeleteUselessMoonPhaseData()
{
    DBCycleCloser cycle(GetWeatherDBFilePath(), WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    CityDBController cityDBController;
    MoonPhaseDBController moonPhaseDBController;
    StringVector moonPhaseLocIdVector = moonPhaseDBController.SelectAllLocationId();
    COMMON_RETV_IF(moonPhaseLocIdVector.size() < 1, ERR_OK);
    bool isDone = true;
    for (size_t i = 0; isDone && i < moonPhaseLocIdVector.size(); ++i)
    {
        if (cityDBController.GetPageIndexWithLocationID(moonPhaseLocIdVector[i]) < 0)
            isDone = moonPhaseDBController.Delete(moonPhaseLocIdVector[i]);
    }
    return ResultOf(cycle, isDone);
}

int DBController::GetWeatherNewsIcon(int iconId, bool isDayTime)
{
    return WeatherNewsIconDBController().Select(iconId, isDayTime);
}

bool DBController::GetIsWeatherInfoExpired()
{
    SettingPtr settingPtr = SettingDBController().Select();
    COMMON_RETV_IF(!settingPtr, false);
    CityPtrVectorPtr cityPtrVector = SelectAllCityData();
    COMMON_RETV_IF(cityPtrVector == NULL, false);
    COMMON_RETV_IF(cityPtrVector->size() == 0, false);

    int64_t lastRefreshedTime = 0;
    for (const CityPtr& cityPtr : *cityPtrVector)
    {
        int64_t refreshedTime = static_cast<int64_t>(cityPtr->GetRefreshedTime());
        if (lastRefreshedTime == 0 || refreshedTime < lastRefreshedTime)
            lastRefreshedTime = refreshedTime;
    }
    int64_t timeInterval = static_cast<int64_t>(settingPtr->GetAutoRefreshInterval()) * 3600;
    int64_t now = static_cast<int64_t>(time(nullptr));
    COMMON_LOG("now [%lu], lastRefreshedTime [%lu], timeInterval [%lu]", static_cast<unsigned long>(now),
               static_cast<unsigned long>(lastRefreshedTime), static_cast<unsigned long>(timeInterval));
    // A refresh time ahead of the clock (the clock was set back) cannot be
    // trusted and counts as expired.
    if (lastRefreshedTime > now)
        return true;
    // Compared this way round, a refresh time far in the past read from the
    // file cannot overflow the difference.
    return lastRefreshedTime < now - timeInterval;
}

}  // namespace NSWeather

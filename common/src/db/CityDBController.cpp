#include "CityDBController.h"

#include <functional>
#include <map>
#include <vector>

#include "CommonLog.h"
#include "DBStatement.h"
#include "TableQuery.h"

namespace NSWeather
{

const char* const CityDBController::TABLE_NAME = "CITY_TABLE";
const char* const CityDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (PK_ID\t\t\t\tINTEGER NOT NULL PRIMARY KEY "
    "AUTOINCREMENT,pageIndex\t\t\tINTEGER,"
    "locationId\t\t\tTEXT,cityName\t\t\tTEXT,cityNameEng\t\tTEXT,countryName\t\tTEXT,countryNameEng\t\tTEXT,"
    "isCurrentLocation\tINTEGER,isSummerTime\t\tINTEGER,isDayTime\t\t\tINTEGER,gmtOffset\t\t\tDOUBLE,"
    "refreshedTime\t\tINT64,localTime\t\t\tINT64,widgetReferenceCount\t\tINTEGER,needToUpdate\t\tINTEGER,"
    "websiteUrl \t\tTEXT);";

namespace
{
const char* const INSERT_COLUMNS =
    "pageIndex,locationId,cityName,cityNameEng,countryName,countryNameEng,isCurrentLocation,isDayTime,"
    "isSummerTime,gmtOffset,refreshedTime,localTime,widgetReferenceCount,needToUpdate,websiteUrl";
const char* const INSERT_PLACEHOLDERS = "?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?";
const char* const UPDATE_ASSIGNMENTS =
    "pageIndex = ?,locationId = ?,cityName = ?,cityNameEng = ?,countryName = ?,countryNameEng = ?,"
    "isCurrentLocation = ?,isDayTime = ?,isSummerTime = ?,gmtOffset = ?,refreshedTime = ?,localTime = ?,"
    "needToUpdate = ?,websiteUrl = ?";
const std::string CURRENT_LOCATION_SUFFIX = ":C";

// Binds the columns shared by insert and update up to isDayTime/isSummerTime
// and the times; returns the next free position.
int BindCommonColumns(DBStatement& stmt, const CityPtr& cityPtr, const std::string& locationId)
{
    int i = 1;
    stmt.BindInt(i++, cityPtr->GetPageIndex());
    stmt.BindText(i++, locationId);
    stmt.BindText(i++, cityPtr->GetCityName());
    stmt.BindText(i++, cityPtr->GetCityNameEng());
    stmt.BindText(i++, cityPtr->GetCountryName());
    stmt.BindText(i++, cityPtr->GetCountryNameEng());
    stmt.BindInt(i++, cityPtr->GetIsCurrentLocation() ? 1 : 0);
    stmt.BindInt(i++, cityPtr->GetIsDayTime() ? 1 : 0);
    stmt.BindInt(i++, cityPtr->GetIsSummerTime() ? 1 : 0);
    stmt.BindDouble(i++, cityPtr->GetGmtOffset());
    stmt.BindInt64(i++, static_cast<int64_t>(cityPtr->GetRefreshedTime()));
    stmt.BindInt64(i++, static_cast<int64_t>(cityPtr->GetLocalTime()));
    return i;
}

CityPtr ReadCity(const DBStatement& stmt)
{
    CityPtr cityPtr = std::make_shared<City>();
    cityPtr->SetPageIndex(stmt.ColumnInt(0));
    cityPtr->SetLocationId(stmt.ColumnText(1));
    cityPtr->SetCityName(stmt.ColumnText(2));
    cityPtr->SetCityNameEng(stmt.ColumnText(3));
    cityPtr->SetCountryName(stmt.ColumnText(4));
    cityPtr->SetCountryNameEng(stmt.ColumnText(5));
    cityPtr->SetIsCurrentLocation(stmt.ColumnInt(6) != 0);
    cityPtr->SetIsDayTime(stmt.ColumnInt(7) != 0);
    cityPtr->SetIsSummerTime(stmt.ColumnInt(8) != 0);
    cityPtr->SetGmtOffset(stmt.ColumnDouble(9));
    cityPtr->SetRefreshedTime(static_cast<time_t>(stmt.ColumnInt64(10)));
    cityPtr->SetLocalTime(static_cast<time_t>(stmt.ColumnInt64(11)));
    cityPtr->SetWidgetReferenceCount(stmt.ColumnInt(12));
    cityPtr->SetNeedToUpdate(stmt.ColumnInt(13) != 0);
    cityPtr->SetWebsiteUrl(stmt.ColumnText(14));
    return cityPtr;
}

void NoBinding(DBStatement&) {}

std::function<void(DBStatement&)> BindIntAt1(int value)
{
    return [value](DBStatement& stmt) { stmt.BindInt(1, value); };
}

std::function<void(DBStatement&)> BindTextAt1(const std::string& value)
{
    return [value](DBStatement& stmt) { stmt.BindText(1, value); };
}

}  // namespace

CityDBController::CityDBController() {}

CityDBController::~CityDBController() {}

bool CityDBController::CreateTable()
{
    return TableQuery::CreateTable(CREATE_TABLE_FORMAT, TABLE_NAME);
}

std::string CityDBController::ResolveLocationId(CityPtr cityPtr)
{
    std::string locationId = cityPtr->GetLocationId();
    do
    {
        COMMON_BREAK_IF(cityPtr->GetIsCurrentLocation() == false);
        if (locationId.find(CURRENT_LOCATION_SUFFIX) == std::string::npos)
        {
            locationId += CURRENT_LOCATION_SUFFIX;
            cityPtr->SetLocationId(locationId);
        }
    } while (0);
    return locationId;
}

bool CityDBController::Insert(CityPtr cityPtr)
{
    COMMON_RETV_IF(!cityPtr, false);
    std::string locationId = ResolveLocationId(cityPtr);
    DBStatement stmt(mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS));
    int i = BindCommonColumns(stmt, cityPtr, locationId);
    stmt.BindInt(i++, cityPtr->GetWidgetReferenceCount());
    stmt.BindInt(i++, cityPtr->GetNeedToUpdate() ? 1 : 0);
    stmt.BindText(i++, cityPtr->GetWebsiteUrl());
    return stmt.Execute();
}

bool CityDBController::Update(CityPtr cityPtr, int primaryKey)
{
    COMMON_RETV_IF(!cityPtr, false);
    std::string locationId = ResolveLocationId(cityPtr);
    DBStatement stmt(mQueryGenernator.MakeUpdateQuery(TABLE_NAME, UPDATE_ASSIGNMENTS,
                                                      mQueryGenernator.MakeWhereClause("PK_ID = ?;")));
    int i = BindCommonColumns(stmt, cityPtr, locationId);
    stmt.BindInt(i++, cityPtr->GetNeedToUpdate() ? 1 : 0);
    stmt.BindText(i++, cityPtr->GetWebsiteUrl());
    stmt.BindInt(i++, primaryKey);
    return stmt.Execute();
}

bool CityDBController::UpdateOnlyWidgetReferenceCount(const std::string& locationId, int count)
{
    std::string query = mQueryGenernator.MakeUpdateQuery(TABLE_NAME, "widgetReferenceCount = ?",
                                                         mQueryGenernator.MakeWhereClause("locationId = ?;"));
    COMMON_LOG("query : %s [%d]", query.c_str(), count);
    DBStatement stmt(query);
    stmt.BindInt(1, count);
    stmt.BindText(2, locationId);
    return stmt.Execute();
}

bool CityDBController::UpdateOnlyMobileLink(CityPtr cityPtr, int primaryKey)
{
    COMMON_RETV_IF(!cityPtr, false);
    DBStatement stmt(mQueryGenernator.MakeUpdateQuery(TABLE_NAME, "websiteUrl = ?",
                                                      mQueryGenernator.MakeWhereClause("PK_ID = ?;")));
    stmt.BindText(1, cityPtr->GetWebsiteUrl());
    stmt.BindInt(2, primaryKey);
    return stmt.Execute();
}

int CityDBController::GetLastInsertedPrimaryKey()
{
    DBStatement stmt("SELECT MAX(PK_ID) FROM CITY_TABLE;");
    int rc = stmt.Step();
    if (rc != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", rc);
        return 0;
    }
    return stmt.ColumnInt(0);
}

int CityDBController::SelectInt(const std::string& column, const std::string& condition, const Binder& binder,
                                int defaultValue)
{
    DBStatement stmt(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, column, mQueryGenernator.MakeWhereClause(condition)));
    binder(stmt);
    int rc = stmt.Step();
    if (rc != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", rc);
        return defaultValue;
    }
    return stmt.ColumnInt(0);
}

std::string CityDBController::SelectText(const std::string& column, const std::string& condition,
                                         const Binder& binder)
{
    DBStatement stmt(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, column, mQueryGenernator.MakeWhereClause(condition)));
    binder(stmt);
    int rc = stmt.Step();
    if (rc != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", rc);
        return std::string();
    }
    return stmt.ColumnText(0);
}

CityPtr CityDBController::SelectCity(const std::string& condition, const Binder& binder)
{
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(TABLE_NAME, INSERT_COLUMNS,
                                                      mQueryGenernator.MakeWhereClause(condition)));
    binder(stmt);
    int rc = stmt.Step();
    if (rc != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", rc);
        return nullptr;
    }
    return ReadCity(stmt);
}

int CityDBController::GetPrimaryKey(int pageIndex)
{
    return SelectInt("PK_ID", "pageIndex = ?", BindIntAt1(pageIndex), 0);
}

int CityDBController::GetPrimaryKey(const std::string& locationId)
{
    return SelectInt("PK_ID", "locationId = ?", BindTextAt1(locationId), 0);
}

int CityDBController::GetNumberOfCities()
{
    return SelectInt("COUNT(*)", std::string(), NoBinding, -1);
}

int CityDBController::GetPageIndexOfCurrentCity()
{
    return SelectInt("pageIndex", "isCurrentLocation = 1", NoBinding, -1);
}

int CityDBController::GetPageIndexWithLocationID(const std::string& locationId)
{
    return SelectInt("pageIndex", "locationID = ?", BindTextAt1(locationId), -1);
}

std::string CityDBController::GetLocationIDWithPageIndex(int pageIndex)
{
    return SelectText("locationId", "pageIndex = ?", BindIntAt1(pageIndex));
}

std::string CityDBController::GetLocationIdOfCurrentCity()
{
    return SelectText("locationId", "isCurrentLocation = 1", NoBinding);
}

bool CityDBController::IsCurrentLocationExist()
{
    return GetPageIndexOfCurrentCity() != -1;
}

bool CityDBController::SetPageIndexAsAscending()
{
    // The pages close up in their current order: ordered by key, a delete
    // would put back the order in which the cities were added, undoing the
    // user's moves. Keys are collected first so no update runs under an open
    // cursor.
    std::vector<int> keys;
    {
        DBStatement select(std::string("SELECT PK_ID FROM ") + TABLE_NAME +
                           " ORDER BY pageIndex ASC, PK_ID ASC;");
        while (select.Step() == SQLITE_ROW) keys.push_back(select.ColumnInt(0));
    }
    DBStatement update(std::string("UPDATE ") + TABLE_NAME + " SET pageIndex=? WHERE PK_ID=?;");
    for (size_t counter = 0; counter < keys.size(); ++counter)
    {
        if (keys[counter] < 1)
        {
            COMMON_LOG("Fail to Get PrmaryKey From CityTable : %d", keys[counter]);
            return false;
        }
        update.Reset();
        update.BindInt(1, static_cast<int>(counter));
        update.BindInt(2, keys[counter]);
        if (update.Execute() == false)
        {
            COMMON_LOG("Fail to renumber the pages");
            return false;
        }
    }
    return true;
}

bool CityDBController::Delete(int primaryKey)
{
    {
        DBStatement stmt(std::string("DELETE FROM ") + TABLE_NAME + " WHERE PK_ID=?;");
        stmt.BindInt(1, primaryKey);
        if (stmt.Execute() == false)
        {
            COMMON_LOG("Fail to Delete");
            return false;
        }
    }
    return SetPageIndexAsAscending();
}

bool CityDBController::DeleteAll()
{
    return TableQuery::DeleteAll(TABLE_NAME);
}

bool CityDBController::Reorder(CityPtrVectorPtr reorderPtrVector)
{
    COMMON_RETV_IF(!reorderPtrVector, false);
    std::vector<int> keys;
    for (const CityPtr& cityPtr : *reorderPtrVector)
    {
        COMMON_RETV_IF(!cityPtr, false);
        keys.push_back(GetPrimaryKey(cityPtr->GetPageIndex()));
        COMMON_RETV_IF(keys.back() < 1, false);
    }
    DBStatement update(std::string("UPDATE ") + TABLE_NAME + " SET pageIndex=? " + "WHERE PK_ID = ?");
    for (size_t i = 0; i < keys.size(); ++i)
    {
        update.Reset();
        update.BindInt(1, static_cast<int>(i));
        update.BindInt(2, keys[i]);
        COMMON_RETV_IF(update.Execute() == false, false);
    }
    return true;
}

std::vector<std::pair<int, CityPtr>> CityDBController::SelectAll()
{
    std::vector<std::pair<int, CityPtr>> rows;
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(INSERT_COLUMNS) + ",PK_ID",
                                                      mQueryGenernator.MakeOrderByClause("PK_ID", true)));
    while (stmt.Step() == SQLITE_ROW) rows.emplace_back(stmt.ColumnInt(15), ReadCity(stmt));
    return rows;
}

std::vector<std::pair<int, CityPtr>> CityDBController::SelectAllInPageOrder()
{
    std::map<int, std::pair<int, CityPtr>> rowByPage;
    for (const auto& row : SelectAll()) rowByPage.emplace(row.second->GetPageIndex(), row);
    std::vector<std::pair<int, CityPtr>> rows;
    for (auto row = rowByPage.lower_bound(0); row != rowByPage.end(); ++row) rows.push_back(row->second);
    return rows;
}

CityPtr CityDBController::Select(int primaryKey)
{
    return SelectCity("PK_ID = ?", BindIntAt1(primaryKey));
}

CityPtr CityDBController::Select(const std::string& locationId)
{
    COMMON_LOG("locationID : %s", locationId.c_str());
    return SelectCity("locationId = ?;", BindTextAt1(locationId));
}

}  // namespace NSWeather

#include "CurrentWeatherDBController.h"

#include <string>

#include "CommonLog.h"
#include "DBStatement.h"
#include "TableQuery.h"

namespace NSWeather
{

const char* const CurrentWeatherDBController::TABLE_NAME = "CURRENT_WEATHER_TABLE";
const char* const CurrentWeatherDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,weatherIcon\t\tINTEGER,weatherStatus\t\tTEXT,"
    "curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,highTemperature\tDOUBLE,date\t\t\t\tINT64,"
    "websiteUrl \t\tTEXT,FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE ON UPDATE "
    "CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl";
const char* const INSERT_PLACEHOLDERS = "?, ?, ?, ?, ?, ?, ?, ?";
const char* const UPDATE_ASSIGNMENTS =
    "weatherIcon = ?,weatherStatus = ?,curTemperature = ?,lowTemperature = ?,highTemperature = ?,date = ?,"
    "websiteUrl = ?";
const char* const SELECT_COLUMNS =
    "weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl";

int BindValues(DBStatement& stmt, int i, const CurrentPtr& currentPtr)
{
    stmt.BindInt(i++, currentPtr->GetWeatherIcon());
    stmt.BindText(i++, currentPtr->GetWeatherStatus());
    TableQuery::BindTemperature(stmt, i++, currentPtr->GetCurTemperature());
    TableQuery::BindTemperature(stmt, i++, currentPtr->GetLowTemperature());
    TableQuery::BindTemperature(stmt, i++, currentPtr->GetHighTemperature());
    stmt.BindInt64(i++, static_cast<int64_t>(currentPtr->GetDate()));
    stmt.BindText(i++, currentPtr->GetWebsiteUrl());
    return i;
}

CurrentPtr ReadCurrent(const DBStatement& stmt)
{
    CurrentPtr currentPtr = std::make_shared<Current>();
    currentPtr->SetWeatherIcon(stmt.ColumnInt(0));
    currentPtr->SetWeatherStatus(stmt.ColumnText(1));
    currentPtr->SetCurTemperature(TableQuery::ColumnTemperature(stmt, 2));
    currentPtr->SetLowTemperature(TableQuery::ColumnTemperature(stmt, 3));
    currentPtr->SetHighTemperature(TableQuery::ColumnTemperature(stmt, 4));
    currentPtr->SetDate(static_cast<time_t>(stmt.ColumnInt64(5)));
    currentPtr->SetWebsiteUrl(stmt.ColumnText(6));
    return currentPtr;
}
}  // namespace

CurrentWeatherDBController::CurrentWeatherDBController() {}

CurrentWeatherDBController::~CurrentWeatherDBController() {}

bool CurrentWeatherDBController::CreateTable()
{
    return TableQuery::CreateTable(CREATE_TABLE_FORMAT, TABLE_NAME);
}

bool CurrentWeatherDBController::DeleteAll()
{
    return TableQuery::DeleteAll(TABLE_NAME);
}

bool CurrentWeatherDBController::Delete(int foreignKey)
{
    return TableQuery::Delete(TABLE_NAME, foreignKey);
}

bool CurrentWeatherDBController::Insert(int foreignKey, CurrentPtr currentPtr)
{
    COMMON_RETV_IF(!currentPtr, true);
    return TableQuery::InsertRecord(
        mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS), foreignKey,
        currentPtr, BindValues);
}

bool CurrentWeatherDBController::Update(int foreignKey, CurrentPtr currentPtr)
{
    COMMON_RETV_IF(!currentPtr, true);
    return TableQuery::UpdateRecord(
        mQueryGenernator.MakeUpdateQuery(TABLE_NAME, UPDATE_ASSIGNMENTS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ?;")),
        foreignKey, currentPtr, BindValues);
}

CurrentPtr CurrentWeatherDBController::Select(int foreignKey)
{
    return TableQuery::Select(mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                                               mQueryGenernator.MakeWhereClause("FK_ID = ?")),
                              foreignKey, ReadCurrent);
}

std::map<int, CurrentPtr> CurrentWeatherDBController::SelectAll()
{
    return TableQuery::SelectAllRecords(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"), 7, ReadCurrent);
}

}  // namespace NSWeather

#include "WeeklyWeatherDBController.h"

#include <ctime>
#include <string>

#include "CommonLog.h"
#include "DBStatement.h"
#include "TableQuery.h"

namespace NSWeather
{

const char* const WeeklyWeatherDBController::TABLE_NAME = "WEEKLY_WEATHER_TABLE";
const char* const WeeklyWeatherDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,weeklyIndex\t\tINTEGER,weatherIcon\t\tINTEGER,"
    "weatherStatus\t\tTEXT,curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,highTemperature\tDOUBLE,"
    "date\t\t\t\tINT64,websiteUrl \t\tTEXT,FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE "
    "ON "
    "UPDATE CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,weeklyIndex,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,"
    "websiteUrl";
const char* const INSERT_PLACEHOLDERS = "?, ?, ?, ?, ?, ?, ?, ?, ?";
const char* const UPDATE_ASSIGNMENTS =
    "weatherIcon = ?,weatherStatus = ?,curTemperature = ?,lowTemperature = ?,highTemperature = ?,date = ?,"
    "websiteUrl = ?";
const char* const SELECT_COLUMNS =
    "weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl";

int BindValues(DBStatement& stmt, int i, const WeeklyPtr& weeklyPtr)
{
    stmt.BindInt(i++, weeklyPtr->GetWeatherIcon());
    stmt.BindText(i++, weeklyPtr->GetWeatherStatus());
    TableQuery::BindTemperature(stmt, i++, weeklyPtr->GetCurTemperature());
    TableQuery::BindTemperature(stmt, i++, weeklyPtr->GetLowTemperature());
    TableQuery::BindTemperature(stmt, i++, weeklyPtr->GetHighTemperature());
    stmt.BindInt64(i++, static_cast<int64_t>(weeklyPtr->GetDate()));
    stmt.BindText(i++, weeklyPtr->GetWebsiteUrl());
    return i;
}

int DayOfWeek(time_t date)
{
    struct tm local = {};
    if (!localtime_r(&date, &local))
        return 0;
    return local.tm_wday;
}

WeeklyPtr ReadWeekly(const DBStatement& stmt)
{
    WeeklyPtr weeklyPtr = std::make_shared<Weekly>();
    weeklyPtr->SetWeatherIcon(stmt.ColumnInt(0));
    weeklyPtr->SetWeatherStatus(stmt.ColumnText(1));
    weeklyPtr->SetCurTemperature(TableQuery::ColumnTemperature(stmt, 2));
    weeklyPtr->SetLowTemperature(TableQuery::ColumnTemperature(stmt, 3));
    weeklyPtr->SetHighTemperature(TableQuery::ColumnTemperature(stmt, 4));
    weeklyPtr->SetDate(static_cast<time_t>(stmt.ColumnInt64(5)));
    weeklyPtr->SetWebsiteUrl(stmt.ColumnText(6));
    weeklyPtr->SetDayOfWeek(DayOfWeek(weeklyPtr->GetDate()));
    return weeklyPtr;
}
}  // namespace

WeeklyWeatherDBController::WeeklyWeatherDBController() {}

WeeklyWeatherDBController::~WeeklyWeatherDBController() {}

bool WeeklyWeatherDBController::CreateTable()
{
    return TableQuery::CreateTable(CREATE_TABLE_FORMAT, TABLE_NAME);
}

bool WeeklyWeatherDBController::DeleteAll()
{
    return TableQuery::DeleteAll(TABLE_NAME);
}

bool WeeklyWeatherDBController::Delete(int foreignKey)
{
    return TableQuery::Delete(TABLE_NAME, foreignKey);
}

bool WeeklyWeatherDBController::Insert(int foreignKey, WeeklyPtrVectorPtr weeklyPtrVector)
{
    COMMON_RETV_IF(!weeklyPtrVector, true);
    return TableQuery::InsertList(
        mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS), foreignKey,
        *weeklyPtrVector, BindValues);
}

bool WeeklyWeatherDBController::Update(int foreignKey, WeeklyPtrVectorPtr weeklyPtrVector)
{
    COMMON_RETV_IF(!weeklyPtrVector, true);
    return TableQuery::UpdateList(
        mQueryGenernator.MakeUpdateQuery(TABLE_NAME, UPDATE_ASSIGNMENTS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ? AND weeklyIndex = ?;")),
        foreignKey, *weeklyPtrVector, BindValues);
}

WeeklyPtrVectorPtr WeeklyWeatherDBController::Select(int foreignKey)
{
    return TableQuery::SelectList(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ?")),
        foreignKey, ReadWeekly);
}

std::map<int, WeeklyPtrVectorPtr> WeeklyWeatherDBController::SelectAll()
{
    return TableQuery::SelectAllLists(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"), 7, ReadWeekly);
}

}  // namespace NSWeather

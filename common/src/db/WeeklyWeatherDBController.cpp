#include "WeeklyWeatherDBController.h"

#include <cstdio>
#include <ctime>
#include <string>

#include "CommonLog.h"
#include "DBConnector.h"
#include "DBStatement.h"

namespace NSWeather
{

const char* const WeeklyWeatherDBController::TABLE_NAME = "WEEKLY_WEATHER_TABLE";
const char* const WeeklyWeatherDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,weeklyIndex\t\tINTEGER,weatherIcon\t\tINTEGER,"
    "weatherStatus\t\tTEXT,curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,highTemperature\tDOUBLE,"
    "date\t\t\t\tINT64,websiteUrl \t\tTEXT,FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE ON "
    "UPDATE CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,weeklyIndex,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl";
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
    stmt.BindTemperature(i++, weeklyPtr->GetCurTemperature());
    stmt.BindTemperature(i++, weeklyPtr->GetLowTemperature());
    stmt.BindTemperature(i++, weeklyPtr->GetHighTemperature());
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
    weeklyPtr->SetCurTemperature(stmt.ColumnTemperature(2));
    weeklyPtr->SetLowTemperature(stmt.ColumnTemperature(3));
    weeklyPtr->SetHighTemperature(stmt.ColumnTemperature(4));
    weeklyPtr->SetDate(static_cast<time_t>(stmt.ColumnInt64(5)));
    weeklyPtr->SetWebsiteUrl(stmt.ColumnText(6));
    weeklyPtr->SetDayOfWeek(DayOfWeek(weeklyPtr->GetDate()));
    return weeklyPtr;
}
}  // namespace

WeeklyWeatherDBController::WeeklyWeatherDBController()
{
}

WeeklyWeatherDBController::~WeeklyWeatherDBController()
{
}

void WeeklyWeatherDBController::CreateTable()
{
    char query[1024] = {0};
    snprintf(query, sizeof(query), CREATE_TABLE_FORMAT, TABLE_NAME);
    DBConnector::GetInstance()->DBExecuteQuery(query);
}

void WeeklyWeatherDBController::DeleteAll()
{
    DBConnector::GetInstance()->DBExecuteQuery((std::string("DELETE FROM ") + TABLE_NAME + ";").c_str());
}

void WeeklyWeatherDBController::Delete(int foreignKey)
{
    DBStatement stmt(std::string("DELETE FROM ") + TABLE_NAME + " WHERE FK_ID=?;");
    stmt.BindInt(1, foreignKey);
    if (stmt.Step() != SQLITE_DONE)
        COMMON_LOG("Fail to Delete");
}

void WeeklyWeatherDBController::Insert(int foreignKey, WeeklyPtrVectorPtr weeklyPtrVector)
{
    COMMON_RET_IF(!weeklyPtrVector);
    DBStatement stmt(mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS));
    for (size_t i = 0; i < weeklyPtrVector->size(); ++i)
    {
        const WeeklyPtr& weeklyPtr = weeklyPtrVector->at(i);
        if (!weeklyPtr)
            continue;
        stmt.Reset();
        stmt.BindInt(1, foreignKey);
        stmt.BindInt(2, static_cast<int>(i));
        BindValues(stmt, 3, weeklyPtr);
        stmt.Step();
    }
}

void WeeklyWeatherDBController::Update(int foreignKey, WeeklyPtrVectorPtr weeklyPtrVector)
{
    COMMON_RET_IF(!weeklyPtrVector);
    DBStatement stmt(mQueryGenernator.MakeUpdateQuery(
        TABLE_NAME, UPDATE_ASSIGNMENTS, mQueryGenernator.MakeWhereClause("FK_ID = ? AND weeklyIndex = ?;")));
    for (size_t i = 0; i < weeklyPtrVector->size(); ++i)
    {
        const WeeklyPtr& weeklyPtr = weeklyPtrVector->at(i);
        if (!weeklyPtr)
            continue;
        stmt.Reset();
        int next = BindValues(stmt, 1, weeklyPtr);
        stmt.BindInt(next, foreignKey);
        stmt.BindInt(next + 1, static_cast<int>(i));
        stmt.Step();
    }
}

WeeklyPtrVectorPtr WeeklyWeatherDBController::Select(int foreignKey)
{
    WeeklyPtrVectorPtr weeklyPtrVector = std::make_shared<WeeklyPtrVector>();
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                                      mQueryGenernator.MakeWhereClause("FK_ID = ?")));
    stmt.BindInt(1, foreignKey);
    while (stmt.Step() == SQLITE_ROW)
        weeklyPtrVector->push_back(ReadWeekly(stmt));
    return weeklyPtrVector;
}

std::map<int, WeeklyPtrVectorPtr> WeeklyWeatherDBController::SelectAll()
{
    std::map<int, WeeklyPtrVectorPtr> listMap;
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"));
    while (stmt.Step() == SQLITE_ROW)
    {
        WeeklyPtrVectorPtr& list = listMap[stmt.ColumnInt(7)];
        if (!list)
            list = std::make_shared<WeeklyPtrVector>();
        list->push_back(ReadWeekly(stmt));
    }
    return listMap;
}

}  // namespace NSWeather

#include "HourlyWeatherDBController.h"

#include <cstdio>
#include <string>

#include "CommonLog.h"
#include "DBConnector.h"
#include "DBStatement.h"

namespace NSWeather
{

const char* const HourlyWeatherDBController::TABLE_NAME = "HOURLY_WEATHER_TABLE";
const char* const HourlyWeatherDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,hourlyIndex\t\tINTEGER,hour\t\t\t\tINT64,"
    "weatherIcon\t\tINTEGER,weatherStatus\t\tTEXT,curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,"
    "highTemperature\tDOUBLE,websiteUrl\t\t\tTEXT,FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE "
    "ON UPDATE CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,hourlyIndex,hour,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,websiteUrl";
const char* const INSERT_PLACEHOLDERS = "?, ?, ?, ?, ?, ?, ?, ?, ?";
const char* const UPDATE_ASSIGNMENTS =
    "hour = ?,weatherIcon = ?,weatherStatus = ?,curTemperature = ?,lowTemperature = ?,highTemperature = ?,"
    "websiteUrl = ?";
const char* const SELECT_COLUMNS =
    "hour,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,websiteUrl";

int BindValues(DBStatement& stmt, int i, const HourlyPtr& hourlyPtr)
{
    stmt.BindInt64(i++, static_cast<int64_t>(hourlyPtr->GetHour()));
    stmt.BindInt(i++, hourlyPtr->GetWeatherIcon());
    stmt.BindText(i++, hourlyPtr->GetWeatherStatus());
    stmt.BindTemperature(i++, hourlyPtr->GetCurTemperature());
    stmt.BindTemperature(i++, hourlyPtr->GetLowTemperature());
    stmt.BindTemperature(i++, hourlyPtr->GetHighTemperature());
    stmt.BindText(i++, hourlyPtr->GetWebsiteUrl());
    return i;
}

HourlyPtr ReadHourly(const DBStatement& stmt)
{
    HourlyPtr hourlyPtr = std::make_shared<Hourly>();
    hourlyPtr->SetHour(static_cast<time_t>(stmt.ColumnInt64(0)));
    hourlyPtr->SetWeatherIcon(stmt.ColumnInt(1));
    hourlyPtr->SetWeatherStatus(stmt.ColumnText(2));
    hourlyPtr->SetCurTemperature(stmt.ColumnTemperature(3));
    hourlyPtr->SetLowTemperature(stmt.ColumnTemperature(4));
    hourlyPtr->SetHighTemperature(stmt.ColumnTemperature(5));
    hourlyPtr->SetWebsiteUrl(stmt.ColumnText(6));
    return hourlyPtr;
}
}  // namespace

HourlyWeatherDBController::HourlyWeatherDBController()
{
}

HourlyWeatherDBController::~HourlyWeatherDBController()
{
}

void HourlyWeatherDBController::CreateTable()
{
    char query[1024] = {0};
    snprintf(query, sizeof(query), CREATE_TABLE_FORMAT, TABLE_NAME);
    DBConnector::GetInstance()->DBExecuteQuery(query);
}

void HourlyWeatherDBController::DeleteAll()
{
    DBConnector::GetInstance()->DBExecuteQuery((std::string("DELETE FROM ") + TABLE_NAME + ";").c_str());
}

void HourlyWeatherDBController::Delete(int foreignKey)
{
    DBStatement stmt(std::string("DELETE FROM ") + TABLE_NAME + " WHERE FK_ID=?;");
    stmt.BindInt(1, foreignKey);
    if (stmt.Step() != SQLITE_DONE)
        COMMON_LOG("Fail to Delete");
}

void HourlyWeatherDBController::Insert(int foreignKey, HourlyPtrVectorPtr hourlyPtrVector)
{
    COMMON_RET_IF(!hourlyPtrVector);
    // One prepared statement serves every row.
    DBStatement stmt(mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS));
    for (size_t i = 0; i < hourlyPtrVector->size(); ++i)
    {
        const HourlyPtr& hourlyPtr = hourlyPtrVector->at(i);
        if (!hourlyPtr)
            continue;
        stmt.Reset();
        stmt.BindInt(1, foreignKey);
        stmt.BindInt(2, static_cast<int>(i));
        BindValues(stmt, 3, hourlyPtr);
        stmt.Step();
    }
}

void HourlyWeatherDBController::Update(int foreignKey, HourlyPtrVectorPtr hourlyPtrVector)
{
    COMMON_RET_IF(!hourlyPtrVector);
    DBStatement stmt(mQueryGenernator.MakeUpdateQuery(
        TABLE_NAME, UPDATE_ASSIGNMENTS, mQueryGenernator.MakeWhereClause("FK_ID = ? AND hourlyIndex = ?;")));
    for (size_t i = 0; i < hourlyPtrVector->size(); ++i)
    {
        const HourlyPtr& hourlyPtr = hourlyPtrVector->at(i);
        if (!hourlyPtr)
            continue;
        stmt.Reset();
        int next = BindValues(stmt, 1, hourlyPtr);
        stmt.BindInt(next, foreignKey);
        stmt.BindInt(next + 1, static_cast<int>(i));
        stmt.Step();
    }
}

HourlyPtrVectorPtr HourlyWeatherDBController::Select(int foreignKey)
{
    HourlyPtrVectorPtr hourlyPtrVector = std::make_shared<HourlyPtrVector>();
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                                      mQueryGenernator.MakeWhereClause("FK_ID = ?")));
    stmt.BindInt(1, foreignKey);
    while (stmt.Step() == SQLITE_ROW)
        hourlyPtrVector->push_back(ReadHourly(stmt));
    return hourlyPtrVector;
}

std::map<int, HourlyPtrVectorPtr> HourlyWeatherDBController::SelectAll()
{
    std::map<int, HourlyPtrVectorPtr> listMap;
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"));
    while (stmt.Step() == SQLITE_ROW)
    {
        HourlyPtrVectorPtr& list = listMap[stmt.ColumnInt(7)];
        if (!list)
            list = std::make_shared<HourlyPtrVector>();
        list->push_back(ReadHourly(stmt));
    }
    return listMap;
}

}  // namespace NSWeather

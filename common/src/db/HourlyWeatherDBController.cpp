#include "HourlyWeatherDBController.h"

#include <string>

#include "CommonLog.h"
#include "DBStatement.h"
#include "TableQuery.h"

namespace NSWeather
{

const char* const HourlyWeatherDBController::TABLE_NAME = "HOURLY_WEATHER_TABLE";
const char* const HourlyWeatherDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,hourlyIndex\t\tINTEGER,hour\t\t\t\tINT64,"
    "weatherIcon\t\tINTEGER,weatherStatus\t\tTEXT,curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,"
    "highTemperature\tDOUBLE,websiteUrl\t\t\tTEXT,FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE "
    "CASCADE "
    "ON UPDATE CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,hourlyIndex,hour,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,"
    "websiteUrl";
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
    TableQuery::BindTemperature(stmt, i++, hourlyPtr->GetCurTemperature());
    TableQuery::BindTemperature(stmt, i++, hourlyPtr->GetLowTemperature());
    TableQuery::BindTemperature(stmt, i++, hourlyPtr->GetHighTemperature());
    stmt.BindText(i++, hourlyPtr->GetWebsiteUrl());
    return i;
}

HourlyPtr ReadHourly(const DBStatement& stmt)
{
    HourlyPtr hourlyPtr = std::make_shared<Hourly>();
    hourlyPtr->SetHour(static_cast<time_t>(stmt.ColumnInt64(0)));
    hourlyPtr->SetWeatherIcon(stmt.ColumnInt(1));
    hourlyPtr->SetWeatherStatus(stmt.ColumnText(2));
    hourlyPtr->SetCurTemperature(TableQuery::ColumnTemperature(stmt, 3));
    hourlyPtr->SetLowTemperature(TableQuery::ColumnTemperature(stmt, 4));
    hourlyPtr->SetHighTemperature(TableQuery::ColumnTemperature(stmt, 5));
    hourlyPtr->SetWebsiteUrl(stmt.ColumnText(6));
    return hourlyPtr;
}
}  // namespace

HourlyWeatherDBController::HourlyWeatherDBController() {}

HourlyWeatherDBController::~HourlyWeatherDBController() {}

bool HourlyWeatherDBController::CreateTable()
{
    return TableQuery::CreateTable(CREATE_TABLE_FORMAT, TABLE_NAME);
}

bool HourlyWeatherDBController::DeleteAll()
{
    return TableQuery::DeleteAll(TABLE_NAME);
}

bool HourlyWeatherDBController::Delete(int foreignKey)
{
    return TableQuery::Delete(TABLE_NAME, foreignKey);
}

bool HourlyWeatherDBController::Insert(int foreignKey, HourlyPtrVectorPtr hourlyPtrVector)
{
    COMMON_RETV_IF(!hourlyPtrVector, true);
    return TableQuery::InsertList(
        mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS), foreignKey,
        *hourlyPtrVector, BindValues);
}

bool HourlyWeatherDBController::Update(int foreignKey, HourlyPtrVectorPtr hourlyPtrVector)
{
    COMMON_RETV_IF(!hourlyPtrVector, true);
    return TableQuery::UpdateList(
        mQueryGenernator.MakeUpdateQuery(TABLE_NAME, UPDATE_ASSIGNMENTS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ? AND hourlyIndex = ?;")),
        foreignKey, *hourlyPtrVector, BindValues);
}

HourlyPtrVectorPtr HourlyWeatherDBController::Select(int foreignKey)
{
    return TableQuery::SelectList(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ?")),
        foreignKey, ReadHourly);
}

std::map<int, HourlyPtrVectorPtr> HourlyWeatherDBController::SelectAll()
{
    return TableQuery::SelectAllLists(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"), 7, ReadHourly);
}

}  // namespace NSWeather

#include "TableQuery.h"

#include <cmath>
#include <cstdio>

#include "QueryGenernator.h"

namespace NSWeather
{

namespace
{
constexpr size_t CREATE_QUERY_BUFFER_SIZE = 1024;
}  // namespace

// Only table names, never values, are put into these texts.
bool TableQuery::CreateTable(const char* createFormat, const char* tableName)
{
    char query[CREATE_QUERY_BUFFER_SIZE] = {};
    int length = snprintf(query, sizeof(query), createFormat, tableName);
    COMMON_RETV_IF(length < 0 || static_cast<size_t>(length) >= sizeof(query), false);
    return DBStatement(query).Execute();
}

bool TableQuery::DeleteAll(const char* tableName)
{
    return DBStatement(std::string("DELETE FROM ") + tableName + ";").Execute();
}

bool TableQuery::Delete(const char* tableName, int foreignKey)
{
    DBStatement stmt(std::string("DELETE FROM ") + tableName + " WHERE FK_ID=?;");
    stmt.BindInt(1, foreignKey);
    if (stmt.Execute())
        return true;
    COMMON_LOG("Fail to Delete");
    return false;
}

bool TableQuery::IsTableExist(const char* tableName)
{
    DBStatement statement(QueryGenernator().MakeSelectQuery(tableName, "COUNT(*)"));
    int result = statement.Step();
    if (result != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", result);
        return false;
    }
    return statement.ColumnDouble(0) > 0;
}

bool TableQuery::BindTemperature(DBStatement& stmt, int index, const TemperaturePtr& temperature)
{
    double celsius = temperature ? temperature->GetCelsius() : 999.0;
    return stmt.BindDouble(index, std::floor(0.5 + celsius * 10) / 10);
}

TemperaturePtr TableQuery::ColumnTemperature(const DBStatement& stmt, int column)
{
    TemperaturePtr temperature = std::make_shared<Temperature>();
    temperature->SetCelsiusValue(stmt.ColumnDouble(column));
    return temperature;
}

}  // namespace NSWeather

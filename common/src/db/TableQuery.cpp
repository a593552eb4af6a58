#include "TableQuery.h"

#include <cstdio>

#include "DBConnector.h"
#include "QueryGenernator.h"

namespace NSWeather
{

namespace
{
constexpr size_t CREATE_QUERY_BUFFER_SIZE = 1024;
}  // namespace

void TableQuery::CreateTable(const char* createFormat, const char* tableName)
{
    char query[CREATE_QUERY_BUFFER_SIZE] = {};
    snprintf(query, sizeof(query), createFormat, tableName);
    DBConnector::GetInstance()->DBExecuteQuery(query);
}

void TableQuery::DeleteAll(const char* tableName)
{
    DBConnector::GetInstance()->DBExecuteQuery((std::string("DELETE FROM ") + tableName + ";").c_str());
}

void TableQuery::Delete(const char* tableName, int foreignKey)
{
    DBStatement stmt(std::string("DELETE FROM ") + tableName + " WHERE FK_ID=?;");
    stmt.BindInt(1, foreignKey);
    if (stmt.Step() != SQLITE_DONE)
        COMMON_LOG("Fail to Delete");
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

}  // namespace NSWeather

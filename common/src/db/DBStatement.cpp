#include "DBStatement.h"

#include "CommonLog.h"
#include "DBConnector.h"

namespace NSWeather
{

DBStatement::DBStatement(const std::string& query)
    : mStmt(DBConnector::GetInstance()->DBPrepareQuery(query.c_str()))
{
}

DBStatement::~DBStatement()
{
    if (mStmt)
        sqlite3_finalize(mStmt);
}

bool DBStatement::BindInt(int index, int value)
{
    return mStmt && sqlite3_bind_int(mStmt, index, value) == SQLITE_OK;
}

bool DBStatement::BindInt64(int index, int64_t value)
{
    return mStmt && sqlite3_bind_int64(mStmt, index, static_cast<sqlite3_int64>(value)) == SQLITE_OK;
}

bool DBStatement::BindDouble(int index, double value)
{
    return mStmt && sqlite3_bind_double(mStmt, index, value) == SQLITE_OK;
}

bool DBStatement::BindText(int index, const std::string& value)
{
    return mStmt && sqlite3_bind_text(mStmt, index, value.c_str(), static_cast<int>(value.size()),
                                      SQLITE_TRANSIENT) == SQLITE_OK;
}

int DBStatement::Step()
{
    if (!mStmt)
        return SQLITE_MISUSE;
    int rc = sqlite3_step(mStmt);
    if (rc != SQLITE_ROW && rc != SQLITE_DONE)
    {
        sqlite3* handle = sqlite3_db_handle(mStmt);
        COMMON_LOG("Fail: sqlite3_step rc [%d][%s]", rc, sqlite3_errmsg(handle));
        COMMON_LOG("Query: %s", sqlite3_sql(mStmt));
        DBConnector::GetInstance()->MarkCycleFailed();
    }
    return rc;
}

bool DBStatement::Execute()
{
    if (!mStmt)
    {
        // The prepare failure is already logged.
        DBConnector::GetInstance()->MarkCycleFailed();
        return false;
    }
    return Step() == SQLITE_DONE;
}

void DBStatement::Reset()
{
    if (!mStmt)
        return;
    sqlite3_reset(mStmt);
    sqlite3_clear_bindings(mStmt);
}

int DBStatement::ColumnInt(int column) const
{
    return mStmt ? sqlite3_column_int(mStmt, column) : 0;
}

int64_t DBStatement::ColumnInt64(int column) const
{
    return mStmt ? static_cast<int64_t>(sqlite3_column_int64(mStmt, column)) : 0;
}

double DBStatement::ColumnDouble(int column) const
{
    return mStmt ? sqlite3_column_double(mStmt, column) : 0.0;
}

std::string DBStatement::ColumnText(int column) const
{
    if (!mStmt)
        return std::string();
    const unsigned char* text = sqlite3_column_text(mStmt, column);
    if (!text)
        return std::string();
    int bytes = sqlite3_column_bytes(mStmt, column);
    return std::string(reinterpret_cast<const char*>(text), static_cast<size_t>(bytes));
}

}  // namespace NSWeather

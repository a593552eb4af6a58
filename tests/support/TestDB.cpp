#include "TestDB.h"

#include <gtest/gtest.h>

namespace WeatherTest
{

RawDB::RawDB(const std::string& path, bool isReadOnly)
{
    int flags = isReadOnly ? SQLITE_OPEN_READONLY : (SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE);
    if (sqlite3_open_v2(path.c_str(), &mHandle, flags, nullptr) != SQLITE_OK)
    {
        sqlite3_close(mHandle);
        mHandle = nullptr;
    }
}

RawDB::~RawDB()
{
    sqlite3_close(mHandle);
}

bool RawDB::Exec(const std::string& sql)
{
    char* error = nullptr;
    int rc = sqlite3_exec(mHandle, sql.c_str(), nullptr, nullptr, &error);
    if (rc != SQLITE_OK)
        ADD_FAILURE() << sql << ": " << (error ? error : "");
    sqlite3_free(error);
    return rc == SQLITE_OK;
}

std::vector<std::string> RawDB::QueryTexts(const std::string& sql)
{
    std::vector<std::string> texts;
    sqlite3_stmt* stmt = nullptr;
    if (sqlite3_prepare_v2(mHandle, sql.c_str(), -1, &stmt, nullptr) != SQLITE_OK)
    {
        ADD_FAILURE() << sql << ": " << (mHandle ? sqlite3_errmsg(mHandle) : "not open");
        sqlite3_finalize(stmt);
        return texts;
    }
    int rc = SQLITE_ROW;
    while ((rc = sqlite3_step(stmt)) == SQLITE_ROW)
    {
        const unsigned char* text = sqlite3_column_text(stmt, 0);
        texts.push_back(text ? reinterpret_cast<const char*>(text) : "");
    }
    if (rc != SQLITE_DONE)
        ADD_FAILURE() << sql << ": " << sqlite3_errmsg(mHandle);
    sqlite3_finalize(stmt);
    return texts;
}

std::string RawDB::QueryText(const std::string& sql)
{
    std::vector<std::string> texts = QueryTexts(sql);
    return texts.empty() ? std::string() : texts.front();
}

double RawDB::QueryDouble(const std::string& sql)
{
    std::string text = QueryText(sql);
    return text.empty() ? 0.0 : std::stod(text);
}

long long RawDB::QueryInt(const std::string& sql)
{
    std::string text = QueryText(sql);
    return text.empty() ? 0 : std::stoll(text);
}

std::string RawDB::TableSql(const std::string& table)
{
    return QueryText("SELECT sql FROM sqlite_master WHERE type = 'table' AND name = '" + table + "'");
}

std::vector<std::string> RawDB::ColumnNames(const std::string& table)
{
    return QueryTexts("SELECT name FROM pragma_table_info('" + table + "')");
}

}  // namespace WeatherTest

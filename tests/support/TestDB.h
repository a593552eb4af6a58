#ifndef WEATHER_TESTS_TEST_DB_H
#define WEATHER_TESTS_TEST_DB_H

#include <sqlite3.h>

#include <string>
#include <vector>

namespace WeatherTest
{

// Direct access to a database file, beside the code under test. Statements
// that fail fail the running test.
class RawDB
{
public:
    explicit RawDB(const std::string& path, bool isReadOnly = false);
    ~RawDB();
    RawDB(const RawDB&) = delete;
    RawDB& operator=(const RawDB&) = delete;

    bool GetIsOpen() const { return mHandle != nullptr; }
    bool Exec(const std::string& sql);
    // Every row of the first column, as text ("" for NULL).
    std::vector<std::string> QueryTexts(const std::string& sql);
    // First column of the first row; empty text / 0 when there is none.
    std::string QueryText(const std::string& sql);
    double QueryDouble(const std::string& sql);
    long long QueryInt(const std::string& sql);
    // The CREATE statement SQLite keeps for a table, empty when absent.
    std::string TableSql(const std::string& table);
    std::vector<std::string> ColumnNames(const std::string& table);

private:
    sqlite3* mHandle = nullptr;
};

}  // namespace WeatherTest

#endif

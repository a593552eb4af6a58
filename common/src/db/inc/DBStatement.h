#ifndef NSWEATHER_DB_STATEMENT_H
#define NSWEATHER_DB_STATEMENT_H

#include <cstdint>
#include <string>

#include <sqlite3.h>

namespace NSWeather
{

// One prepared statement on the open DBConnector cycle, finalised when the
// guard goes out of scope. A statement that failed to prepare is inert:
// binds fail and Step returns SQLITE_MISUSE.
class DBStatement
{
public:
    explicit DBStatement(const std::string& query);
    virtual ~DBStatement();
    DBStatement(const DBStatement&) = delete;
    DBStatement& operator=(const DBStatement&) = delete;

    bool GetIsValid() const { return mStmt != nullptr; }
    // Indexes start at 1.
    bool BindInt(int index, int value);
    bool BindInt64(int index, int64_t value);
    bool BindDouble(int index, double value);
    // The text is copied, so a temporary string is safe to pass.
    bool BindText(int index, const std::string& value);
    // A failing step is logged and fails the cycle (see DBConnector).
    int Step();
    // Runs a statement that returns no rows; false (and the cycle failed)
    // unless it ran to completion.
    bool Execute();
    // Makes the statement ready to run again with new values.
    void Reset();
    // Columns start at 0.
    int ColumnInt(int column) const;
    int64_t ColumnInt64(int column) const;
    double ColumnDouble(int column) const;
    // SQL NULL reads as an empty string.
    std::string ColumnText(int column) const;

private:
    sqlite3_stmt* mStmt;
};

}  // namespace NSWeather

#endif

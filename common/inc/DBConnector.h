#ifndef NSWEATHER_DB_CONNECTOR_H
#define NSWEATHER_DB_CONNECTOR_H

#include <string>

#include <sqlite3.h>

namespace NSWeather
{

// The one SQLite connection of the process. Every database operation is a
// short cycle: DBInitialize (open + begin), statements, DBFinalize (commit
// + close). Cycles never nest; at most one file is open at a time.
class DBConnector
{
public:
    // Created on first use and never destroyed; the caller does not own it.
    static DBConnector* GetInstance();
    virtual ~DBConnector();

    bool DBInitialize(const std::string& dbFilePath, bool isReadOnly);
    void DBFinalize();
    // The caller owns the statement and finalises it (see DBStatement).
    sqlite3_stmt* DBPrepareQuery(const char* query);
    bool DBExecuteQuery(const char* query);
    bool GetIsOpened() const { return mDBHandle != nullptr; }

    static int DBUtilBusyHandler(void* userData, int count);

private:
    DBConnector();
    DBConnector(const DBConnector&) = delete;
    DBConnector& operator=(const DBConnector&) = delete;

    bool DBFileOpen(const std::string& dbFilePath, int openFlags);
    bool DBSetBusyHandler();
    bool DBExcutePerformanceOptimization();
    bool DBStartTransaction();
    bool DBEndTransaction();
    void DBClose();

    sqlite3* mDBHandle;
};

}  // namespace NSWeather

#endif

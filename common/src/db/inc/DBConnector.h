#ifndef NSWEATHER_DB_CONNECTOR_H
#define NSWEATHER_DB_CONNECTOR_H

#include <string>

#include <sqlite3.h>

namespace NSWeather
{

// The one SQLite connection of the process. Every database operation is a
// short cycle: DBInitialize (open + begin), statements, DBFinalize (commit
// + close). Cycles never nest; at most one file is open at a time. A cycle
// in which a step failed is rolled back instead of committed.
class DBConnector
{
public:
    // Created on first use and never destroyed; the caller does not own it.
    static DBConnector* GetInstance();
    virtual ~DBConnector();

    // A read-write cycle holds the write lock from its first read on, so no
    // other process writes between what it reads and what it writes back.
    bool DBInitialize(const std::string& dbFilePath, bool isReadOnly);
    // Commits (or rolls back a failed cycle) and closes; true only when a
    // cycle without failure was committed.
    bool DBFinalize();
    void MarkCycleFailed() { mIsCycleFailed = true; }
    bool GetIsCycleFailed() const { return mIsCycleFailed; }
    // The caller owns the statement and finalises it (see DBStatement).
    sqlite3_stmt* DBPrepareQuery(const char* query);
    // Makes a second file's tables readable in this cycle under their own
    // names; it is read in the cycle's transaction and detached on close.
    bool DBAttach(const std::string& dbFilePath);
    bool DBExecuteQuery(const char* query);
    bool GetIsOpened() const { return mDBHandle != nullptr; }
    // SQLite's result code of the last failed call on the open handle.
    int GetLastErrorCode() const { return mDBHandle ? sqlite3_errcode(mDBHandle) : SQLITE_MISUSE; }

    static int DBUtilBusyHandler(void* userData, int count);
    // Lets tests give up on a held lock after fewer waits; a negative
    // limit restores the usual ten.
    static void SetBusyRetryLimit(int limit);

private:
    DBConnector();
    DBConnector(const DBConnector&) = delete;
    DBConnector& operator=(const DBConnector&) = delete;

    bool DBFileOpen(const std::string& dbFilePath, int openFlags);
    static void RollBackHotJournal(const std::string& dbFilePath);
    bool DBSetBusyHandler();
    bool DBExcutePerformanceOptimization();
    bool DBOpen(const std::string& dbFilePath, bool isReadOnly);
    bool DBStartTransaction();
    bool DBEndTransaction();
    void DBClose();

    sqlite3* mDBHandle;
    bool mIsCycleFailed;
    bool mIsReadOnly;
};

}  // namespace NSWeather

#endif

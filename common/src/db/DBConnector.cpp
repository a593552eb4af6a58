#include "DBConnector.h"

#include <cstring>
#include <unistd.h>

#include "CommonLog.h"

namespace NSWeather
{

namespace
{
constexpr int MAX_BUSY_RETRY = 10;
constexpr useconds_t BUSY_WAIT_STEP_USEC = 100000;
int busyRetryLimit = MAX_BUSY_RETRY;
}  // namespace

DBConnector* DBConnector::GetInstance()
{
    // Deliberately leaked: statements may still be finalised during exit.
    static DBConnector* instance = new DBConnector();
    return instance;
}

DBConnector::DBConnector() : mDBHandle(nullptr), mIsCycleFailed(false), mIsReadOnly(true) {}

DBConnector::~DBConnector()
{
    DBClose();
}

bool DBConnector::DBInitialize(const std::string& dbFilePath, bool isReadOnly)
{
    mIsReadOnly = isReadOnly;
    return DBOpen(dbFilePath, isReadOnly);
}

bool DBConnector::DBOpen(const std::string& dbFilePath, bool isReadOnly)
{
    if (mDBHandle)
    {
        COMMON_LOG("DBInitialize is already called, mDBHandle is not NULL");
        return true;
    }
    COMMON_RETV_IF(dbFilePath.empty(), false);
    if (isReadOnly)
    {
        RollBackHotJournal(dbFilePath);
        COMMON_RETV_IF(DBFileOpen(dbFilePath, SQLITE_OPEN_SHAREDCACHE | SQLITE_OPEN_READONLY) == false,
                       false);
    }
    else
    {
        COMMON_RETV_IF(DBFileOpen(dbFilePath, SQLITE_OPEN_SHAREDCACHE | SQLITE_OPEN_READWRITE |
                                                  SQLITE_OPEN_CREATE) == false,
                       false);
    }
    COMMON_RETV_IF(DBSetBusyHandler() == false, false);
    COMMON_RETV_IF(DBExcutePerformanceOptimization() == false, false);
    COMMON_RETV_IF(DBStartTransaction() == false, false);
    mIsCycleFailed = false;
    return true;
}

bool DBConnector::DBFinalize()
{
    COMMON_RETV_IF(DBEndTransaction() == false, false);
    if (!mDBHandle)
    {
        COMMON_LOG("mDBHandle is NULL");
        return false;
    }
    DBClose();
    return true;
}

sqlite3_stmt* DBConnector::DBPrepareQuery(const char* query)
{
    if (!mDBHandle || !query)
    {
        COMMON_LOG("mDBHandle is NULL");
        return nullptr;
    }
    sqlite3_stmt* stmt = nullptr;
    int rc = sqlite3_prepare_v2(mDBHandle, query, static_cast<int>(strlen(query)), &stmt, nullptr);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("Fail: sqlite3_prepare_v2 Failed rc [%d][%s]", rc, sqlite3_errmsg(mDBHandle));
        COMMON_LOG("Query: %s", query);
        sqlite3_finalize(stmt);
        return nullptr;
    }
    return stmt;
}

bool DBConnector::DBAttach(const std::string& dbFilePath)
{
    sqlite3_stmt* stmt = DBPrepareQuery("ATTACH DATABASE ? AS attached;");
    COMMON_RETV_IF(!stmt, false);
    sqlite3_bind_text(stmt, 1, dbFilePath.c_str(), -1, SQLITE_TRANSIENT);
    int rc = sqlite3_step(stmt);
    sqlite3_finalize(stmt);
    if (rc != SQLITE_DONE)
    {
        COMMON_LOG("ATTACH %s rc [%d][%s]", dbFilePath.c_str(), rc, sqlite3_errmsg(mDBHandle));
        mIsCycleFailed = true;
        return false;
    }
    return true;
}

bool DBConnector::DBExecuteQuery(const char* query)
{
    if (!mDBHandle || !query)
    {
        COMMON_LOG("mDBHandle is NULL");
        return false;
    }
    char* errorMsg = nullptr;
    int rc = sqlite3_exec(mDBHandle, query, nullptr, nullptr, &errorMsg);
    if (rc == SQLITE_OK)
    {
        sqlite3_free(errorMsg);
        return true;
    }
    if (errorMsg)
    {
        COMMON_LOG("Fail: sqlite3_exec Failed rc [%d][%s]", rc, errorMsg);
        sqlite3_free(errorMsg);
    }
    return false;
}

int DBConnector::DBUtilBusyHandler(void* /*userData*/, int count)
{
    if (count >= busyRetryLimit)
    {
        COMMON_LOG("Busy Handler will be returned SQLITE_BUSY error");
        return 0;
    }
    COMMON_LOG("Busy Handler Called! : CNT(%d)\n", count + 1);
    usleep(static_cast<useconds_t>(count + 1) * BUSY_WAIT_STEP_USEC);
    return 1;
}

void DBConnector::SetBusyRetryLimit(int limit)
{
    busyRetryLimit = limit < 0 ? MAX_BUSY_RETRY : limit;
}

bool DBConnector::DBFileOpen(const std::string& dbFilePath, int openFlags)
{
    int rc = sqlite3_open_v2(dbFilePath.c_str(), &mDBHandle, openFlags, nullptr);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("sqlite3_open_open failed. %d %p, %s", rc, static_cast<void*>(mDBHandle),
                   dbFilePath.c_str());
        DBClose();
        return false;
    }
    return true;
}

// A writer killed inside its transaction leaves a hot journal, and only a
// connection that may write can roll it back: until the next writer came,
// every read-only cycle would fail and the readers would see no city at all.
// A live writer's journal is not hot; SQLite then only reads.
void DBConnector::RollBackHotJournal(const std::string& dbFilePath)
{
    if (access((dbFilePath + "-journal").c_str(), F_OK) != 0)
        return;
    sqlite3* handle = nullptr;
    int rc =
        sqlite3_open_v2(dbFilePath.c_str(), &handle, SQLITE_OPEN_READWRITE | SQLITE_OPEN_NOFOLLOW, nullptr);
    if (rc == SQLITE_OK)
    {
        sqlite3_busy_handler(handle, DBUtilBusyHandler, nullptr);
        rc = sqlite3_exec(handle, "SELECT COUNT(*) FROM sqlite_master;", nullptr, nullptr, nullptr);
    }
    if (rc != SQLITE_OK)
        COMMON_LOG("journal of %s not rolled back: rc [%d]", dbFilePath.c_str(), rc);
    sqlite3_close_v2(handle);
}

bool DBConnector::DBSetBusyHandler()
{
    if (sqlite3_busy_handler(mDBHandle, DBUtilBusyHandler, nullptr) != SQLITE_OK)
    {
        COMMON_LOG("Fail to register busy handler");
        DBClose();
        return false;
    }
    return true;
}

// Durability is traded for speed; a failed step closes the connection so the
// next cycle opens the file it asks for instead of reusing this one.
bool DBConnector::DBExcutePerformanceOptimization()
{
    char* errorMsg = nullptr;
    int rc =
        sqlite3_exec(mDBHandle, "PRAGMA synchronous=OFF; PRAGMA count_changes=OFF; PRAGMA temp_store=memory;",
                     nullptr, nullptr, &errorMsg);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("Fail to sqlite3_exec for performance optimization.");
        COMMON_LOG("pszErrorMsg : %s", errorMsg ? errorMsg : "");
        sqlite3_free(errorMsg);
        DBClose();
        return false;
    }
    return true;
}

// A read-write cycle takes the write lock at once, waiting through the busy
// handler. Deferred, it would take the lock at its first write, and SQLite
// refuses that upgrade at once, without the busy handler, while another
// process writes: two writers at the same moment would lose a write.
bool DBConnector::DBStartTransaction()
{
    const char* beginQuery = mIsReadOnly ? "BEGIN TRANSACTION;" : "BEGIN IMMEDIATE TRANSACTION;";
    int rc = sqlite3_exec(mDBHandle, beginQuery, nullptr, nullptr, nullptr);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("sqlite3_exec fail");
        COMMON_LOG("%s rc [%d][%s]", beginQuery, rc, sqlite3_errmsg(mDBHandle));
        DBClose();
        return false;
    }
    return true;
}

// A cycle with a failed step, or whose commit fails (e.g. busy), is rolled
// back: nothing of it is kept and the handle does not stay inside a
// transaction for the next cycle to inherit.
bool DBConnector::DBEndTransaction()
{
    if (!mDBHandle)
        return true;
    if (mIsCycleFailed)
    {
        COMMON_LOG("A step of this cycle failed: rolled back");
        sqlite3_exec(mDBHandle, "ROLLBACK;", nullptr, nullptr, nullptr);
        DBClose();
        return false;
    }
    int rc = sqlite3_exec(mDBHandle, "END TRANSACTION;", nullptr, nullptr, nullptr);
    if (rc != SQLITE_OK)
    {
        COMMON_LOG("sqlite3_exec fail");
        COMMON_LOG("END TRANSACTION rc [%d][%s]", rc, sqlite3_errmsg(mDBHandle));
        sqlite3_exec(mDBHandle, "ROLLBACK;", nullptr, nullptr, nullptr);
        DBClose();
        return false;
    }
    return true;
}

void DBConnector::DBClose()
{
    if (!mDBHandle)
        return;
    // sqlite3_close_v2 defers the close if a statement were still alive.
    sqlite3_close_v2(mDBHandle);
    mDBHandle = nullptr;
}

}  // namespace NSWeather

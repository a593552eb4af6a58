#include "DBCycleCloser.h"

#include "CommonLog.h"
#include "DBConnector.h"

namespace NSWeather
{

namespace
{
bool Open(DBConnector* dbConnector, const std::string& dbFilePath, DBCycleCloser::Mode mode)
{
    switch (mode)
    {
        case DBCycleCloser::Mode::READ:
            return dbConnector->DBInitialize(dbFilePath, true);
        case DBCycleCloser::Mode::WRITE:
            return dbConnector->DBInitialize(dbFilePath, false);
    }
    return false;
}
}  // namespace

DBCycleCloser::DBCycleCloser(const std::string& dbFilePath, Mode mode)
    : mDBConnector(DBConnector::GetInstance())
{
    if (Open(mDBConnector, dbFilePath, mode))
        return;
    COMMON_LOG("Cannot open %s for %s", dbFilePath.c_str(), mode == Mode::READ ? "reading" : "writing");
    mDBConnector = nullptr;
}

DBCycleCloser::~DBCycleCloser()
{
    Close();
}

bool DBCycleCloser::Attach(const std::string& dbFilePath)
{
    return mDBConnector && mDBConnector->DBAttach(dbFilePath);
}

void DBCycleCloser::MarkFailed()
{
    if (mDBConnector)
        mDBConnector->MarkCycleFailed();
}

bool DBCycleCloser::Close(bool isDone)
{
    if (!mDBConnector)
        return false;
    if (!isDone)
        mDBConnector->MarkCycleFailed();
    bool isCommitted = mDBConnector->DBFinalize();
    mDBConnector = nullptr;
    return isCommitted;
}

}  // namespace NSWeather

#include "DBCycleCloser.h"

#include "DBConnector.h"

namespace NSWeather
{

DBCycleCloser::DBCycleCloser(DBConnector* dbConnector) : mDBConnector(dbConnector) {}

DBCycleCloser::~DBCycleCloser()
{
    Close();
}

void DBCycleCloser::MarkFailed()
{
    if (mDBConnector)
        mDBConnector->MarkCycleFailed();
}

bool DBCycleCloser::Close()
{
    if (!mDBConnector)
        return false;
    bool isCommitted = mDBConnector->DBFinalize();
    mDBConnector = nullptr;
    return isCommitted;
}

}  // namespace NSWeather

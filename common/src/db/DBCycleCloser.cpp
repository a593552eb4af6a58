#include "DBCycleCloser.h"

#include "DBConnector.h"

namespace NSWeather
{

DBCycleCloser::DBCycleCloser(DBConnector* dbConnector) : mDBConnector(dbConnector) {}

DBCycleCloser::~DBCycleCloser()
{
    mDBConnector->DBFinalize();
}

}  // namespace NSWeather

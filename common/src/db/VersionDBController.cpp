#include "VersionDBController.h"

#include "CommonLog.h"
#include "DBConnector.h"
#include "DBCycleCloser.h"
#include "DBStatement.h"
#include "FileUtil.h"
#include "TableQuery.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{
constexpr const char* VERSION_TABLE = "VERSION_TABLE";
constexpr const char* VERSION_CREATE_FORMAT = "CREATE TABLE IF NOT EXISTS %s (dbVersion DOUBLE);";
constexpr double LATEST_DB_VERSION = 0.8;
constexpr double NO_VERSION = -1.0;

std::string GetVersionDBFilePath()
{
    return FileUtil::GetVersionDBFilePath();
}
}  // namespace

VersionDBController::VersionDBController() = default;

VersionDBController::~VersionDBController() = default;

int VersionDBController::Initialize()
{
    DBConnector* dbConnector = DBConnector::GetInstance();
    COMMON_RETV_IF(dbConnector->DBInitialize(GetVersionDBFilePath(), false) == false, ERR_FAIL);
    DBCycleCloser cycle(dbConnector);
    CreateTable();
    if (GetCurrentVersion() < 0)
        Insert(0.0);
    return ERR_OK;
}

double VersionDBController::GetCurrentDBVersion()
{
    DBConnector* dbConnector = DBConnector::GetInstance();
    COMMON_RETV_IF(dbConnector->DBInitialize(GetVersionDBFilePath(), true) == false, 0.0);
    DBCycleCloser cycle(dbConnector);
    return GetCurrentVersion();
}

double VersionDBController::GetCurrentVersion()
{
    DBStatement statement(mQueryGenernator.MakeSelectQuery(VERSION_TABLE, "dbVersion"));
    int result = statement.Step();
    if (result != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", result);
        return NO_VERSION;
    }
    return statement.ColumnDouble(0);
}

double VersionDBController::GetLatestDBVersion() const
{
    return LATEST_DB_VERSION;
}

void VersionDBController::Insert(double version)
{
    DBStatement statement(mQueryGenernator.MakeInsertQuery(VERSION_TABLE, "dbVersion", "?"));
    statement.BindDouble(1, version);
    statement.Step();
}

void VersionDBController::Update(double version)
{
    DBStatement statement(mQueryGenernator.MakeUpdateQuery(VERSION_TABLE, "dbVersion = ?"));
    statement.BindDouble(1, version);
    statement.Step();
}

bool VersionDBController::UpgradeDB(double version)
{
    DBConnector* dbConnector = DBConnector::GetInstance();
    COMMON_RETV_IF(dbConnector->DBInitialize(GetVersionDBFilePath(), false) == false, false);
    DBCycleCloser cycle(dbConnector);
    Update(version);
    return true;
}

void VersionDBController::CreateTable()
{
    TableQuery::CreateTable(VERSION_CREATE_FORMAT, VERSION_TABLE);
}

}  // namespace NSWeather

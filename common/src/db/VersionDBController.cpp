#include "VersionDBController.h"

#include "CommonLog.h"
#include "DBCycleCloser.h"
#include "DBStatement.h"
#include "FileUtil.h"
#include "QueryGenernator.h"
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
    DBCycleCloser cycle(GetVersionDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    bool isDone = CreateTable() && (GetCurrentVersion() >= 0 || Insert(0.0));
    return cycle.Close(isDone) ? ERR_OK : ERR_FAIL;
}

double VersionDBController::GetCurrentDBVersion()
{
    DBCycleCloser cycle(GetVersionDBFilePath(), DBCycleCloser::Mode::READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, 0.0);
    return GetCurrentVersion();
}

double VersionDBController::GetCurrentVersion()
{
    DBStatement statement(QueryGenernator().MakeSelectQuery(VERSION_TABLE, "dbVersion"));
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

bool VersionDBController::Insert(double version)
{
    DBStatement statement(QueryGenernator().MakeInsertQuery(VERSION_TABLE, "dbVersion", "?"));
    statement.BindDouble(1, version);
    return statement.Execute();
}

bool VersionDBController::Update(double version)
{
    DBStatement statement(QueryGenernator().MakeUpdateQuery(VERSION_TABLE, "dbVersion = ?"));
    statement.BindDouble(1, version);
    return statement.Execute();
}

bool VersionDBController::UpgradeDB(double version)
{
    DBCycleCloser cycle(GetVersionDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, false);
    return cycle.Close(Update(version));
}

bool VersionDBController::CreateTable()
{
    return TableQuery::CreateTable(VERSION_CREATE_FORMAT, VERSION_TABLE);
}

}  // namespace NSWeather

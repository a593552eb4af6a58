#include "ShareTargetDBController.h"

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
constexpr const char* SHARE_TARGET_TABLE = "SHARE_TARGET_TABLE";
constexpr const char* SHARE_TARGET_CREATE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (PK_ID\tINTEGER NOT NULL PRIMARY KEY AUTOINCREMENT,AppID\tTEXT, "
    "PortID\tTEXT);";
constexpr const char* SHARE_TARGET_SELECT_COLUMNS = "AppID,PortID";
constexpr const char* SHARE_TARGET_INSERT_COLUMNS = "AppID, PortID";
constexpr const char* SHARE_TARGET_PLACEHOLDERS = "?, ?";

std::string GetShareTargetDataDBFilePath()
{
    return FileUtil::GetShareTargetDataDBFilePath();
}
}  // namespace

ShareTargetDBController::ShareTargetDBController() = default;

ShareTargetDBController::~ShareTargetDBController() = default;

int ShareTargetDBController::Initialize()
{
    DBCycleCloser cycle(GetShareTargetDataDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    bool isDone = IsShareTargetTableExist() || CreateTable();
    return cycle.Close(isDone) ? ERR_OK : ERR_FAIL;
}

bool ShareTargetDBController::IsShareTargetTableExist()
{
    return TableQuery::IsTableExist(SHARE_TARGET_TABLE);
}

bool ShareTargetDBController::CreateTable()
{
    return TableQuery::CreateTable(SHARE_TARGET_CREATE_FORMAT, SHARE_TARGET_TABLE);
}

int ShareTargetDBController::Insert(const ShareTargetPtr& shareTargetPtr)
{
    COMMON_RETV_IF(!shareTargetPtr, ERR_FAIL);
    DBCycleCloser cycle(GetShareTargetDataDBFilePath(), DBCycleCloser::Mode::WRITE);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, ERR_FAIL);
    // A scan that could not finish (busy, broken file) must not let a
    // second row with the same id in.
    int scanResult = SQLITE_DONE;
    bool isStored = IsAppIdStored(shareTargetPtr->GetAppID(), scanResult);
    if (isStored)
        COMMON_LOG("There is a same appId. so we didn't insert this app");
    else if (scanResult != SQLITE_DONE)
        COMMON_LOG("Fail to read SHARE_TARGET_TABLE : %d", scanResult);
    if (isStored || scanResult != SQLITE_DONE)
        return isStored ? ERR_OK : ERR_FAIL;
    bool isDone = false;
    {
        DBStatement statement(QueryGenernator().MakeInsertQuery(
            SHARE_TARGET_TABLE, SHARE_TARGET_INSERT_COLUMNS, SHARE_TARGET_PLACEHOLDERS));
        statement.BindText(1, shareTargetPtr->GetAppID());
        statement.BindText(2, shareTargetPtr->GetPortID());
        isDone = statement.Execute();
    }
    return cycle.Close(isDone) ? ERR_OK : ERR_FAIL;
}

ShareTargetPtrVectorPtr ShareTargetDBController::Select()
{
    DBCycleCloser cycle(GetShareTargetDataDBFilePath(), DBCycleCloser::Mode::READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, nullptr);
    return SelectRows();
}

void ShareTargetDBController::UpgradeDB(double /*currentVersion*/) {}

bool ShareTargetDBController::IsAppIdStored(const std::string& appId, int& stepResult)
{
    DBStatement statement(QueryGenernator().MakeSelectQuery(SHARE_TARGET_TABLE, SHARE_TARGET_SELECT_COLUMNS));
    while ((stepResult = statement.Step()) == SQLITE_ROW)
    {
        if (statement.ColumnText(0) == appId)
            return true;
    }
    return false;
}

ShareTargetPtrVectorPtr ShareTargetDBController::SelectRows()
{
    auto shareTargetPtrVector = std::make_shared<ShareTargetPtrVector>();
    DBStatement statement(QueryGenernator().MakeSelectQuery(SHARE_TARGET_TABLE, SHARE_TARGET_SELECT_COLUMNS));
    int result = statement.Step();
    if (result != SQLITE_ROW)
        COMMON_LOG("No result : %d", result);
    for (; result == SQLITE_ROW; result = statement.Step())
    {
        auto shareTargetPtr = std::make_shared<ShareTarget>();
        shareTargetPtr->SetAppID(statement.ColumnText(0));
        shareTargetPtr->SetPortID(statement.ColumnText(1));
        shareTargetPtrVector->push_back(shareTargetPtr);
    }
    return shareTargetPtrVector;
}

}  // namespace NSWeather

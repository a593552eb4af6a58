#include "MoonPhaseDBController.h"

#include "CommonLog.h"
#include "DBStatement.h"
#include "TableQuery.h"

namespace NSWeather
{

const char* const MoonPhaseDBController::TABLE_NAME = "MOON_PHASE_TABLE";
const char* const MoonPhaseDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,moonPhaseIndex\t\tINTEGER,locationID\t\t\tTEXT,"
    "date\t\t\t\tINT64,moonRiseTime\t\tINT64,moonSetTime\t\tINT64,phaseText\t\t\tTEXT,age\t\t\t\tINTEGER,"
    "FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE ON UPDATE CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,moonPhaseIndex,locationID,date,moonRiseTime,moonSetTime,phaseText,age";
const char* const INSERT_PLACEHOLDERS = "?, ?, ?, ?, ?, ?, ?, ?";
const char* const UPDATE_ASSIGNMENTS =
    "locationID = ?,date = ?,moonRiseTime = ?,moonSetTime = ?,phaseText = ?,age = ?";
const char* const SELECT_COLUMNS = "locationID,date,moonRiseTime,moonSetTime,phaseText,age";

int BindValues(DBStatement& stmt, int i, const MoonPhasePtr& moonPhasePtr)
{
    stmt.BindText(i++, moonPhasePtr->GetLocationID());
    stmt.BindInt64(i++, static_cast<int64_t>(moonPhasePtr->GetDate()));
    stmt.BindInt64(i++, static_cast<int64_t>(moonPhasePtr->GetMoonRiseTime()));
    stmt.BindInt64(i++, static_cast<int64_t>(moonPhasePtr->GetMoonSetTime()));
    stmt.BindText(i++, moonPhasePtr->GetPhaseText());
    stmt.BindInt(i++, moonPhasePtr->GetAge());
    return i;
}

MoonPhasePtr ReadMoonPhase(const DBStatement& stmt)
{
    MoonPhasePtr moonPhasePtr = std::make_shared<MoonPhase>();
    moonPhasePtr->SetLocationID(stmt.ColumnText(0));
    moonPhasePtr->SetDate(static_cast<time_t>(stmt.ColumnInt64(1)));
    moonPhasePtr->SetMoonRiseTime(static_cast<time_t>(stmt.ColumnInt64(2)));
    moonPhasePtr->SetMoonSetTime(static_cast<time_t>(stmt.ColumnInt64(3)));
    moonPhasePtr->SetPhaseText(stmt.ColumnText(4));
    moonPhasePtr->SetAge(stmt.ColumnInt(5));
    return moonPhasePtr;
}
}  // namespace

MoonPhaseDBController::MoonPhaseDBController() {}

MoonPhaseDBController::~MoonPhaseDBController() {}

bool MoonPhaseDBController::CreateTable()
{
    return TableQuery::CreateTable(CREATE_TABLE_FORMAT, TABLE_NAME);
}

bool MoonPhaseDBController::DeleteAll()
{
    return TableQuery::DeleteAll(TABLE_NAME);
}

bool MoonPhaseDBController::Delete(int foreignKey)
{
    return TableQuery::Delete(TABLE_NAME, foreignKey);
}

bool MoonPhaseDBController::Delete(const std::string& locationId)
{
    DBStatement stmt(std::string("DELETE FROM ") + TABLE_NAME + " WHERE locationID = ?;");
    stmt.BindText(1, locationId);
    if (stmt.Execute())
        return true;
    COMMON_LOG("Fail to Delete");
    return false;
}

bool MoonPhaseDBController::Insert(int foreignKey, MoonPhasePtrVectorPtr moonPhasePtrVector)
{
    COMMON_RETV_IF(!moonPhasePtrVector, true);
    return TableQuery::InsertList(
        mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS), foreignKey,
        *moonPhasePtrVector, BindValues);
}

bool MoonPhaseDBController::Update(int foreignKey, MoonPhasePtrVectorPtr moonPhasePtrVector)
{
    COMMON_RETV_IF(!moonPhasePtrVector, true);
    return TableQuery::UpdateList(mQueryGenernator.MakeUpdateQuery(
                                      TABLE_NAME, UPDATE_ASSIGNMENTS,
                                      mQueryGenernator.MakeWhereClause("FK_ID = ? AND moonPhaseIndex = ?;")),
                                  foreignKey, *moonPhasePtrVector, BindValues);
}

MoonPhasePtrVectorPtr MoonPhaseDBController::Select(int foreignKey)
{
    return TableQuery::SelectList(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ?")),
        foreignKey, ReadMoonPhase);
}

std::vector<std::string> MoonPhaseDBController::SelectAllLocationId()
{
    std::vector<std::string> retStringVector;
    DBStatement stmt(mQueryGenernator.MakeSelectQuery(
        TABLE_NAME, "locationID", mQueryGenernator.MakeWhereClause("moonPhaseIndex = 0")));
    while (stmt.Step() == SQLITE_ROW) retStringVector.push_back(stmt.ColumnText(0));
    if (retStringVector.size() < 1)
        COMMON_LOG("retStringVector.size() < 1");
    return retStringVector;
}

std::map<int, MoonPhasePtrVectorPtr> MoonPhaseDBController::SelectAll()
{
    return TableQuery::SelectAllLists(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"), 6,
        ReadMoonPhase);
}

}  // namespace NSWeather

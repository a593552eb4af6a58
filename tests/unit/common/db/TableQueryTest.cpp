#include "TableQuery.h"

#include <gtest/gtest.h>

#include "DBConnector.h"
#include "DBTestSupport.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{
struct Entry
{
    int value = 0;
};
using EntryPtr = std::shared_ptr<Entry>;
using EntryList = std::vector<EntryPtr>;

const char* const kTable = "ENTRY_TABLE";
const char* const kCreate =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID INTEGER, entryIndex INTEGER, value INTEGER);";

int BindEntry(DBStatement& stmt, int i, const EntryPtr& entry)
{
    stmt.BindInt(i++, entry->value);
    return i;
}

EntryPtr ReadEntry(const DBStatement& stmt)
{
    EntryPtr entry = std::make_shared<Entry>();
    entry->value = stmt.ColumnInt(0);
    return entry;
}

EntryPtr MakeEntry(int value)
{
    EntryPtr entry = std::make_shared<Entry>();
    entry->value = value;
    return entry;
}

// Reads, deletes and table checks are covered through the controllers; what
// is left here is what the controllers cannot show.
class TableQueryTest : public WeatherTest::DBTest
{
protected:
    void SetUp() override
    {
        WeatherTest::DBTest::SetUp();
        mPath = DBDir() + "/entries.db";
        ASSERT_TRUE(DBConnector::GetInstance()->DBInitialize(mPath, false));
        TableQuery::CreateTable(kCreate, kTable);
    }
    void TearDown() override { DBConnector::GetInstance()->DBFinalize(); }
    std::vector<std::string> Rows()
    {
        // Committed first so that a second connection sees the rows.
        DBConnector::GetInstance()->DBFinalize();
        std::vector<std::string> rows = RawDB(mPath).QueryTexts(
            "SELECT FK_ID || ':' || entryIndex || '=' || value FROM ENTRY_TABLE ORDER BY FK_ID, entryIndex;");
        DBConnector::GetInstance()->DBInitialize(mPath, false);
        return rows;
    }
    void InsertList(int foreignKey, const EntryList& list)
    {
        TableQuery::InsertList("INSERT INTO ENTRY_TABLE (FK_ID,entryIndex,value) VALUES (?, ?, ?)",
                               foreignKey, list, BindEntry);
    }

    std::string mPath;
};
}  // namespace

TEST_F(TableQueryTest, ListEntriesKeepTheirPositionAndNullEntriesLeaveAGap)
{
    InsertList(7, {MakeEntry(10), nullptr, MakeEntry(30)});
    InsertList(8, {MakeEntry(40)});
    EXPECT_EQ(Rows(), (std::vector<std::string>{"7:0=10", "7:2=30", "8:0=40"}));

    // Only rows that exist change; the longer list writes nothing extra.
    TableQuery::UpdateList("UPDATE ENTRY_TABLE SET value = ? WHERE FK_ID = ? AND entryIndex = ?;", 7,
                           EntryList{MakeEntry(11), MakeEntry(21), nullptr, MakeEntry(41)}, BindEntry);
    EXPECT_EQ(Rows(), (std::vector<std::string>{"7:0=11", "7:2=30", "8:0=40"}));
}

TEST_F(TableQueryTest, RecordsAreKeyedByTheirCityAndTheFirstRowWins)
{
    const char* insert = "INSERT INTO ENTRY_TABLE (FK_ID,value) VALUES (?, ?)";
    TableQuery::InsertRecord(insert, 7, MakeEntry(1), BindEntry);
    TableQuery::InsertRecord(insert, 7, MakeEntry(2), BindEntry);
    TableQuery::InsertRecord(insert, 8, MakeEntry(3), BindEntry);
    TableQuery::UpdateRecord("UPDATE ENTRY_TABLE SET value = ? WHERE FK_ID = ?", 8, MakeEntry(4), BindEntry);

    const char* select = "SELECT value FROM ENTRY_TABLE WHERE FK_ID = ?";
    EXPECT_EQ(TableQuery::Select(select, 7, ReadEntry)->value, 1);
    EXPECT_EQ(TableQuery::Select(select, 8, ReadEntry)->value, 4);
    EXPECT_EQ(TableQuery::Select(select, 9, ReadEntry), nullptr);
    EXPECT_TRUE(mLog.Contains("No result : 101")) << mLog.Dump();

    auto records = TableQuery::SelectAllRecords("SELECT value,FK_ID FROM ENTRY_TABLE", 1, ReadEntry);
    ASSERT_EQ(records.size(), 2u);
    EXPECT_EQ(records[7]->value, 1);
    EXPECT_EQ(records[8]->value, 4);
}

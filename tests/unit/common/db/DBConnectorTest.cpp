#include "DBConnector.h"

#include <gtest/gtest.h>

#include <fstream>
#include <unistd.h>

#include "DBController.h"
#include "DBStatement.h"
#include "DBTestSupport.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{
class DBConnectorTest : public WeatherTest::DBTest
{
protected:
    DBConnector* mConnector = DBConnector::GetInstance();

    void TearDown() override
    {
        if (mConnector->GetIsOpened())
        {
            ADD_FAILURE() << "a cycle was left open";
            mConnector->DBFinalize();
        }
    }
    bool FileExists(const std::string& path) { return access(path.c_str(), F_OK) == 0; }
};
}  // namespace

TEST_F(DBConnectorTest, SecondInitializeKeepsTheFirstFile)
{
    std::string first = DBDir() + "/first.db";
    std::string second = DBDir() + "/second.db";
    ASSERT_TRUE(mConnector->DBInitialize(first, false));
    EXPECT_TRUE(mConnector->DBInitialize(second, false));
    EXPECT_TRUE(mLog.Contains("DBInitialize is already called, mDBHandle is not NULL"));
    EXPECT_TRUE(mConnector->DBExecuteQuery("CREATE TABLE T (a INTEGER);"));
    mConnector->DBFinalize();
    EXPECT_FALSE(mConnector->GetIsOpened());
    EXPECT_FALSE(FileExists(second));
    EXPECT_EQ(RawDB(first).QueryInt("SELECT COUNT(*) FROM sqlite_master WHERE name = 'T';"), 1);
}

TEST_F(DBConnectorTest, EmptyAndMissingPaths)
{
    EXPECT_FALSE(mConnector->DBInitialize("", false));
    EXPECT_TRUE(mLog.Contains("(dbFilePath.empty()) [return]"));
    EXPECT_FALSE(mConnector->GetIsOpened());

    std::string missing = DBDir() + "/missing.db";
    EXPECT_FALSE(mConnector->DBInitialize(missing, true));
    EXPECT_TRUE(mLog.Contains("sqlite3_open_open failed."));
    EXPECT_TRUE(
        mLog.Contains("(DBFileOpen(dbFilePath, SQLITE_OPEN_SHAREDCACHE | SQLITE_OPEN_READONLY) == false)"));
    EXPECT_FALSE(mConnector->GetIsOpened());
    EXPECT_FALSE(FileExists(missing));

    ASSERT_TRUE(mConnector->DBInitialize(missing, false));
    mConnector->DBFinalize();
    EXPECT_TRUE(FileExists(missing));
}

TEST_F(DBConnectorTest, CycleCommitsEverythingAtTheEnd)
{
    ASSERT_TRUE(mConnector->DBInitialize(WeatherDBPath(), false));
    EXPECT_TRUE(mConnector->DBExecuteQuery("INSERT INTO CITY_TABLE (locationId) VALUES ('a');"));
    {
        RawDB other(WeatherDBPath());
        // Another connection does not see the uncommitted row yet.
        EXPECT_EQ(other.QueryInt("SELECT COUNT(*) FROM CITY_TABLE;"), 0);
    }
    mConnector->DBFinalize();
    EXPECT_EQ(RawDB(WeatherDBPath()).QueryInt("SELECT COUNT(*) FROM CITY_TABLE;"), 1);
}

TEST_F(DBConnectorTest, FailedStatementsAreLoggedAndHarmless)
{
    ASSERT_TRUE(mConnector->DBInitialize(WeatherDBPath(), false));
    EXPECT_EQ(mConnector->DBPrepareQuery("SELECT * FROM NO_TABLE"), nullptr);
    EXPECT_TRUE(mLog.Contains("Fail: sqlite3_prepare_v2 Failed rc [1][no such table: NO_TABLE]"));
    EXPECT_TRUE(mLog.Contains("Query: SELECT * FROM NO_TABLE"));
    EXPECT_FALSE(mConnector->DBExecuteQuery("DELETE FROM NO_TABLE;"));
    EXPECT_TRUE(mLog.Contains("Fail: sqlite3_exec Failed rc [1][no such table: NO_TABLE]"));
    DBStatement stmt("SELECT * FROM NO_TABLE");
    EXPECT_FALSE(stmt.GetIsValid());
    EXPECT_FALSE(stmt.BindInt(1, 1));
    EXPECT_EQ(stmt.Step(), SQLITE_MISUSE);
    EXPECT_EQ(stmt.ColumnText(0), "");
    mConnector->DBFinalize();
}

// A file that is not a database fails at the pragmas; the connection must
// not stay open, or the next cycle would silently reuse it.
TEST_F(DBConnectorTest, FailedPragmasLeaveTheConnectorClosed)
{
    std::string garbage = DBDir() + "/garbage.db";
    std::ofstream(garbage) << std::string(4096, '\x5a');
    EXPECT_FALSE(mConnector->DBInitialize(garbage, true));
    EXPECT_TRUE(mLog.Contains("Fail to sqlite3_exec for performance optimization."));
    EXPECT_TRUE(mLog.Contains("pszErrorMsg : file is not a database"));
    EXPECT_TRUE(mLog.Contains("(DBExcutePerformanceOptimization() == false) [return]"));
    EXPECT_FALSE(mConnector->GetIsOpened());

    ASSERT_TRUE(mConnector->DBInitialize(WeatherDBPath(), true));
    EXPECT_FALSE(mLog.Contains("DBInitialize is already called"));
    DBStatement stmt("SELECT COUNT(*) FROM CITY_TABLE");
    EXPECT_EQ(stmt.Step(), SQLITE_ROW);
    mConnector->DBFinalize();
}

TEST_F(DBConnectorTest, FailedCommitClosesTheConnector)
{
    ASSERT_TRUE(mConnector->DBInitialize(WeatherDBPath(), false));
    EXPECT_TRUE(mConnector->DBExecuteQuery("COMMIT;"));
    EXPECT_FALSE(mConnector->DBFinalize());
    EXPECT_TRUE(mLog.Contains("(DBEndTransaction() == false) [return]"));
    EXPECT_FALSE(mConnector->GetIsOpened());

    EXPECT_FALSE(mConnector->DBFinalize());
    EXPECT_TRUE(mLog.Contains("mDBHandle is NULL"));
}

TEST_F(DBConnectorTest, NullTextReadsAsEmpty)
{
    RawDB(WeatherDBPath())
        .Exec("INSERT INTO CITY_TABLE (pageIndex, locationId, cityName) VALUES (0, 'id', NULL);");
    CityPtrVectorPtr cities = DBController().SelectAllCityData();
    ASSERT_TRUE(cities);
    ASSERT_EQ(cities->size(), 1u);
    EXPECT_EQ(cities->at(0)->GetCityName(), "");
    EXPECT_EQ(cities->at(0)->GetWebsiteUrl(), "");
    EXPECT_EQ(cities->at(0)->GetLocationId(), "id");
}

// The busy handler's back-off against a lock held by another process.
TEST_F(DBConnectorTest, WaitsForALockReleasedWithinTheBudget)
{
    RawDB(WeatherDBPath()).Exec("INSERT INTO CITY_TABLE (pageIndex, locationId) VALUES (0, 'a');");
    WeatherTest::LockHolder holder({WeatherDBPath()}, "BEGIN EXCLUSIVE;", 700);
    ASSERT_TRUE(holder.GetIsLocked());
    EXPECT_EQ(DBController().GetNumberOfCities(), 1) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("Busy Handler Called! : CNT(1)"));
    EXPECT_TRUE(mLog.Contains("Busy Handler Called! : CNT(2)"));
    EXPECT_FALSE(mLog.Contains("Busy Handler Called! : CNT(10)"));
    EXPECT_FALSE(mLog.Contains("Busy Handler will be returned SQLITE_BUSY error"));
}

TEST_F(DBConnectorTest, GivesUpAfterTheTenthWait)
{
    WeatherTest::LockHolder holder({WeatherDBPath()}, "BEGIN EXCLUSIVE;", 20000);
    ASSERT_TRUE(holder.GetIsLocked());
    EXPECT_EQ(DBController().GetNumberOfCities(), -1);
    holder.Release();
    for (int count = 1; count <= 10; ++count)
        EXPECT_EQ(mLog.Count("Busy Handler Called! : CNT(" + std::to_string(count) + ")\n"), 1) << count;
    EXPECT_FALSE(mLog.Contains("CNT(11)"));
    EXPECT_EQ(mLog.Count("Busy Handler will be returned SQLITE_BUSY error"), 1);
    EXPECT_FALSE(mConnector->GetIsOpened());
}

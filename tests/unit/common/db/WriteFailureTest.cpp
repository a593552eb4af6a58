#include <csignal>
#include <fstream>
#include <functional>

#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include "DBConnector.h"
#include "DBController.h"
#include "DBTestSupport.h"
#include "SettingDBController.h"
#include "TestFiles.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace
{

struct WriterCase
{
    const char* name;
    std::function<int()> write;
};

CityPtr CityAt(const std::string& locationId, int seed, int pageIndex)
{
    CityPtr cityPtr = WeatherTest::MakeCity(locationId, seed);
    cityPtr->SetPageIndex(pageIndex);
    return cityPtr;
}

// Every writer of the store, each of which succeeds on the two stored
// cities "a" (page 0) and "b" (page 1) and the settings row, in this order.
const std::vector<WriterCase>& Writers()
{
    static const std::vector<WriterCase> writers = {
        {"InsertCityData", [] { return DBController().InsertCityData(CityAt("c", 3, 0)); }},
        {"UpdateCityData", [] { return DBController().UpdateCityData(CityAt("a", 9, -1)); }},
        {"UpdateOnlyMoonPhaseData",
         [] { return DBController().UpdateOnlyMoonPhaseData(CityAt("a", 8, -1)); }},
        {"UpdateOnlyMobileLink", [] { return DBController().UpdateOnlyMobileLink(CityAt("b", 7, -1)); }},
        {"UpdateOnlyWidgetReferenceCount",
         [] { return DBController().UpdateOnlyWidgetReferenceCount("a", true); }},
        {"ReorderCityData",
         []
         {
             auto order =
                 std::make_shared<CityPtrVector>(CityPtrVector{CityAt("b", 2, 1), CityAt("a", 1, 0)});
             return DBController().ReorderCityData(order);
         }},
        {"DeleteCityData", [] { return DBController().DeleteCityData("b"); }},
        {"DeleteAllCityDataAndInsertCityPtrVector",
         []
         {
             auto cities =
                 std::make_shared<CityPtrVector>(CityPtrVector{CityAt("a", 1, 0), CityAt("b", 2, 1)});
             return DBController().DeleteAllCityDataAndInsertCityPtrVector(cities);
         }},
        {"SettingDBController::Update",
         []
         {
             auto settingPtr = std::make_shared<Setting>();
             settingPtr->SetCpType("Kweather");
             return SettingDBController().Update(settingPtr);
         }},
        {"UpdateLocationIdOfDisplayCity",
         [] { return SettingDBController().UpdateLocationIdOfDisplayCity("b"); }},
        {"SelectAndUpdate",
         []
         {
             auto change = [](const SettingPtr& s) { s->SetAutoScrollOn(true); };
             return SettingDBController().SelectAndUpdate(change) ? ERR_OK : ERR_FAIL;
         }},
    };
    return writers;
}

// The names of the writers that reported success.
std::vector<std::string> RunWriters()
{
    std::vector<std::string> succeeded;
    for (const WriterCase& writer : Writers())
    {
        if (writer.write() == ERR_OK)
            succeeded.push_back(writer.name);
    }
    return succeeded;
}

class WriteFailureTest : public WeatherTest::DBTest
{
protected:
    void SetUp() override
    {
        DBTest::SetUp();
        ASSERT_EQ(ERR_OK, SettingDBController().Initialize());
        ASSERT_EQ(ERR_OK, DBController().InsertCityData(CityAt("a", 1, 0)));
        ASSERT_EQ(ERR_OK, DBController().InsertCityData(CityAt("b", 2, 1)));
    }

    // Both files byte for byte: a rolled-back cycle leaves no trace.
    std::string Snapshot() const
    {
        return WeatherTest::ReadText(WeatherDBPath()) + "|" + WeatherTest::ReadText(SettingDBPath());
    }

    // Once the cause is gone, every writer succeeds again: the failures
    // above came from the cause, not from the cases.
    void ExpectWritersWorkAgain() { EXPECT_EQ(Writers().size(), RunWriters().size()) << mLog.Dump(); }
};

using Names = std::vector<std::string>;

// Another process holds both files locked for longer than the busy
// back-off (shortened here to one wait): an exclusive lock stops even the
// opening reads, a reserved one lets them run and stops the first write.
TEST_F(WriteFailureTest, LockHeldByAnotherProcess)
{
    std::string before = Snapshot();
    for (const char* lock : {"BEGIN EXCLUSIVE;", "BEGIN IMMEDIATE;"})
    {
        WeatherTest::LockHolder holder({WeatherDBPath(), SettingDBPath()}, lock, 60000);
        ASSERT_TRUE(holder.GetIsLocked()) << lock;
        DBConnector::SetBusyRetryLimit(1);
        Names succeeded = RunWriters();
        DBConnector::SetBusyRetryLimit(-1);
        holder.Release();
        EXPECT_EQ(Names(), succeeded) << lock;
        EXPECT_EQ(before, Snapshot()) << lock;
    }
    // A write cycle takes the lock at its start, so the wait ends there.
    EXPECT_TRUE(mLog.Contains("BEGIN IMMEDIATE TRANSACTION; rc [5][database is locked]")) << mLog.Dump();
    ExpectWritersWorkAgain();
}

// A file format write version above 2 makes SQLite treat the file as
// read-only; file permissions would not bind a test run as root.
TEST_F(WriteFailureTest, ReadOnlyFiles)
{
    auto setWriteVersion = [](const std::string& path, char version)
    {
        std::fstream file(path, std::ios::in | std::ios::out | std::ios::binary);
        file.seekp(18);
        file.put(version);
    };
    setWriteVersion(WeatherDBPath(), 3);
    setWriteVersion(SettingDBPath(), 3);
    std::string before = Snapshot();

    EXPECT_EQ(Names(), RunWriters());
    EXPECT_TRUE(mLog.Contains("[8][attempt to write a readonly database]")) << mLog.Dump();
    EXPECT_EQ(before, Snapshot());

    setWriteVersion(WeatherDBPath(), 1);
    setWriteVersion(SettingDBPath(), 1);
    ExpectWritersWorkAgain();
}

// A process that may not write one byte more (RLIMIT_FSIZE) stands for a
// full file system; each writer gets the limit in a child of its own.
TEST_F(WriteFailureTest, NoRoomToWrite)
{
    std::string before = Snapshot();
    for (const WriterCase& writer : Writers())
    {
        pid_t pid = fork();
        ASSERT_GE(pid, 0);
        if (pid == 0)
        {
            signal(SIGXFSZ, SIG_IGN);
            struct rlimit limit = {0, 0};
            if (setrlimit(RLIMIT_FSIZE, &limit) != 0)
                _exit(2);
            _exit(writer.write() == ERR_FAIL ? 0 : 1);
        }
        int status = -1;
        ASSERT_EQ(pid, waitpid(pid, &status, 0));
        EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << writer.name << " " << status;
        EXPECT_EQ(before, Snapshot()) << writer.name;
    }
    ExpectWritersWorkAgain();
}

// The city row is written before its forecasts; a forecast that cannot be
// written takes the city row back with it.
TEST_F(WriteFailureTest, LaterFailedStepUndoesTheEarlierOnes)
{
    WeatherTest::RawDB(WeatherDBPath())
        .Exec(
            "CREATE TRIGGER refuse BEFORE INSERT ON HOURLY_WEATHER_TABLE BEGIN SELECT RAISE(ABORT, 'no'); "
            "END;");
    std::string before = Snapshot();
    EXPECT_EQ(ERR_FAIL, DBController().InsertCityData(CityAt("c", 3, 0)));
    EXPECT_EQ(ERR_FAIL, DBController().UpdateCityData(CityAt("a", 9, -1)));
    EXPECT_EQ(before, Snapshot());
    EXPECT_TRUE(mLog.Contains("A step of this cycle failed: rolled back")) << mLog.Dump();
}

}  // namespace

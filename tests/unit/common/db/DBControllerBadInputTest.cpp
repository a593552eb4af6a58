#include "DBController.h"

#include <gtest/gtest.h>

#include <climits>
#include <fstream>
#include <functional>
#include <sys/stat.h>
#include <unistd.h>

#include "DBConnector.h"
#include "DBTestSupport.h"
#include "FileUtil.h"
#include "SettingDBController.h"
#include "TestFiles.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::MakeCity;
using WeatherTest::RawDB;

namespace
{
const char* const kReadFailure = " for reading";
const char* const kWriteFailure = " for writing";

struct Operation
{
    const char* name;
    bool isReader;
    // True when the operation returned its empty value.
    std::function<bool(DBController&)> run;
};

std::vector<Operation> AllOperations()
{
    CityPtrVectorPtr two = std::make_shared<CityPtrVector>(CityPtrVector{MakeCity("X", 0), MakeCity("Y", 1)});
    return {
        {"Initialize", false, [](DBController& db) { return db.Initialize() == ERR_FAIL; }},
        {"SelectAllCityData", true, [](DBController& db) { return !db.SelectAllCityData(); }},
        {"SelectCityData(page)", true, [](DBController& db) { return !db.SelectCityData(0); }},
        {"SelectCityData(id)", true, [](DBController& db) { return !db.SelectCityData(std::string("A")); }},
        {"SelectAllLocationIDData", true, [](DBController& db) { return !db.SelectAllLocationIDData(); }},
        {"SelectNeedToUpdateLocationIDData", true,
         [](DBController& db) { return !db.SelectNeedToUpdateLocationIDData(); }},
        {"GetNumberOfCities", true, [](DBController& db) { return db.GetNumberOfCities() == -1; }},
        {"GetPageIndexOfCurrentCity", true,
         [](DBController& db) { return db.GetPageIndexOfCurrentCity() == -1; }},
        {"GetPageIndexWithLocationID", true,
         [](DBController& db) { return db.GetPageIndexWithLocationID("A") == -1; }},
        {"GetLocationIdOfCurrentCity", true,
         [](DBController& db) { return db.GetLocationIdOfCurrentCity().empty(); }},
        {"IsCurrentLocationExist", true, [](DBController& db) { return !db.IsCurrentLocationExist(); }},
        {"InsertCityData", false,
         [](DBController& db) { return db.InsertCityData(MakeCity("A", 0)) == ERR_FAIL; }},
        {"UpdateCityData", false,
         [](DBController& db) { return db.UpdateCityData(MakeCity("A", 0)) == ERR_FAIL; }},
        {"UpdateOnlyWidgetReferenceCount", false,
         [](DBController& db) { return db.UpdateOnlyWidgetReferenceCount("A", true) == ERR_FAIL; }},
        {"UpdateOnlyMobileLink", false,
         [](DBController& db) { return db.UpdateOnlyMobileLink(MakeCity("A", 0)) == ERR_FAIL; }},
        {"ReorderCityData", false, [two](DBController& db) { return db.ReorderCityData(two) == ERR_FAIL; }},
        {"DeleteCityData(page)", false, [](DBController& db) { return db.DeleteCityData(0) == ERR_FAIL; }},
        {"DeleteCityData(id)", false,
         [](DBController& db) { return db.DeleteCityData(std::string("A")) == ERR_FAIL; }},
        {"DeleteAllCityData", false, [](DBController& db) { return db.DeleteAllCityData() == ERR_FAIL; }},
        {"DeleteAllCityDataAndInsertCityPtrVector", false,
         [two](DBController& db) { return db.DeleteAllCityDataAndInsertCityPtrVector(two) == ERR_FAIL; }},
        {"UpdateOnlyMoonPhaseData", false,
         [](DBController& db) { return db.UpdateOnlyMoonPhaseData(MakeCity("A", 0)) == ERR_FAIL; }},
        {"DeleteUselessMoonPhaseData", false,
         [](DBController& db) { return db.DeleteUselessMoonPhaseData() == ERR_FAIL; }},
        {"GetIsWeatherInfoExpired", true, [](DBController& db) { return !db.GetIsWeatherInfoExpired(); }},
    };
}

class DBControllerBadInputTest : public WeatherTest::DBTest
{
protected:
    // Every operation fails cleanly with its own log line and leaves the
    // connector closed.
    void ExpectEveryOperationFails()
    {
        DBController db;
        for (const Operation& op : AllOperations())
        {
            mLog.Clear();
            EXPECT_TRUE(op.run(db)) << op.name;
            if (std::string(op.name) != "GetIsWeatherInfoExpired")
            {
                EXPECT_TRUE(mLog.Contains(op.isReader ? kReadFailure : kWriteFailure))
                    << op.name << mLog.Dump();
            }
            EXPECT_FALSE(DBConnector::GetInstance()->GetIsOpened()) << op.name;
        }
    }
    void ReplaceWeatherDB(const std::string& content)
    {
        unlink(WeatherDBPath().c_str());
        WeatherTest::WriteText(WeatherDBPath(), content);
    }
};
}  // namespace

TEST_F(DBControllerBadInputTest, RandomBytesAreNeitherReadNorOverwritten)
{
    std::string bytes = WeatherTest::RandomBytes(8192, 7);
    ReplaceWeatherDB(bytes);
    ExpectEveryOperationFails();
    EXPECT_EQ(WeatherTest::ReadText(WeatherDBPath()), bytes);
}

TEST_F(DBControllerBadInputTest, UnregisteredWeatherAppGivesAnEmptyPath)
{
    ASSERT_EQ(system(("rm -rf '" + mRoot.Path("apps/com.quorvex.weather-m") + "'").c_str()), 0);
    FileUtil::ClearCache();
    ExpectEveryOperationFails();
    EXPECT_TRUE(mLog.Contains("(dbFilePath.empty()) [return]"));
}

TEST_F(DBControllerBadInputTest, DatabaseFolderThatCannotBeWritten)
{
    unlink(WeatherDBPath().c_str());
    ASSERT_EQ(rmdir(DBDir().c_str()), 0);
    // A plain file where the folder should be: nothing can be created below it.
    std::ofstream(DBDir()) << "x";
    ExpectEveryOperationFails();
}

TEST_F(DBControllerBadInputTest, ReadOnlyFolderWithoutADatabase)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "permissions do not bind root";
    unlink(WeatherDBPath().c_str());
    ASSERT_EQ(chmod(DBDir().c_str(), 0555), 0);
    ExpectEveryOperationFails();
}

// A database of another program: the tables exist under our names but with
// other columns. Nothing crashes, nothing of theirs is changed by reads.
TEST_F(DBControllerBadInputTest, ForeignSchemaGivesEmptyResults)
{
    ReplaceWeatherDB("");
    {
        RawDB raw(WeatherDBPath());
        raw.Exec(
            "CREATE TABLE CITY_TABLE (name TEXT); INSERT INTO CITY_TABLE VALUES ('theirs'), ('also "
            "theirs');");
        raw.Exec("CREATE TABLE notes (body TEXT); INSERT INTO notes VALUES ('keep');");
    }
    DBController db;
    CityPtrVectorPtr cities = db.SelectAllCityData();
    ASSERT_TRUE(cities);
    EXPECT_TRUE(cities->empty());
    EXPECT_FALSE(db.SelectCityData(0));
    EXPECT_FALSE(db.SelectCityData(std::string("theirs")));
    EXPECT_EQ(db.GetPageIndexOfCurrentCity(), -1);
    EXPECT_EQ(db.GetLocationIdOfCurrentCity(), "");
    EXPECT_FALSE(db.IsCurrentLocationExist());
    EXPECT_EQ(*db.SelectAllLocationIDData(), (std::vector<std::string>{"", ""}));
    EXPECT_TRUE(db.SelectNeedToUpdateLocationIDData()->empty());
    db.InsertCityData(MakeCity("A", 0));
    db.UpdateCityData(MakeCity("A", 0));
    db.DeleteUselessMoonPhaseData();
    EXPECT_TRUE(mLog.Contains("Fail: sqlite3_prepare_v2 Failed"));
    EXPECT_FALSE(DBConnector::GetInstance()->GetIsOpened());
    RawDB raw(WeatherDBPath());
    EXPECT_EQ(raw.QueryTexts("SELECT name FROM CITY_TABLE;"),
              (std::vector<std::string>{"theirs", "also theirs"}));
    EXPECT_EQ(raw.QueryTexts("SELECT body FROM notes;"), (std::vector<std::string>{"keep"}));
}

TEST_F(DBControllerBadInputTest, UnreadableCitiesAreNotExpired)
{
    ASSERT_EQ(SettingDBController().Initialize(), ERR_OK);
    ReplaceWeatherDB(std::string(2048, '\x01'));
    EXPECT_FALSE(DBController().GetIsWeatherInfoExpired());
    EXPECT_TRUE(mLog.Contains("(cityPtrVector == NULL) [return]")) << mLog.Dump();
}

// Values at the limits of their columns, as a damaged file or another writer
// can leave them; each once overflowed a computation on it.
TEST_F(DBControllerBadInputTest, ValuesAtTheLimitsOfTheirColumnsAreTakenSafely)
{
    InitializeSettings();
    struct Case
    {
        const char* sql;
        std::function<void(DBController&)> check;
    };
    const Case cases[] = {
        {"UPDATE CITY_TABLE SET pageIndex = 2147483647 WHERE locationId = 'B'",
         [](DBController& db)
         {
             CityPtrVectorPtr cities = db.SelectAllCityData();
             ASSERT_TRUE(cities);
             ASSERT_EQ(cities->size(), 2u);
             EXPECT_EQ(cities->back()->GetPageIndex(), INT_MAX);
         }},
        {"UPDATE CITY_TABLE SET refreshedTime = -9223372036854775808",
         [](DBController& db) { EXPECT_TRUE(db.GetIsWeatherInfoExpired()); }},
        {"UPDATE CITY_TABLE SET widgetReferenceCount = 2147483647",
         [](DBController& db)
         {
             EXPECT_EQ(db.UpdateOnlyWidgetReferenceCount("A", true), ERR_OK);
             EXPECT_EQ(db.SelectCityData(std::string("A"))->GetWidgetReferenceCount(), INT_MAX);
         }},
    };
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.sql);
        DBController db;
        CityPtrVectorPtr two =
            std::make_shared<CityPtrVector>(CityPtrVector{MakeCity("A", 0), MakeCity("B", 1)});
        ASSERT_EQ(db.DeleteAllCityDataAndInsertCityPtrVector(two), ERR_OK);
        RawDB(WeatherDBPath()).Exec(c.sql);
        c.check(db);
    }
}

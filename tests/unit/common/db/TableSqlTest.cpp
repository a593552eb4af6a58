#include <gtest/gtest.h>

#include "CityDBController.h"
#include "CurrentWeatherDBController.h"
#include "DBConnector.h"
#include "DBTestSupport.h"
#include "ExtraWeatherDBController.h"
#include "HourlyWeatherDBController.h"
#include "MoonPhaseDBController.h"
#include "WeeklyWeatherDBController.h"

using namespace NSWeather;
using WeatherTest::MakeCity;
using WeatherTest::RawDB;

namespace
{
const char* const kTables[] = {"CITY_TABLE",           "CURRENT_WEATHER_TABLE", "HOURLY_WEATHER_TABLE",
                               "WEEKLY_WEATHER_TABLE", "EXTRA_WEATHER_TABLE",   "MOON_PHASE_TABLE"};

class TableSqlTest : public WeatherTest::DBTest
{
protected:
    // Tables with none of the expected columns make every statement fail
    // to prepare, and the connector then logs the statement text.
    void OpenForeignSchema()
    {
        std::string path = DBDir() + "/foreign.db";
        {
            RawDB raw(path);
            for (const char* table : kTables)
                raw.Exec(std::string("CREATE TABLE ") + table + " (dummy INTEGER);");
        }
        ASSERT_TRUE(DBConnector::GetInstance()->DBInitialize(path, false));
    }
    void TearDown() override { DBConnector::GetInstance()->DBFinalize(); }
    void ExpectQuery(const std::string& sql)
    {
        EXPECT_EQ(mLog.Count("Query: " + sql), 1) << sql << "\n" << mLog.Dump();
    }
};
}  // namespace

TEST_F(TableSqlTest, CreateStatementsAreExact)
{
    RawDB raw(WeatherDBPath());
    auto sql = [&](const char* table) { return raw.TableSql(table); };
    EXPECT_EQ(
        sql("CITY_TABLE"),
        "CREATE TABLE CITY_TABLE (PK_ID\t\t\t\tINTEGER NOT NULL PRIMARY KEY "
        "AUTOINCREMENT,pageIndex\t\t\tINTEGER,"
        "locationId\t\t\tTEXT,cityName\t\t\tTEXT,cityNameEng\t\tTEXT,countryName\t\tTEXT,"
        "countryNameEng\t\tTEXT,"
        "isCurrentLocation\tINTEGER,isSummerTime\t\tINTEGER,isDayTime\t\t\tINTEGER,gmtOffset\t\t\tDOUBLE,"
        "refreshedTime\t\tINT64,localTime\t\t\tINT64,widgetReferenceCount\t\tINTEGER,needToUpdate\t\tINTEGER,"
        "websiteUrl \t\tTEXT)");
    const std::string fk =
        ",FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE ON UPDATE CASCADE)";
    EXPECT_EQ(sql("CURRENT_WEATHER_TABLE"),
              "CREATE TABLE CURRENT_WEATHER_TABLE "
              "(FK_ID\t\t\t\tINTEGER,weatherIcon\t\tINTEGER,weatherStatus\t\tTEXT,"
              "curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,highTemperature\tDOUBLE,date\t\t\t\tINT64,"
              "websiteUrl \t\tTEXT" +
                  fk);
    EXPECT_EQ(
        sql("HOURLY_WEATHER_TABLE"),
        "CREATE TABLE HOURLY_WEATHER_TABLE (FK_ID\t\t\t\tINTEGER,hourlyIndex\t\tINTEGER,hour\t\t\t\tINT64,"
        "weatherIcon\t\tINTEGER,weatherStatus\t\tTEXT,curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,"
        "highTemperature\tDOUBLE,websiteUrl\t\t\tTEXT" +
            fk);
    EXPECT_EQ(
        sql("WEEKLY_WEATHER_TABLE"),
        "CREATE TABLE WEEKLY_WEATHER_TABLE "
        "(FK_ID\t\t\t\tINTEGER,weeklyIndex\t\tINTEGER,weatherIcon\t\tINTEGER,"
        "weatherStatus\t\tTEXT,curTemperature\t\tDOUBLE,lowTemperature\t\tDOUBLE,highTemperature\tDOUBLE,"
        "date\t\t\t\tINT64,websiteUrl \t\tTEXT" +
            fk);
    EXPECT_EQ(
        sql("EXTRA_WEATHER_TABLE"),
        "CREATE TABLE EXTRA_WEATHER_TABLE (FK_ID\t\t\t\tINTEGER,humidity\t\t\tINTEGER,sunsetTime\t\t\tINT64,"
        "sunriseTime\t\tINT64,pm25\t\t\t\tINTEGER,pm10\t\t\t\tINTEGER,aqi\t\t\t\tINTEGER,"
        "uvIndex\t\t\tINTEGER,"
        "outdoorExcercise\tINTEGER,comfort\t\t\tINTEGER,clothing\t\t\tINTEGER,skincare\t\t\tINTEGER,"
        "carwash\t\t\tINTEGER,foodPoison\t\t\tINTEGER,heat\t\t\t\tINTEGER,spoiledFood\t\tINTEGER,"
        "discomfort\t\t\tINTEGER,frozenPipes\t\tINTEGER,frostbite\t\t\tINTEGER,cold\t\t\t\tINTEGER,"
        "pollen\t\t\t\tINTEGER,airDust\t\t\tINTEGER,drySkin\t\t\tINTEGER,realfeel\t\t\tDOUBLE,"
        "precType\t\t\tINTEGER,precProbability\tDOUBLE,precAmount\t\t\tDOUBLE,precProbabilityNight\tDOUBLE,"
        "precAmountNight\t\t\tDOUBLE" +
            fk);
    EXPECT_EQ(
        sql("MOON_PHASE_TABLE"),
        "CREATE TABLE MOON_PHASE_TABLE (FK_ID\t\t\t\tINTEGER,moonPhaseIndex\t\tINTEGER,locationID\t\t\tTEXT,"
        "date\t\t\t\tINT64,moonRiseTime\t\tINT64,moonSetTime\t\tINT64,phaseText\t\t\tTEXT,"
        "age\t\t\t\tINTEGER" +
            fk);
    // The longest statement must fit the 1024-byte buffer it is formatted into.
    char longest[1024];
    EXPECT_EQ(snprintf(longest, sizeof(longest), ExtraWeatherDBController::CREATE_TABLE_FORMAT,
                       ExtraWeatherDBController::TABLE_NAME),
              694);
}

TEST_F(TableSqlTest, CityStatements)
{
    OpenForeignSchema();
    CityDBController city;
    city.Insert(MakeCity("A", 0));
    city.Update(MakeCity("A", 0), 1);
    city.Select(1);
    const std::string columns =
        "pageIndex,locationId,cityName,cityNameEng,countryName,countryNameEng,isCurrentLocation,isDayTime,"
        "isSummerTime,gmtOffset,refreshedTime,localTime,widgetReferenceCount,needToUpdate,websiteUrl";
    ExpectQuery("INSERT INTO CITY_TABLE (" + columns +
                ") VALUES ( ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?)");
    ExpectQuery(
        "UPDATE CITY_TABLE SET pageIndex = ?,locationId = ?,cityName = ?,cityNameEng = ?,countryName = ?,"
        "countryNameEng = ?,isCurrentLocation = ?,isDayTime = ?,isSummerTime = ?,gmtOffset = ?,"
        "refreshedTime = ?,localTime = ?,needToUpdate = ?,websiteUrl = ? WHERE PK_ID = ?;");
    ExpectQuery("SELECT " + columns + " FROM CITY_TABLE WHERE PK_ID = ?");
    city.GetPageIndexWithLocationID("A");
    ExpectQuery("SELECT pageIndex FROM CITY_TABLE WHERE locationID = ?");
}

TEST_F(TableSqlTest, CurrentAndExtraStatements)
{
    OpenForeignSchema();
    CityPtr source = MakeCity("A", 0);
    CurrentWeatherDBController current;
    current.Insert(1, source->GetCurrentPtr());
    current.Update(1, source->GetCurrentPtr());
    EXPECT_FALSE(current.Select(1));
    ExpectQuery(
        "INSERT INTO CURRENT_WEATHER_TABLE (FK_ID,weatherIcon,weatherStatus,curTemperature,lowTemperature,"
        "highTemperature,date,websiteUrl) VALUES ( ?, ?, ?, ?, ?, ?, ?, ?)");
    ExpectQuery(
        "UPDATE CURRENT_WEATHER_TABLE SET weatherIcon = ?,weatherStatus = ?,curTemperature = ?,"
        "lowTemperature = ?,highTemperature = ?,date = ?,websiteUrl = ? WHERE FK_ID = ?;");
    ExpectQuery(
        "SELECT weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl FROM "
        "CURRENT_WEATHER_TABLE WHERE FK_ID = ?");

    ExtraWeatherDBController extra;
    extra.Insert(1, source->GetExtraPtr());
    extra.Update(1, source->GetExtraPtr());
    EXPECT_FALSE(extra.Select(1));
    const std::string columns =
        "humidity,sunsetTime,sunriseTime,pm25,pm10,aqi,uvIndex,outdoorExcercise,comfort,clothing,skincare,"
        "carwash,"
        "foodPoison,heat,spoiledFood,discomfort,frozenPipes,frostbite,cold,pollen,airDust,drySkin,realfeel,"
        "precType,"
        "precProbability,precAmount,precProbabilityNight,precAmountNight";
    ExpectQuery(
        "INSERT INTO EXTRA_WEATHER_TABLE (FK_ID," + columns +
        ") VALUES ( ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?)");
    std::string assignments;
    for (size_t start = 0; start < columns.size();)
    {
        size_t end = columns.find(',', start);
        if (end == std::string::npos)
            end = columns.size();
        assignments += (assignments.empty() ? "" : ",") + columns.substr(start, end - start) + " = ?";
        start = end + 1;
    }
    ExpectQuery("UPDATE EXTRA_WEATHER_TABLE SET " + assignments + " WHERE FK_ID = ?");
    ExpectQuery("SELECT " + columns + " FROM EXTRA_WEATHER_TABLE WHERE FK_ID = ?");
}

TEST_F(TableSqlTest, ListTableStatements)
{
    OpenForeignSchema();
    CityPtr source = MakeCity("A", 0);
    HourlyWeatherDBController hourly;
    hourly.Insert(1, source->GetHourlyPtrVector());
    hourly.Update(1, source->GetHourlyPtrVector());
    EXPECT_TRUE(hourly.Select(1)->empty());
    ExpectQuery(
        "INSERT INTO HOURLY_WEATHER_TABLE (FK_ID,hourlyIndex,hour,weatherIcon,weatherStatus,curTemperature,"
        "lowTemperature,highTemperature,websiteUrl) VALUES ( ?, ?, ?, ?, ?, ?, ?, ?, ?)");
    ExpectQuery(
        "UPDATE HOURLY_WEATHER_TABLE SET hour = ?,weatherIcon = ?,weatherStatus = ?,curTemperature = ?,"
        "lowTemperature = ?,highTemperature = ?,websiteUrl = ? WHERE FK_ID = ? AND hourlyIndex = ?;");
    ExpectQuery(
        "SELECT hour,weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,websiteUrl FROM "
        "HOURLY_WEATHER_TABLE WHERE FK_ID = ?");

    WeeklyWeatherDBController weekly;
    weekly.Insert(1, source->GetWeeklyPtrVector());
    weekly.Update(1, source->GetWeeklyPtrVector());
    EXPECT_TRUE(weekly.Select(1)->empty());
    ExpectQuery(
        "INSERT INTO WEEKLY_WEATHER_TABLE (FK_ID,weeklyIndex,weatherIcon,weatherStatus,curTemperature,"
        "lowTemperature,highTemperature,date,websiteUrl) VALUES ( ?, ?, ?, ?, ?, ?, ?, ?, ?)");
    ExpectQuery(
        "UPDATE WEEKLY_WEATHER_TABLE SET weatherIcon = ?,weatherStatus = ?,curTemperature = ?,"
        "lowTemperature = ?,highTemperature = ?,date = ?,websiteUrl = ? WHERE FK_ID = ? AND weeklyIndex = "
        "?;");
    ExpectQuery(
        "SELECT weatherIcon,weatherStatus,curTemperature,lowTemperature,highTemperature,date,websiteUrl FROM "
        "WEEKLY_WEATHER_TABLE WHERE FK_ID = ?");

    MoonPhaseDBController moon;
    moon.Insert(1, source->GetMoonPhasePtrVector());
    moon.Update(1, source->GetMoonPhasePtrVector());
    EXPECT_TRUE(moon.Select(1)->empty());
    EXPECT_TRUE(moon.SelectAllLocationId().empty());
    ExpectQuery(
        "INSERT INTO MOON_PHASE_TABLE (FK_ID,moonPhaseIndex,locationID,date,moonRiseTime,moonSetTime,"
        "phaseText,age) VALUES ( ?, ?, ?, ?, ?, ?, ?, ?)");
    ExpectQuery(
        "UPDATE MOON_PHASE_TABLE SET locationID = ?,date = ?,moonRiseTime = ?,moonSetTime = ?,phaseText = ?,"
        "age = ? WHERE FK_ID = ? AND moonPhaseIndex = ?;");
    ExpectQuery(
        "SELECT locationID,date,moonRiseTime,moonSetTime,phaseText,age FROM MOON_PHASE_TABLE WHERE FK_ID = "
        "?");
    ExpectQuery("SELECT locationID FROM MOON_PHASE_TABLE WHERE moonPhaseIndex = 0");
    EXPECT_TRUE(mLog.Contains("retStringVector.size() < 1"));
}

TEST_F(TableSqlTest, DeletesLogWhenTheyFail)
{
    OpenForeignSchema();
    MoonPhaseDBController().Delete(std::string("A"));
    HourlyWeatherDBController().Delete(1);
    EXPECT_EQ(mLog.Count("Fail to Delete"), 2);
    ExpectQuery("DELETE FROM MOON_PHASE_TABLE WHERE locationID = ?;");
    ExpectQuery("DELETE FROM HOURLY_WEATHER_TABLE WHERE FK_ID=?;");
}

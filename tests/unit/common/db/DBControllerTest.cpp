#include "DBController.h"

#include <gtest/gtest.h>

#include <ctime>

#include "DBTestSupport.h"
#include "SettingDBController.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::MakeCity;
using WeatherTest::RawDB;

namespace
{
class DBControllerTest : public WeatherTest::DBTest
{
protected:
    DBController mDB;

    std::vector<std::string> PageOrder()
    {
        std::vector<std::string> ids;
        CityPtrVectorPtr cities = mDB.SelectAllCityData();
        for (const CityPtr& city : *cities)
            ids.push_back(city->GetLocationId() + "@" + std::to_string(city->GetPageIndex()));
        return ids;
    }
    void InsertCities(const std::vector<std::string>& ids)
    {
        for (size_t i = 0; i < ids.size(); ++i)
            ASSERT_EQ(mDB.InsertCityData(MakeCity(ids[i], static_cast<int>(i))), ERR_OK) << mLog.Dump();
    }
};

void ExpectTemperature(const TemperaturePtr& t, double celsius, double fahrenheit)
{
    ASSERT_TRUE(t);
    EXPECT_DOUBLE_EQ(t->GetCelsius(), celsius);
    EXPECT_DOUBLE_EQ(t->GetFahrenheit(), fahrenheit);
}
}  // namespace

TEST_F(DBControllerTest, CityWithAllChildrenRoundTrips)
{
    CityPtr in = MakeCity("LOC1", 1);
    ASSERT_EQ(mDB.InsertCityData(in), ERR_OK);
    ASSERT_EQ(mDB.UpdateOnlyMoonPhaseData(in), ERR_OK);
    CityPtr out = mDB.SelectCityData(std::string("LOC1"));
    ASSERT_TRUE(out) << mLog.Dump();
    EXPECT_EQ(WeatherTest::DescribeCity(*out), WeatherTest::DescribeCity(*in));
    EXPECT_EQ(out->GetWeeklyPtrVector()->size(), 10u);
    EXPECT_EQ(out->GetMoonPhasePtrVector()->size(), 3u);

    // Fahrenheit is derived from the stored one-decimal Celsius; the day of
    // week from the stored date.
    ExpectTemperature(out->GetCurrentPtr()->GetCurTemperature(), 21.5, 70.7);
    ExpectTemperature(out->GetCurrentPtr()->GetLowTemperature(), 0.0, 32.0);
    ExpectTemperature(out->GetWeeklyPtrVector()->at(0)->GetLowTemperature(), -5.2, 22.6);
    time_t date = out->GetWeeklyPtrVector()->at(3)->GetDate();
    struct tm local = {};
    localtime_r(&date, &local);
    EXPECT_EQ(out->GetWeeklyPtrVector()->at(3)->GetDayOfWeek(), local.tm_wday);
}

TEST_F(DBControllerTest, ChildRowsCarryTheCityKeyAndTheirIndex)
{
    InsertCities({"A", "B"});
    RawDB raw(WeatherDBPath());
    int64_t keyB = raw.QueryInt("SELECT PK_ID FROM CITY_TABLE WHERE locationId = 'B';");
    EXPECT_EQ(
        raw.QueryInt("SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE WHERE FK_ID = " + std::to_string(keyB) + ";"),
        24);
    std::vector<std::string> indexes =
        raw.QueryTexts("SELECT hourlyIndex FROM HOURLY_WEATHER_TABLE WHERE FK_ID = " + std::to_string(keyB) +
                       " ORDER BY hourlyIndex;");
    ASSERT_EQ(indexes.size(), 24u);
    EXPECT_EQ(indexes.front(), "0");
    EXPECT_EQ(indexes.back(), "23");
    EXPECT_EQ(raw.QueryTexts("SELECT curTemperature FROM CURRENT_WEATHER_TABLE;"),
              (std::vector<std::string>{"21.5", "21.5"}));
    EXPECT_EQ(
        raw.QueryInt("SELECT COUNT(*) FROM WEEKLY_WEATHER_TABLE WHERE FK_ID = " + std::to_string(keyB) + ";"),
        10);
}

TEST_F(DBControllerTest, EmptyTableGivesAnEmptyList)
{
    CityPtrVectorPtr cities = mDB.SelectAllCityData();
    ASSERT_TRUE(cities);
    EXPECT_TRUE(cities->empty());
    EXPECT_EQ(mDB.GetNumberOfCities(), 0);
    EXPECT_FALSE(mDB.SelectCityData(0));
    EXPECT_FALSE(mDB.SelectCityData(std::string("")));
    EXPECT_TRUE(mLog.Contains("(locationID.length() < 1) [return]"));
    EXPECT_TRUE(mDB.SelectAllLocationIDData()->empty());
    EXPECT_FALSE(mDB.IsCurrentLocationExist());
    EXPECT_EQ(mDB.GetLocationIdOfCurrentCity(), "");
}

TEST_F(DBControllerTest, InitializeTwiceKeepsRows)
{
    InsertCities({"A"});
    EXPECT_EQ(mDB.Initialize(), ERR_OK);
    EXPECT_EQ(mDB.GetNumberOfCities(), 1);
}

TEST_F(DBControllerTest, UpdateRewritesInPlace)
{
    InsertCities({"A", "B"});
    CityPtr city = MakeCity("B", 4);
    city->SetPageIndex(-1);  // resolved from the location id
    city->SetCityName("renamed");
    city->SetWidgetReferenceCount(40);
    city->GetCurrentPtr()->GetCurTemperature()->SetCelsiusValue(-3.05);
    city->GetWeeklyPtrVector()->resize(12, city->GetWeeklyPtrVector()->at(0));
    city->GetHourlyPtrVector()->resize(5);
    city->GetExtraPtr()->SetHumidity(5);
    ASSERT_EQ(mDB.UpdateCityData(city), ERR_OK);

    CityPtr out = mDB.SelectCityData(1);
    ASSERT_TRUE(out);
    EXPECT_EQ(out->GetLocationId(), "B");
    EXPECT_EQ(out->GetCityName(), "renamed");
    EXPECT_EQ(out->GetWidgetReferenceCount(), 1);  // only its own update writes it
    ExpectTemperature(out->GetCurrentPtr()->GetCurTemperature(), -3.0, 26.6);
    EXPECT_EQ(out->GetWeeklyPtrVector()->size(), 10u);  // extra days are not stored
    EXPECT_EQ(out->GetHourlyPtrVector()->size(), 5u);   // hourly list replaced
    EXPECT_EQ(out->GetExtraPtr()->GetHumidity(), 5);
    EXPECT_EQ(mDB.SelectCityData(0)->GetCityName(), "city A-0");
}

TEST_F(DBControllerTest, CityThatIsNotStoredLeavesNoOrphanRows)
{
    InsertCities({"A"});
    CityPtr stranger = MakeCity("Z", 1);
    stranger->SetPageIndex(-1);
    EXPECT_EQ(mDB.UpdateCityData(stranger), ERR_FAIL);
    EXPECT_EQ(mDB.UpdateOnlyMoonPhaseData(stranger), ERR_FAIL);
    EXPECT_TRUE(mLog.Contains("(primaryKey < 1) [return]"));
    RawDB raw(WeatherDBPath());
    for (const char* table : {"CURRENT_WEATHER_TABLE", "WEEKLY_WEATHER_TABLE", "HOURLY_WEATHER_TABLE",
                              "EXTRA_WEATHER_TABLE", "MOON_PHASE_TABLE"})
        EXPECT_EQ(raw.QueryInt(std::string("SELECT COUNT(*) FROM ") + table + " WHERE FK_ID < 1;"), 0)
            << table;
    EXPECT_EQ(mDB.SelectCityData(0)->GetCityName(), "city A-0");
}

TEST_F(DBControllerTest, ShorterWeeklyListLeavesSurplusRows)
{
    InsertCities({"A"});
    CityPtr city = MakeCity("A", 0);
    city->GetWeeklyPtrVector()->resize(7);
    city->GetWeeklyPtrVector()->at(6)->SetWeatherStatus("changed");
    ASSERT_EQ(mDB.UpdateCityData(city), ERR_OK);
    WeeklyPtrVectorPtr days = mDB.SelectCityData(0)->GetWeeklyPtrVector();
    ASSERT_EQ(days->size(), 10u);
    EXPECT_EQ(days->at(6)->GetWeatherStatus(), "changed");
    EXPECT_EQ(days->at(7)->GetWeatherStatus(), "day 7");
}

TEST_F(DBControllerTest, DeleteKeepsTheUsersPageOrder)
{
    InsertCities({"A", "B", "C"});
    CityPtrVectorPtr cities = mDB.SelectAllCityData();
    CityPtrVectorPtr reordered =
        std::make_shared<CityPtrVector>(CityPtrVector{cities->at(2), cities->at(0), cities->at(1)});
    ASSERT_EQ(mDB.ReorderCityData(reordered), ERR_OK);
    EXPECT_EQ(PageOrder(), (std::vector<std::string>{"C@0", "A@1", "B@2"}));

    ASSERT_EQ(mDB.DeleteCityData(std::string("A")), ERR_OK);
    EXPECT_EQ(PageOrder(), (std::vector<std::string>{"C@0", "B@1"}));
    RawDB raw(WeatherDBPath());
    EXPECT_EQ(raw.QueryInt("SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE;"), 48);
    EXPECT_EQ(raw.QueryInt("SELECT COUNT(*) FROM CURRENT_WEATHER_TABLE;"), 2);
    EXPECT_EQ(raw.QueryInt("SELECT COUNT(*) FROM EXTRA_WEATHER_TABLE;"), 2);

    ASSERT_EQ(mDB.DeleteCityData(1), ERR_OK);
    EXPECT_EQ(PageOrder(), (std::vector<std::string>{"C@0"}));
    EXPECT_EQ(mDB.ReorderCityData(nullptr), ERR_FAIL);
    EXPECT_TRUE(mLog.Contains("(!reorderPtrVector) [return]"));
}

TEST_F(DBControllerTest, NewCitiesGoToTheEnd)
{
    InsertCities({"A", "B", "C"});
    CityPtr atFive = MakeCity("D", 3);
    atFive->SetPageIndex(5);
    ASSERT_EQ(mDB.InsertCityData(atFive), ERR_OK);
    EXPECT_EQ(mDB.GetPageIndexWithLocationID("D"), 5);
    CityPtr atZero = MakeCity("E", 4);
    ASSERT_EQ(mDB.InsertCityData(atZero), ERR_OK);
    EXPECT_EQ(atZero->GetPageIndex(), 4);
    EXPECT_EQ(mDB.GetPageIndexWithLocationID("E"), 4);
}

TEST_F(DBControllerTest, CurrentLocationIdCarriesOneSuffix)
{
    CityPtr here = MakeCity("HERE", 0, true);
    ASSERT_EQ(mDB.InsertCityData(here), ERR_OK);
    EXPECT_EQ(here->GetLocationId(), "HERE:C");
    CityPtr there = MakeCity("THERE:C", 1, true);
    ASSERT_EQ(mDB.InsertCityData(there), ERR_OK);
    ASSERT_EQ(mDB.InsertCityData(MakeCity("PLAIN", 2)), ERR_OK);
    EXPECT_TRUE(mLog.Contains("(cityPtr->GetIsCurrentLocation() == false) [break]"));
    EXPECT_EQ(*mDB.SelectAllLocationIDData(), (std::vector<std::string>{"HERE:C", "THERE:C", "PLAIN"}));
    EXPECT_TRUE(mDB.IsCurrentLocationExist());
    EXPECT_EQ(mDB.GetPageIndexOfCurrentCity(), 0);
    EXPECT_EQ(mDB.GetLocationIdOfCurrentCity(), "HERE:C");

    CityPtr update = MakeCity("HERE", 5, true);
    ASSERT_EQ(mDB.UpdateCityData(update), ERR_OK);
    EXPECT_EQ(update->GetLocationId(), "HERE:C");
    EXPECT_EQ(mDB.SelectCityData(0)->GetLocationId(), "HERE:C");
}

TEST_F(DBControllerTest, SameCityIsStoredOnce)
{
    InsertCities({"A"});
    EXPECT_EQ(mDB.InsertCityData(MakeCity("A", 9)), ERR_FAIL);
    EXPECT_TRUE(mLog.Contains("There is a same city in DB"));
    EXPECT_EQ(mDB.GetNumberOfCities(), 1);
    EXPECT_EQ(mDB.SelectCityData(0)->GetCityName(), "city A-0");

    // The current-location twin of a city is another city (its id gets ":C").
    EXPECT_EQ(mDB.InsertCityData(MakeCity("A", 9, true)), ERR_OK);
    EXPECT_EQ(mDB.GetNumberOfCities(), 2);
    // ... and is found again although the stored id carries the suffix.
    EXPECT_EQ(mDB.InsertCityData(MakeCity("A", 10, true)), ERR_FAIL);
    EXPECT_EQ(mDB.GetNumberOfCities(), 2);
}

TEST_F(DBControllerTest, ReferenceCountNeverDropsBelowZero)
{
    CityPtr city = MakeCity("A", 0);
    ASSERT_EQ(mDB.InsertCityData(city), ERR_OK);
    EXPECT_EQ(mDB.UpdateOnlyWidgetReferenceCount("A", true), ERR_OK);
    EXPECT_EQ(mDB.SelectCityData(0)->GetWidgetReferenceCount(), 1);
    EXPECT_TRUE(
        mLog.Contains("query : UPDATE CITY_TABLE SET widgetReferenceCount = ? WHERE locationId = ?; [1]"));
    mDB.UpdateOnlyWidgetReferenceCount("A", false);
    mDB.UpdateOnlyWidgetReferenceCount("A", false);
    EXPECT_EQ(mDB.SelectCityData(0)->GetWidgetReferenceCount(), 0);
    EXPECT_EQ(mDB.UpdateOnlyWidgetReferenceCount("missing", true), ERR_FAIL);
}

TEST_F(DBControllerTest, MobileLinkAndNeedToUpdateList)
{
    InsertCities({"A", "B", "C", "D"});  // seeds 0 and 3 need an update
    CityPtr link = MakeCity("C", 0);
    link->SetPageIndex(-1);
    link->SetWebsiteUrl("http://new.example.com/");
    ASSERT_EQ(mDB.UpdateOnlyMobileLink(link), ERR_OK);
    EXPECT_EQ(mDB.SelectCityData(2)->GetWebsiteUrl(), "http://new.example.com/");
    EXPECT_EQ(mDB.SelectCityData(2)->GetCityName(), "city C-2");
    EXPECT_EQ(*mDB.SelectNeedToUpdateLocationIDData(), (std::vector<std::string>{"A", "D"}));
}

TEST_F(DBControllerTest, DeleteAllAndReplace)
{
    InsertCities({"A", "B"});
    CityPtrVectorPtr next = std::make_shared<CityPtrVector>(
        CityPtrVector{MakeCity("X", 0), MakeCity("Y", 1), nullptr, MakeCity("X", 2)});
    ASSERT_EQ(mDB.DeleteAllCityDataAndInsertCityPtrVector(next), ERR_OK);
    EXPECT_EQ(PageOrder(), (std::vector<std::string>{"X@0", "Y@1"}));
    EXPECT_TRUE(mLog.Contains("There is a same city in DB"));
    EXPECT_EQ(RawDB(WeatherDBPath()).QueryInt("SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE;"), 48);

    ASSERT_EQ(mDB.DeleteAllCityData(), ERR_OK);
    EXPECT_TRUE(mLog.Contains("DeleteAllCityData"));
    RawDB raw(WeatherDBPath());
    for (const char* table : {"CITY_TABLE", "CURRENT_WEATHER_TABLE", "WEEKLY_WEATHER_TABLE",
                              "HOURLY_WEATHER_TABLE", "EXTRA_WEATHER_TABLE"})
        EXPECT_EQ(raw.QueryInt(std::string("SELECT COUNT(*) FROM ") + table + ";"), 0) << table;
}

TEST_F(DBControllerTest, UselessMoonPhasesAreRemoved)
{
    EXPECT_EQ(mDB.DeleteUselessMoonPhaseData(), ERR_OK);
    EXPECT_TRUE(mLog.Contains("(moonPhaseLocIdVector.size() < 1) [return]"));

    CityPtr a = MakeCity("A", 0);
    CityPtr b = MakeCity("B", 1);
    InsertCities({"A", "B"});
    mDB.UpdateOnlyMoonPhaseData(a);
    mDB.UpdateOnlyMoonPhaseData(b);
    mDB.UpdateOnlyMoonPhaseData(b);  // replaces, does not add
    RawDB raw(WeatherDBPath());
    EXPECT_EQ(raw.QueryInt("SELECT COUNT(*) FROM MOON_PHASE_TABLE;"), 6);

    mDB.DeleteCityData(std::string("A"));
    EXPECT_EQ(raw.QueryInt("SELECT COUNT(*) FROM MOON_PHASE_TABLE;"), 6);
    ASSERT_EQ(mDB.DeleteUselessMoonPhaseData(), ERR_OK);
    EXPECT_EQ(raw.QueryTexts("SELECT DISTINCT locationID FROM MOON_PHASE_TABLE;"),
              (std::vector<std::string>{"B"}));
    EXPECT_EQ(raw.QueryInt("SELECT COUNT(*) FROM MOON_PHASE_TABLE;"), 3);
}

TEST_F(DBControllerTest, ExpiryFollowsTheOldestRefreshAndTheInterval)
{
    EXPECT_FALSE(mDB.GetIsWeatherInfoExpired());
    EXPECT_TRUE(mLog.Contains("(!settingPtr) [return]"));
    ASSERT_EQ(SettingDBController().Initialize(), ERR_OK);  // interval 6 hours
    EXPECT_FALSE(mDB.GetIsWeatherInfoExpired());
    EXPECT_TRUE(mLog.Contains("(cityPtrVector->size() == 0) [return]"));

    time_t now = time(nullptr);
    CityPtr fresh = MakeCity("A", 0);
    fresh->SetRefreshedTime(now - 60);
    CityPtr older = MakeCity("B", 1);
    older->SetRefreshedTime(now - 5 * 3600);
    mDB.InsertCityData(fresh);
    mDB.InsertCityData(older);
    EXPECT_FALSE(mDB.GetIsWeatherInfoExpired());
    EXPECT_TRUE(mLog.Contains("timeInterval [21600]"));

    CityPtr stale = MakeCity("C", 2);
    stale->SetRefreshedTime(now - 7 * 3600);
    mDB.InsertCityData(stale);
    EXPECT_TRUE(mDB.GetIsWeatherInfoExpired());
    EXPECT_TRUE(mLog.Contains("lastRefreshedTime [" + std::to_string(now - 7 * 3600) + "]"));

    // A refresh time ahead of the clock counts as expired too.
    ASSERT_EQ(mDB.DeleteAllCityData(), ERR_OK);
    fresh->SetRefreshedTime(now + 24 * 3600);
    mDB.InsertCityData(fresh);
    EXPECT_TRUE(mDB.GetIsWeatherInfoExpired());
}

TEST_F(DBControllerTest, ListAgreesWithSingleSelects)
{
    InsertCities({"A", "B", "C"});
    CityPtr b = MakeCity("B", 1);
    b->SetPageIndex(1);
    b->GetMoonPhasePtrVector()->resize(1);
    mDB.UpdateOnlyMoonPhaseData(b);
    RawDB(WeatherDBPath()).Exec("DELETE FROM CURRENT_WEATHER_TABLE WHERE FK_ID = 3;");
    CityPtrVectorPtr all = mDB.SelectAllCityData();
    ASSERT_EQ(all->size(), 3u);
    for (int page = 0; page < 3; ++page)
        EXPECT_EQ(WeatherTest::DescribeCity(*all->at(page)),
                  WeatherTest::DescribeCity(*mDB.SelectCityData(page)));
    EXPECT_FALSE(all->at(2)->GetCurrentPtr());
    EXPECT_EQ(all->at(1)->GetMoonPhasePtrVector()->size(), 1u);
    EXPECT_TRUE(all->at(0)->GetMoonPhasePtrVector()->empty());
}

// Rows written by another program with a duplicate and a missing page index.
TEST_F(DBControllerTest, ListSkipsMissingPagesAndTakesTheFirstOfADuplicate)
{
    InsertCities({"A", "B", "C"});
    RawDB(WeatherDBPath()).Exec("UPDATE CITY_TABLE SET pageIndex = 0 WHERE locationId = 'B';");
    EXPECT_EQ(PageOrder(), (std::vector<std::string>{"A@0", "C@2"}));

    // A gap: C keeps page 2 at position 1, and D (page 3), beyond the row
    // count, is still listed.
    InsertCities({"D"});
    RawDB(WeatherDBPath()).Exec("DELETE FROM CITY_TABLE WHERE locationId = 'B';");
    EXPECT_EQ(PageOrder(), (std::vector<std::string>{"A@0", "C@2", "D@3"}));
}

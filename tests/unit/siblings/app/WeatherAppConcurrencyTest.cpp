#include <vector>

#include "DBController.h"
#include "SiblingTestSupport.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "FileUtil.h"
#include "SampleWeatherSource.h"

using namespace NSWeather;

namespace
{

class WeatherAppConcurrencyTest : public SiblingTest::SiblingFixture
{
};

// The agent refreshes while the weather app adds cities, each in its own
// process: every city ends up stored once, whole, on its own page.
TEST_F(WeatherAppConcurrencyTest, RefreshWhileAddingLosesNoCity)
{
    const char* const first[] = {"seoul", "oslo"};
    for (const char* name : first) ASSERT_EQ(0, SiblingTest::Run({SiblingTest::AppProgram(), "add", name}));
    const char* const added[] = {"tokyo", "paris", "sydney", "london", "cairo", "lima"};
    std::vector<pid_t> agents;
    std::vector<pid_t> apps;
    for (int round = 0; round < 3; ++round)
        agents.push_back(SiblingTest::Start({SiblingTest::AgentProgram(), "refresh"}));
    for (const char* name : added)
        apps.push_back(SiblingTest::Start({SiblingTest::AppProgram(), "add", name}));
    for (pid_t pid : apps)
        EXPECT_EQ(0, SiblingTest::Finish(pid)) << WeatherTest::ReadText(mRoot.Path("log/dlog.log"));
    for (pid_t pid : agents) SiblingTest::Finish(pid);

    WeatherTest::RawDB db(FileUtil::GetWeatherDBFilePath(), true);
    const int count = 8;
    EXPECT_EQ(count, db.QueryInt("SELECT COUNT(DISTINCT locationId) FROM CITY_TABLE"));
    EXPECT_EQ(count, db.QueryInt("SELECT COUNT(*) FROM CITY_TABLE"));
    EXPECT_EQ(count, db.QueryInt(
                         "SELECT COUNT(DISTINCT pageIndex) FROM CITY_TABLE WHERE pageIndex BETWEEN 0 AND 7"));
    EXPECT_EQ(count, db.QueryInt("SELECT COUNT(*) FROM CURRENT_WEATHER_TABLE"));
    EXPECT_EQ(count, db.QueryInt("SELECT COUNT(*) FROM EXTRA_WEATHER_TABLE"));
    EXPECT_EQ(count * 24, db.QueryInt("SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE"));
    EXPECT_EQ(count * SampleWeatherSource::DAILY_COUNT,
              db.QueryInt("SELECT COUNT(*) FROM WEEKLY_WEATHER_TABLE"));
    EXPECT_EQ(0,
              db.QueryInt("SELECT COUNT(*) FROM HOURLY_WEATHER_TABLE WHERE FK_ID NOT IN (SELECT PK_ID FROM "
                          "CITY_TABLE)"));
}

}  // namespace

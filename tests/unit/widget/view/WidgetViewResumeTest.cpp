// When a resume or an update rebuilds the pages, and what it follows.
#include <gtest/gtest.h>

#include "WidgetHostPages.h"

namespace WeatherTest
{

class WidgetViewResumeTest : public WidgetHostPagesTest
{
public:
    void SetUp() override
    {
        WidgetHostPagesTest::SetUp();
        WriteCities(3);
        ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetCurrentCityLocationId("226081"); });
        StartHost({"4x4"});
    }

    // The host answers once the callbacks have run. A refreshing page
    // spins its indicator and never becomes idle.
    void PauseAndResume(bool waitIdle = true)
    {
        EXPECT_EQ(Send("pause " + Id(1)), "OK");
        EXPECT_EQ(Send("resume " + Id(1)), "OK");
        if (waitIdle)
            WaitIdle();
    }
};

TEST_F(WidgetViewResumeTest, RebuildsOnlyWhenSomethingChanged)
{
    struct Case
    {
        const char* name;
        std::function<void(WidgetViewResumeTest&)> act;
        bool rebuilds;
    };
    const Case cases[] = {
        {"Unchanged", [](WidgetViewResumeTest& t) { t.PauseAndResume(); }, false},
        {"UnchangedAgain", [](WidgetViewResumeTest& t) { t.PauseAndResume(); }, false},
        {"Forced",
         [](WidgetViewResumeTest& t)
         {
             EXPECT_EQ(t.Send("update " + t.Id(1)), "OK");
             t.WaitIdle();
         },
         true},
        {"Refreshing",
         [](WidgetViewResumeTest& t)
         {
             t.ChangeSetting(
                 [](const NSWeather::SettingPtr& s)
                 {
                     s->SetIsNowRefreshing(true);
                     s->SetRefreshingStartTime(time(nullptr));
                 });
             t.PauseAndResume(false);
         },
         true},
    };
    for (const Case& c : cases)
    {
        int rebuilt = CountLog("Update City Information on Widget");
        int skipped = CountLog("No need to Update");
        c.act(*this);
        EXPECT_EQ(CountLog("Update City Information on Widget") - rebuilt, c.rebuilds ? 1 : 0) << c.name;
        EXPECT_EQ(CountLog("No need to Update") - skipped, c.rebuilds ? 0 : 1) << c.name;
    }
}

TEST_F(WidgetViewResumeTest, FollowsTheCityAnotherProcessChose)
{
    ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetCurrentCityLocationId("347629"); });
    PauseAndResume();
    EXPECT_EQ(CentreText(Id(1), "name"), "San Francisco");
    EXPECT_NE(Slot(Id(1), "prevLayout").find("Reykjavík"), std::string::npos);
    EXPECT_NE(Slot(Id(1), "nextLayout").find("서울"), std::string::npos);
}

}  // namespace WeatherTest

namespace WeatherTest
{

// Pages are filled again in place: nothing of the earlier data may stay.
TEST_F(WidgetViewResumeTest, UpdatedPageShowsOnlyTheNewDays)
{
    EXPECT_NE(CentreText(Id(1), "weatherForecastHighTemp4"), "");
    WriteCities(3, 2);
    ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetLastRefreshedTime(time(nullptr)); });
    EXPECT_EQ(Send("update " + Id(1)), "OK");
    WaitIdle();
    EXPECT_NE(CentreText(Id(1), "weatherForecastHighTemp2"), "");
    for (const char* part : {"weatherForecastHighTemp3", "weatherForecastWeek4", "weatherForecastLowTemp4"})
        EXPECT_EQ(CentreText(Id(1), part), "") << part;
    EXPECT_EQ(Slot(Id(1), "centerLayout").find("weatherForecastIcon3\":{"), std::string::npos);
}

}  // namespace WeatherTest

namespace WeatherTest
{

// Neighbour pages are off-screen: they come once the first frame is out;
// an instance that goes before that takes their pending build with it.
TEST_F(WidgetViewResumeTest, NeighbourPagesFollowTheFirstFrame)
{
    std::vector<std::string> replies =
        SendTogether({"create 4x2", "dump " + Id(2), "create 4x4", "destroy " + Id(3)});
    ASSERT_EQ(replies.size(), 4u);
    EXPECT_EQ(replies[0], "OK " + Id(2));
    EXPECT_NE(SlotOf(replies[1], "centerLayout"), "");
    for (const char* slot : {"prevLayout", "nextLayout"}) EXPECT_EQ(SlotOf(replies[1], slot), "") << slot;
    EXPECT_EQ(replies[3], "OK");
    WaitIdle();
    EXPECT_NE(Slot(Id(2), "prevLayout").find("San Francisco"), std::string::npos);
    EXPECT_NE(Slot(Id(2), "nextLayout").find("Reykjavík"), std::string::npos);
    EXPECT_EQ(CountLog("drew its first frame"), 2);
    // A flick before the first frame builds them on the spot.
    replies = SendTogether({"create 4x2", "swipe " + Id(4) + " 300 300 300 50 120"});
    ASSERT_EQ(replies.size(), 2u);
    EXPECT_EQ(replies[1].compare(0, 3, "OK "), 0) << replies[1];
    WaitIdle();
    EXPECT_EQ(CentreText(Id(4), "name"), "Reykjavík");
}

}  // namespace WeatherTest

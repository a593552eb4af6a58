#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>

#include "WidgetHostFixture.h"

using ::testing::AllOf;
using ::testing::HasSubstr;

namespace WeatherTest
{

namespace
{
struct MouseRecord
{
    std::string kind;
    int x;
    int y;
    unsigned long timestamp;
};

std::vector<MouseRecord> MouseRecords(const std::vector<std::string>& lines, const std::string& id)
{
    std::vector<MouseRecord> events;
    for (auto& line : lines)
    {
        auto words = Words(line);
        if (words.size() == 5 && words[0].compare(0, 6, "mouse-") == 0 && words[1] == id)
            events.push_back({words[0], atoi(words[2].c_str()), atoi(words[3].c_str()),
                              strtoul(words[4].c_str(), nullptr, 10)});
    }
    // The pointer first moves to where the finger lands, as touch input does.
    if (events.size() >= 2 && events[0].kind == "mouse-move" && events[1].kind == "mouse-down")
    {
        EXPECT_EQ(events[0].x, events[1].x);
        EXPECT_EQ(events[0].y, events[1].y);
        EXPECT_EQ(events[0].timestamp, events[1].timestamp);
        events.erase(events.begin());
    }
    return events;
}

unsigned long StartOf(const std::string& reply)
{
    return reply.compare(0, 3, "OK ") == 0 ? strtoul(reply.c_str() + 3, nullptr, 10) : 0;
}
}  // namespace

TEST_F(WidgetHostTest, TapReachesTheInstanceWithItsPlaceAndTimes)
{
    StartHost();
    std::string other = CreateInstance("4x2");
    std::string id = CreateInstance("4x4");
    std::string reply = Send("tap " + id + " 100 120 150");
    unsigned long start = StartOf(reply);
    ASSERT_GT(start, 1000u) << reply;
    auto events = MouseRecords(Records(), id);
    ASSERT_EQ(events.size(), 2u);
    EXPECT_EQ(events[0].kind, "mouse-down");
    EXPECT_EQ(events[0].x, 100);
    EXPECT_EQ(events[0].y, 120);
    EXPECT_EQ(events[0].timestamp, start);
    EXPECT_EQ(events[1].kind, "mouse-up");
    EXPECT_EQ(events[1].x, 100);
    EXPECT_EQ(events[1].y, 120);
    EXPECT_EQ(events[1].timestamp, start + 150);
    EXPECT_TRUE(MouseRecords(Records(), other).empty());
    // The next gesture starts after this one ended.
    EXPECT_GT(StartOf(Send("tap " + id + " 5 5")), start + 150);
}

TEST_F(WidgetHostTest, SwipeMovesAlongTheLineOverTheGivenTime)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    std::string reply = Send("swipe " + id + " 50 300 90 100 200");
    unsigned long start = StartOf(reply);
    ASSERT_GT(start, 1000u) << reply;
    auto events = MouseRecords(Records(), id);
    ASSERT_GE(events.size(), 4u);
    EXPECT_EQ(events.front().kind, "mouse-down");
    EXPECT_EQ(events.front().x, 50);
    EXPECT_EQ(events.front().y, 300);
    EXPECT_EQ(events.front().timestamp, start);
    EXPECT_EQ(events.back().kind, "mouse-up");
    EXPECT_EQ(events.back().x, 90);
    EXPECT_EQ(events.back().y, 100);
    EXPECT_EQ(events.back().timestamp, start + 200);
    int moves = 0;
    for (size_t i = 1; i + 1 < events.size(); ++i)
    {
        EXPECT_EQ(events[i].kind, "mouse-move");
        EXPECT_GE(events[i].timestamp, events[i - 1].timestamp);
        EXPECT_LE(events[i].y, events[i - 1].y);
        EXPECT_GE(events[i].x, events[i - 1].x);
        // On the line from (50, 300) to (90, 100): x moves 1 for every 5 of y.
        EXPECT_NEAR((events[i].x - 50) * 5, 300 - events[i].y, 5);
        ++moves;
    }
    EXPECT_GE(moves, 10);
    EXPECT_THAT(Send("swipe " + id + " 1 2 3 4"), HasSubstr("ERR usage"));
}

TEST_F(WidgetHostTest, IdleWaitsForTimersAndAnimations)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    WaitIdle();
    EXPECT_EQ(Records("timer"), std::vector<std::string>{"timer " + id});
    ASSERT_EQ(Send("tap " + id + " 300 300").compare(0, 3, "OK "), 0);
    // The one-second animation of the tap is still drawing.
    EXPECT_THAT(Send("idle 0.4"), AllOf(HasSubstr("ERR timeout: "), HasSubstr("canvas still drawing")));
    EXPECT_TRUE(Records("transit-end").empty());
    WaitIdle();
    EXPECT_EQ(Records("transit-end").size(), 1u);
}

}  // namespace WeatherTest

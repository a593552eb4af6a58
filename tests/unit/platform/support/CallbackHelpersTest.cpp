#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "CallbackTrampoline.h"
#include "ListenerList.h"

namespace NSWeather
{
namespace
{

std::vector<std::string> gReports;

void Record(const CallbackSite& site, bool isMissingObject, const char* text)
{
    gReports.push_back(std::string(site.function) + (isMissingObject ? " missing " : " threw ") + text);
}

struct Counter
{
    int calls = 0;
    int Bump(bool fail)
    {
        ++calls;
        if (fail)
            throw std::runtime_error("boom");
        return calls;
    }
};

int CounterCb(void* data, bool fail)
{
    return ForwardCallback<Counter>(
        data, [fail](Counter& c) { return c.Bump(fail); }, WEATHER_CALLBACK_SITE_WITH("test", Record), -1);
}

TEST(CallbackTrampolineTest, MissingObjectAndExceptionsGiveTheFallbackAndAReport)
{
    gReports.clear();
    Counter counter;
    EXPECT_EQ(1, CounterCb(&counter, false));
    EXPECT_EQ(-1, CounterCb(&counter, true));
    EXPECT_EQ(-1, CounterCb(nullptr, false));
    EXPECT_EQ(2, counter.calls);
    EXPECT_EQ((std::vector<std::string>{"CounterCb threw boom", "CounterCb missing pThis == NULL"}),
              gReports);
}

TEST(ListenerListTest, ANotifiedListenerCanRemoveALaterOneOrAddANewOne)
{
    ListenerList<int> list;
    EXPECT_TRUE(list.Add(1));
    EXPECT_FALSE(list.Add(1));
    list.Add(2);
    list.Add(3);
    std::vector<int> called;
    list.Notify(
        [&](int listener)
        {
            called.push_back(listener);
            if (listener == 1)
            {
                list.Remove(2);
                list.Add(4);
            }
        });
    EXPECT_EQ((std::vector<int>{1, 3}), called);
    EXPECT_TRUE(list.Contains(4));
    EXPECT_FALSE(list.Remove(2));
}

}  // namespace
}  // namespace NSWeather

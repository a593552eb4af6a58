#include <gtest/gtest.h>

#include "TestPlatform.h"
#include "WidgetViewData.h"

namespace
{

using NSWeather::City;
using NSWeather::CityPtr;
using NSWeather::CityPtrVector;
using NSWeatherWidget::WidgetViewData;

struct IndexCase
{
    const char* name;
    std::vector<int> pageIndexes;  // one city per entry, ids "A", "B", ...
    const char* display;
    int index;
    int prev;
    int next;
};

// The store skips a missing page index, so the list {0, 2, 3} is what a
// gap in the middle looks like to the widget.
const IndexCase kIndexCases[] = {
    {"Empty", {}, "A", 0, 0, 0},
    {"OneCity", {0}, "A", 0, 0, 0},
    {"TwoCitiesNeighboursAreTheOther", {0, 1}, "A", 0, 1, 1},
    {"FirstOfThreeWrapsBack", {0, 1, 2}, "A", 0, 2, 1},
    {"LastOfThreeWrapsForward", {0, 1, 2}, "C", 2, 1, 0},
    {"UnknownIdShowsTheFirst", {0, 1, 2}, "default", 0, 2, 1},
    {"EmptyIdShowsTheFirst", {0, 1, 2}, "", 0, 2, 1},
    {"GapUsesPositions", {0, 2, 3}, "B", 1, 0, 2},
    {"GapLastWrapsToFirst", {0, 2, 3}, "C", 2, 1, 0},
};

class WidgetViewDataTest : public WeatherTest::PlatformTest
{
};

std::shared_ptr<CityPtrVector> MakeCities(const std::vector<int>& pageIndexes)
{
    auto cities = std::make_shared<CityPtrVector>();
    for (size_t i = 0; i < pageIndexes.size(); ++i)
    {
        CityPtr city = std::make_shared<City>();
        city->SetPageIndex(pageIndexes[i]);
        city->SetLocationId(std::string(1, static_cast<char>('A' + i)));
        cities->push_back(city);
    }
    return cities;
}

TEST_F(WidgetViewDataTest, DisplayedIndexAndNeighboursArePositionsWithWrapAround)
{
    for (const IndexCase& c : kIndexCases)
    {
        WidgetViewData data;
        data.SetCityPtrVector(MakeCities(c.pageIndexes));
        data.SetLocationIdOfDisplayCity(c.display);
        EXPECT_EQ(data.GetIndexOfDisplayCity(), c.index) << c.name;
        EXPECT_EQ(data.GetPrevCityIndex(), c.prev) << c.name;
        EXPECT_EQ(data.GetNextCityIndex(), c.next) << c.name;
        EXPECT_EQ(data.GetNumberOfCities(), static_cast<int>(c.pageIndexes.size())) << c.name;
    }
}

TEST_F(WidgetViewDataTest, OutOfRangeAndMissingListGiveEmptyValues)
{
    WidgetViewData data;
    EXPECT_EQ(data.GetNumberOfCities(), 0);
    EXPECT_FALSE(data.GetCityPtr(0));
    EXPECT_EQ(data.GetSizeType(), WidgetViewData::kSizeTypeUnknown);
    EXPECT_TRUE(data.GetIsFirstCreated());
    data.SetCityPtrVector(MakeCities({0, 1}));
    for (int index : {-1, 2, 100})
    {
        EXPECT_FALSE(data.GetCityPtr(index)) << index;
        EXPECT_EQ(data.GetLocationId(index), "") << index;
    }
    EXPECT_TRUE(mLog.Contains("exception caught: out of range"));
    EXPECT_EQ(data.GetLocationId(1), "B");
    EXPECT_FALSE(data.GetCityPtrWithLocationId("b"));
}

}  // namespace

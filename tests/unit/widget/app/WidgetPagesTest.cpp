// Every page state of one instance, read back from the host's dump.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "WidgetHostPages.h"

namespace WeatherTest
{

using ::testing::HasSubstr;
using ::testing::Not;

namespace
{
struct PageCase
{
    const char* name;
    const char* size;
    int cities;
    int days;
    bool current;
    std::function<void(WidgetHostPagesTest&)> prepare;
    std::vector<std::string> shown;
    std::vector<std::string> absent;
};

void PrintTo(const PageCase& c, std::ostream* out)
{
    *out << c.name;
}

void Refreshing(const NSWeather::SettingPtr& s)
{
    s->SetUseCurrentLocationOn(true);
    s->SetShowCurrentCityAgreement(true);
    s->SetIsNowRefreshing(true);
    s->SetRefreshingStartTime(time(nullptr));
}
}  // namespace

class WidgetPageStatesTest : public WidgetHostPagesTest, public ::testing::WithParamInterface<PageCase>
{
public:
    void ChangeSettingOf(const std::function<void(const NSWeather::SettingPtr&)>& change)
    {
        ChangeSetting(change);
    }
    void SetKeyOf(const char* key, int value) { SetKey(key, value); }
};

TEST_P(WidgetPageStatesTest, CentrePageShowsItsState)
{
    const PageCase& c = GetParam();
    if (c.cities > 0)
        WriteCities(c.cities, c.days, c.current);
    ChangeSetting(
        [&](const NSWeather::SettingPtr& s) {
            s->SetCurrentCityLocationId(c.current ? "226081:C" : c.cities > 1 ? "347629" : "226081");
        });
    if (c.prepare)
        c.prepare(*this);
    StartHost({c.size});
    std::string centre = Slot(Id(1), "centerLayout");
    for (const std::string& text : c.shown) EXPECT_THAT(centre, HasSubstr(text)) << c.name;
    for (const std::string& text : c.absent) EXPECT_THAT(centre, Not(HasSubstr(text))) << c.name;
}

const PageCase kPageCases[] = {
    {"NoCity",
     "4x2",
     0,
     7,
     false,
     nullptr,
     {"\"group\":\"noCity\"", "\"title\":\"Weather\"", "\"message\":\"Tap here to add a city.\""},
     {"\"group\":\"city\""}},
    {"Loading",
     "4x4",
     0,
     7,
     false,
     [](WidgetHostPagesTest& t) { t.ChangeSetting(Refreshing); },
     {"\"group\":\"loading\"", "\"message\":\"Loading…\""},
     {"\"group\":\"noCity\""}},
    {"City4x2",
     "4x2",
     3,
     7,
     false,
     nullptr,
     {"\"name\":\"San Francisco\"", "\"current\":\"13\"", "03.weather_view_cloudy_154x154.png",
      "weather_widget_4x2_temp_c.png", "weather_widget_4x2_temp_c_press.png",
      "weather_box_logo_accuweather.png", "weather_box_ic_refresh.png", "\"group\":\"cityName\""},
     {"weatherForecast", "\"msg\":\"No"}},
    {"City4x4Fahrenheit",
     "4x4",
     3,
     7,
     false,
     [](WidgetHostPagesTest& t)
     { t.ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetTemperatureUnit(0); }); },
     {"\"current\":\"56\"", "_196x196.png", "weather_widget_4x4_temp_f.png",
      "\"weatherForecastHighTemp4\":\"56°\"", "\"weatherForecastLowTemp1\":\"47°\"", "_96x96.png"},
     {}},
    {"CurrentLocationCity", "4x2", 2, 7, true, nullptr, {"\"group\":\"cityNameCurrentLocation\""}, {}},
    {"TwoDailyRecords",
     "4x4",
     1,
     2,
     false,
     nullptr,
     {"\"weatherForecastHighTemp3\":\"\"", "\"weatherForecastWeek3\":\"\"",
      "\"group\":\"weather_box_ic_refresh.png\""},
     {"\"weatherForecastWeek2\":\"\"", "\"weatherForecastHighTemp2\":\"\""}},
    {"NoNetwork",
     "4x2",
     1,
     7,
     false,
     [](WidgetHostPagesTest& t) { t.SetKey("memory/dnet/status", 0); },
     {"\"msg\":\"No network connection\"", "\"date\":\"\""},
     {}},
    {"LocationOffOnCurrentLocationCity",
     "4x2",
     1,
     7,
     true,
     [](WidgetHostPagesTest& t)
     {
         t.SetKey("db/location/setting/Usemylocation", 0);
         t.SetKey("db/location/setting/GpsEnabled", 0);
     },
     {"\"msg\":\"Couldn't find location\"", "\"time\":\"\""},
     {}},
    {"ProviderWithoutLogo",
     "4x2",
     1,
     7,
     false,
     [](WidgetHostPagesTest& t)
     { t.ChangeSetting([](const NSWeather::SettingPtr& s) { s->SetCpType("WeatherNews"); }); },
     {"\"group\":\"city\"", "weather_box_ic_refresh.png"},
     {"weather_box_logo_accuweather.png"}},
};

INSTANTIATE_TEST_SUITE_P(States, WidgetPageStatesTest, ::testing::ValuesIn(kPageCases),
                         [](const ::testing::TestParamInfo<PageCase>& info) { return info.param.name; });

}  // namespace WeatherTest

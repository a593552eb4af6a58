#include <ctime>
#include <set>
#include <sstream>

#include "ContentProvider.h"
#include "IconMappingTable.h"
#include "SampleWeatherSource.h"
#include "SettingDBController.h"
#include "SiblingTestSupport.h"
#include "SunCalculator.h"
#include "WeatherCondition.h"

using namespace NSWeather;

namespace
{

class SampleWeatherSourceTest : public SiblingTest::SiblingFixture
{
protected:
    CityPtr Fill(const std::string& id, time_t when, int provider = CP_ACCUWEATHER)
    {
        CatalogueCityPtr placePtr = mCataloguePtr->FindById(id);
        EXPECT_TRUE(placePtr) << id;
        auto cityPtr = std::make_shared<City>();
        if (placePtr)
        {
            EXPECT_TRUE(mSource.Fill(*placePtr, when, provider, *cityPtr));
        }
        return cityPtr;
    }

    SampleWeatherSource mSource;
};

time_t Utc(int year, int month, int day, int hour)
{
    struct tm t = {};
    t.tm_year = year - 1900;
    t.tm_mon = month - 1;
    t.tm_mday = day;
    t.tm_hour = hour;
    return timegm(&t);
}

// Every value a refresh writes, as text, to compare two fills.
std::string Describe(const City& city)
{
    std::ostringstream out;
    auto weather = [&out](const Weather& w)
    {
        out << w.GetWeatherIcon() << w.GetWeatherStatus() << w.GetCurTemperature()->GetCelsius() << ","
            << w.GetLowTemperature()->GetCelsius() << "," << w.GetHighTemperature()->GetCelsius() << "@"
            << w.GetDate() << ";";
    };
    weather(*city.GetCurrentPtr());
    for (const HourlyPtr& h : *city.GetHourlyPtrVector()) weather(*h);
    for (const WeeklyPtr& w : *city.GetWeeklyPtrVector()) weather(*w);
    ExtraPtr e = city.GetExtraPtr();
    out << e->GetHumidity() << e->GetSunriseTime() << e->GetSunsetTime() << e->GetRealfeel()->GetCelsius()
        << e->GetPrecipitationPtr()->GetPrecProbability() << city.GetIsDayTime();
    for (const MoonPhasePtr& m : *city.GetMoonPhasePtrVector())
        out << m->GetPhaseText() << m->GetAge() << m->GetMoonRiseTime();
    return out.str();
}

double MeanHigh(const City& city)
{
    double sum = 0.0;
    for (const WeeklyPtr& w : *city.GetWeeklyPtrVector()) sum += w->GetHighTemperature()->GetCelsius();
    return sum / city.GetWeeklyPtrVector()->size();
}

struct PlaceAndTime
{
    const char* id;
    time_t when;
};

const PlaceAndTime PLACES[] = {
    {"kr-seoul", Utc(2026, 1, 15, 3)},     {"kr-seoul", Utc(2026, 7, 15, 15)},
    {"no-oslo", Utc(2026, 1, 15, 12)},     {"sg-singapore", Utc(2026, 4, 1, 0)},
    {"au-sydney", Utc(2026, 12, 24, 9)},   {"us-anchorage", Utc(2026, 6, 21, 20)},
    {"us-honolulu", Utc(2026, 10, 3, 23)},
};

TEST_F(SampleWeatherSourceTest, SameInputGivesSameWeatherAndPlausibleRows)
{
    for (const PlaceAndTime& p : PLACES)
    {
        SCOPED_TRACE(p.id);
        CityPtr firstPtr = Fill(p.id, p.when);
        EXPECT_EQ(Describe(*firstPtr), Describe(*Fill(p.id, p.when)));
        ASSERT_EQ(SampleWeatherSource::HOURLY_COUNT,
                  static_cast<int>(firstPtr->GetHourlyPtrVector()->size()));
        ASSERT_EQ(SampleWeatherSource::DAILY_COUNT, static_cast<int>(firstPtr->GetWeeklyPtrVector()->size()));
        ASSERT_EQ(SampleWeatherSource::MOON_COUNT,
                  static_cast<int>(firstPtr->GetMoonPhasePtrVector()->size()));
        CurrentPtr currentPtr = firstPtr->GetCurrentPtr();
        double cur = currentPtr->GetCurTemperature()->GetCelsius();
        EXPECT_LE(currentPtr->GetLowTemperature()->GetCelsius(), cur);
        EXPECT_GE(currentPtr->GetHighTemperature()->GetCelsius(), cur);
        EXPECT_GT(cur, -50.0);
        EXPECT_LT(cur, 45.0);
        time_t expectedHour = p.when - p.when % 3600 + 3600;
        for (const HourlyPtr& hourlyPtr : *firstPtr->GetHourlyPtrVector())
        {
            EXPECT_EQ(expectedHour, hourlyPtr->GetHour());
            expectedHour += 3600;
        }
        for (const WeeklyPtr& weeklyPtr : *firstPtr->GetWeeklyPtrVector())
            EXPECT_LE(weeklyPtr->GetLowTemperature()->GetCelsius(),
                      weeklyPtr->GetHighTemperature()->GetCelsius());
        ExtraPtr extraPtr = firstPtr->GetExtraPtr();
        EXPECT_LE(extraPtr->GetSunriseTime(), extraPtr->GetSunsetTime());
        bool isBetween = p.when >= extraPtr->GetSunriseTime() && p.when < extraPtr->GetSunsetTime();
        EXPECT_EQ(isBetween, firstPtr->GetIsDayTime());
    }
}

// 23:13 UTC on a Sunday is already Monday in Paris (solar time there is
// still Sunday): the first forecast day is the Monday, stamped at its noon.
TEST_F(SampleWeatherSourceTest, ForecastDaysAreTheCitysCivilDays)
{
    CityPtr parisPtr = Fill("fr-paris", 1796598780);
    ASSERT_TRUE(parisPtr);
    EXPECT_EQ(parisPtr->GetWeeklyPtrVector()->at(0)->GetDate(), 1796641200);
}

TEST_F(SampleWeatherSourceTest, SeasonsLatitudeAndFrontsShowInTheWeather)
{
    time_t january = Utc(2026, 1, 15, 12);
    time_t july = Utc(2026, 7, 15, 12);
    EXPECT_GT(MeanHigh(*Fill("no-oslo", july)), MeanHigh(*Fill("no-oslo", january)) + 10.0);
    EXPECT_GT(MeanHigh(*Fill("au-sydney", january)), MeanHigh(*Fill("au-sydney", july)) + 5.0);
    EXPECT_GT(MeanHigh(*Fill("sg-singapore", january)), MeanHigh(*Fill("no-oslo", january)) + 20.0);

    // Over two months fronts bring clear, cloudy and wet days; nights are
    // long in an Oslo winter and short in its summer.
    std::set<WeatherCondition> seen;
    CatalogueCityPtr seoulPtr = mCataloguePtr->FindById("kr-seoul");
    for (time_t t = january; t < january + 60 * 86400; t += 6 * 3600)
        seen.insert(SampleWeatherSource::SampleAt(*seoulPtr, t).condition);
    EXPECT_GE(seen.size(), 4u);
    CatalogueCityPtr osloPtr = mCataloguePtr->FindById("no-oslo");
    time_t rise = 0;
    time_t set = 0;
    SunCalculator::GetSunTimes(osloPtr->GetLatitude(), osloPtr->GetLongitude(), january, rise, set);
    EXPECT_LT(set - rise, 8 * 3600);
    SunCalculator::GetSunTimes(osloPtr->GetLatitude(), osloPtr->GetLongitude(), july, rise, set);
    EXPECT_GT(set - rise, 17 * 3600);
}

// The widget's own icon tables turn every provider's numbers back into the
// intended condition; KWeather has no plain flurries icon.
TEST_F(SampleWeatherSourceTest, EveryProviderIconMapsToTheIntendedCondition)
{
    setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-widget", 1);
    for (const char* cpType : {"Accuweather", "cmaweather", "Kweather", "weathernews_kr", "WeatherNews"})
    {
        ASSERT_TRUE(
            SettingDBController().SelectAndUpdate([cpType](const SettingPtr& s) { s->SetCpType(cpType); }));
        int provider = ContentProvider::GetContentProviderOfCpType(cpType);
        for (int c = 0; c < WEATHER_CONDITION_COUNT; ++c)
        {
            auto condition = static_cast<WeatherCondition>(c);
            for (bool isDay : {true, false})
            {
                int expected = WeatherConditionText::GetWidgetIcon(condition, isDay);
                if (condition == WeatherCondition::FLURRIES &&
                    (provider == CP_KWEATHER || provider == CP_WEATHERNEWS_KR))
                    expected = 11;
                int providerIcon = WeatherConditionText::GetProviderIcon(condition, provider, isDay);
                EXPECT_EQ(expected, IconMappingTable().GetMappingIconNum(providerIcon, isDay))
                    << cpType << " condition " << c << (isDay ? " day" : " night");
            }
        }
    }
    unsetenv("PLATFORM_APP_ID");
}

}  // namespace

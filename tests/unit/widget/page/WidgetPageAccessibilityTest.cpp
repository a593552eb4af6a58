// What screen readers read of the real pages, read back through
// Elementary's accessibility interface, in both languages.
#define EFL_BETA_API_SUPPORT 1
#define EFL_ACCESS_ACTION_PROTECTED 1
#include <Elementary.h>
#include <app_common.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <libintl.h>
#include <vconf.h>

#include <clocale>
#include <ctime>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SampleCities.h"
#include "SettingDBController.h"
#include "TestFiles.h"
#include "TestPlatform.h"
#include "ViewBasicElements.h"
#include "Widget4x2PageData.h"
#include "Widget4x4Page.h"
#include "Widget4x4PageData.h"
#include "WidgetAccessibleText.h"

namespace
{

using namespace NSWeather;
using namespace NSWeatherWidget;
using ::testing::StartsWith;

const char* const kWidgetId = "com.quorvex.weather-m-widget";
const time_t kDay = 86400;
const int kSanFrancisco = 2;  // sample city: cloudy, 13.2 °C (55.8 °F)

// Today at 21:40 on the test's clock (UTC).
time_t TodayAt2140()
{
    return time(nullptr) / kDay * kDay + 21 * 3600 + 40 * 60;
}

std::string Strftime(const char* format, time_t t)
{
    char text[32] = {};
    struct tm tm = {};
    gmtime_r(&t, &tm);
    strftime(text, sizeof(text), format, &tm);
    return text;
}

std::string Name(const Evas_Object* object)
{
    const char* name = object ? efl_access_object_i18n_name_get(object) : nullptr;
    return name ? name : "";
}

std::string Description(const Evas_Object* object)
{
    const char* description = object ? efl_access_object_description_get(object) : nullptr;
    return description ? description : "";
}

class WidgetPageAccessibilityTest : public WeatherTest::PlatformTest
{
public:
    void SetUp() override
    {
        ASSERT_EQ(app_set_own_id(kWidgetId), APP_ERROR_NONE);
        FileUtil::ClearCache();
        mRoot.UseBuildResources();
        mRoot.RegisterApp("com.quorvex.weather-m-agent", "exec=/bin/true\n");
        mRoot.RegisterApp("org.tizen.browser", "exec=/bin/true\nview-uri=http,https\n");
        setenv("TZ", "UTC", 1);
        tzset();
        setlocale(LC_ALL, "C.UTF-8");
        bindtextdomain("weather-m", (WeatherTest::BuildDir() + "/res/" + kWidgetId + "/res/locale").c_str());
        bind_textdomain_codeset("weather-m", "UTF-8");
        UseLanguage("en");
        for (const char* key : {"db/location/setting/Usemylocation", "db/location/setting/GpsEnabled"})
            SetKey(key, 1);
        SetKey("memory/dnet/status", 2);
        SetKey("db/menu_widget/regionformat_time1224", 2);
        ASSERT_EQ(DataStoreInitializer::Run(), 0);
        mWin = elm_win_add(nullptr, "accessibility-test", ELM_WIN_BASIC);
        ASSERT_NE(mWin, nullptr);
    }

    void TearDown() override
    {
        mPage.reset();
        evas_object_del(mWin);
        unsetenv("LANGUAGE");
        unsetenv("LC_TIME");
    }

    // The display language and the region format together, as a phone set
    // to that language has them.
    static void UseLanguage(const std::string& language)
    {
        setenv("LANGUAGE", language.c_str(), 1);
        setenv("LC_TIME", language == "ko" ? "ko_KR.UTF-8" : "en_US.UTF-8", 1);
        // Setting the domain again tells gettext its environment changed.
        textdomain(textdomain(nullptr));
    }

    static void SetKey(const char* key, int value) { ASSERT_EQ(vconf_set_int(key, value), 0) << key; }

    void ChangeSetting(const std::function<void(const SettingPtr&)>& change)
    {
        SettingPtr setting = SettingDBController().Select();
        ASSERT_TRUE(setting);
        change(setting);
        SettingDBController().Update(setting);
    }

    void UseCity(time_t refreshedTime = TodayAt2140(), bool isCurrentLocation = false)
    {
        mCity = SampleCities::MakeCity(kSanFrancisco, refreshedTime, 7);
        mCity->SetIsCurrentLocation(isCurrentLocation);
    }

    // A fresh page of that size on the settings and the city (if any).
    void MakePage(const std::string& size)
    {
        mPage.reset();
        mData = size == "4x4" ? WidgetPageDataPtr(std::make_shared<Widget4x4PageData>())
                              : WidgetPageDataPtr(std::make_shared<Widget4x2PageData>());
        mData->SetSettingPtr(SettingDBController().Select());
        mData->SetCityPtr(mCity);
        mPage = size == "4x4" ? std::make_shared<Widget4x4Page>() : std::make_shared<Widget4x2Page>();
        ASSERT_NE(mPage->Create(mWin, mData), nullptr) << mLog.Dump();
    }

    Evas_Object* State() const { return elm_object_part_content_get(mPage->GetBaseLayout(), "content"); }
    Evas_Object* CityPart(const char* part) const { return elm_object_part_content_get(State(), part); }
    // The screen reader's button over a press-effect layout of the bottom line.
    Evas_Object* Button(const char* effectPart) const
    {
        Evas_Object* bottomLine = CityPart("bottomLineSwallow");
        Evas_Object* effect = bottomLine ? elm_object_part_content_get(bottomLine, effectPart) : nullptr;
        return effect ? elm_access_object_get(effect) : nullptr;
    }

    CityPtr mCity;
    WidgetPageDataPtr mData;
    std::shared_ptr<Widget4x2Page> mPage;
    Evas_Object* mWin = nullptr;
};

void Refreshing(const SettingPtr& s)
{
    s->SetUseCurrentLocationOn(true);
    s->SetShowCurrentCityAgreement(true);
    s->SetIsNowRefreshing(true);
    s->SetRefreshingStartTime(time(nullptr));
}

// A page state: the city (none, one, or the current-location one) and
// what the settings and system keys say.
struct PageCase
{
    const char* name;
    const char* size;
    const char* language;
    enum
    {
        NO_CITY,
        CITY,
        CURRENT_LOCATION_CITY
    } city;
    enum
    {
        UPDATED_TODAY,
        UPDATED_YESTERDAY,
        REFRESHING,
        FAHRENHEIT,
        OFFLINE,
        LOCATION_OFF,
        PROVIDER_WITHOUT_LOGO
    } state;
    std::string page;  // the whole name, or its start before the local time
    bool hasLocalTime;
    std::string refresh;  // city pages: the two buttons
    std::string logo;
};

void PrintTo(const PageCase& c, std::ostream* out)
{
    *out << c.name;
}

class PageNameTest : public WidgetPageAccessibilityTest, public ::testing::WithParamInterface<PageCase>
{
public:
    void Prepare(const PageCase& c)
    {
        UseLanguage(c.language);
        if (c.city != PageCase::NO_CITY)
            UseCity(TodayAt2140() - (c.state == PageCase::UPDATED_YESTERDAY ? kDay : 0),
                    c.city == PageCase::CURRENT_LOCATION_CITY);
        ChangeSetting(
            [&c](const SettingPtr& s)
            {
                if (c.state == PageCase::REFRESHING)
                    Refreshing(s);
                s->SetTemperatureUnit(c.state == PageCase::FAHRENHEIT ? 0 : 1);
                s->SetCpType(c.state == PageCase::PROVIDER_WITHOUT_LOGO ? "WeatherNews" : "AccuWeather");
            });
        SetKey("memory/dnet/status", c.state == PageCase::OFFLINE ? 0 : 2);
        for (const char* key : {"db/location/setting/Usemylocation", "db/location/setting/GpsEnabled"})
            SetKey(key, c.state == PageCase::LOCATION_OFF ? 0 : 1);
    }
};

TEST_P(PageNameTest, SaysWhatThePageShows)
{
    const PageCase& c = GetParam();
    Prepare(c);
    MakePage(c.size);
    const std::string name = Name(State());
    if (c.hasLocalTime)  // the city's clock runs on; only its label is fixed
        EXPECT_THAT(
            name, StartsWith(c.page + (c.language == std::string("ko") ? ", 현지 시각 " : ", local time ")));
    else
        EXPECT_EQ(name, c.page);
    EXPECT_EQ(efl_access_object_role_get(State()),
              mCity ? EFL_ACCESS_ROLE_PANEL : EFL_ACCESS_ROLE_PUSH_BUTTON);
    EXPECT_EQ(Name(Button("refreshButtonEffect")), c.refresh);
    EXPECT_EQ(Name(Button("cpLogoEffect")), c.logo);
    if (mCity)
        EXPECT_EQ(efl_access_object_access_type_get(Button("cpLogoEffect")),
                  c.logo.empty() ? EFL_ACCESS_TYPE_SKIPPED : EFL_ACCESS_TYPE_REGULAR);
}

const PageCase kPageCases[] = {
    {"NoCity", "4x2", "en", PageCase::NO_CITY, PageCase::UPDATED_TODAY, "Weather. Tap here to add a city.",
     false},
    {"NoCityKorean", "4x4", "ko", PageCase::NO_CITY, PageCase::UPDATED_TODAY,
     "날씨. 도시를 추가하려면 여기를 누르세요.", false},
    {"Loading", "4x4", "en", PageCase::NO_CITY, PageCase::REFRESHING, "Loading…", false},
    {"LoadingKorean", "4x2", "ko", PageCase::NO_CITY, PageCase::REFRESHING, "불러오는 중…", false},
    {"City", "4x2", "en", PageCase::CITY, PageCase::UPDATED_TODAY,
     "San Francisco, 13 degrees Celsius, cloudy, updated 21:40", true, "Refresh", "AccuWeather"},
    {"CityKoreanFahrenheit", "4x4", "ko", PageCase::CITY, PageCase::FAHRENHEIT,
     "San Francisco, 화씨 56도, 흐림, 21:40 업데이트됨", true, "새로고침", "AccuWeather"},
    {"CurrentLocationKorean", "4x2", "ko", PageCase::CURRENT_LOCATION_CITY, PageCase::UPDATED_TODAY,
     "San Francisco, 현재 위치, 섭씨 13도, 흐림, 21:40 업데이트됨", false, "새로고침", "AccuWeather"},
    {"UpdatedYesterday", "4x2", "en", PageCase::CITY, PageCase::UPDATED_YESTERDAY,
     "San Francisco, 13 degrees Celsius, cloudy, updated " + Strftime("%m/%d", TodayAt2140() - kDay) +
         " 21:40",
     true, "Refresh", "AccuWeather"},
    {"Offline", "4x2", "en", PageCase::CITY, PageCase::OFFLINE,
     "San Francisco, 13 degrees Celsius, cloudy, No network connection", true, "Refresh", "AccuWeather"},
    {"LocationOffOnCurrentLocationCity", "4x2", "en", PageCase::CURRENT_LOCATION_CITY, PageCase::LOCATION_OFF,
     "San Francisco, current location, 13 degrees Celsius, cloudy, Couldn't find location", false, "Refresh",
     "AccuWeather"},
    {"RefreshingKorean", "4x2", "ko", PageCase::CITY, PageCase::REFRESHING,
     "San Francisco, 섭씨 13도, 흐림, 21:40 업데이트됨", true, "새로고침 중", "AccuWeather"},
    {"ProviderWithoutLogo", "4x2", "en", PageCase::CITY, PageCase::PROVIDER_WITHOUT_LOGO,
     "San Francisco, 13 degrees Celsius, sunny, updated 21:40", true, "Refresh", ""},
};

INSTANTIATE_TEST_SUITE_P(States, PageNameTest, ::testing::ValuesIn(kPageCases),
                         [](const ::testing::TestParamInfo<PageCase>& info) { return info.param.name; });

// Each change a sighted user would see reaches the names at once.
TEST_F(WidgetPageAccessibilityTest, NamesFollowTheChangesOfThePage)
{
    struct Step
    {
        const char* name;
        std::function<void(WidgetPageAccessibilityTest&)> act;
        const char* pageHas;
        const char* refresh;
    };
    const Step steps[] = {
        {"Created", nullptr, "13 degrees Celsius, cloudy, updated 21:40", "Refresh"},
        {"LanguageChanged",
         [](WidgetPageAccessibilityTest& t)
         {
             UseLanguage("ko");
             t.mPage->Resume();
         },
         "섭씨 13도, 흐림, 21:40 업데이트됨", "새로고침"},
        {"NewWeather",
         [](WidgetPageAccessibilityTest& t)
         {
             UseLanguage("en");
             t.mCity->GetCurrentPtr()->GetCurTemperature()->SetCelsiusValue(-2.4);
             t.mPage->Resume();
         },
         "-2 degrees Celsius", "Refresh"},
        {"RefreshTapped", [](WidgetPageAccessibilityTest& t) { EXPECT_EQ(t.mPage->Refresh(), 0); },
         "updated 21:40", "Refreshing"},
        {"Paused", [](WidgetPageAccessibilityTest& t) { t.mPage->Pause(); }, "updated 21:40", "Refresh"},
        {"RefreshTappedOffline",
         [](WidgetPageAccessibilityTest& t)
         {
             t.SetKey("memory/dnet/status", 0);
             t.mData->SetIsNowRefreshing(false);
             t.mPage->Resume();
             EXPECT_EQ(t.mPage->Refresh(), -1);
         },
         "cloudy, No network connection", "Refresh"},
    };
    UseCity();
    MakePage("4x2");
    for (const Step& step : steps)
    {
        if (step.act)
            step.act(*this);
        EXPECT_THAT(Name(State()), ::testing::HasSubstr(step.pageHas)) << step.name;
        EXPECT_EQ(Name(Button("refreshButtonEffect")), step.refresh) << step.name;
    }
}

// Pressing a button through the accessibility interface does what a tap
// on it does.
TEST_F(WidgetPageAccessibilityTest, ButtonsDoWhatATapDoes)
{
    struct Case
    {
        const char* effectPart;
        const char* description;
        const char* launched;
    };
    const Case cases[] = {
        {"refreshButtonEffect", "Gets the latest weather.", "REQUEST_ALL_WEATHER_INFO"},
        {"cpLogoEffect", "Opens the weather provider's website.", "https://www.accuweather.com/?partner="},
    };
    UseCity();
    MakePage("4x2");
    EXPECT_EQ(Description(State()), "Opens the weather app.");
    for (const Case& c : cases)
    {
        Evas_Object* button = Button(c.effectPart);
        ASSERT_NE(button, nullptr) << c.effectPart;
        EXPECT_EQ(Description(button), c.description);
        int activate = -1;
        for (int i = 0; const char* action = efl_access_action_name_get(button, i); ++i)
            activate = std::string(action) == "activate" ? i : activate;
        ASSERT_GE(activate, 0) << c.effectPart;
        EXPECT_TRUE(efl_access_action_do(button, activate)) << c.effectPart;
        edje_message_signal_process();
        EXPECT_THAT(WeatherTest::ReadText(mRoot.Path("log/launch.log")), ::testing::HasSubstr(c.launched))
            << c.effectPart;
    }
    EXPECT_EQ(Name(Button("refreshButtonEffect")), "Refreshing");
}

// One sentence per day shown; days the page does not show are not read.
TEST_F(WidgetPageAccessibilityTest, ForecastReadsTheDaysShown)
{
    const time_t refreshed = TodayAt2140();
    const std::string twoDays = Strftime("%a", refreshed) + ", sunny, high 16°, low 8°. " +
                                Strftime("%a", refreshed + kDay) + ", sunny, high 15°, low 9°";
    for (int days : {2, 0})
    {
        mCity = SampleCities::MakeCity(kSanFrancisco, refreshed, days);
        MakePage("4x4");
        EXPECT_EQ(Name(CityPart("weatherForecastSwallow")), days ? twoDays : "") << days;
    }
}

// Nothing outlives the page: every named object goes with it.
TEST_F(WidgetPageAccessibilityTest, NamedObjectsDieWithThePage)
{
    UseCity();
    MakePage("4x4");
    std::vector<Evas_Object*> named = {State(), CityPart("weatherForecastSwallow"),
                                       Button("refreshButtonEffect"), Button("cpLogoEffect")};
    int deleted = 0;
    auto countCb = [](void* data, Evas*, Evas_Object*, void*) { ++*static_cast<int*>(data); };
    for (Evas_Object* object : named)
    {
        ASSERT_FALSE(Name(object).empty());
        evas_object_event_callback_add(object, EVAS_CALLBACK_DEL, countCb, &deleted);
    }
    mPage.reset();
    EXPECT_EQ(deleted, static_cast<int>(named.size()));
}

TEST(WidgetAccessibleTextTest, ConditionsAreReadAsTheirImagesShowThem)
{
    setenv("LANGUAGE", "en", 1);
    setlocale(LC_ALL, "C.UTF-8");
    bindtextdomain("weather-m", (WeatherTest::BuildDir() + "/res/" + kWidgetId + "/res/locale").c_str());
    bind_textdomain_codeset("weather-m", "UTF-8");
    for (int code :
         {-1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15, 16, 17, 18, 19, 20, 21, 22, 99})
    {
        // "07.weather_view_partly_sunny_with_shower_96x96.png" shows "partly sunny with shower";
        // either may say a little more ("showers").
        std::string image = ViewBasicElements::MakeWeatherIconName(4, code);
        std::string words = image.substr(image.find("view_") + 5);
        words = words.substr(0, words.rfind('_'));
        for (char& c : words)
            if (c == '_')
                c = ' ';
        std::string name = WidgetAccessibleText::GetConditionName(code);
        EXPECT_TRUE(name.rfind(words, 0) == 0 || words.rfind(name, 0) == 0) << code << ": " << name;
    }
    unsetenv("LANGUAGE");
}

}  // namespace

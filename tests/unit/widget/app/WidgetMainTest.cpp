// WidgetMain's decisions in this process, on a fixed clock: the refreshing
// mark, the automatic-refresh check, the zone link and the answers to
// contexts the host does not know.
#include <Ecore.h>
#include <gtest/gtest.h>
#include <unistd.h>
#include <vconf.h>
#include <widget_errno.h>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SampleCities.h"
#include "SettingDBController.h"
#include "TestPlatform.h"
#include "WeatherDefine.h"
#include "WidgetMain.h"
#include "WidgetViewData.h"

namespace WeatherTest
{

using NSWeatherWidget::WidgetMain;

namespace
{
const time_t kNow = 1700000000;
time_t FixedClock()
{
    return kNow;
}
}  // namespace

class WidgetMainTest : public PlatformTest
{
public:
    void SetUp() override
    {
        NSWeather::FileUtil::ClearCache();
        ecore_init();
        WidgetMain::SetClock(FixedClock);
        ASSERT_EQ(NSWeather::DataStoreInitializer::Run(), NSWeather::ERR_OK);
        ASSERT_EQ(vconf_set_int("memory/dnet/status", 2), 0);
    }
    void TearDown() override
    {
        WidgetMain::GetInstance()->CancelAutoRefresh();
        WidgetMain::SetClock(nullptr);
        WidgetMain::SetTimeZoneLinkPath(WidgetMain::kTimeZoneLinkPath);
        ecore_shutdown();
    }
    void ChangeSetting(const std::function<void(const NSWeather::SettingPtr&)>& change)
    {
        NSWeather::SettingDBController controller;
        NSWeather::SettingPtr setting = controller.Select();
        ASSERT_TRUE(setting);
        change(setting);
        ASSERT_EQ(controller.Update(setting), NSWeather::ERR_OK);
    }
};

TEST_F(WidgetMainTest, RefreshingMarkIsStaleAfterNinetySeconds)
{
    struct Case
    {
        bool flag;
        time_t start;
        bool refreshing;
    };
    const Case cases[] = {
        {true, kNow - 89, true}, {true, kNow - 90, false}, {false, kNow, false}, {true, kNow + 30, true}};
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.start - kNow);
        ChangeSetting(
            [&](const NSWeather::SettingPtr& s)
            {
                s->SetIsNowRefreshing(c.flag);
                s->SetRefreshingStartTime(c.start);
            });
        EXPECT_EQ(WidgetMain::GetInstance()->GetIsNowRefreshing(), c.refreshing);
    }
    WidgetMain::GetInstance()->SetIsNowRefreshing(true);
    NSWeather::SettingPtr setting = NSWeather::SettingDBController().Select();
    EXPECT_TRUE(setting->GetIsNowRefreshing());
    EXPECT_EQ(setting->GetRefreshingStartTime(), kNow);
    WidgetMain::GetInstance()->SetIsNowRefreshing(false);
    EXPECT_FALSE(NSWeather::SettingDBController().Select()->GetIsNowRefreshing());
}

TEST_F(WidgetMainTest, AutomaticRefreshStartsOneTimerOnlyWhenTheDataIsOlderThanTheInterval)
{
    struct Case
    {
        const char* name;
        int hours;
        time_t age;
        time_t markAge;  // < 0: no mark
        int networkStatus;
        bool timer;
    };
    const Case cases[] = {
        {"IntervalZero", 0, 100000, -1, 2, false},   {"ExactlyOneHour", 1, 3600, -1, 2, false},
        {"OneHourAndASecond", 1, 3601, -1, 2, true}, {"MarkOfNinetySeconds", 1, 7200, 90, 2, false},
        {"MarkOfNinetyOne", 1, 7200, 91, 2, true},   {"RefreshedInTheFuture", 1, -600, -1, 2, true},
        {"NoNetwork", 1, 7200, -1, 0, false},
    };
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        ASSERT_EQ(NSWeatherWidget::SampleCities::WriteCities(2, kNow - c.age, 7, false), NSWeather::ERR_OK);
        ChangeSetting(
            [&](const NSWeather::SettingPtr& s)
            {
                s->SetAutoRefreshInterval(c.hours);
                s->SetIsNowRefreshing(c.markAge >= 0);
                s->SetRefreshingStartTime(kNow - c.markAge);
            });
        ASSERT_EQ(vconf_set_int("memory/dnet/status", c.networkStatus), 0);
        WidgetMain* widgetMain = WidgetMain::GetInstance();
        auto viewData = std::make_shared<NSWeatherWidget::WidgetViewData>();
        viewData->SetCityPtrVector(widgetMain->GetWeatherInfo());
        widgetMain->StartAutoRefreshIfNeeded(viewData, widgetMain->GetSettingPtr());
        EXPECT_EQ(widgetMain->HasPendingAutoRefresh(), c.timer);
        // A second check replaces the pending timer rather than adding one.
        widgetMain->StartAutoRefreshIfNeeded(viewData, widgetMain->GetSettingPtr());
        widgetMain->CancelAutoRefresh();
        EXPECT_FALSE(widgetMain->HasPendingAutoRefresh());
    }
}

TEST_F(WidgetMainTest, TimeZoneIsWhatFollowsTheZoneFolder)
{
    struct Case
    {
        const char* target;  // nullptr: no link
        const char* key;
        const char* zone;
    };
    const Case cases[] = {
        {"/usr/share/zoneinfo/Europe/Paris", "Asia/Seoul", "Europe/Paris"},
        {"../usr/share/zoneinfo/Asia/Tokyo", "Asia/Seoul", "Asia/Tokyo"},
        {"/zoneinfo/America/New_York", "Asia/Seoul", "America/New_York"},
        {"/etc/somewhere/UTC", "Asia/Seoul", "Asia/Seoul"},
        {nullptr, "Europe/Berlin", "Europe/Berlin"},
        {nullptr, "", ""},
    };
    std::string link = mRoot.Path("localtime");
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.target ? c.target : "(no link)");
        unlink(link.c_str());
        if (c.target)
        {
            ASSERT_EQ(symlink(c.target, link.c_str()), 0);
        }
        ASSERT_EQ(vconf_set_str("db/setting/timezone_id", c.key), 0);
        EXPECT_EQ(WidgetMain::GetTimeZone(link), c.zone);
    }
}

TEST_F(WidgetMainTest, CallbacksAnswerAnUnknownContextWithTheirCodes)
{
    widget_context_h unknown = nullptr;
    EXPECT_EQ(WidgetMain::CreateWidgetInstance(unknown, nullptr, 712, 354, nullptr), -22);
    EXPECT_EQ(WidgetMain::DestroyWidgetInstance(unknown, WIDGET_APP_DESTROY_TYPE_DEFAULT, nullptr, nullptr),
              WIDGET_ERROR_NOT_EXIST);
    EXPECT_EQ(WidgetMain::PauseWidgetInstance(unknown, nullptr), WIDGET_ERROR_NOT_EXIST);
    EXPECT_EQ(WidgetMain::ResumeWidgetInstance(unknown, nullptr), 0);
    EXPECT_EQ(WidgetMain::ResizeWidgetInstance(unknown, 712, 354, nullptr), WIDGET_ERROR_NOT_EXIST);
    EXPECT_EQ(WidgetMain::UpdateWidgetInstance(unknown, nullptr, 1, nullptr), WIDGET_ERROR_NOT_EXIST);
}

}  // namespace WeatherTest

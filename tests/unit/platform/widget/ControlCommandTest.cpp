#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <Ecore.h>

#include <cstdlib>
#include <ctime>

#include "app_common.h"
#include "widget/AppEventDispatcher.h"
#include "widget/ControlCommandHandler.h"
#include "widget/ObjectTreeDumper.h"

using platform::AppEventDispatcher;
using platform::ControlCommandHandler;
using platform::ObjectTreeDumper;
using ::testing::ElementsAre;

namespace WeatherTest
{

TEST(ControlCommand, SplitsAtAnyWhitespace)
{
    EXPECT_THAT(ControlCommandHandler::Split("  tap\tid:1   10 20 "), ElementsAre("tap", "id:1", "10", "20"));
    EXPECT_TRUE(ControlCommandHandler::Split("   ").empty());
}

TEST(ControlCommand, NumbersMustBeWholeIntegers)
{
    int value = 7;
    EXPECT_TRUE(ControlCommandHandler::ParseInt("-12", value));
    EXPECT_EQ(value, -12);
    for (const char* bad : {"", "12a", "1.5", " 3", "99999999999", "0x10"})
    {
        value = 7;
        EXPECT_FALSE(ControlCommandHandler::ParseInt(bad, value)) << bad;
        EXPECT_EQ(value, 7) << bad;
    }
}

TEST(ControlCommand, CallbackFailuresBecomeErrWithTheirCode)
{
    EXPECT_EQ(ControlCommandHandler::Result("resize", 0), "OK");
    EXPECT_EQ(ControlCommandHandler::Result("resize", -22), "ERR resize returned -22");
}

TEST(ControlCommand, DumpTextsAreValidJsonStrings)
{
    EXPECT_EQ(ObjectTreeDumper::Quote("Seoul \"12\"\n\\"), "\"Seoul \\\"12\\\"\\u000a\\\\\"");
    EXPECT_EQ(ObjectTreeDumper::Quote(std::string("a\x01"
                                                  "b")),
              "\"a\\u0001b\"");
    EXPECT_EQ(ObjectTreeDumper::Quote("서울"), "\"서울\"");
    EXPECT_EQ(ObjectTreeDumper::Quote("Se\xffoul"), "\"Se\xef\xbf\xbdoul\"");
}

TEST(AppEvents, LanguageKeyBecomesALanguageList)
{
    EXPECT_EQ(AppEventDispatcher::LanguageList("ko_KR.UTF-8"), "ko_KR:ko");
    EXPECT_EQ(AppEventDispatcher::LanguageList("en_US.UTF-8@euro"), "en_US:en");
    EXPECT_EQ(AppEventDispatcher::LanguageList("de"), "de");
    EXPECT_EQ(AppEventDispatcher::LanguageList("C.UTF-8"), "");
    EXPECT_EQ(AppEventDispatcher::LanguageList(""), "");
}

TEST(AppEvents, TimeZoneKeySetsLocalTimeOnlyForAKnownZone)
{
    const char* old = getenv("TZ");
    std::string saved = old ? old : "";
    struct Case
    {
        const char* zone;
        bool applied;
    };
    const Case cases[] = {{"Asia/Tokyo", true},
                          {"", false},
                          {"Nowhere/City", false},
                          {"../../etc/passwd", false},
                          {"/usr/share/zoneinfo/UTC", false},
                          {"Asia/Tokyo;x", false}};
    for (const Case& c : cases)
    {
        ASSERT_TRUE(AppEventDispatcher::ApplyTimeZone("Europe/London"));
        EXPECT_EQ(AppEventDispatcher::ApplyTimeZone(c.zone), c.applied) << c.zone;
        time_t noon = 1700000000;
        struct tm local;
        localtime_r(&noon, &local);
        EXPECT_EQ(local.tm_gmtoff, c.applied ? 9 * 3600 : 0) << c.zone;
    }
    if (old)
        setenv("TZ", saved.c_str(), 1);
    else
        unsetenv("TZ");
    tzset();
}

TEST(AppEvents, HandlerRulesFollowThePlatform)
{
    ecore_init();  // the key watch behind a handler lives on the main loop
    auto& dispatcher = AppEventDispatcher::GetInstance();
    app_event_cb callback = [](app_event_info_h, void*) {};
    app_event_handler_h handler = nullptr;
    EXPECT_EQ(dispatcher.AddHandler(&handler, APP_EVENT_DEVICE_ORIENTATION_CHANGED, callback, nullptr),
              TIZEN_ERROR_NOT_SUPPORTED);
    EXPECT_EQ(dispatcher.AddHandler(&handler, static_cast<app_event_type_e>(9), callback, nullptr),
              APP_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(dispatcher.AddHandler(nullptr, APP_EVENT_LOW_MEMORY, callback, nullptr),
              APP_ERROR_INVALID_PARAMETER);
    ASSERT_EQ(dispatcher.AddHandler(&handler, APP_EVENT_LOW_MEMORY, callback, nullptr), APP_ERROR_NONE);
    app_event_handler_h duplicate = nullptr;
    EXPECT_EQ(dispatcher.AddHandler(&duplicate, APP_EVENT_LOW_MEMORY, callback, nullptr),
              APP_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(dispatcher.RemoveHandler(handler), APP_ERROR_NONE);
    EXPECT_EQ(dispatcher.RemoveHandler(handler), APP_ERROR_INVALID_PARAMETER);
    ecore_shutdown();
}

TEST(AppEvents, EventInfoGivesOnlyItsOwnKindOfValue)
{
    app_event_info language{APP_EVENT_LANGUAGE_CHANGED, "ko_KR.UTF-8", 0};
    char* text = nullptr;
    ASSERT_EQ(app_event_get_language(&language, &text), APP_ERROR_NONE);
    EXPECT_STREQ(text, "ko_KR.UTF-8");
    free(text);
    EXPECT_EQ(app_event_get_region_format(&language, &text), APP_ERROR_INVALID_CONTEXT);
    app_event_low_battery_status_e battery = APP_EVENT_LOW_BATTERY_POWER_OFF;
    EXPECT_EQ(app_event_get_low_battery_status(&language, &battery), APP_ERROR_INVALID_CONTEXT);
    app_event_info memory{APP_EVENT_LOW_MEMORY, std::string(), APP_EVENT_LOW_MEMORY_SOFT_WARNING};
    app_event_low_memory_status_e status = APP_EVENT_LOW_MEMORY_NORMAL;
    ASSERT_EQ(app_event_get_low_memory_status(&memory, &status), APP_ERROR_NONE);
    EXPECT_EQ(status, APP_EVENT_LOW_MEMORY_SOFT_WARNING);
    EXPECT_EQ(app_event_get_low_memory_status(nullptr, &status), APP_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_event_get_language(&language, nullptr), APP_ERROR_INVALID_PARAMETER);
}

}  // namespace WeatherTest

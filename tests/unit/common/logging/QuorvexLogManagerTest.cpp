#include "QuorvexLogManager.h"

#include <Ecore.h>
#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "TestFiles.h"
#include "TestPlatform.h"

using NSWeather::QuorvexLogManager;

namespace
{

const std::string kFeatureUri = "content://" QUORVEX_LOG_AUTHORITY "/log/use_app_feature_survey";
const std::string kStatusUri = "content://" QUORVEX_LOG_AUTHORITY "/log/report_app_status_survey";

struct Record
{
    std::string uri;
    std::string data;
};

// Splits {"request_id":N,"uri":"...","data":{...}} into its uri and data.
Record Parse(const std::string& line)
{
    size_t uriAt = line.find("\"uri\":\"") + 7;
    size_t uriEnd = line.find("\",\"data\":", uriAt);
    size_t dataAt = uriEnd + 9;
    return {line.substr(uriAt, uriEnd - uriAt), line.substr(dataAt, line.size() - dataAt - 1)};
}

std::string Data(const std::string& feature, const std::string& extra, const std::string& value)
{
    return "{\"app_id\":\"com.quorvex.weather-m\",\"feature\":\"" + feature + "\",\"extra\":\"" + extra +
           "\",\"value\":\"" + value + "\"}";
}

class QuorvexLogManagerTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override { ecore_init(); }

    void TearDown() override
    {
        // The manager is process-wide; leave it without a handle.
        QuorvexLogManager::GetInstance()->Destroy();
        ecore_shutdown();
    }

    std::vector<Record> Records() const
    {
        std::vector<Record> records;
        for (const std::string& line : WeatherTest::ReadLines(mRoot.Path("log/usage.log")))
            records.push_back(Parse(line));
        return records;
    }

    QuorvexLogManager* mManager = QuorvexLogManager::GetInstance();
};

// Only a created manager sends; a second Create keeps the one handle.
TEST_F(QuorvexLogManagerTest, SendsOnlyBetweenCreateAndDestroy)
{
    mManager->CollectLogByFeature(2005, 10, 0);
    mManager->Create();
    mManager->Create();
    mManager->CollectLogByFeature(2008, 13, 1);
    mManager->Destroy();
    mManager->CollectLogByFeature(2005, 10, 0);
    EXPECT_EQ(1u, Records().size());
}

TEST_F(QuorvexLogManagerTest, RecordsCarryTheirKeysAndValues)
{
    mManager->Create();
    const struct
    {
        int feature, detail, uriType, value;
        std::string uri, data;
    } cases[] = {
        {2005, 10, 0, 0, kFeatureUri, Data("2005", "enter_accuweather", "0")},
        {2008, 15, 1, -1, kStatusUri, Data("2008", "added_widget_4x2", "0")},
        {2008, 14, 1, 0, kStatusUri, Data("2008", "added_widget_4x4", "0")},
        {2009, 16, 0, 1, kFeatureUri, Data("2009", "widget_alive", "1000")},
        {1, 0, 0, 7, kFeatureUri, Data("1", "use_current_location_option", "7000")},
        // Too large to scale: capped instead of overflowing.
        {1, 0, 0, INT_MAX, kFeatureUri, Data("1", "use_current_location_option", "2147483000")},
        // An unknown detail still sends, with an empty extra.
        {2008, 17, 1, 0, kStatusUri, Data("2008", "", "0")},
        // An unknown uri type is refused by the client: nothing stored.
        {2005, 10, 2, 0, "", ""},
    };
    for (const auto& c : cases) mManager->CollectLogByFeature(c.feature, c.detail, c.uriType, c.value);
    std::vector<Record> records = Records();
    ASSERT_EQ(std::size(cases) - 1, records.size());
    for (size_t i = 0; i < records.size(); ++i)
    {
        EXPECT_EQ(cases[i].uri, records[i].uri) << i;
        EXPECT_EQ(cases[i].data, records[i].data) << i;
    }
    EXPECT_TRUE(mLog.Contains("quorvex_log_manager_insert failed : -22", "weather-common")) << mLog.Dump();
}

TEST_F(QuorvexLogManagerTest, CompletionIsLoggedOnTheMainLoop)
{
    mManager->Create();
    mManager->CollectLogByFeature(2005, 10, 0);
    EXPECT_FALSE(mLog.Contains("completed"));
    ecore_timer_add(
        0.05,
        [](void*) -> Eina_Bool
        {
            ecore_main_loop_quit();
            return ECORE_CALLBACK_CANCEL;
        },
        nullptr);
    ecore_main_loop_begin();
    EXPECT_TRUE(mLog.Contains("completed, uri:" + kFeatureUri, "weather-common")) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("Insert request:"));
}

}  // namespace

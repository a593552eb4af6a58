#include <quorvex_log_manager.h>

#include <Ecore.h>
#include <sys/stat.h>
#include <unistd.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "MainLoop.h"
#include "TestFiles.h"
#include "TestPlatform.h"

namespace
{

struct Completion
{
    int requestId;
    std::string uri;
};

void CompletedCb(int requestId, const char* uri, void* data)
{
    static_cast<std::vector<Completion>*>(data)->push_back({requestId, uri});
}

class UsageLogClientTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        ecore_init();
        ASSERT_EQ(QUORVEX_LOG_MANAGER_ERROR_NONE, quorvex_log_manager_create(&mManager));
        mData = bundle_create();
    }

    void TearDown() override
    {
        bundle_free(mData);
        if (mManager)
            quorvex_log_manager_destroy(mManager);
        ecore_shutdown();
    }

    std::vector<std::string> Records() const { return WeatherTest::ReadLines(mRoot.Path("log/usage.log")); }

    quorvex_log_manager_h mManager = nullptr;
    bundle* mData = nullptr;
    std::vector<Completion> mCompleted;
};

TEST_F(UsageLogClientTest, RecordIsStoredAndCompletionArrivesOnTheLoop)
{
    bundle_add_str(mData, "app_id", "com.quorvex.weather-m");
    bundle_add_str(mData, "extra", "say \"hi\"");
    int first = quorvex_log_manager_insert(mManager, "content://a/log/x", mData, CompletedCb, &mCompleted);
    int second = quorvex_log_manager_insert(mManager, "content://a/log/y", mData, CompletedCb, &mCompleted);
    ASSERT_GT(first, 0);
    EXPECT_GT(second, first);
    EXPECT_TRUE(mCompleted.empty());

    std::vector<std::string> records = Records();
    ASSERT_EQ(2u, records.size());
    EXPECT_EQ("{\"request_id\":" + std::to_string(first) +
                  ",\"uri\":\"content://a/log/x\",\"data\":{\"app_id\":\"com.quorvex.weather-m\","
                  "\"extra\":\"say \\\"hi\\\"\"}}",
              records[0]);

    WeatherTest::RunLoopFor(0.05);
    ASSERT_EQ(2u, mCompleted.size());
    EXPECT_EQ(first, mCompleted[0].requestId);
    EXPECT_EQ("content://a/log/x", mCompleted[0].uri);
    EXPECT_EQ(second, mCompleted[1].requestId);
}

TEST_F(UsageLogClientTest, EmptyUriOrRecordIsRefused)
{
    EXPECT_EQ(QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER,
              quorvex_log_manager_insert(mManager, "content://a", mData, CompletedCb, &mCompleted));
    bundle_add_str(mData, "k", "v");
    EXPECT_EQ(QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER,
              quorvex_log_manager_insert(mManager, "", mData, CompletedCb, &mCompleted));
    EXPECT_EQ(QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER,
              quorvex_log_manager_insert(nullptr, "content://a", mData, nullptr, nullptr));
    EXPECT_EQ(QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER,
              quorvex_log_manager_insert(mManager, "content://a", nullptr, nullptr, nullptr));
    EXPECT_TRUE(mLog.Contains("rejected a record", "USAGE_LOG"));
    WeatherTest::RunLoopFor(0.05);
    EXPECT_TRUE(Records().empty());
    EXPECT_TRUE(mCompleted.empty());
}

TEST_F(UsageLogClientTest, DestroyDropsPendingCompletions)
{
    bundle_add_str(mData, "k", "v");
    ASSERT_GT(quorvex_log_manager_insert(mManager, "content://a", mData, CompletedCb, &mCompleted), 0);
    ASSERT_GT(quorvex_log_manager_insert(mManager, "content://a", mData, nullptr, nullptr), 0);
    EXPECT_EQ(QUORVEX_LOG_MANAGER_ERROR_NONE, quorvex_log_manager_destroy(mManager));
    mManager = nullptr;
    WeatherTest::RunLoopFor(0.05);
    EXPECT_TRUE(mCompleted.empty());
    EXPECT_EQ(2u, Records().size());
}

TEST_F(UsageLogClientTest, LogThatIsNotOurPlainFileIsAnIoError)
{
    bundle_add_str(mData, "k", "v\xFF");
    ASSERT_GT(quorvex_log_manager_insert(mManager, "content://a", mData, nullptr, nullptr), 0);
    EXPECT_EQ("{\"k\":\"v\xEF\xBF\xBD\"}}", Records().at(0).substr(Records()[0].find("{\"k")));
    std::string logPath = mRoot.Path("log/usage.log");
    struct stat st;
    ASSERT_EQ(0, stat(logPath.c_str(), &st));
    EXPECT_EQ(0600u, st.st_mode & 0777);

    // A folder, then a planted link, where the log file should be.
    std::string target = mRoot.Path("target");
    WeatherTest::WriteText(target, "");
    for (bool asLink : {false, true})
    {
        unlink(logPath.c_str());
        ASSERT_EQ(0, asLink ? symlink(target.c_str(), logPath.c_str()) : mkdir(logPath.c_str(), 0700));
        EXPECT_EQ(QUORVEX_LOG_MANAGER_ERROR_IO_ERROR,
                  quorvex_log_manager_insert(mManager, "content://a", mData, CompletedCb, &mCompleted));
        rmdir(logPath.c_str());
    }
    EXPECT_EQ("", WeatherTest::ReadText(target));
    EXPECT_EQ(2, mLog.Count("cannot write the usage log", "USAGE_LOG"));
    WeatherTest::RunLoopFor(0.05);
    EXPECT_TRUE(mCompleted.empty());
}

}  // namespace

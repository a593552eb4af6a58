#include <net_connection.h>
#include <vconf.h>

#include <Ecore.h>
#include <gtest/gtest.h>

#include <vector>

#include "MainLoop.h"
#include "TestPlatform.h"

namespace
{
using WeatherTest::PlatformTest;
using WeatherTest::RunLoopFor;
using WeatherTest::RunLoopUntil;

class ConnectionTest : public PlatformTest
{
protected:
    void SetUp() override
    {
        ecore_init();
        ASSERT_EQ(connection_create(&mConnection), CONNECTION_ERROR_NONE);
    }
    void TearDown() override
    {
        if (mConnection)
            connection_destroy(mConnection);
        ecore_shutdown();
    }
    static void TypeChangedCb(connection_type_e type, void* data)
    {
        static_cast<std::vector<int>*>(data)->push_back(type);
    }
    connection_h mConnection = nullptr;
};

TEST_F(ConnectionTest, StatusKeyNumberingMapsOntoConnectionTypes)
{
    connection_type_e unread = CONNECTION_TYPE_WIFI;
    EXPECT_EQ(connection_get_type(mConnection, &unread), CONNECTION_ERROR_OPERATION_FAILED);
    EXPECT_EQ(unread, CONNECTION_TYPE_WIFI);
    const struct
    {
        int status;
        connection_type_e type;
    } kCases[] = {{VCONFKEY_NETWORK_OFF, CONNECTION_TYPE_DISCONNECTED},
                  {VCONFKEY_NETWORK_CELLULAR, CONNECTION_TYPE_CELLULAR},
                  {VCONFKEY_NETWORK_WIFI, CONNECTION_TYPE_WIFI},
                  {VCONFKEY_NETWORK_ETHERNET, CONNECTION_TYPE_ETHERNET},
                  {VCONFKEY_NETWORK_BLUETOOTH, CONNECTION_TYPE_BT},
                  {17, CONNECTION_TYPE_DISCONNECTED},
                  {-1, CONNECTION_TYPE_DISCONNECTED}};
    for (const auto& item : kCases)
    {
        SCOPED_TRACE(item.status);
        ASSERT_EQ(vconf_set_int(VCONFKEY_NETWORK_STATUS, item.status), VCONF_OK);
        connection_type_e type = CONNECTION_TYPE_BT;
        EXPECT_EQ(connection_get_type(mConnection, &type), CONNECTION_ERROR_NONE);
        EXPECT_EQ(type, item.type);
    }
}

TEST_F(ConnectionTest, OnlyANewTypeIsReported)
{
    ASSERT_EQ(vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI), VCONF_OK);
    std::vector<int> seen;
    ASSERT_EQ(connection_set_type_changed_cb(mConnection, TypeChangedCb, &seen), CONNECTION_ERROR_NONE);
    // Rewrites of the same type, then one change; 17 and -1 read as disconnected.
    const struct
    {
        std::vector<int> writes;
        int type;
    } kSteps[] = {
        {{VCONFKEY_NETWORK_WIFI, VCONFKEY_NETWORK_WIFI, VCONFKEY_NETWORK_CELLULAR}, CONNECTION_TYPE_CELLULAR},
        {{VCONFKEY_NETWORK_CELLULAR, VCONFKEY_NETWORK_OFF, 17, -1}, CONNECTION_TYPE_DISCONNECTED},
        {{VCONFKEY_NETWORK_OFF, VCONFKEY_NETWORK_ETHERNET}, CONNECTION_TYPE_ETHERNET},
    };
    std::vector<int> expected;
    for (const auto& step : kSteps)
    {
        for (int status : step.writes)
        {
            ASSERT_EQ(vconf_set_int(VCONFKEY_NETWORK_STATUS, status), VCONF_OK);
            RunLoopFor(0.02);
        }
        expected.push_back(step.type);
        ASSERT_TRUE(RunLoopUntil([&] { return seen.size() >= expected.size(); }, 5.0));
        EXPECT_EQ(seen, expected);
    }
}

TEST_F(ConnectionTest, SeveralHandlesEachHearChangesUntilUnset)
{
    connection_h second = nullptr;
    ASSERT_EQ(connection_create(&second), CONNECTION_ERROR_NONE);
    std::vector<int> first;
    std::vector<int> other;
    ASSERT_EQ(connection_set_type_changed_cb(mConnection, TypeChangedCb, &first), CONNECTION_ERROR_NONE);
    ASSERT_EQ(connection_set_type_changed_cb(second, TypeChangedCb, &other), CONNECTION_ERROR_NONE);
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI);
    ASSERT_TRUE(RunLoopUntil([&] { return first.size() == 1 && other.size() == 1; }, 5.0));

    EXPECT_EQ(connection_unset_type_changed_cb(mConnection), CONNECTION_ERROR_NONE);
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_ETHERNET);
    ASSERT_TRUE(RunLoopUntil([&] { return other.size() == 2; }, 5.0));
    EXPECT_EQ(other.back(), CONNECTION_TYPE_ETHERNET);

    EXPECT_EQ(connection_destroy(second), CONNECTION_ERROR_NONE);
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI);
    RunLoopFor(0.2);
    EXPECT_EQ(first.size(), 1u);
    EXPECT_EQ(other.size(), 2u);
}

// A callback that destroys another handle: that handle is not called (ASan
// would see a freed one).
TEST_F(ConnectionTest, CallbackMayDestroyAnotherHandle)
{
    struct Context
    {
        connection_h other = nullptr;
        int otherCalls = 0;
    } context;
    ASSERT_EQ(connection_create(&context.other), CONNECTION_ERROR_NONE);
    auto destroyOther = [](connection_type_e, void* data)
    {
        auto* ctx = static_cast<Context*>(data);
        connection_destroy(ctx->other);
        ctx->other = nullptr;
    };
    ASSERT_EQ(connection_set_type_changed_cb(mConnection, destroyOther, &context), CONNECTION_ERROR_NONE);
    ASSERT_EQ(connection_set_type_changed_cb(
                  context.other,
                  [](connection_type_e, void* data) { ++static_cast<Context*>(data)->otherCalls; }, &context),
              CONNECTION_ERROR_NONE);
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI);
    ASSERT_TRUE(RunLoopUntil([&] { return context.other == nullptr; }, 5.0));
    RunLoopFor(0.1);
    EXPECT_EQ(context.otherCalls, 0);
}

TEST_F(ConnectionTest, BadHandlesAndArgumentsAreRejected)
{
    connection_type_e type;
    int notAHandle = 0;
    EXPECT_EQ(connection_get_type(&notAHandle, &type), CONNECTION_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(connection_unset_type_changed_cb(&notAHandle), CONNECTION_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(connection_destroy(mConnection), CONNECTION_ERROR_NONE);
    // A second destroy of the same handle is refused, not a double free.
    EXPECT_EQ(connection_destroy(mConnection), CONNECTION_ERROR_INVALID_PARAMETER);
    mConnection = nullptr;
}

}  // namespace

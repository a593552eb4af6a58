#include "NetworkConnection.h"

#include <vconf.h>

#include <Ecore.h>
#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

#include "MainLoop.h"
#include "TestPlatform.h"
#include "WeatherDefine.h"

namespace
{
using NSWeather::NetworkConnection;
using NSWeather::NetworkConnectionStateEventListner;

class RecordingListener : public NetworkConnectionStateEventListner
{
public:
    void OnNetworkConnectionStateChanged(int state, void* userData) override
    {
        mStates.push_back(state);
        mUserData.push_back(userData);
        if (mThrow)
            throw std::runtime_error("listener failed");
    }
    std::vector<int> mStates;
    std::vector<void*> mUserData;
    bool mThrow = false;
};

class NetworkConnectionTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override { ecore_init(); }
    void TearDown() override { ecore_shutdown(); }
};

TEST_F(NetworkConnectionTest, AvailabilityOfEachConnectionType)
{
    const struct
    {
        int status;
        bool available;
    } kCases[] = {{VCONFKEY_NETWORK_WIFI, true},
                  {VCONFKEY_NETWORK_CELLULAR, true},
                  {VCONFKEY_NETWORK_ETHERNET, true},
                  {VCONFKEY_NETWORK_OFF, false},
                  {VCONFKEY_NETWORK_BLUETOOTH, false}};
    NetworkConnection connection;
    EXPECT_FALSE(connection.IsNetworkAvailable());
    EXPECT_TRUE(mLog.Contains("connection_get_type:", "weather-common")) << mLog.Dump();
    for (const auto& item : kCases)
    {
        SCOPED_TRACE(item.status);
        mLog.Clear();
        ASSERT_EQ(vconf_set_int(VCONFKEY_NETWORK_STATUS, item.status), VCONF_OK);
        EXPECT_EQ(connection.IsNetworkAvailable(), item.available);
        EXPECT_EQ(
            mLog.Count(item.available ? "network isAvailable:1" : "network isAvailable:0", "weather-common"),
            1)
            << mLog.Dump();
        EXPECT_EQ(mLog.Contains("connection type disconnected or bt connection. network connection type:"),
                  !item.available);
    }
}

TEST_F(NetworkConnectionTest, ChangeReachesListenerWithNewTypeAndUserData)
{
    RecordingListener listener;
    int tag = 0;
    NetworkConnection connection;
    ASSERT_EQ(connection.SetNetworkConnectionStateChangedCb(&listener, &tag), NSWeather::ERR_OK);
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_CELLULAR);
    ASSERT_TRUE(WeatherTest::RunLoopUntil([&] { return listener.mStates.size() == 1; }, 5.0));
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI);
    ASSERT_TRUE(WeatherTest::RunLoopUntil([&] { return listener.mStates.size() == 2; }, 5.0));
    EXPECT_EQ(listener.mStates, (std::vector<int>{CONNECTION_TYPE_CELLULAR, CONNECTION_TYPE_WIFI}));
    EXPECT_EQ(listener.mUserData, (std::vector<void*>{&tag, &tag}));
}

TEST_F(NetworkConnectionTest, ListenerExceptionsStayInsideTheCallback)
{
    RecordingListener listener;
    listener.mThrow = true;
    NetworkConnection connection;
    ASSERT_EQ(connection.SetNetworkConnectionStateChangedCb(&listener, nullptr), NSWeather::ERR_OK);
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_OFF);
    ASSERT_TRUE(WeatherTest::RunLoopUntil([&] { return listener.mStates.size() == 1; }, 5.0));
    EXPECT_TRUE(mLog.Contains("listener failed", "weather-common")) << mLog.Dump();
}

TEST_F(NetworkConnectionTest, RegisteringWithoutListenerFailsAndRegistersNothing)
{
    NetworkConnection connection;
    EXPECT_EQ(connection.SetNetworkConnectionStateChangedCb(nullptr, nullptr), NSWeather::ERR_FAIL);
    EXPECT_TRUE(mLog.Contains("eventListener is null [break]", "weather-common")) << mLog.Dump();
}

TEST_F(NetworkConnectionTest, DestroyedMonitorHearsNoMoreChanges)
{
    RecordingListener listener;
    {
        NetworkConnection connection;
        ASSERT_EQ(connection.SetNetworkConnectionStateChangedCb(&listener, nullptr), NSWeather::ERR_OK);
    }
    vconf_set_int(VCONFKEY_NETWORK_STATUS, VCONFKEY_NETWORK_WIFI);
    WeatherTest::RunLoopFor(0.2);
    EXPECT_TRUE(listener.mStates.empty());
    EXPECT_FALSE(mLog.Contains("connection_destroy failed"));
}

}  // namespace

#ifndef WEATHER_TESTS_COMMON_TIME_TIME_ENVIRONMENT_H
#define WEATHER_TESTS_COMMON_TIME_TIME_ENVIRONMENT_H

#include <cstdlib>
#include <ctime>
#include <string>

#include "TestPlatform.h"

namespace WeatherTest
{

// Sets an environment variable for the test and restores it afterwards.
class ScopedEnv
{
public:
    explicit ScopedEnv(const char* name) : mName(name), mHad(getenv(name) != nullptr)
    {
        if (mHad)
            mOld = getenv(name);
    }
    ~ScopedEnv()
    {
        mHad ? setenv(mName.c_str(), mOld.c_str(), 1) : unsetenv(mName.c_str());
        tzset();
    }
    void Set(const char* value)
    {
        setenv(mName.c_str(), value, 1);
        tzset();
    }

private:
    std::string mName;
    bool mHad;
    std::string mOld;
};

// A fresh root with the device at UTC and the region format en_US.
class TimeTest : public PlatformTest
{
protected:
    void SetUp() override
    {
        mTz.Set("UTC");
        mLcTime.Set("en_US.UTF-8");
    }
    ScopedEnv mTz{"TZ"};
    ScopedEnv mLcTime{"LC_TIME"};
};

// 2026-07-14 00:00:00 UTC, a Tuesday.
const time_t kJuly14 = 1783987200;

}  // namespace WeatherTest

#endif

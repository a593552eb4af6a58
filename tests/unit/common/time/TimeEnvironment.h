#ifndef WEATHER_TESTS_COMMON_TIME_TIME_ENVIRONMENT_H
#define WEATHER_TESTS_COMMON_TIME_TIME_ENVIRONMENT_H

#include <cstdlib>
#include <ctime>
#include <string>

#include "TestPlatform.h"

namespace WeatherTest
{

// Restores an environment variable when it goes.
class ScopedEnv
{
public:
    explicit ScopedEnv(const char* name) : mName(name)
    {
        const char* old = getenv(name);
        mHad = old != nullptr;
        if (mHad)
            mOld = old;
    }
    ~ScopedEnv()
    {
        if (mHad)
            setenv(mName.c_str(), mOld.c_str(), 1);
        else
            unsetenv(mName.c_str());
        tzset();
    }
    void Set(const char* value)
    {
        setenv(mName.c_str(), value, 1);
        tzset();
    }

private:
    std::string mName;
    std::string mOld;
    bool mHad = false;
};

// A fresh root with the device clock, region format and language under the
// test's control (device at UTC, en_US, 24-hour clock unless changed).
class TimeTest : public PlatformTest
{
protected:
    void SetUp() override
    {
        mTz.Set("UTC");
        mLcTime.Set("en_US.UTF-8");
        mLang.Set("C.UTF-8");
    }
    ScopedEnv mTz{"TZ"};
    ScopedEnv mLcTime{"LC_TIME"};
    ScopedEnv mLang{"LANG"};
};

// 2026-07-14 00:00:00 UTC, a Tuesday.
const time_t kJuly14 = 1783987200;

}  // namespace WeatherTest

#endif

#include "dlog/LogLimiter.h"

#include "core/ApiGuard.h"

namespace platform
{

LogLimiter::LogLimiter(log_priority priority, const char* tag, double intervalSeconds)
    : mPriority(priority), mTag(tag ? tag : ""), mInterval(intervalSeconds)
{
}

LogLimiter::~LogLimiter()
{
    if (mTimer)
        ecore_timer_del(mTimer);
    mTimer = nullptr;
    // What was held back is not lost when the owner goes first.
    if (mHeldBack > 0)
        Summarise();
}

void LogLimiter::Log(const std::string& text)
{
    if (mTimer)
    {
        ++mHeldBack;
        mLastText = text;
        return;
    }
    dlog_print(mPriority, mTag.c_str(), "%s", text.c_str());
    mTimer = ecore_timer_add(mInterval, IntervalEndCb, this);
}

void LogLimiter::Summarise()
{
    dlog_print(mPriority, mTag.c_str(), "%u more like this within %g s: %s", mHeldBack, mInterval,
               mLastText.c_str());
    mHeldBack = 0;
    mLastText.clear();
}

Eina_Bool LogLimiter::IntervalEndCb(void* data)
{
    return NSWeather::ForwardCallback<LogLimiter>(
        data,
        [](LogLimiter& limiter)
        { return limiter.OnIntervalEnd() ? ECORE_CALLBACK_RENEW : ECORE_CALLBACK_CANCEL; },
        PLATFORM_CALLBACK_SITE("DLOG"), ECORE_CALLBACK_CANCEL);
}

// A quiet interval ends the burst; a busy one gives its summary and starts
// the next interval. The timer is forgotten first, so a failed summary
// leaves no handle to a timer that ends.
bool LogLimiter::OnIntervalEnd()
{
    Ecore_Timer* timer = mTimer;
    mTimer = nullptr;
    if (mHeldBack == 0)
        return false;
    Summarise();
    mTimer = timer;
    return true;
}

}  // namespace platform

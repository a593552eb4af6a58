#include "dlog/LogLimiter.h"

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
    auto* limiter = static_cast<LogLimiter*>(data);
    if (!limiter)
        return ECORE_CALLBACK_CANCEL;
    try
    {
        if (limiter->OnIntervalEnd())
            return ECORE_CALLBACK_RENEW;
    }
    catch (...)
    {
    }
    limiter->mTimer = nullptr;
    return ECORE_CALLBACK_CANCEL;
}

// A quiet interval ends the burst; a busy one gives its summary and starts
// the next interval.
bool LogLimiter::OnIntervalEnd()
{
    if (mHeldBack == 0)
        return false;
    Summarise();
    return true;
}

}  // namespace platform

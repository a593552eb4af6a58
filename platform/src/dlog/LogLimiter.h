#ifndef PLATFORM_DLOG_LOG_LIMITER_H
#define PLATFORM_DLOG_LOG_LIMITER_H

#include <Ecore.h>

#include <string>

#include "dlog.h"

namespace platform
{

// Keeps a repeated line from flooding the log: the first line of a burst
// goes out at once, the rest of each interval is summed up in one line with
// their count. Main loop only; the limiter owns its timer.
class LogLimiter
{
public:
    LogLimiter(log_priority priority, const char* tag, double intervalSeconds = 1.0);
    ~LogLimiter();
    LogLimiter(const LogLimiter&) = delete;
    LogLimiter& operator=(const LogLimiter&) = delete;

    void Log(const std::string& text);
    unsigned GetHeldBack() const { return mHeldBack; }

private:
    static Eina_Bool IntervalEndCb(void* data);
    bool OnIntervalEnd();
    void Summarise();

    log_priority mPriority;
    std::string mTag;
    double mInterval;
    Ecore_Timer* mTimer = nullptr;
    unsigned mHeldBack = 0;
    std::string mLastText;
};

}  // namespace platform

#endif

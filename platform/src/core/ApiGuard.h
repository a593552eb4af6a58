#ifndef PLATFORM_CORE_API_GUARD_H
#define PLATFORM_CORE_API_GUARD_H

#include <exception>
#include <new>
#include <type_traits>

#include "CallbackTrampoline.h"
#include "dlog.h"
#include "tizen_error.h"

// Entry points of the C API and the C callbacks the platform hands to EFL
// are called from C: an exception that crossed one would end the process.
// Entry points go through GuardedCall, callbacks through ForwardCallback
// with PLATFORM_CALLBACK_SITE. Internal to the platform library.
namespace platform
{

// Logs under `tag` why a call failed; never throws.
inline void LogFailedCall(const char* tag, const char* why) noexcept
{
    try
    {
        dlog_print(DLOG_ERROR, tag, "call failed: %s", why);
    }
    catch (...)
    {
    }
}

// Runs `body` and returns its result; on an exception logs it under `tag`,
// sets the last result (out of memory, else I/O error) and returns `failure`.
template <typename Failure, typename Body, typename Result = std::invoke_result_t<Body&>>
Result GuardedCall(const char* tag, Failure failure, Body&& body) noexcept
{
    try
    {
        return body();
    }
    catch (const std::bad_alloc&)
    {
        LogFailedCall(tag, "out of memory");
        set_last_result(TIZEN_ERROR_OUT_OF_MEMORY);
    }
    catch (const std::exception& error)
    {
        LogFailedCall(tag, error.what());
        set_last_result(TIZEN_ERROR_IO_ERROR);
    }
    catch (...)
    {
        LogFailedCall(tag, "unknown exception");
        set_last_result(TIZEN_ERROR_IO_ERROR);
    }
    return static_cast<Result>(failure);
}

// The platform's report for ForwardCallback: one plain line under the
// callback's tag naming the callback and what went wrong.
inline void ReportCallbackProblem(const NSWeather::CallbackSite& site, bool isMissingObject,
                                  const char* text) noexcept
{
    try
    {
        dlog_print(DLOG_ERROR, site.tag, "%s(): %d: %s: %s", site.function, site.line,
                   isMissingObject ? "callback without its object" : "exception caught", text);
    }
    catch (...)
    {
    }
}

}  // namespace platform

// Where a platform C callback is, for ForwardCallback.
#define PLATFORM_CALLBACK_SITE(tag) WEATHER_CALLBACK_SITE_WITH(tag, platform::ReportCallbackProblem)

#endif

#ifndef NSWEATHER_CALLBACK_TRAMPOLINE_H
#define NSWEATHER_CALLBACK_TRAMPOLINE_H

#include <exception>
#include <type_traits>

// C callbacks handed to EFL or to the platform carry their object as user
// data. ForwardCallback is the one body such a callback has: it checks the
// object, calls it, and keeps every exception on this side of the C caller.

namespace NSWeather
{

struct CallbackSite;

// Logs one problem of a callback: the object is missing (`isMissingObject`,
// `text` is the object's expression) or the call threw (`text` is what).
using CallbackReport = void (*)(const CallbackSite& site, bool isMissingObject, const char* text);

// Where the callback is and how its component logs, so a problem is logged
// under the callback's own tag, file, function and line. Each component
// has a macro that fills it in at the callback.
struct CallbackSite
{
    const char* tag;
    const char* file;
    const char* function;
    int line;
    CallbackReport report;
};

// Calls `body(object)` for the object behind `data`; gives `fallback` when
// the object is null or the body throws.
template <typename T, typename Body, typename R = std::invoke_result_t<Body, T&>>
R ForwardCallback(void* data, Body&& body, const CallbackSite& site, R fallback = R()) noexcept
{
    auto* object = static_cast<T*>(data);
    if (object == nullptr)
    {
        site.report(site, true, "pThis == NULL");
        return fallback;
    }
    try
    {
        return body(*object);
    }
    catch (const std::exception& e)
    {
        site.report(site, false, e.what());
    }
    catch (...)
    {
        site.report(site, false, "unknown exception");
    }
    return fallback;
}

// The void form; a void body has no fallback to give.
template <typename T, typename Body>
std::enable_if_t<std::is_void_v<std::invoke_result_t<Body, T&>>> ForwardCallback(
    void* data, Body&& body, const CallbackSite& site) noexcept
{
    auto* object = static_cast<T*>(data);
    if (object == nullptr)
    {
        site.report(site, true, "pThis == NULL");
        return;
    }
    try
    {
        body(*object);
    }
    catch (const std::exception& e)
    {
        site.report(site, false, e.what());
    }
    catch (...)
    {
        site.report(site, false, "unknown exception");
    }
}

}  // namespace NSWeather

#define WEATHER_CALLBACK_SITE_WITH(tag, report)   \
    NSWeather::CallbackSite                       \
    {                                             \
        tag, __FILE__, __func__, __LINE__, report \
    }

#endif

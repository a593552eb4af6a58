#ifndef NSWEATHER_WEATHER_LOG_H
#define NSWEATHER_WEATHER_LOG_H

#include <dlog.h>

#include "CallbackTrampoline.h"

// Log lines of the suite: "<file>: <function>(<line>) > " and the text in
// red, at error priority. Each component defines its own tag macros on top
// of these (CommonLog.h, UICommonLog.h, WidgetLog.h).

namespace NSWeather
{
constexpr const char* LogFileName(const char* path)
{
    const char* name = path;
    for (const char* p = path; *p; ++p)
        if (*p == '/')
            name = p + 1;
    return name;
}
}  // namespace NSWeather

#define WEATHER_LOG_COLOR_BEGIN "\033[0;40;31m"
#define WEATHER_LOG_COLOR_END "\033[0;m"

#define WEATHER_LOG(tag, fmt, ...)                                                                 \
    dlog_print(DLOG_ERROR, tag, "%s: %s(%d) > " WEATHER_LOG_COLOR_BEGIN fmt WEATHER_LOG_COLOR_END, \
               NSWeather::LogFileName(__FILE__), __func__, __LINE__, ##__VA_ARGS__)

// Guards log the failed condition as source text and leave at once. The
// component macros stringify the condition themselves and pass the text
// down: stringified here, NULL would already have been expanded.
#define WEATHER_RETV_IF(tag, cond, condText, value)                                     \
    do                                                                                  \
    {                                                                                   \
        if (cond)                                                                       \
        {                                                                               \
            WEATHER_LOG(tag, "[%s(): %d] (%s) [return]", __func__, __LINE__, condText); \
            return value;                                                               \
        }                                                                               \
    } while (0)

#define WEATHER_RET_IF(tag, cond, condText)                                             \
    do                                                                                  \
    {                                                                                   \
        if (cond)                                                                       \
        {                                                                               \
            WEATHER_LOG(tag, "[%s(): %d] (%s) [return]", __func__, __LINE__, condText); \
            return;                                                                     \
        }                                                                               \
    } while (0)

// Leaves the enclosing loop or switch; no do/while wrapper on purpose.
#define WEATHER_BREAK_IF(tag, cond, condText)                                      \
    if (cond)                                                                      \
    {                                                                              \
        WEATHER_LOG(tag, "[%s(): %d] (%s) [break]", __func__, __LINE__, condText); \
        break;                                                                     \
    }

// Logs the [break] line for a condition without leaving anything; for
// steps that skip one action and go on.
#define WEATHER_LOG_BREAK(tag, condText) \
    WEATHER_LOG(tag, "[%s(): %d] (%s) [break]", __func__, __LINE__, condText)

namespace NSWeather
{
// The callback report of the suite's components: a missing object gives
// the guard's [return] line, an exception one line with what it said.
inline void ReportCallbackProblem(const CallbackSite& site, bool isMissingObject, const char* text)
{
    if (isMissingObject)
        dlog_print(DLOG_ERROR, site.tag,
                   "%s: %s(%d) > " WEATHER_LOG_COLOR_BEGIN "[%s(): %d] (%s) [return]" WEATHER_LOG_COLOR_END,
                   LogFileName(site.file), site.function, site.line, site.function, site.line, text);
    else
        dlog_print(DLOG_ERROR, site.tag,
                   "%s: %s(%d) > " WEATHER_LOG_COLOR_BEGIN "exception caught: %s" WEATHER_LOG_COLOR_END,
                   LogFileName(site.file), site.function, site.line, text);
}
}  // namespace NSWeather

// Where a C callback is, for ForwardCallback; each component's log header
// names its tag.
#define WEATHER_CALLBACK_SITE(tag) WEATHER_CALLBACK_SITE_WITH(tag, NSWeather::ReportCallbackProblem)

#endif

#ifndef WEATHER_TESTS_MAIN_LOOP_H
#define WEATHER_TESTS_MAIN_LOOP_H

#include <Ecore.h>

#include <functional>

namespace WeatherTest
{

// Runs the Ecore main loop until `done` holds or `timeoutSeconds` pass.
inline bool RunLoopUntil(const std::function<bool()>& done, double timeoutSeconds)
{
    auto poll = [](void* data) -> Eina_Bool
    {
        if ((*static_cast<const std::function<bool()>*>(data))())
            ecore_main_loop_quit();
        return ECORE_CALLBACK_RENEW;
    };
    auto quit = [](void* data) -> Eina_Bool
    {
        *static_cast<Ecore_Timer**>(data) = nullptr;
        ecore_main_loop_quit();
        return ECORE_CALLBACK_CANCEL;
    };
    Ecore_Timer* pollTimer = ecore_timer_add(0.01, poll, const_cast<std::function<bool()>*>(&done));
    Ecore_Timer* timeout = nullptr;
    timeout = ecore_timer_add(timeoutSeconds, quit, &timeout);
    if (!done())
        ecore_main_loop_begin();
    ecore_timer_del(pollTimer);
    if (timeout)
        ecore_timer_del(timeout);
    return done();
}

inline void RunLoopFor(double seconds)
{
    RunLoopUntil([] { return false; }, seconds);
}

}  // namespace WeatherTest

#endif

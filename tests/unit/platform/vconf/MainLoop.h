#ifndef WEATHER_TESTS_PLATFORM_VCONF_MAIN_LOOP_H
#define WEATHER_TESTS_PLATFORM_VCONF_MAIN_LOOP_H

#include <Ecore.h>

#include <functional>

namespace WeatherTest
{

// Runs the Ecore main loop until `done` holds or `timeoutSeconds` pass;
// returns whether `done` held.
inline bool RunLoopUntil(const std::function<bool()>& done, double timeoutSeconds)
{
    struct State
    {
        const std::function<bool()>* done;
        bool timedOut;
    } state{&done, false};
    Ecore_Timer* poll = ecore_timer_add(0.01, [](void* data) -> Eina_Bool {
        if ((*static_cast<State*>(data)->done)())
            ecore_main_loop_quit();
        return ECORE_CALLBACK_RENEW;
    }, &state);
    Ecore_Timer* timeout = ecore_timer_add(timeoutSeconds, [](void* data) -> Eina_Bool {
        static_cast<State*>(data)->timedOut = true;
        ecore_main_loop_quit();
        return ECORE_CALLBACK_CANCEL;
    }, &state);
    if (!done())
        ecore_main_loop_begin();
    ecore_timer_del(poll);
    if (!state.timedOut)
        ecore_timer_del(timeout);
    return done();
}

// Lets the main loop deliver whatever is pending for `seconds`.
inline void RunLoopFor(double seconds)
{
    RunLoopUntil([] { return false; }, seconds);
}

}  // namespace WeatherTest

#endif

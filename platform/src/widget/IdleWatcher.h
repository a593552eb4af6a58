#ifndef PLATFORM_WIDGET_IDLE_WATCHER_H
#define PLATFORM_WIDGET_IDLE_WATCHER_H

#include <Ecore.h>
#include <Evas.h>

#include <functional>
#include <memory>
#include <set>
#include <string>
#include <vector>

namespace platform
{

// Answers once the widget has nothing pending: the loop reaches an idler
// (no job or event queued), no timer of the widget is armed, and no canvas
// of the instances has drawn a change for a while (animators and transits
// draw every frame while they run).
class IdleWatcher
{
public:
    using CanvasListCb = std::function<std::vector<Evas*>()>;
    // Empty text when idle, else what was still pending at the timeout.
    using DoneCb = std::function<void(const std::string& pending)>;

    explicit IdleWatcher(CanvasListCb canvases);
    ~IdleWatcher();
    IdleWatcher(const IdleWatcher&) = delete;
    IdleWatcher& operator=(const IdleWatcher&) = delete;

    void Wait(double timeoutSeconds, DoneCb done);

    // Timers with a longer interval are the toolkit's housekeeping.
    static constexpr double kLongTimer = 10.0;
    // A canvas that drew nothing for this long counts as still.
    static constexpr double kStillTime = 0.1;

private:
    struct Waiter
    {
        IdleWatcher* watcher;
        double start;
        double deadline;
        DoneCb done;
        Ecore_Timer* timer = nullptr;
        Ecore_Idler* idler = nullptr;
        int quietChecks = 0;
    };

    static Eina_Bool TickCb(void* data);
    static Eina_Bool IdlerCb(void* data);
    static void RenderPostCb(void* data, Evas* canvas, void* eventInfo);
    void HookCanvases();
    void Check(Waiter* waiter);
    std::string DescribePending(double watchStart);
    int CountForeignTimers();
    void Finish(Waiter* waiter, const std::string& pending);

    CanvasListCb mCanvases;
    std::vector<std::unique_ptr<Waiter>> mWaiters;
    std::set<Evas*> mHooked;
    double mLastChange = 0.0;
};

}  // namespace platform

#endif

#include "widget/IdleWatcher.h"

#include <algorithm>

#include "core/ApiGuard.h"
#include "dlog.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";
const double kTickSeconds = 0.02;
// Two quiet checks in a row, so that a job queued by the last timer runs first.
const int kQuietChecksNeeded = 2;
}  // namespace

IdleWatcher::IdleWatcher(CanvasListCb canvases) : mCanvases(std::move(canvases)) {}

IdleWatcher::~IdleWatcher()
{
    for (auto& waiter : mWaiters)
    {
        if (waiter->timer)
            ecore_timer_del(waiter->timer);
        if (waiter->idler)
            ecore_idler_del(waiter->idler);
    }
    // Only canvases that still exist can give their callbacks back.
    for (Evas* canvas : mCanvases())
        if (mHooked.count(canvas))
            evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, RenderPostCb, this);
}

void IdleWatcher::Wait(double timeoutSeconds, DoneCb done)
{
    auto waiter = std::make_unique<Waiter>();
    waiter->watcher = this;
    waiter->start = ecore_time_get();
    waiter->deadline = waiter->start + timeoutSeconds;
    waiter->done = std::move(done);
    waiter->timer = ecore_timer_add(kTickSeconds, TickCb, waiter.get());
    mWaiters.push_back(std::move(waiter));
    HookCanvases();
}

void IdleWatcher::HookCanvases()
{
    std::vector<Evas*> canvases = mCanvases();
    // Canvases of instances that have gone are forgotten; their callbacks went with them.
    for (auto it = mHooked.begin(); it != mHooked.end();)
        it = std::find(canvases.begin(), canvases.end(), *it) == canvases.end() ? mHooked.erase(it)
                                                                                : std::next(it);
    for (Evas* canvas : canvases)
    {
        if (mHooked.insert(canvas).second)
            evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_POST, RenderPostCb, this);
    }
}

void IdleWatcher::RenderPostCb(void* data, Evas*, void* eventInfo)
{
    // Only draws that changed pixels count; the data is the watcher itself.
    auto* post = static_cast<Evas_Event_Render_Post*>(eventInfo);
    if (post && !post->updated_area)
        return;
    NSWeather::ForwardCallback<IdleWatcher>(
        data, [](IdleWatcher& watcher) { watcher.mLastChange = ecore_time_get(); },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

Eina_Bool IdleWatcher::TickCb(void* data)
{
    // The check runs from an idler: it only gets there once queued jobs ran.
    // The waiter owns its timer, so the timer stays even when a tick fails.
    return NSWeather::ForwardCallback<Waiter>(
        data,
        [](Waiter& waiter)
        {
            if (!waiter.idler)
                waiter.idler = ecore_idler_add(IdlerCb, &waiter);
            return ECORE_CALLBACK_RENEW;
        },
        PLATFORM_CALLBACK_SITE(kLogTag), ECORE_CALLBACK_RENEW);
}

Eina_Bool IdleWatcher::IdlerCb(void* data)
{
    NSWeather::ForwardCallback<Waiter>(
        data,
        [](Waiter& waiter)
        {
            waiter.idler = nullptr;
            waiter.watcher->Check(&waiter);
        },
        PLATFORM_CALLBACK_SITE(kLogTag));
    return ECORE_CALLBACK_CANCEL;
}

void IdleWatcher::Check(Waiter* waiter)
{
    HookCanvases();
    std::string pending = DescribePending(waiter->start);
    waiter->quietChecks = pending.empty() ? waiter->quietChecks + 1 : 0;
    if (waiter->quietChecks >= kQuietChecksNeeded)
        Finish(waiter, std::string());
    else if (ecore_time_get() >= waiter->deadline)
        Finish(waiter, pending.empty() ? "not settled" : pending);
}

std::string IdleWatcher::DescribePending(double watchStart)
{
    std::string pending;
    int timers = CountForeignTimers();
    if (timers > 0)
        pending += std::to_string(timers) + " timer(s)";
    // Draws before the watch began were not seen, so stillness counts from then.
    if (ecore_time_get() - std::max(mLastChange, watchStart) < kStillTime)
        pending += std::string(pending.empty() ? "" : ", ") + "canvas still drawing";
    return pending;
}

int IdleWatcher::CountForeignTimers()
{
    int count = 0;
    Eina_Iterator* children = efl_children_iterator_new(efl_main_loop_get());
    Eo* child = nullptr;
    EINA_ITERATOR_FOREACH(children, child)
    {
        if (!efl_isa(child, EFL_LOOP_TIMER_CLASS) || efl_event_freeze_count_get(child) > 0)
            continue;
        if (efl_loop_timer_interval_get(child) >= kLongTimer)
            continue;
        bool ours = std::any_of(mWaiters.begin(), mWaiters.end(),
                                [child](const auto& waiter) { return waiter->timer == child; });
        if (!ours)
            ++count;
    }
    eina_iterator_free(children);
    return count;
}

void IdleWatcher::Finish(Waiter* waiter, const std::string& pending)
{
    auto found = std::find_if(mWaiters.begin(), mWaiters.end(),
                              [waiter](const auto& item) { return item.get() == waiter; });
    if (found == mWaiters.end())
        return;
    std::unique_ptr<Waiter> owned = std::move(*found);
    mWaiters.erase(found);
    if (owned->timer)
        ecore_timer_del(owned->timer);
    if (owned->idler)
        ecore_idler_del(owned->idler);
    owned->done(pending);
}

}  // namespace platform

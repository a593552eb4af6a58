#include "widget/InputFeeder.h"

#include <Ecore.h>

#include <algorithm>

namespace platform
{

unsigned InputFeeder::sLastTimestamp = 0;

namespace
{
const unsigned kFrameMs = 16;
}

unsigned InputFeeder::NextTimestamp()
{
    auto now = static_cast<unsigned>(ecore_time_get() * 1000.0);
    return std::max(now, sLastTimestamp + 1);
}

void InputFeeder::Begin(Evas* canvas, int x, int y, unsigned timestamp)
{
    // Hit tests use object geometry, which layouts settle only on calculation.
    evas_smart_objects_calculate(canvas);
    evas_event_feed_mouse_in(canvas, timestamp, nullptr);
    evas_event_feed_mouse_move(canvas, x, y, timestamp, nullptr);
    evas_event_feed_mouse_down(canvas, 1, EVAS_BUTTON_NONE, timestamp, nullptr);
}

unsigned InputFeeder::Tap(Evas* canvas, int x, int y, unsigned durationMs)
{
    unsigned start = NextTimestamp();
    Begin(canvas, x, y, start);
    evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, start + durationMs, nullptr);
    sLastTimestamp = start + durationMs;
    return start;
}

unsigned InputFeeder::Swipe(Evas* canvas, int x1, int y1, int x2, int y2, unsigned durationMs)
{
    unsigned start = NextTimestamp();
    Begin(canvas, x1, y1, start);
    unsigned steps = std::max(1u, durationMs / kFrameMs);
    for (unsigned i = 1; i <= steps; ++i)
    {
        int x = x1 + static_cast<int>((static_cast<long long>(x2 - x1) * i) / steps);
        int y = y1 + static_cast<int>((static_cast<long long>(y2 - y1) * i) / steps);
        evas_event_feed_mouse_move(canvas, x, y, start + durationMs * i / steps, nullptr);
    }
    evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, start + durationMs, nullptr);
    sLastTimestamp = start + durationMs;
    return start;
}

}  // namespace platform

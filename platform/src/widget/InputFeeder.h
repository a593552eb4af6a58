#ifndef PLATFORM_WIDGET_INPUT_FEEDER_H
#define PLATFORM_WIDGET_INPUT_FEEDER_H

#include <Evas.h>

namespace platform
{

// Feeds taps and swipes into a canvas as real mouse events, with event
// timestamps in milliseconds that grow from one gesture to the next.
class InputFeeder
{
public:
    // Down at (x, y), up `durationMs` later at the same place.
    // Each returns the timestamp of its mouse down.
    static unsigned Tap(Evas* canvas, int x, int y, unsigned durationMs);
    // Down at the start, moves about every 16 ms along the line, up at the
    // end `durationMs` after the down.
    static unsigned Swipe(Evas* canvas, int x1, int y1, int x2, int y2, unsigned durationMs);

private:
    static unsigned NextTimestamp();
    static void Begin(Evas* canvas, int x, int y, unsigned timestamp);
    static unsigned sLastTimestamp;
};

}  // namespace platform

#endif

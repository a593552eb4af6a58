#ifndef PLATFORM_WIDGET_CANVAS_SNAPSHOT_H
#define PLATFORM_WIDGET_CANVAS_SNAPSHOT_H

#include <Ecore_Evas.h>
#include <Evas.h>

#include <string>

namespace platform
{

// Renders the canvas of a window and writes it to an image file (PNG by
// the file's extension).
class CanvasSnapshot
{
public:
    // Empty on success, else the reason.
    static std::string Save(Evas_Object* window, const std::string& path, int& width, int& height);

private:
    // Windows on a display: a snapshot image over the whole canvas catches
    // what the canvas draws below it, whatever the window's stacking on screen.
    static std::string CaptureWithSnapshotObject(Ecore_Evas* ee, const std::string& path, int width,
                                                 int height);
    static std::string WritePixels(const void* pixels, int width, int height, const std::string& path);
};

}  // namespace platform

#endif

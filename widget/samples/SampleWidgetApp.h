#ifndef WEATHER_WIDGET_SAMPLES_SAMPLE_WIDGET_APP_H
#define WEATHER_WIDGET_SAMPLES_SAMPLE_WIDGET_APP_H

#include <widget_app.h>

#include "LayoutSample.h"

#include <string>

namespace NSWeatherWidget
{

// A widget application that shows the sample pages in each instance's
// window, so that the host's snapshot, dump and gestures work on them.
class SampleWidgetApp
{
public:
    SampleWidgetApp(const std::string& resDir, LayoutSample::PageState state);
    int Run(int argc, char** argv);

    static widget_class_h CreateCb(void* data);
    static void TerminateCb(void* data);
    static int InstanceCreateCb(widget_context_h context, bundle* content, int w, int h, void* data);
    static int InstanceDestroyCb(widget_context_h context, widget_app_destroy_type_e reason, bundle* content,
                                 void* data);
    static int InstancePauseCb(widget_context_h context, void* data);
    static int InstanceResumeCb(widget_context_h context, void* data);
    static int InstanceResizeCb(widget_context_h context, int w, int h, void* data);
    static int InstanceUpdateCb(widget_context_h context, bundle* content, int force, void* data);

private:
    int ShowPages(widget_context_h context, int w, int h);
    int DropPages(widget_context_h context);

    std::string mResDir;
    LayoutSample::PageState mState;
};

}  // namespace NSWeatherWidget

#endif

#include "SampleWidgetApp.h"

#include <widget_app_efl.h>
#include <widget_errno.h>

#include <cstdio>
#include <exception>

namespace NSWeatherWidget
{

namespace
{

const int kHeight4x4 = 712;

template <typename Body>
int Guarded(void* data, const char* name, Body body)
{
    auto* pThis = static_cast<SampleWidgetApp*>(data);
    if (!pThis)
    {
        fprintf(stderr, "%s: no application\n", name);
        return WIDGET_ERROR_INVALID_PARAMETER;
    }
    try
    {
        return body(pThis);
    }
    catch (const std::exception& e)
    {
        fprintf(stderr, "%s: %s\n", name, e.what());
        return WIDGET_ERROR_FAULT;
    }
}

}  // namespace

SampleWidgetApp::SampleWidgetApp(const std::string& resDir, LayoutSample::PageState state)
    : mResDir(resDir), mState(state)
{
}

int SampleWidgetApp::Run(int argc, char** argv)
{
    widget_app_lifecycle_callback_s callbacks = {CreateCb, TerminateCb};
    return widget_app_main(argc, argv, &callbacks, this);
}

widget_class_h SampleWidgetApp::CreateCb(void* data)
{
    if (!data)
        return nullptr;
    widget_instance_lifecycle_callback_s instance = {InstanceCreateCb, InstanceDestroyCb, InstancePauseCb,
                                                     InstanceResumeCb, InstanceResizeCb,  InstanceUpdateCb};
    return widget_app_class_create(instance, data);
}

void SampleWidgetApp::TerminateCb(void*) {}

int SampleWidgetApp::InstanceCreateCb(widget_context_h context, bundle*, int w, int h, void* data)
{
    return Guarded(data, "create", [&](SampleWidgetApp* pThis) { return pThis->ShowPages(context, w, h); });
}

int SampleWidgetApp::InstanceDestroyCb(widget_context_h context, widget_app_destroy_type_e, bundle*,
                                       void* data)
{
    return Guarded(data, "destroy", [&](SampleWidgetApp* pThis) { return pThis->DropPages(context); });
}

int SampleWidgetApp::InstancePauseCb(widget_context_h, void* data)
{
    return Guarded(data, "pause", [](SampleWidgetApp*) { return WIDGET_ERROR_NONE; });
}

int SampleWidgetApp::InstanceResumeCb(widget_context_h, void* data)
{
    return Guarded(data, "resume", [](SampleWidgetApp*) { return WIDGET_ERROR_NONE; });
}

int SampleWidgetApp::InstanceResizeCb(widget_context_h context, int w, int h, void* data)
{
    return Guarded(data, "resize", [&](SampleWidgetApp* pThis) { return pThis->ShowPages(context, w, h); });
}

int SampleWidgetApp::InstanceUpdateCb(widget_context_h, bundle*, int, void* data)
{
    return Guarded(data, "update", [](SampleWidgetApp*) { return WIDGET_ERROR_NONE; });
}

// Builds the pages for the instance's size, replacing any earlier ones.
int SampleWidgetApp::ShowPages(widget_context_h context, int w, int h)
{
    Evas_Object* win = nullptr;
    if (widget_app_get_elm_win(context, &win) != WIDGET_ERROR_NONE || !win)
        return WIDGET_ERROR_FAULT;
    if (DropPages(context) != WIDGET_ERROR_NONE)
        return WIDGET_ERROR_FAULT;
    LayoutSample sample(mResDir, h >= kHeight4x4);
    Evas_Object* view = sample.CreateView(win, mState);
    if (!view)
        return WIDGET_ERROR_FAULT;
    evas_object_size_hint_weight_set(view, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_win_resize_object_add(win, view);
    evas_object_resize(win, w, h);
    evas_object_show(win);
    widget_app_context_set_tag(context, view);
    return WIDGET_ERROR_NONE;
}

int SampleWidgetApp::DropPages(widget_context_h context)
{
    void* tag = nullptr;
    if (widget_app_context_get_tag(context, &tag) != WIDGET_ERROR_NONE)
        return WIDGET_ERROR_FAULT;
    if (tag)
    {
        evas_object_del(static_cast<Evas_Object*>(tag));
        widget_app_context_set_tag(context, nullptr);
    }
    return WIDGET_ERROR_NONE;
}

}  // namespace NSWeatherWidget

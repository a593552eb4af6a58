// widget_app.h, widget_app_efl.h, widget.h and elm_win_tizen.h over the
// widget host of this process.
#include "widget_app.h"

#include <Elementary.h>

#include <cstdlib>

#include "dlog.h"
#include "elm_win_tizen.h"
#include "widget.h"
#include "widget/AppEventDispatcher.h"
#include "widget/WidgetHost.h"
#include "widget_app_efl.h"

using platform::WidgetHost;
using platform::WidgetInstance;

namespace
{
const char* const kLogTag = "widget-host";

WidgetInstance* FindContext(widget_context_h context)
{
    return context ? WidgetHost::GetInstance().FindInstance(context) : nullptr;
}
}  // namespace

extern "C" int widget_app_main(int argc, char** argv, widget_app_lifecycle_callback_s* callback,
                               void* user_data)
{
    return WidgetHost::GetInstance().Run(argc, argv, callback, user_data);
}

extern "C" int widget_app_exit(void)
{
    return WidgetHost::GetInstance().Exit();
}

extern "C" int widget_app_terminate_context(widget_context_h context)
{
    return WidgetHost::GetInstance().TerminateContext(context);
}

extern "C" int widget_app_foreach_context(widget_context_cb callback, void* data)
{
    if (!callback)
        return WIDGET_ERROR_INVALID_PARAMETER;
    auto& host = WidgetHost::GetInstance();
    for (WidgetInstance* instance : host.GetInstances())
    {
        // An earlier callback may have ended this instance.
        if (host.FindInstance(instance) && !callback(instance, data))
            return WIDGET_ERROR_CANCELED;
    }
    return WIDGET_ERROR_NONE;
}

extern "C" int widget_app_add_event_handler(app_event_handler_h* event_handler, app_event_type_e event_type,
                                            app_event_cb callback, void* user_data)
{
    return platform::AppEventDispatcher::GetInstance().AddHandler(event_handler, event_type, callback,
                                                                  user_data);
}

extern "C" int widget_app_remove_event_handler(app_event_handler_h event_handler)
{
    return platform::AppEventDispatcher::GetInstance().RemoveHandler(event_handler);
}

extern "C" const char* widget_app_get_id(widget_context_h context)
{
    WidgetInstance* instance = FindContext(context);
    if (!instance)
    {
        set_last_result(WIDGET_ERROR_INVALID_PARAMETER);
        return nullptr;
    }
    set_last_result(WIDGET_ERROR_NONE);
    return instance->GetId().c_str();
}

extern "C" widget_class_h widget_app_class_create(widget_instance_lifecycle_callback_s callback,
                                                  void* user_data)
{
    auto* widgetClass = new (std::nothrow) _widget_class{callback, user_data};
    set_last_result(widgetClass ? WIDGET_ERROR_NONE : WIDGET_ERROR_OUT_OF_MEMORY);
    return widgetClass;
}

extern "C" int widget_app_context_set_tag(widget_context_h context, void* tag)
{
    WidgetInstance* instance = FindContext(context);
    if (!instance)
        return WIDGET_ERROR_INVALID_PARAMETER;
    instance->SetTag(tag);
    return WIDGET_ERROR_NONE;
}

extern "C" int widget_app_context_get_tag(widget_context_h context, void** tag)
{
    WidgetInstance* instance = FindContext(context);
    if (!instance || !tag)
        return WIDGET_ERROR_INVALID_PARAMETER;
    *tag = instance->GetTag();
    return WIDGET_ERROR_NONE;
}

extern "C" int widget_app_context_set_content_info(widget_context_h context, bundle* content_info)
{
    WidgetInstance* instance = FindContext(context);
    if (!instance || !content_info)
        return WIDGET_ERROR_INVALID_PARAMETER;
    bundle_raw* raw = nullptr;
    int length = 0;
    if (bundle_encode(content_info, &raw, &length) != 0 || !raw)
        return WIDGET_ERROR_FAULT;
    instance->SetContentInfo(std::string(reinterpret_cast<const char*>(raw), length));
    free(raw);
    return WIDGET_ERROR_NONE;
}

extern "C" int widget_app_context_set_title(widget_context_h context, const char* title)
{
    WidgetInstance* instance = FindContext(context);
    if (!instance || !title)
        return WIDGET_ERROR_INVALID_PARAMETER;
    instance->SetTitle(title);
    return WIDGET_ERROR_NONE;
}

extern "C" int widget_app_get_elm_win(widget_context_h context, Evas_Object** win)
{
    WidgetInstance* instance = FindContext(context);
    if (!instance || !win)
        return WIDGET_ERROR_INVALID_PARAMETER;
    if (instance->GetWindow())
    {
        *win = instance->GetWindow();
        return WIDGET_ERROR_NONE;
    }
    Evas_Object* parent = instance->GetParentObject();
    Evas_Object* window = parent ? elm_win_tizen_widget_add(instance->GetId().c_str(), parent) : nullptr;
    if (parent)
        evas_object_del(parent);
    if (!window)
        return WIDGET_ERROR_FAULT;
    *win = window;
    return WIDGET_ERROR_NONE;
}

extern "C" int widget_set_extra_info(const char* id, const char* content_info, const char* title, const char*,
                                     const char*)
{
    WidgetInstance* instance = id ? WidgetHost::GetInstance().FindInstance(std::string(id)) : nullptr;
    if (!instance)
        return WIDGET_ERROR_INVALID_PARAMETER;
    if (content_info)
        instance->SetContentInfo(content_info);
    if (title)
        instance->SetTitle(title);
    return WIDGET_ERROR_NONE;
}

extern "C" void* widget_get_evas_object(const char* id, int gbar)
{
    WidgetInstance* instance = id ? WidgetHost::GetInstance().FindInstance(std::string(id)) : nullptr;
    if (!instance || gbar != 0)
    {
        set_last_result(gbar != 0 ? WIDGET_ERROR_NOT_SUPPORTED : WIDGET_ERROR_INVALID_PARAMETER);
        return nullptr;
    }
    Evas_Object* parent = instance->GetParentObject();
    set_last_result(parent ? WIDGET_ERROR_NONE : WIDGET_ERROR_FAULT);
    return parent;
}

extern "C" Evas_Object* elm_win_tizen_widget_add(const char* name, Evas_Object* parent)
{
    if (!parent)
        return nullptr;
    WidgetInstance* instance = WidgetHost::GetInstance().FindInstanceByCanvas(evas_object_evas_get(parent));
    if (!instance)
    {
        dlog_print(DLOG_ERROR, kLogTag, "elm_win_tizen_widget_add: the parent belongs to no widget instance");
        return nullptr;
    }
    return instance->CreateWindow(name);
}

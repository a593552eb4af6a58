// A widget application for the host tests: it records every callback (and
// its arguments) as one line in $TEST_WIDGET_RECORD, draws coloured
// rectangles and a text, and records the mouse events of its background.
#include <Elementary.h>

#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <string>

#include "elm_win_tizen.h"
#include "widget.h"
#include "widget_app.h"
#include "widget_app_efl.h"
#include "widget_service.h"

namespace
{
struct Drawn
{
    std::string id;
    Evas_Object* window = nullptr;
    Evas_Object* background = nullptr;
    Evas_Object* block = nullptr;
    unsigned downTimestamp = 0;
};

std::map<std::string, Drawn> gDrawn;
const char* const kWidgetId = "com.quorvex.test-widget";

void Record(const char* format, ...)
{
    const char* path = getenv("TEST_WIDGET_RECORD");
    FILE* file = path ? fopen(path, "a") : nullptr;
    if (!file)
        return;
    va_list args;
    va_start(args, format);
    vfprintf(file, format, args);
    va_end(args);
    fputc('\n', file);
    fclose(file);
}

const char* Env(const char* name)
{
    const char* value = getenv(name);
    return value ? value : "-";
}

std::string IdOf(widget_context_h context)
{
    const char* id = widget_app_get_id(context);
    return id ? id : "(null)";
}

void MouseDownCb(void* data, Evas*, Evas_Object*, void* info)
{
    auto* drawn = static_cast<Drawn*>(data);
    auto* event = static_cast<Evas_Event_Mouse_Down*>(info);
    if (!drawn || !event)
        return;
    drawn->downTimestamp = event->timestamp;
    Record("mouse-down %s %d %d %u", drawn->id.c_str(), event->canvas.x, event->canvas.y, event->timestamp);
}

void MouseMoveCb(void* data, Evas*, Evas_Object*, void* info)
{
    auto* drawn = static_cast<Drawn*>(data);
    auto* event = static_cast<Evas_Event_Mouse_Move*>(info);
    if (drawn && event)
        Record("mouse-move %s %d %d %u", drawn->id.c_str(), event->cur.canvas.x, event->cur.canvas.y,
               event->timestamp);
}

void TransitEndCb(void*, Elm_Transit*)
{
    Record("transit-end");
}

// A tap also starts a short animation and asks for an update of the instance,
// so that idle and trigger_update can be watched. A press of a second or more
// asks to close the window, as a window manager would.
void MouseUpCb(void* data, Evas*, Evas_Object*, void* info)
{
    auto* drawn = static_cast<Drawn*>(data);
    auto* event = static_cast<Evas_Event_Mouse_Up*>(info);
    if (!drawn || !event)
        return;
    Record("mouse-up %s %d %d %u", drawn->id.c_str(), event->canvas.x, event->canvas.y, event->timestamp);
    if (event->timestamp - drawn->downTimestamp >= 1000)
    {
        Record("close-request %s", drawn->id.c_str());
        evas_object_smart_callback_call(drawn->window, "delete,request", nullptr);
        return;
    }
    Elm_Transit* transit = elm_transit_add();
    elm_transit_object_add(transit, drawn->block);
    elm_transit_effect_translation_add(transit, 0, 0, 40, 0);
    elm_transit_duration_set(transit, 1.0);
    elm_transit_del_cb_set(transit, TransitEndCb, nullptr);
    elm_transit_go(transit);
    Record("trigger %d", widget_service_trigger_update(kWidgetId, drawn->id.c_str(), nullptr, 0));
}

Eina_Bool LateTimerCb(void* data)
{
    Record("timer %s", static_cast<const char*>(data));
    free(data);
    return ECORE_CALLBACK_CANCEL;
}

void Draw(Drawn& drawn, int w, int h)
{
    Evas* canvas = evas_object_evas_get(drawn.window);
    drawn.background = evas_object_rectangle_add(canvas);
    evas_object_color_set(drawn.background, 20, 60, 160, 255);
    evas_object_resize(drawn.background, w, h);
    evas_object_show(drawn.background);
    evas_object_event_callback_add(drawn.background, EVAS_CALLBACK_MOUSE_DOWN, MouseDownCb, &drawn);
    evas_object_event_callback_add(drawn.background, EVAS_CALLBACK_MOUSE_MOVE, MouseMoveCb, &drawn);
    evas_object_event_callback_add(drawn.background, EVAS_CALLBACK_MOUSE_UP, MouseUpCb, &drawn);
    drawn.block = evas_object_rectangle_add(canvas);
    evas_object_color_set(drawn.block, 240, 180, 20, 255);
    evas_object_move(drawn.block, 20, 20);
    evas_object_resize(drawn.block, w / 3, h / 3);
    evas_object_pass_events_set(drawn.block, EINA_TRUE);
    evas_object_show(drawn.block);
    Evas_Object* text = evas_object_text_add(canvas);
    evas_object_text_font_set(text, "Sans", 40);
    evas_object_text_text_set(text, drawn.id.c_str());
    evas_object_color_set(text, 255, 255, 255, 255);
    evas_object_move(text, 20, h / 2);
    evas_object_pass_events_set(text, EINA_TRUE);
    evas_object_show(text);
    // A layout with an image in one of its swallows, for the dump.
    Evas_Object* layout = elm_layout_add(drawn.window);
    elm_layout_file_set(layout, TEST_WIDGET_EDJ, "test/page");
    elm_object_part_text_set(layout, "title", drawn.id.c_str());
    elm_object_part_text_set(layout, "note", "second line");
    Evas_Object* icon = elm_image_add(layout);
    elm_image_file_set(icon, TEST_WIDGET_EDJ, "test/icon");
    elm_object_part_content_set(layout, "icon", icon);
    evas_object_move(layout, w / 2, 0);
    evas_object_resize(layout, w / 2, h / 2);
    evas_object_pass_events_set(layout, EINA_TRUE);
    evas_object_show(layout);
}

int CreateCb(widget_context_h context, bundle* content, int w, int h, void*)
{
    std::string id = IdOf(context);
    widget_size_type_e type = WIDGET_SIZE_TYPE_UNKNOWN;
    widget_service_get_size_type(w, h, &type);
    Record("create %s %d %d type=0x%x content=%s", id.c_str(), w, h, type, content ? "yes" : "no");
    Drawn& drawn = gDrawn[id];
    drawn.id = id;
    // 4x4 instances take the framework's shortcut to their window.
    if (type == WIDGET_SIZE_TYPE_4x4)
        widget_app_get_elm_win(context, &drawn.window);
    else if (auto* parent = static_cast<Evas_Object*>(widget_get_evas_object(context)))
    {
        drawn.window = elm_win_tizen_widget_add("test-widget", parent);
        evas_object_del(parent);
    }
    if (!drawn.window)
        return WIDGET_ERROR_FAULT;
    widget_app_context_set_tag(context, &drawn);
    Draw(drawn, w, h);
    evas_object_show(drawn.window);
    widget_set_extra_info(id.c_str(), nullptr, ("Test " + id.substr(id.rfind(':') + 1)).c_str(), nullptr,
                          nullptr);
    ecore_timer_add(0.3, LateTimerCb, strdup(id.c_str()));
    return WIDGET_ERROR_NONE;
}

int DestroyCb(widget_context_h context, widget_app_destroy_type_e reason, bundle* content, void*)
{
    std::string id = IdOf(context);
    void* tag = nullptr;
    widget_app_context_get_tag(context, &tag);
    auto found = gDrawn.find(id);
    bool tagKept = found != gDrawn.end() && tag == &found->second;
    Record("destroy %s reason=%d content=%s tag=%s", id.c_str(), reason, content ? "yes" : "no",
           tagKept ? "kept" : "lost");
    if (found != gDrawn.end())
    {
        evas_object_del(found->second.window);
        gDrawn.erase(found);
    }
    return WIDGET_ERROR_NONE;
}

int PauseCb(widget_context_h context, void*)
{
    Record("pause %s", IdOf(context).c_str());
    return WIDGET_ERROR_NONE;
}

int ResumeCb(widget_context_h context, void*)
{
    Record("resume %s", IdOf(context).c_str());
    return WIDGET_ERROR_NONE;
}

int ResizeCb(widget_context_h context, int w, int h, void*)
{
    std::string id = IdOf(context);
    Record("resize %s %d %d", id.c_str(), w, h);
    auto found = gDrawn.find(id);
    if (found == gDrawn.end())
        return WIDGET_ERROR_NOT_EXIST;
    evas_object_resize(found->second.window, w, h);
    evas_object_resize(found->second.background, w, h);
    return WIDGET_ERROR_NONE;
}

int UpdateCb(widget_context_h context, bundle* content, int force, void*)
{
    char* value = nullptr;
    if (content)
        bundle_get_str(content, "reason", &value);
    Record("update %s force=%d reason=%s", IdOf(context).c_str(), force, value ? value : "-");
    return WIDGET_ERROR_NONE;
}

void LanguageCb(app_event_info_h info, void*)
{
    char* language = nullptr;
    app_event_get_language(info, &language);
    Record("event language %s LANGUAGE=%s", language ? language : "-", Env("LANGUAGE"));
    free(language);
    bundle* content = bundle_create();
    bundle_add_str(content, "reason", "language");
    Record("trigger %d", widget_service_trigger_update(kWidgetId, nullptr, content, 1));
    bundle_free(content);
}

void RegionCb(app_event_info_h info, void*)
{
    char* region = nullptr;
    app_event_get_region_format(info, &region);
    Record("event region %s LC_TIME=%s", region ? region : "-", Env("LC_TIME"));
    free(region);
}

void LowBatteryCb(app_event_info_h info, void*)
{
    app_event_low_battery_status_e status = APP_EVENT_LOW_BATTERY_POWER_OFF;
    app_event_get_low_battery_status(info, &status);
    Record("event low-battery %d", status);
    widget_app_exit();
}

bool CollectContextCb(widget_context_h context, void* data)
{
    auto* ids = static_cast<std::string*>(data);
    *ids += " " + IdOf(context);
    return true;
}

bool FirstContextCb(widget_context_h context, void* data)
{
    *static_cast<widget_context_h*>(data) = context;
    return false;
}

// Low memory makes the widget give up its first instance.
void LowMemoryCb(app_event_info_h info, void*)
{
    app_event_low_memory_status_e status = APP_EVENT_LOW_MEMORY_NORMAL;
    app_event_get_low_memory_status(info, &status);
    Record("event low-memory %d", status);
    std::string ids;
    int all = widget_app_foreach_context(CollectContextCb, &ids);
    widget_context_h first = nullptr;
    int stopped = widget_app_foreach_context(FirstContextCb, &first);
    Record("contexts%s all=%d stopped=%d", ids.c_str(), all, stopped);
    if (first)
        Record("terminate %s %d", IdOf(first).c_str(), widget_app_terminate_context(first));
}

widget_class_h AppCreateCb(void*)
{
    Record("app-create");
    Record("env LANG=%s LANGUAGE=%s LC_TIME=%s", Env("LANG"), Env("LANGUAGE"), Env("LC_TIME"));
    app_event_handler_h handler = nullptr;
    widget_app_add_event_handler(&handler, APP_EVENT_LANGUAGE_CHANGED, LanguageCb, nullptr);
    widget_app_add_event_handler(&handler, APP_EVENT_REGION_FORMAT_CHANGED, RegionCb, nullptr);
    widget_app_add_event_handler(&handler, APP_EVENT_LOW_BATTERY, LowBatteryCb, nullptr);
    widget_app_add_event_handler(&handler, APP_EVENT_LOW_MEMORY, LowMemoryCb, nullptr);
    widget_instance_lifecycle_callback_s callbacks = {CreateCb, DestroyCb, PauseCb,
                                                      ResumeCb, ResizeCb,  UpdateCb};
    return widget_app_class_create(callbacks, nullptr);
}

void AppTerminateCb(void*)
{
    Record("app-terminate");
}
}  // namespace

int main(int argc, char** argv)
{
    widget_app_lifecycle_callback_s callbacks = {AppCreateCb, AppTerminateCb};
    int result = widget_app_main(argc, argv, &callbacks, nullptr);
    Record("main-returned %d", result);
    return result;
}

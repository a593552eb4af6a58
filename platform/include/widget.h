#ifndef PLATFORM_WIDGET_H
#define PLATFORM_WIDGET_H

#include "widget_app.h"

#ifdef __cplusplus
extern "C"
{
#endif

    /* Keeps the instance's content and title (the title is what `list` of the
     * control socket shows). Strings are copied; NULL leaves a value as it was. */
    int widget_set_extra_info(const char* id, const char* content_info, const char* title, const char* icon,
                              const char* name);

    /* A transparent rectangle on the instance's off-screen canvas, to be the
     * parent of the instance's window (elm_win_tizen_widget_add); the caller may
     * delete it once the window exists. NULL with get_last_result on error;
     * gbar (glance bar) other than 0 is not supported. */
    void* widget_get_evas_object(const char* id, int gbar);

#ifdef __cplusplus
}

/* The same for an instance context, as home-screen widgets usually call it. */
inline void* widget_get_evas_object(widget_context_h context)
{
    return widget_get_evas_object(widget_app_get_id(context), 0);
}
#endif

#endif

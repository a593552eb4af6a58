#ifndef PLATFORM_WIDGET_APP_EFL_H
#define PLATFORM_WIDGET_APP_EFL_H

#include <Evas.h>

#include "widget_app.h"

#ifdef __cplusplus
extern "C"
{
#endif

    /* The instance's window, made on first call; owned by the instance. */
    int widget_app_get_elm_win(widget_context_h context, Evas_Object** win);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_ELM_WIN_TIZEN_H
#define PLATFORM_ELM_WIN_TIZEN_H

#include <Evas.h>

#ifdef __cplusplus
extern "C"
{
#endif

    /* The widget window of the instance whose canvas holds `parent` (the object
     * of widget_get_evas_object). NULL on failure or when that instance already
     * has a window. The window belongs to the caller; deleting it is allowed. */
    Evas_Object* elm_win_tizen_widget_add(const char* name, Evas_Object* parent);

#ifdef __cplusplus
}
#endif

#endif

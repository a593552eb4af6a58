#ifndef PLATFORM_WIDGET_APP_H
#define PLATFORM_WIDGET_APP_H

#include <stdbool.h>

#include "app_common.h"
#include "bundle.h"
#include "widget_errno.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef enum widget_app_destroy_type
    {
        WIDGET_APP_DESTROY_TYPE_DEFAULT = 0x00, /* deleted by the user */
        WIDGET_APP_DESTROY_TYPE_UPGRADE = 0x01,
        WIDGET_APP_DESTROY_TYPE_UNINSTALL = 0x02,
        WIDGET_APP_DESTROY_TYPE_TERMINATE = 0x03, /* reboot */
        WIDGET_APP_DESTROY_TYPE_FAULT = 0x04,
        WIDGET_APP_DESTROY_TYPE_TEMPORARY = 0x05, /* will be created again */
        WIDGET_APP_DESTROY_TYPE_UNKNOWN = 0x06,
    } widget_app_destroy_type_e;

    typedef struct _widget_class* widget_class_h;
    typedef struct _widget_context* widget_context_h;

    typedef int (*widget_instance_create_cb)(widget_context_h context, bundle* content, int w, int h,
                                             void* user_data);
    typedef int (*widget_instance_destroy_cb)(widget_context_h context, widget_app_destroy_type_e reason,
                                              bundle* content, void* user_data);
    typedef int (*widget_instance_pause_cb)(widget_context_h context, void* user_data);
    typedef int (*widget_instance_resume_cb)(widget_context_h context, void* user_data);
    typedef int (*widget_instance_resize_cb)(widget_context_h context, int w, int h, void* user_data);
    typedef int (*widget_instance_update_cb)(widget_context_h context, bundle* content, int force,
                                             void* user_data);

    typedef struct
    {
        widget_instance_create_cb create;
        widget_instance_destroy_cb destroy;
        widget_instance_pause_cb pause;
        widget_instance_resume_cb resume;
        widget_instance_resize_cb resize;
        widget_instance_update_cb update;
    } widget_instance_lifecycle_callback_s;

    typedef widget_class_h (*widget_app_create_cb)(void* user_data);
    typedef void (*widget_app_terminate_cb)(void* user_data);

    typedef struct
    {
        widget_app_create_cb create;
        widget_app_terminate_cb terminate;
    } widget_app_lifecycle_callback_s;

    typedef bool (*widget_context_cb)(widget_context_h context, void* data);

    /* Runs the widget process: Elementary, the application create callback,
     * the control socket <root>/run/widget/<widget id>.ctl, instances given
     * with "--instance 4x2|4x4", the main loop, then terminate. Options of our
     * host: "--widget-id <id>" (else PLATFORM_APP_ID, else the weather widget). */
    int widget_app_main(int argc, char** argv, widget_app_lifecycle_callback_s* callback, void* user_data);
    int widget_app_exit(void);
    int widget_app_terminate_context(widget_context_h context);
    int widget_app_foreach_context(widget_context_cb callback, void* data);
    int widget_app_add_event_handler(app_event_handler_h* event_handler, app_event_type_e event_type,
                                     app_event_cb callback, void* user_data);
    int widget_app_remove_event_handler(app_event_handler_h event_handler);
    /* The instance id; owned by the host while the instance lives. */
    const char* widget_app_get_id(widget_context_h context);
    /* The class is owned by the host once returned from the create callback. */
    widget_class_h widget_app_class_create(widget_instance_lifecycle_callback_s callback, void* user_data);
    int widget_app_context_set_tag(widget_context_h context, void* tag);
    int widget_app_context_get_tag(widget_context_h context, void** tag);
    int widget_app_context_set_content_info(widget_context_h context, bundle* content_info);
    int widget_app_context_set_title(widget_context_h context, const char* title);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_WIDGET_SERVICE_H
#define PLATFORM_WIDGET_SERVICE_H

#include "bundle.h"
#include "widget_errno.h"

#ifdef __cplusplus
extern "C"
{
#endif

    /* Values are the cell sizes; pixels are those of a 720x1280 screen. */
    typedef enum widget_size_type
    {
        WIDGET_SIZE_TYPE_1x1 = 0x0001,      /* 175x175 */
        WIDGET_SIZE_TYPE_2x1 = 0x0002,      /* 354x175 */
        WIDGET_SIZE_TYPE_2x2 = 0x0004,      /* 354x354 */
        WIDGET_SIZE_TYPE_4x1 = 0x0008,      /* 712x175 */
        WIDGET_SIZE_TYPE_4x2 = 0x0010,      /* 712x354 */
        WIDGET_SIZE_TYPE_4x3 = 0x0020,      /* 712x533 */
        WIDGET_SIZE_TYPE_4x4 = 0x0040,      /* 712x712 */
        WIDGET_SIZE_TYPE_4x5 = 0x0080,      /* 712x891 */
        WIDGET_SIZE_TYPE_4x6 = 0x0100,      /* 712x1070 */
        WIDGET_SIZE_TYPE_FULL = 0x0800,     /* 720x1280 */
        WIDGET_SIZE_TYPE_EASY_1x1 = 0x1000, /* 224x215 */
        WIDGET_SIZE_TYPE_EASY_3x1 = 0x2000, /* 680x215 */
        WIDGET_SIZE_TYPE_EASY_3x3 = 0x4000, /* 680x653 */
        WIDGET_SIZE_TYPE_UNKNOWN = 0xFFFF,
    } widget_size_type_e;

    int widget_service_get_size(widget_size_type_e type, int* width, int* height);
    /* Exact pixel matches only; otherwise UNKNOWN and INVALID_PARAMETER. */
    int widget_service_get_size_type(int width, int height, widget_size_type_e* size_type);
    /* Queues an update of one instance (or of all with a NULL instance id) of
     * the widget hosted by this process; the bundle is copied. */
    int widget_service_trigger_update(const char* widget_id, const char* instance_id, bundle* b, int force);
    /* Periodic updates of one instance (or all); 0.0 stops them. */
    int widget_service_change_period(const char* widget_id, const char* instance_id, double period);

#ifdef __cplusplus
}
#endif

#endif

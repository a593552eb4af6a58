// widget_service.h over the widget host of this process.
#include "widget_service.h"

#include <string>

#include "dlog.h"
#include "widget/WidgetHost.h"

namespace
{
struct SizeEntry
{
    widget_size_type_e type;
    int width;
    int height;
};

// The phone's table for a 720x1280 screen.
const SizeEntry kSizes[] = {
    {WIDGET_SIZE_TYPE_1x1, 175, 175},      {WIDGET_SIZE_TYPE_2x1, 354, 175},
    {WIDGET_SIZE_TYPE_2x2, 354, 354},      {WIDGET_SIZE_TYPE_4x1, 712, 175},
    {WIDGET_SIZE_TYPE_4x2, 712, 354},      {WIDGET_SIZE_TYPE_4x3, 712, 533},
    {WIDGET_SIZE_TYPE_4x4, 712, 712},      {WIDGET_SIZE_TYPE_4x5, 712, 891},
    {WIDGET_SIZE_TYPE_4x6, 712, 1070},     {WIDGET_SIZE_TYPE_FULL, 720, 1280},
    {WIDGET_SIZE_TYPE_EASY_1x1, 224, 215}, {WIDGET_SIZE_TYPE_EASY_3x1, 680, 215},
    {WIDGET_SIZE_TYPE_EASY_3x3, 680, 653},
};

const char* const kLogTag = "widget-host";
}  // namespace

extern "C" int widget_service_get_size(widget_size_type_e type, int* width, int* height)
{
    if (!width || !height)
        return WIDGET_ERROR_INVALID_PARAMETER;
    for (const auto& entry : kSizes)
    {
        if (entry.type == type)
        {
            *width = entry.width;
            *height = entry.height;
            return WIDGET_ERROR_NONE;
        }
    }
    return WIDGET_ERROR_INVALID_PARAMETER;
}

extern "C" int widget_service_get_size_type(int width, int height, widget_size_type_e* size_type)
{
    if (!size_type)
        return WIDGET_ERROR_INVALID_PARAMETER;
    for (const auto& entry : kSizes)
    {
        if (entry.width == width && entry.height == height)
        {
            *size_type = entry.type;
            return WIDGET_ERROR_NONE;
        }
    }
    *size_type = WIDGET_SIZE_TYPE_UNKNOWN;
    return WIDGET_ERROR_INVALID_PARAMETER;
}

extern "C" int widget_service_trigger_update(const char* widget_id, const char* instance_id, bundle* b,
                                             int force)
{
    if (!widget_id)
        return WIDGET_ERROR_INVALID_PARAMETER;
    auto& host = platform::WidgetHost::GetInstance();
    if (!host.GetIsRunning() || host.GetWidgetId() != widget_id)
    {
        dlog_print(DLOG_ERROR, kLogTag, "trigger_update: %s is not hosted by this process", widget_id);
        return WIDGET_ERROR_NOT_EXIST;
    }
    return host.TriggerUpdate(instance_id ? instance_id : std::string(), b, force);
}

extern "C" int widget_service_change_period(const char* widget_id, const char*, double period)
{
    if (!widget_id || period < 0.0)
        return WIDGET_ERROR_INVALID_PARAMETER;
    dlog_print(DLOG_ERROR, kLogTag, "change_period: periodic updates are not offered by this host");
    return WIDGET_ERROR_NOT_SUPPORTED;
}

#include "LaunchRequest.h"

#include <app_control.h>
#include <app_control_launch.h>

#include <cstdlib>

#include "SiblingLog.h"

namespace NSWeather
{

namespace
{
constexpr size_t MAX_EXTRA_COUNT = 32;
constexpr size_t MAX_VALUE_BYTES = 4096;

bool AddExtraCb(app_control_h request, const char* key, void* data)
{
    auto* extraData = static_cast<std::map<std::string, std::string>*>(data);
    if (!key || extraData->size() >= MAX_EXTRA_COUNT)
        return false;
    char* value = nullptr;
    if (app_control_get_extra_data(request, key, &value) == APP_CONTROL_ERROR_NONE && value)
    {
        std::string text(value);
        if (text.size() <= MAX_VALUE_BYTES)
            (*extraData)[key] = text;
        else
            SIBLING_LOG("extra data '%s' too long; ignored", key);
    }
    free(value);
    return true;
}
}  // namespace

bool LaunchRequest::Read(std::map<std::string, std::string>& extraData)
{
    app_control_h request = nullptr;
    int result = app_control_get_launch_request(&request);
    if (result != APP_CONTROL_ERROR_NONE)
    {
        if (result != APP_CONTROL_ERROR_KEY_NOT_FOUND)
            SIBLING_LOG("app_control_get_launch_request failed(%d)", result);
        return false;
    }
    result = app_control_foreach_extra_data(request, AddExtraCb, &extraData);
    app_control_destroy(request);
    SIBLING_RETV_IF(result != APP_CONTROL_ERROR_NONE, false);
    return true;
}

}  // namespace NSWeather

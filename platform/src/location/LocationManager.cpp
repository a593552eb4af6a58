#include "locations.h"

#include <algorithm>
#include <new>
#include <vector>

#include "dlog.h"
#include "vconf.h"

struct location_manager_s
{
    location_method_e method;
};

namespace
{

const char* const kLogTag = "LOCATION_MANAGER";

std::vector<location_manager_h>& LiveManagers()
{
    static auto* managers = new std::vector<location_manager_h>();
    return *managers;
}

const char* SettingKey(location_method_e method)
{
    switch (method)
    {
    case LOCATIONS_METHOD_HYBRID:
        return VCONFKEY_LOCATION_USE_MY_LOCATION;
    case LOCATIONS_METHOD_GPS:
        return VCONFKEY_LOCATION_ENABLED;
    case LOCATIONS_METHOD_WPS:
        return VCONFKEY_LOCATION_NETWORK_ENABLED;
    default:
        return nullptr;
    }
}

}  // namespace

extern "C" int location_manager_is_enabled_method(location_method_e method, bool* enable)
{
    const char* key = SettingKey(method);
    if (!key)
        return LOCATIONS_ERROR_INCORRECT_METHOD;
    if (!enable)
        return LOCATIONS_ERROR_INVALID_PARAMETER;
    int value = 0;
    if (vconf_get_int(key, &value) != VCONF_OK)
    {
        dlog_print(DLOG_ERROR, kLogTag, "location setting %s cannot be read", key);
        return LOCATIONS_ERROR_SERVICE_NOT_AVAILABLE;
    }
    *enable = value != 0;
    return LOCATIONS_ERROR_NONE;
}

extern "C" int location_manager_create(location_method_e method, location_manager_h* manager)
{
    if (!SettingKey(method))
        return LOCATIONS_ERROR_INCORRECT_METHOD;
    if (!manager)
        return LOCATIONS_ERROR_INVALID_PARAMETER;
    auto* made = new (std::nothrow) location_manager_s{method};
    if (!made)
        return LOCATIONS_ERROR_OUT_OF_MEMORY;
    LiveManagers().push_back(made);
    *manager = made;
    return LOCATIONS_ERROR_NONE;
}

extern "C" int location_manager_destroy(location_manager_h manager)
{
    auto& managers = LiveManagers();
    auto it = std::find(managers.begin(), managers.end(), manager);
    if (!manager || it == managers.end())
        return LOCATIONS_ERROR_INVALID_PARAMETER;
    managers.erase(it);
    delete manager;
    return LOCATIONS_ERROR_NONE;
}

#include "locations.h"

#include <algorithm>
#include <memory>
#include <vector>

#include "core/ApiGuard.h"
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

int LocationManagerIsEnabledMethod(location_method_e method, bool* enable)
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

int LocationManagerCreate(location_method_e method, location_manager_h* manager)
{
    if (!SettingKey(method))
        return LOCATIONS_ERROR_INCORRECT_METHOD;
    if (!manager)
        return LOCATIONS_ERROR_INVALID_PARAMETER;
    auto made = std::make_unique<location_manager_s>(location_manager_s{method});
    LiveManagers().push_back(made.get());
    *manager = made.release();
    return LOCATIONS_ERROR_NONE;
}

int LocationManagerDestroy(location_manager_h manager)
{
    auto& managers = LiveManagers();
    auto it = std::find(managers.begin(), managers.end(), manager);
    if (!manager || it == managers.end())
        return LOCATIONS_ERROR_INVALID_PARAMETER;
    managers.erase(it);
    delete manager;
    return LOCATIONS_ERROR_NONE;
}

}  // namespace

extern "C" int location_manager_is_enabled_method(location_method_e method, bool* enable)
{
    return platform::GuardedCall(kLogTag, LOCATIONS_ERROR_OUT_OF_MEMORY,
                                 [&] { return LocationManagerIsEnabledMethod(method, enable); });
}

extern "C" int location_manager_create(location_method_e method, location_manager_h* manager)
{
    return platform::GuardedCall(kLogTag, LOCATIONS_ERROR_OUT_OF_MEMORY,
                                 [&] { return LocationManagerCreate(method, manager); });
}

extern "C" int location_manager_destroy(location_manager_h manager)
{
    return platform::GuardedCall(kLogTag, LOCATIONS_ERROR_OUT_OF_MEMORY,
                                 [&] { return LocationManagerDestroy(manager); });
}

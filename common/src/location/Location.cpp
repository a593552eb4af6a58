#include "Location.h"

#include "CommonLog.h"

namespace NSWeather
{

Location::Location() : mHandler(nullptr) {}

Location::~Location()
{
    if (!mHandler)
        return;
    int ret = location_manager_destroy(mHandler);
    if (ret != LOCATIONS_ERROR_NONE)
    {
        COMMON_LOG("[Failed] location_manager_destroy : %d", ret);
        COMMON_LOG("LocationDestroy failed");
    }
    mHandler = nullptr;
}

bool Location::IsLocationEnabled()
{
    bool enabled = false;
    int ret = location_manager_is_enabled_method(LOCATIONS_METHOD_HYBRID, &enabled);
    if (ret != LOCATIONS_ERROR_NONE)
    {
        COMMON_LOG("location_manager_is_enabled_method failed(%d", ret);
        enabled = false;
    }
    COMMON_LOG("enabled : %d", enabled ? 1 : 0);
    return enabled;
}

}  // namespace NSWeather

// Directories of installed applications under the platform root.
#include <string>

#include "app_common.h"
#include "app_manager.h"
#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

namespace
{

const char* const kLogTag = "APP_MANAGER";

int AppSubPath(const char* appId, const char* sub, char** path)
{
    if (!appId || !path)
        return APP_MANAGER_ERROR_INVALID_PARAMETER;
    *path = nullptr;
    if (!platform::IsSafeName(appId))
        return APP_MANAGER_ERROR_INVALID_PARAMETER;
    std::string appDir = platform::AppDir(appId);
    if (appDir.empty())
        return APP_MANAGER_ERROR_IO_ERROR;
    // A linked application folder is not one we made.
    if (!platform::IsRealDir(appDir))
        return APP_MANAGER_ERROR_NO_SUCH_APP;
    *path = platform::CopyString(appDir + sub);
    return *path ? APP_MANAGER_ERROR_NONE : APP_MANAGER_ERROR_OUT_OF_MEMORY;
}

int AppManagerGetSharedDataPath(const char* appId, char** path)
{
    return AppSubPath(appId, "/shared/data/", path);
}

int AppManagerGetSharedResourcePath(const char* appId, char** path)
{
    return AppSubPath(appId, "/shared/res/", path);
}

char* AppGetResourcePath()
{
    std::string own = platform::OwnAppId();
    if (own.empty())
    {
        set_last_result(APP_ERROR_INVALID_CONTEXT);
        return nullptr;
    }
    return platform::CopyString(platform::AppDir(own) + "/res/");
}

int AppGetId(char** id)
{
    if (!id)
        return APP_ERROR_INVALID_PARAMETER;
    std::string own = platform::OwnAppId();
    *id = nullptr;
    if (own.empty())
        return APP_ERROR_INVALID_CONTEXT;
    *id = platform::CopyString(own);
    return *id ? APP_ERROR_NONE : APP_ERROR_OUT_OF_MEMORY;
}

}  // namespace

extern "C" int app_manager_get_shared_data_path(const char* appId, char** path)
{
    return platform::GuardedCall(kLogTag, APP_MANAGER_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppManagerGetSharedDataPath(appId, path); });
}

extern "C" int app_manager_get_shared_resource_path(const char* appId, char** path)
{
    return platform::GuardedCall(kLogTag, APP_MANAGER_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppManagerGetSharedResourcePath(appId, path); });
}

extern "C" char* app_get_resource_path(void)
{
    return platform::GuardedCall(kLogTag, nullptr, [&] { return AppGetResourcePath(); });
}

extern "C" int app_get_id(char** id)
{
    return platform::GuardedCall(kLogTag, APP_ERROR_OUT_OF_MEMORY, [&] { return AppGetId(id); });
}

// Directories of installed applications under the platform root.
#include <sys/stat.h>

#include <string>

#include "app_common.h"
#include "app_manager.h"
#include "core/PlatformRoot.h"

namespace
{

bool IsDirectory(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

int AppSubPath(const char* appId, const char* sub, char** path)
{
    if (!appId || !path)
        return APP_MANAGER_ERROR_INVALID_PARAMETER;
    *path = nullptr;
    std::string appDir = platform::AppDir(appId);
    if (appDir.empty())
        return APP_MANAGER_ERROR_INVALID_PARAMETER;
    if (!IsDirectory(appDir))
        return APP_MANAGER_ERROR_NO_SUCH_APP;
    *path = platform::CopyString(appDir + sub);
    return *path ? APP_MANAGER_ERROR_NONE : APP_MANAGER_ERROR_OUT_OF_MEMORY;
}

}  // namespace

extern "C" int app_manager_get_shared_data_path(const char* appId, char** path)
{
    return AppSubPath(appId, "/shared/data/", path);
}

extern "C" int app_manager_get_shared_resource_path(const char* appId, char** path)
{
    return AppSubPath(appId, "/shared/res/", path);
}

extern "C" char* app_get_resource_path(void)
{
    std::string own = platform::OwnAppId();
    if (own.empty())
    {
        set_last_result(APP_ERROR_INVALID_CONTEXT);
        return nullptr;
    }
    return platform::CopyString(platform::AppDir(own) + "/res/");
}

extern "C" int app_get_id(char** id)
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

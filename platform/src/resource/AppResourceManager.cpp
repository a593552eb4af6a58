// Resource lookup: the device's resolution folder first, then the plain
// resource folder of the calling application.
#include "app_resource_manager.h"

#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cstdlib>
#include <sstream>
#include <string>

#include "app_common.h"
#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

namespace
{

const char* const kLogTag = "RESOURCE_MANAGER";
// The widget host draws on the phone's 720x1280 screen table.
const char* const kResolutionFolder = "720x1280";
const char* const kTypePrefixes[] = {"images/", "edje/", "sounds/", "bin/"};

std::atomic<bool> gInitialised{false};

bool IsSafeRelative(const std::string& id)
{
    if (id.empty() || id[0] == '/')
        return false;
    std::stringstream stream(id);
    std::string part;
    while (std::getline(stream, part, '/'))
        if (part == "..")
            return false;
    return true;
}

bool IsReadableFile(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode) && access(path.c_str(), R_OK) == 0;
}

std::string OwnResourceDir()
{
    char* path = app_get_resource_path();
    if (!path)
        return std::string();
    std::string dir = path;
    free(path);
    return dir;
}

std::string StripTypePrefix(int type, const std::string& id)
{
    std::string prefix = kTypePrefixes[type];
    if (id.compare(0, prefix.size(), prefix) == 0)
        return id.substr(prefix.size());
    return id;
}

int AppResourceManagerGet(int type, const char* id, char** path)
{
    if (type < APP_RESOURCE_TYPE_MIN || type > APP_RESOURCE_TYPE_MAX || !id || !path)
        return APP_RESOURCE_ERROR_INVALID_PARAMETER;
    *path = nullptr;
    std::string name = StripTypePrefix(type, id);
    if (!IsSafeRelative(name))
    {
        dlog_print(DLOG_ERROR, kLogTag, "rejected resource id \"%s\"", id);
        return APP_RESOURCE_ERROR_INVALID_PARAMETER;
    }
    app_resource_manager_init();
    std::string resDir = OwnResourceDir();
    if (resDir.empty())
    {
        dlog_print(DLOG_ERROR, kLogTag, "no resource folder: the process has no application id");
        return APP_RESOURCE_ERROR_IO_ERROR;
    }
    for (const std::string& candidate : {resDir + kResolutionFolder + "/" + name, resDir + name})
    {
        if (IsReadableFile(candidate))
        {
            *path = platform::CopyString(candidate);
            return *path ? APP_RESOURCE_ERROR_NONE : APP_RESOURCE_ERROR_OUT_OF_MEMORY;
        }
    }
    dlog_print(DLOG_ERROR, kLogTag, "no file for resource \"%s\" in %s", id, resDir.c_str());
    return APP_RESOURCE_ERROR_IO_ERROR;
}

}  // namespace

extern "C" int app_resource_manager_init(void)
{
    gInitialised = true;
    return APP_RESOURCE_ERROR_NONE;
}

extern "C" int app_resource_manager_get(app_resource_e type, const char* id, char** path)
{
    // Read once as a number: callers may pass values outside the enum.
    int rawType = type;
    return platform::GuardedCall(kLogTag, APP_RESOURCE_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppResourceManagerGet(rawType, id, path); });
}

extern "C" int app_resource_manager_release(void)
{
    gInitialised = false;
    return APP_RESOURCE_ERROR_NONE;
}

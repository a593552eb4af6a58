#include "FileUtil.h"

#include <cerrno>
#include <cstring>
#include <memory>
#include <string>

#include <glib.h>
#include <sys/stat.h>
#include <sys/types.h>

#include "CommonLog.h"
#include "WeatherDefine.h"
#include "app_common.h"
#include "app_manager.h"

namespace NSWeather
{

namespace
{
// Filled only by a successful, non-empty answer of the platform.
std::string gSharedDataDirPath;
std::string gSharedResDirPath;
std::string gResourceDirPath;

struct PlatformTextFree
{
    void operator()(char* text) const { g_free(text); }
};
// Frees a text the platform allocated, on every way out.
using PlatformText = std::unique_ptr<char, PlatformTextFree>;

// Callers append relative parts directly, so the separator must be there.
std::string AsDirectory(const char* path)
{
    std::string directory(path);
    if (directory.back() != '/')
        directory += '/';
    return directory;
}
}  // namespace

std::string FileUtil::GetSharedDataDirectoryPath()
{
    if (!gSharedDataDirPath.empty())
        return gSharedDataDirPath;

    char* sharedDataDirPath = nullptr;
    int ret = app_manager_get_shared_data_path(WEATHER_APP_ID, &sharedDataDirPath);
    PlatformText owner(sharedDataDirPath);
    COMMON_RETV_IF(ret != ERR_OK, std::string());
    COMMON_RETV_IF(sharedDataDirPath == NULL, std::string());
    if (sharedDataDirPath[0] == '\0')
    {
        COMMON_LOG("sharedDataDirPath < 1");
        return std::string();
    }
    gSharedDataDirPath = AsDirectory(sharedDataDirPath);
    return gSharedDataDirPath;
}

std::string FileUtil::GetSharedResourceDirectoryPath()
{
    if (!gSharedResDirPath.empty())
        return gSharedResDirPath;

    char* sharedResDirPath = nullptr;
    int ret = app_manager_get_shared_resource_path(WEATHER_APP_ID, &sharedResDirPath);
    PlatformText owner(sharedResDirPath);
    COMMON_RETV_IF(ret != ERR_OK, std::string());
    COMMON_RETV_IF(sharedResDirPath == NULL, std::string());
    if (sharedResDirPath[0] == '\0')
        return std::string();
    gSharedResDirPath = AsDirectory(sharedResDirPath);
    return gSharedResDirPath;
}

std::string FileUtil::GetResourceDirectoryPath()
{
    if (!gResourceDirPath.empty())
        return gResourceDirPath;

    char* resourceDirPath = app_get_resource_path();
    PlatformText owner(resourceDirPath);
    COMMON_LOG("app_get_resource_path : %s", resourceDirPath ? resourceDirPath : "NULL");
    COMMON_RETV_IF(resourceDirPath == NULL, std::string());
    if (resourceDirPath[0] == '\0')
    {
        COMMON_LOG("resourceDirPath < 1");
        return std::string();
    }
    gResourceDirPath = AsDirectory(resourceDirPath);
    return gResourceDirPath;
}

bool FileUtil::MakeDirectory(const std::string& path)
{
    COMMON_RETV_IF(path.length() < 1, false);

    if (mkdir(path.c_str(), 0755) == 0)
        return true;
    int error = errno;
    if (error != EEXIST)
        COMMON_LOG("mkdir failed(path:%s), errno:%d", path.c_str(), error);
    return false;
}

std::string FileUtil::GetWeatherDBFilePath()
{
    std::string ret = GetSharedDataDirectoryPath();
    COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret + "db/.weather.db";
}

std::string FileUtil::GetSettingDBFilePath()
{
    std::string ret = GetSharedDataDirectoryPath();
    COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret + "db/.setting.db";
}

std::string FileUtil::GetVersionDBFilePath()
{
    std::string ret = GetSharedDataDirectoryPath();
    COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret + "db/.version.db";
}

std::string FileUtil::GetShareTargetDataDBFilePath()
{
    std::string ret = GetSharedDataDirectoryPath();
    COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret + "db/.share_target.db";
}

std::string FileUtil::GetDBDirectoryPath()
{
    std::string ret = GetSharedDataDirectoryPath();
    COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret + "db";
}

std::string FileUtil::GetWeatherNewsIconDBFilePath()
{
    std::string ret = GetResourceDirectoryPath();
    COMMON_RETV_IF(ret.length() < 1, std::string());
    return ret + "data/weathernews_icon.db";
}

void FileUtil::ClearCache()
{
    gSharedDataDirPath.clear();
    gSharedResDirPath.clear();
    gResourceDirPath.clear();
}

}  // namespace NSWeather

#ifndef NSWEATHER_FILE_UTIL_H
#define NSWEATHER_FILE_UTIL_H

#include <string>

namespace NSWeather
{
// Where the suite's files live. The three directories are asked of the
// platform once and cached; every text returned is empty on failure, and
// every directory text ends with "/".
class FileUtil
{
public:
    // Shared data of the weather application; the databases live here.
    static std::string GetSharedDataDirectoryPath();
    // Shared resources of the weather application (images, theme tables).
    static std::string GetSharedResourceDirectoryPath();
    // This application's own resources (layouts, icon database, locale).
    static std::string GetResourceDirectoryPath();

    // Creates one directory with mode 0755; false when it already exists
    // (silently) or cannot be made (logged).
    static bool MakeDirectory(const std::string& path);

    static std::string GetWeatherDBFilePath();
    static std::string GetSettingDBFilePath();
    static std::string GetVersionDBFilePath();
    static std::string GetShareTargetDataDBFilePath();
    // The "db" folder of the shared data directory, without a trailing "/".
    static std::string GetDBDirectoryPath();
    static std::string GetWeatherNewsIconDBFilePath();

    // Forgets the cached directories so the next call asks the platform.
    static void ClearCache();
};
}  // namespace NSWeather

#endif

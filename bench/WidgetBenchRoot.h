#ifndef NSWEATHER_WIDGET_BENCH_ROOT_H
#define NSWEATHER_WIDGET_BENCH_ROOT_H

#include <vconf.h>

#include <cstdlib>
#include <filesystem>
#include <string>
#include <system_error>

#include "FileUtil.h"

// A throw-away platform root for the widget's benchmarks: the widget's
// resources are the build tree's, the weather application's shared data
// folder exists, the network is connected, and this process runs as
// `appId`. Aborts when the root cannot be made: no figure is better than
// one measured on a broken root.
inline std::string MakeWidgetBenchRoot(const char* appId)
{
    namespace fs = std::filesystem;
    std::string root = (fs::temp_directory_path() / "weather-bench-XXXXXX").string();
    if (!mkdtemp(&root[0]))
        abort();
    setenv("PLATFORM_ROOT", root.c_str(), 1);
    setenv("PLATFORM_APP_ID", appId, 1);
    fs::path widgetDir = fs::path(root) / "apps" / "com.quorvex.weather-m-widget";
    std::error_code error;
    fs::create_directories(fs::path(root) / "apps" / "com.quorvex.weather-m" / "shared" / "data", error);
    if (!error)
        fs::create_directories(widgetDir, error);
    if (!error)
        fs::create_directory_symlink(WEATHER_BENCH_RES_DIR, widgetDir / "res", error);
    if (error)
        abort();
    NSWeather::FileUtil::ClearCache();
    vconf_set_int("memory/dnet/status", 2);
    return root;
}

#endif

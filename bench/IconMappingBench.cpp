// Cost of one icon lookup and one provider lookup, each of which reads the
// settings database (and, for WeatherNews, the icon database) every call.
#include <benchmark/benchmark.h>

#include <cstdlib>
#include <stdexcept>
#include <string>

#include <sqlite3.h>
#include <sys/stat.h>
#include <unistd.h>

#include "ContentProvider.h"
#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "IconMappingTable.h"

namespace
{

void MakeDirs(const std::string& path)
{
    for (size_t pos = path.find('/', 1);; pos = path.find('/', pos + 1))
    {
        mkdir(path.substr(0, pos).c_str(), 0755);
        if (pos == std::string::npos)
            break;
    }
}

std::string BuildDir()
{
    if (const char* dir = getenv("WEATHER_BUILD_DIR"))
        return dir;
    char exe[4096] = {};
    ssize_t length = readlink("/proc/self/exe", exe, sizeof(exe) - 1);
    std::string path(exe, length > 0 ? static_cast<size_t>(length) : 0);
    for (int i = 0; i < 2 && path.find('/') != std::string::npos; ++i) path = path.substr(0, path.rfind('/'));
    return path;
}

// A platform root of its own, with the widget's built resources.
class BenchRoot
{
public:
    BenchRoot()
    {
        char pattern[] = "/tmp/weather-bench-XXXXXX";
        if (!mkdtemp(pattern))
            throw std::runtime_error("mkdtemp failed");
        mPath = pattern;
        setenv("PLATFORM_ROOT", mPath.c_str(), 1);
        setenv("PLATFORM_APP_ID", "com.quorvex.weather-m-widget", 1);
        MakeDirs(mPath + "/apps/com.quorvex.weather-m/shared/data");
        MakeDirs(mPath + "/apps/com.quorvex.weather-m-widget");
        std::string res = BuildDir() + "/res/com.quorvex.weather-m-widget/res";
        if (symlink(res.c_str(), (mPath + "/apps/com.quorvex.weather-m-widget/res").c_str()) != 0)
            throw std::runtime_error("cannot link the widget resources");
        NSWeather::FileUtil::ClearCache();
        NSWeather::DataStoreInitializer::Run();
    }

    ~BenchRoot()
    {
        std::string command = "rm -rf '" + mPath + "'";
        if (system(command.c_str()) != 0)
            fprintf(stderr, "cannot remove %s\n", mPath.c_str());
    }

    void SetProvider(const char* cpType)
    {
        std::string db = mPath + "/apps/com.quorvex.weather-m/shared/data/db/.setting.db";
        sqlite3* handle = nullptr;
        sqlite3_open(db.c_str(), &handle);
        std::string sql = std::string("UPDATE SETTING_TABLE SET CpType = '") + cpType + "'";
        sqlite3_exec(handle, sql.c_str(), nullptr, nullptr, nullptr);
        sqlite3_close(handle);
    }

private:
    std::string mPath;
};

BenchRoot& Root()
{
    static BenchRoot root;
    return root;
}

void BM_GetMappingIconNumAccuWeather(benchmark::State& state)
{
    Root().SetProvider("Accuweather");
    NSWeather::IconMappingTable table;
    int iconNum = 0;
    for (auto _ : state)
    {
        benchmark::DoNotOptimize(table.GetMappingIconNum(iconNum, (iconNum & 1) == 0));
        iconNum = (iconNum + 1) % 45;
    }
}
BENCHMARK(BM_GetMappingIconNumAccuWeather);

void BM_GetMappingIconNumKWeather(benchmark::State& state)
{
    Root().SetProvider("Kweather");
    NSWeather::IconMappingTable table;
    int iconNum = 0;
    for (auto _ : state)
    {
        benchmark::DoNotOptimize(table.GetMappingIconNum(iconNum, true));
        iconNum = (iconNum + 1) % 41;
    }
}
BENCHMARK(BM_GetMappingIconNumKWeather);

void BM_GetMappingIconNumWeatherNews(benchmark::State& state)
{
    Root().SetProvider("WeatherNews");
    NSWeather::IconMappingTable table;
    for (auto _ : state) benchmark::DoNotOptimize(table.GetMappingIconNum(101, false));
}
BENCHMARK(BM_GetMappingIconNumWeatherNews);

void BM_GetContentProvider(benchmark::State& state)
{
    Root().SetProvider("cmaweather");
    for (auto _ : state) benchmark::DoNotOptimize(NSWeather::ContentProvider::GetContentProvider());
}
BENCHMARK(BM_GetContentProvider);

}  // namespace

BENCHMARK_MAIN();

#ifndef WEATHER_TESTS_SUITE_FOLDERS_H
#define WEATHER_TESTS_SUITE_FOLDERS_H

#include <sys/stat.h>

#include <string>

namespace WeatherTest
{

// The three applications of the suite, as a platform root registers them.
constexpr const char* kSuiteApps[] = {"com.quorvex.weather-m", "com.quorvex.weather-m-agent",
                                      "com.quorvex.weather-m-widget"};

// mkdir -p, without a shell; existing folders are left as they are.
inline void MakeDirs(const std::string& path, mode_t mode)
{
    for (size_t pos = path.find('/', 1);; pos = path.find('/', pos + 1))
    {
        mkdir(path.substr(0, pos).c_str(), mode);
        if (pos == std::string::npos)
            break;
    }
}

}  // namespace WeatherTest

#endif

// weather-sample-data: fills the platform root's databases with sample
// cities and settings, so that the real widget has something to show.
//   weather-sample-data [--cities N] [--days N] [--current] [--fahrenheit]
//                       [--refreshing] [--provider CPTYPE] [--display N]
#include <getopt.h>

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <string>

#include "DataStoreInitializer.h"
#include "SampleCities.h"
#include "SettingDBController.h"
#include "WeatherDefine.h"

namespace
{
struct Options
{
    int cities = 3;
    int days = 7;
    int display = 0;
    bool current = false;
    bool fahrenheit = false;
    bool refreshing = false;
    std::string provider = "AccuWeather";
};

bool Parse(int argc, char** argv, Options& options)
{
    static const option kOptions[] = {
        {"cities", required_argument, nullptr, 'c'},   {"days", required_argument, nullptr, 'd'},
        {"display", required_argument, nullptr, 'i'},  {"current", no_argument, nullptr, 'l'},
        {"fahrenheit", no_argument, nullptr, 'f'},     {"refreshing", no_argument, nullptr, 'r'},
        {"provider", required_argument, nullptr, 'p'}, {nullptr, 0, nullptr, 0}};
    int c;
    while ((c = getopt_long(argc, argv, "", kOptions, nullptr)) != -1)
    {
        switch (c)
        {
            case 'c':
                options.cities = atoi(optarg);
                break;
            case 'd':
                options.days = atoi(optarg);
                break;
            case 'i':
                options.display = atoi(optarg);
                break;
            case 'l':
                options.current = true;
                break;
            case 'f':
                options.fahrenheit = true;
                break;
            case 'r':
                options.refreshing = true;
                break;
            case 'p':
                options.provider = optarg;
                break;
            default:
                return false;
        }
    }
    return true;
}
}  // namespace

int main(int argc, char** argv)
{
    Options options;
    if (!Parse(argc, argv, options))
    {
        fprintf(stderr,
                "usage: weather-sample-data [--cities N] [--days N] [--current] [--fahrenheit] "
                "[--refreshing] [--provider CPTYPE] [--display N]\n");
        return 2;
    }
    NSWeather::DataStoreInitializer::Run();
    time_t now = time(nullptr);
    int written =
        NSWeatherWidget::SampleCities::WriteCities(options.cities, now - 600, options.days, options.current);
    NSWeather::SettingDBController settingDBController;
    NSWeather::SettingPtr setting = settingDBController.Select();
    if (written != NSWeather::ERR_OK || !setting)
    {
        fprintf(stderr, "weather-sample-data: the databases could not be written\n");
        return 1;
    }
    std::string displayId;
    if (options.display < options.cities)
    {
        displayId = NSWeatherWidget::SampleCities::MakeCity(options.display, now, 0)->GetLocationId();
        if (options.display == 0 && options.current)
            displayId += ":C";
    }
    setting->SetCurrentCityLocationId(displayId);
    setting->SetTemperatureUnit(options.fahrenheit ? 0 : 1);
    setting->SetCpType(options.provider);
    setting->SetIsNowRefreshing(options.refreshing);
    setting->SetRefreshingStartTime(options.refreshing ? now : 0);
    setting->SetUseCurrentLocationOn(options.current || options.refreshing);
    setting->SetShowCurrentCityAgreement(options.current || options.refreshing);
    setting->SetLastRefreshedTime(now - 600);
    settingDBController.Update(setting);
    return 0;
}

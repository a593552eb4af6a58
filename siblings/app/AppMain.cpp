// weather-app: the weather application's stand-in. From a shell it manages
// cities and settings; launched by the widget it records the request and,
// on a display, opens a small window on the city or an add-city prompt.
#include <Elementary.h>

#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <string>
#include <vector>

#include "AppLaunchView.h"
#include "CityCatalogue.h"
#include "DBController.h"
#include "DataStoreInitializer.h"
#include "LaunchRequest.h"
#include "SampleWeatherSource.h"
#include "SiblingLog.h"
#include "WeatherAppCommands.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace
{

bool HasDisplay()
{
    const char* x11 = getenv("DISPLAY");
    const char* wayland = getenv("WAYLAND_DISPLAY");
    return (x11 && *x11) || (wayland && *wayland);
}

int ShowWindow(const std::string& locationId, bool isAddCity, int argc, char** argv)
{
    elm_init(argc, argv);
    CityPtr cityPtr;
    if (!isAddCity && !locationId.empty() && DataStoreInitializer::Run() == ERR_OK)
        cityPtr = DBController().SelectCityData(locationId);
    int result = 1;
    {
        AppLaunchView view;
        if (view.Create(cityPtr))
        {
            elm_run();
            result = 0;
        }
    }
    elm_shutdown();
    return result;
}

int ServeLaunch(int argc, char** argv)
{
    std::map<std::string, std::string> extraData;
    if (!LaunchRequest::Read(extraData))
    {
        fputs(WeatherAppCommands::GetUsage().c_str(), stderr);
        return 2;
    }
    std::string locationId = extraData["LOCATION_ID"];
    bool isAddCity = extraData["MODE"] == "ADD_CITY";
    SIBLING_LOG("launched: LOCATION_ID=%s MODE=%s", locationId.empty() ? "(none)" : locationId.c_str(),
                extraData["MODE"].empty() ? "(none)" : extraData["MODE"].c_str());
    if (!HasDisplay())
        return 0;
    return ShowWindow(locationId, isAddCity, argc, argv);
}

}  // namespace

int main(int argc, char** argv)
{
    setlocale(LC_ALL, "");
    if (argc == 1)
        return ServeLaunch(argc, argv);
    std::vector<std::string> args(argv + 1, argv + argc);
    if (args[0] == "--help" || args[0] == "-h")
    {
        fputs(WeatherAppCommands::GetUsage().c_str(), stdout);
        return 0;
    }
    WeatherAppCommands commands(CityCatalogue::Load(CityCatalogue::GetDefaultPath()),
                                std::make_shared<SampleWeatherSource>());
    std::string out;
    int result = commands.Run(args, out);
    fputs(out.c_str(), result == ERR_OK ? stdout : stderr);
    return result == ERR_OK ? 0 : 1;
}

// weather-agent: started by the suite's launch requests, or from a shell
// with "refresh" or "locate". Its weather is sample weather unless the
// --source option or the platform key asks for Open-Meteo.
#include <cstdio>
#include <map>
#include <string>
#include <vector>

#include "CityCatalogue.h"
#include "LaunchRequest.h"
#include "OpenMeteoWeatherSource.h"
#include "SiblingLog.h"
#include "WeatherAgent.h"
#include "WeatherDefine.h"
#include "WeatherSourceChoice.h"

using namespace NSWeather;

namespace
{

void Usage(FILE* out)
{
    fprintf(out,
            "usage: weather-agent [--source open-meteo|sample] [refresh | locate | --help]\n"
            "  refresh  gives every stored city new weather and tells the widget\n"
            "  locate   adds the city nearest to the device position as the current-location city\n"
            "Without a command it serves the launch request it was started with (MESSAGE, PORT_ID).\n"
            "\n"
            "Sources:\n"
            "  sample      made up offline from season, latitude and time of day; not a forecast (default)\n"
            "  open-meteo  forecasts fetched over HTTPS from Open-Meteo; needs the network\n"
            "Without --source the key %s (string) names the source, so agents\n"
            "that the widget launches follow it too. The environment variables\n"
            "%s and %s (milliseconds)\n"
            "change the Open-Meteo address and time limit.\n"
            "\n"
            "%s.\n",
            WeatherSourceChoice::SOURCE_KEY, WeatherSourceChoice::BASE_URL_ENV,
            WeatherSourceChoice::TIMEOUT_ENV, OpenMeteoWeatherSource::CREDIT);
}

int Serve(WeatherAgent& agent)
{
    std::map<std::string, std::string> extraData;
    if (!LaunchRequest::Read(extraData))
    {
        SIBLING_LOG("started without a launch request and without a command");
        return 2;
    }
    return agent.HandleRequest(extraData["MESSAGE"], extraData["PORT_ID"]) == ERR_OK ? 0 : 1;
}

int RunCommand(WeatherAgent& agent, const WeatherSource& source, const std::string& command)
{
    int result = ERR_FAIL;
    if (command == "refresh")
        result = agent.HandleRequest(WeatherAgent::REQUEST_ALL_WEATHER_INFO, "");
    else if (command == "locate")
        result = agent.HandleRequest(WeatherAgent::REQUEST_CURRENT_LOCATION, WeatherAgent::WIDGET_PORT);
    else
    {
        Usage(stderr);
        return 2;
    }
    printf("%s (%s)\n", result == ERR_OK ? "done" : "failed; see the log", source.GetDescription().c_str());
    return result == ERR_OK ? 0 : 1;
}

}  // namespace

int main(int argc, char** argv)
{
    std::vector<std::string> args(argv + 1, argv + argc);
    std::string sourceName;
    if (!args.empty() && args[0] == "--source")
    {
        if (args.size() < 2 || args[1].empty())
        {
            Usage(stderr);
            return 2;
        }
        sourceName = args[1];
        args.erase(args.begin(), args.begin() + 2);
    }
    if (args.size() == 1 && (args[0] == "--help" || args[0] == "-h"))
    {
        Usage(stdout);
        return 0;
    }
    WeatherSourcePtr sourcePtr = WeatherSourceChoice::Make(sourceName);
    if (args.size() > 1 || !sourcePtr)
    {
        Usage(stderr);
        return 2;
    }
    WeatherAgent agent(CityCatalogue::Load(CityCatalogue::GetDefaultPath()), sourcePtr);
    return args.empty() ? Serve(agent) : RunCommand(agent, *sourcePtr, args[0]);
}

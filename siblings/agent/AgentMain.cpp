// weather-agent: started by the suite's launch requests, or from a shell
// with "refresh" or "locate". Its weather is sample weather.
#include <cstdio>
#include <cstring>
#include <map>
#include <string>

#include "CityCatalogue.h"
#include "LaunchRequest.h"
#include "SampleWeatherSource.h"
#include "SiblingLog.h"
#include "WeatherAgent.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace
{

void Usage(FILE* out, const WeatherSource& source)
{
    fprintf(out,
            "usage: weather-agent [refresh | locate | --help]\n"
            "  refresh  gives every stored city new weather and tells the widget\n"
            "  locate   adds the city nearest to the device position as the current-location city\n"
            "Without a command it serves the launch request it was started with (MESSAGE, PORT_ID).\n"
            "Note: this agent gives %s.\n",
            source.GetDescription().c_str());
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

}  // namespace

int main(int argc, char** argv)
{
    auto sourcePtr = std::make_shared<SampleWeatherSource>();
    if (argc > 2 || (argc == 2 && (!strcmp(argv[1], "--help") || !strcmp(argv[1], "-h"))))
    {
        Usage(argc == 2 ? stdout : stderr, *sourcePtr);
        return argc == 2 ? 0 : 2;
    }
    WeatherAgent agent(CityCatalogue::Load(CityCatalogue::GetDefaultPath()), sourcePtr);
    if (argc == 1)
        return Serve(agent);
    std::string command = argv[1];
    int result = ERR_FAIL;
    if (command == "refresh")
        result = agent.HandleRequest(WeatherAgent::REQUEST_ALL_WEATHER_INFO, "");
    else if (command == "locate")
        result = agent.HandleRequest(WeatherAgent::REQUEST_CURRENT_LOCATION, WeatherAgent::WIDGET_PORT);
    else
    {
        Usage(stderr, *sourcePtr);
        return 2;
    }
    printf("%s (%s)\n", result == ERR_OK ? "done" : "failed; see the log",
           sourcePtr->GetDescription().c_str());
    return result == ERR_OK ? 0 : 1;
}

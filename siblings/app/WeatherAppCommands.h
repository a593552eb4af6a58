#ifndef NSWEATHER_WEATHER_APP_COMMANDS_H
#define NSWEATHER_WEATHER_APP_COMMANDS_H

#include <functional>
#include <string>
#include <vector>

#include "CityCatalogue.h"
#include "Setting.h"
#include "WeatherAgent.h"

namespace NSWeather
{

// The weather application's command line: manages the user's cities and
// settings through the suite's data store with the application's rules.
// Cities stay in page order without gaps; the settings' current city always
// names a stored city (or none when the list is empty); the settings row is
// read, changed and written whole in one transaction.
class WeatherAppCommands
{
public:
    WeatherAppCommands(CityCataloguePtr cataloguePtr, WeatherSourcePtr sourcePtr);
    virtual ~WeatherAppCommands() = default;

    // Runs one command with its arguments; what it says goes to `out`.
    // ERR_OK, or ERR_FAIL with the reason in `out` and the log.
    int Run(const std::vector<std::string>& args, std::string& out);
    static std::string GetUsage();

private:
    int Add(const std::string& query, std::string& out);
    int Remove(const std::string& which, std::string& out);
    int Move(const std::string& from, const std::string& to, std::string& out);
    int List(std::string& out);
    int SetCurrent(const std::string& which, std::string& out);
    int SetUnit(const std::string& unit, std::string& out);
    int SetInterval(const std::string& hours, std::string& out);
    int SetProvider(const std::string& provider, std::string& out);
    int SetLocation(const std::string& onOff, std::string& out);

    CatalogueCityPtr FindPlace(const std::string& query) const;
    // A stored city by page index (digits) or location id; null if none.
    static CityPtr FindStored(const std::string& which);
    // Points the settings' current city at a stored one when it names none,
    // reading the cities in the settings' write transaction.
    static bool KeepCurrentCityValid();
    // Removes a city with its rows and its unused moon rows.
    static bool Delete(const std::string& locationId);
    static void ForgetUnusedMoonRows();
    static bool ChangeSetting(const std::function<void(const SettingPtr&)>& change, std::string& out);

    CityCataloguePtr mCataloguePtr;
    WeatherAgent mAgent;
};

}  // namespace NSWeather

#endif

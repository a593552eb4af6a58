#include "WeatherAppCommands.h"

#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <functional>
#include <map>

#include "ContentProvider.h"
#include "DBController.h"
#include "DataStoreInitializer.h"
#include "SettingDBController.h"
#include "SiblingLog.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{
constexpr size_t PREFIX_CANDIDATES = 20;
const int INTERVAL_CHOICES[] = {0, 1, 3, 6, 12, 24};
const char* const PROVIDER_TEXTS[] = {"Accuweather", "cmaweather", "Kweather", "weathernews_kr",
                                      "WeatherNews"};

// A whole non-negative number of at most six digits; -1 otherwise.
int ParseIndex(const std::string& text)
{
    if (text.empty() || text.size() > 6 || text.find_first_not_of("0123456789") != std::string::npos)
        return -1;
    return atoi(text.c_str());
}

int Fail(std::string& out, const std::string& reason)
{
    out += reason + "\n";
    SIBLING_LOG("%s", reason.c_str());
    return ERR_FAIL;
}

std::string FormatTemperature(const TemperaturePtr& temperaturePtr, bool isCelsius)
{
    if (!temperaturePtr || temperaturePtr->GetCelsius() == 999.0)
        return "--";
    char text[32];
    snprintf(text, sizeof(text), "%.0f%s",
             isCelsius ? temperaturePtr->GetCelsius() : temperaturePtr->GetFahrenheit(),
             isCelsius ? "C" : "F");
    return text;
}

std::string FormatUtc(time_t when)
{
    if (when <= 0)
        return "never";
    struct tm utc = {};
    char text[32];
    gmtime_r(&when, &utc);
    strftime(text, sizeof(text), "%Y-%m-%d %H:%M UTC", &utc);
    return text;
}
}  // namespace

WeatherAppCommands::WeatherAppCommands(CityCataloguePtr cataloguePtr, WeatherSourcePtr sourcePtr)
    : mCataloguePtr(cataloguePtr), mAgent(cataloguePtr, std::move(sourcePtr))
{
}

std::string WeatherAppCommands::GetUsage()
{
    return "usage: weather-app COMMAND\n"
           "  add <name|id>          add a catalogue city (largest match of a name prefix)\n"
           "  remove <id|index>      remove a stored city\n"
           "  move <from> <to>       move a city to another page (0-based)\n"
           "  list                   the cities in page order and the settings\n"
           "  current <id|index>     the city the widget and the app show\n"
           "  unit c|f               temperature unit\n"
           "  interval <hours>       automatic refresh: 0 (never), 1, 3, 6, 12 or 24\n"
           "  provider <code|name>   0 Accuweather, 1 cmaweather, 2 Kweather, 3 weathernews_kr, 4 "
           "WeatherNews\n"
           "  location on|off        use the current location (and agree to it)\n"
           "Weather given with a new city is sample weather, not a forecast; 'weather-agent --source\n"
           "open-meteo refresh' fetches forecasts. Weather data by Open-Meteo.com, CC BY 4.0.\n";
}

int WeatherAppCommands::Run(const std::vector<std::string>& args, std::string& out)
{
    static const std::map<std::string, size_t> ARG_COUNTS = {
        {"add", 2},  {"remove", 2},   {"move", 3},     {"list", 1},     {"current", 2},
        {"unit", 2}, {"interval", 2}, {"provider", 2}, {"location", 2},
    };
    auto expected = args.empty() ? ARG_COUNTS.end() : ARG_COUNTS.find(args[0]);
    if (expected == ARG_COUNTS.end() || expected->second != args.size())
        return Fail(out, GetUsage());
    if (DataStoreInitializer::Run() != ERR_OK)
        return Fail(out, "the data store cannot be opened");
    const std::string& command = args[0];
    if (command == "add")
        return Add(args[1], out);
    if (command == "remove")
        return Remove(args[1], out);
    if (command == "move")
        return Move(args[1], args[2], out);
    if (command == "list")
        return List(out);
    if (command == "current")
        return SetCurrent(args[1], out);
    if (command == "unit")
        return SetUnit(args[1], out);
    if (command == "interval")
        return SetInterval(args[1], out);
    if (command == "provider")
        return SetProvider(args[1], out);
    return SetLocation(args[1], out);
}

CatalogueCityPtr WeatherAppCommands::FindPlace(const std::string& query) const
{
    if (!mCataloguePtr || query.empty() || query.size() > 256)
        return nullptr;
    if (CatalogueCityPtr placePtr = mCataloguePtr->FindById(query))
        return placePtr;
    CatalogueCityPtrVector candidates = mCataloguePtr->FindByPrefix(query, PREFIX_CANDIDATES);
    std::string folded = CityCatalogue::FoldCase(query);
    for (const CatalogueCityPtr& placePtr : candidates)
        if (CityCatalogue::FoldCase(placePtr->GetName()) == folded ||
            CityCatalogue::FoldCase(placePtr->GetNameEng()) == folded)
            return placePtr;
    return candidates.empty() ? nullptr : candidates.front();
}

CityPtr WeatherAppCommands::FindStored(const std::string& which)
{
    DBController dbController;
    int pageIndex = ParseIndex(which);
    return pageIndex >= 0 ? dbController.SelectCityData(pageIndex) : dbController.SelectCityData(which);
}

bool WeatherAppCommands::ChangeSetting(const std::function<void(const SettingPtr&)>& change, std::string& out)
{
    if (!SettingDBController().SelectAndUpdate(change))
    {
        Fail(out, "the settings could not be written");
        return false;
    }
    return true;
}

bool WeatherAppCommands::KeepCurrentCityValid()
{
    SettingPtr settingPtr = SettingDBController().SelectAndUpdateWithCities(
        [](const SettingPtr& s, const CityPtrVector& cityPtrVector)
        {
            for (const CityPtr& cityPtr : cityPtrVector)
            {
                if (cityPtr->GetLocationId() == s->GetCurrentCityLocationId())
                {
                    s->SetCurrentCityIndex(cityPtr->GetPageIndex());
                    return;
                }
            }
            s->SetCurrentCityLocationId(cityPtrVector.empty() ? std::string()
                                                              : cityPtrVector.front()->GetLocationId());
            s->SetCurrentCityIndex(0);
        });
    if (!settingPtr)
        SIBLING_LOG("the current city could not be checked");
    return settingPtr != nullptr;
}

bool WeatherAppCommands::Delete(const std::string& locationId)
{
    DBController dbController;
    SIBLING_RETV_IF(dbController.DeleteCityData(locationId) != ERR_OK, false);
    ForgetUnusedMoonRows();
    return true;
}

void WeatherAppCommands::ForgetUnusedMoonRows()
{
    if (DBController().DeleteUselessMoonPhaseData() != ERR_OK)
        SIBLING_LOG("moon rows could not be removed");
}

int WeatherAppCommands::Add(const std::string& query, std::string& out)
{
    CatalogueCityPtr placePtr = FindPlace(query);
    if (!placePtr)
        return Fail(out, "no catalogue city matches '" + query + "'");
    DBController dbController;
    if (dbController.SelectCityData(placePtr->GetId()))
    {
        out += placePtr->GetId() + " is already in the list\n";
        return ERR_OK;
    }
    CityPtr cityPtr = mAgent.MakeCity(*placePtr, false, ContentProvider::GetContentProvider());
    if (!cityPtr)
        return Fail(out, "no weather for " + placePtr->GetId());
    cityPtr->SetPageIndex(-1);
    if (dbController.InsertCityData(cityPtr) != ERR_OK)
        return Fail(out, placePtr->GetId() + " could not be stored");
    cityPtr->SetPageIndex(-1);
    if (dbController.UpdateOnlyMoonPhaseData(cityPtr) != ERR_OK)
        SIBLING_LOG("moon rows of %s could not be stored", placePtr->GetId().c_str());
    KeepCurrentCityValid();
    out += "added " + placePtr->GetId() + " (" + placePtr->GetName() + ", " + placePtr->GetCountry() +
           ") as page " + std::to_string(dbController.GetPageIndexWithLocationID(placePtr->GetId())) + "\n";
    return ERR_OK;
}

int WeatherAppCommands::Remove(const std::string& which, std::string& out)
{
    CityPtr cityPtr = FindStored(which);
    if (!cityPtr)
        return Fail(out, "no stored city '" + which + "'");
    if (!Delete(cityPtr->GetLocationId()))
        return Fail(out, cityPtr->GetLocationId() + " could not be removed");
    KeepCurrentCityValid();
    out += "removed " + cityPtr->GetLocationId() + "\n";
    return ERR_OK;
}

int WeatherAppCommands::Move(const std::string& from, const std::string& to, std::string& out)
{
    int fromIndex = ParseIndex(from);
    int toIndex = ParseIndex(to);
    int count = DBController().GetNumberOfCities();
    if (count < 0)
        return Fail(out, "the cities cannot be read");
    if (fromIndex < 0 || toIndex < 0 || fromIndex >= count || toIndex >= count)
        return Fail(out, "pages run from 0 to " + std::to_string(count - 1));
    // The order is read again inside the write: a change made meanwhile by
    // another process is moved with, not undone.
    std::string movedId = DBController().MoveCityData(fromIndex, toIndex);
    if (movedId.empty())
        return Fail(out, "the new order could not be stored");
    KeepCurrentCityValid();
    out += "moved " + movedId + " to page " + std::to_string(toIndex) + "\n";
    return ERR_OK;
}

int WeatherAppCommands::List(std::string& out)
{
    SettingPtr settingPtr = SettingDBController().Select();
    CityPtrVectorPtr cityPtrVector = DBController().SelectAllCityData();
    if (!settingPtr || !cityPtrVector)
        return Fail(out, "the data store cannot be read");
    bool isCelsius = settingPtr->GetTemperatureUnit() == 1;
    out += "unit " + std::string(isCelsius ? "c" : "f") + ", interval " +
           std::to_string(settingPtr->GetAutoRefreshInterval()) + " h, provider " + settingPtr->GetCpType() +
           ", location " + (settingPtr->GetUseCurrentLocationOn() ? "on" : "off") + ", last refresh " +
           FormatUtc(settingPtr->GetLastRefreshedTime()) + "\n";
    for (const CityPtr& cityPtr : *cityPtrVector)
    {
        bool isShown = cityPtr->GetLocationId() == settingPtr->GetCurrentCityLocationId();
        CurrentPtr currentPtr = cityPtr->GetCurrentPtr();
        out += (isShown ? "* " : "  ") + std::to_string(cityPtr->GetPageIndex()) + " " +
               cityPtr->GetLocationId() + " " + cityPtr->GetCityName() + ", " + cityPtr->GetCountryName() +
               " " +
               (currentPtr ? FormatTemperature(currentPtr->GetCurTemperature(), isCelsius) + " " +
                                 currentPtr->GetWeatherStatus()
                           : std::string("--")) +
               ", refreshed " + FormatUtc(cityPtr->GetRefreshedTime()) + "\n";
    }
    return ERR_OK;
}

int WeatherAppCommands::SetCurrent(const std::string& which, std::string& out)
{
    CityPtr cityPtr = FindStored(which);
    if (!cityPtr)
        return Fail(out, "no stored city '" + which + "'");
    std::string locationId = cityPtr->GetLocationId();
    bool isStored = false;
    SettingPtr settingPtr = SettingDBController().SelectAndUpdateWithCities(
        [&locationId, &isStored](const SettingPtr& s, const CityPtrVector& cityPtrVector)
        {
            for (const CityPtr& storedPtr : cityPtrVector)
            {
                if (storedPtr->GetLocationId() != locationId)
                    continue;
                isStored = true;
                s->SetCurrentCityLocationId(locationId);
                s->SetCurrentCityIndex(storedPtr->GetPageIndex());
            }
        });
    if (!settingPtr)
        return Fail(out, "the settings could not be written");
    if (!isStored)
        return Fail(out, locationId + " was removed meanwhile");
    out += "current city " + locationId + "\n";
    return ERR_OK;
}

int WeatherAppCommands::SetUnit(const std::string& unit, std::string& out)
{
    if (unit != "c" && unit != "f")
        return Fail(out, "unit is c or f");
    int value = unit == "c" ? 1 : 0;
    if (!ChangeSetting([value](const SettingPtr& settingPtr) { settingPtr->SetTemperatureUnit(value); }, out))
        return ERR_FAIL;
    out += "unit " + unit + "\n";
    return ERR_OK;
}

int WeatherAppCommands::SetInterval(const std::string& hours, std::string& out)
{
    int value = ParseIndex(hours);
    bool isChoice = false;
    for (int choice : INTERVAL_CHOICES) isChoice = isChoice || choice == value;
    if (!isChoice)
        return Fail(out, "interval is 0, 1, 3, 6, 12 or 24 hours");
    if (!ChangeSetting(
            [value](const SettingPtr& settingPtr)
            {
                settingPtr->SetAutoRefreshInterval(value);
                settingPtr->SetAutoRefreshOn(value > 0);
            },
            out))
        return ERR_FAIL;
    out += "interval " + std::to_string(value) + " h\n";
    return ERR_OK;
}

int WeatherAppCommands::SetProvider(const std::string& provider, std::string& out)
{
    int code = ParseIndex(provider);
    for (int i = 0; code < 0 && i <= CP_WEATHERNEWS; ++i) code = provider == PROVIDER_TEXTS[i] ? i : -1;
    if (code < 0 || code > CP_WEATHERNEWS)
        return Fail(out, "provider is a code 0-4 or one of its names");
    std::string cpType = PROVIDER_TEXTS[code];
    if (!ChangeSetting([&cpType](const SettingPtr& settingPtr) { settingPtr->SetCpType(cpType); }, out))
        return ERR_FAIL;
    out += "provider " + cpType + "\n";
    return ERR_OK;
}

int WeatherAppCommands::SetLocation(const std::string& onOff, std::string& out)
{
    if (onOff != "on" && onOff != "off")
        return Fail(out, "location is on or off");
    bool isOn = onOff == "on";
    if (!ChangeSetting(
            [isOn](const SettingPtr& settingPtr)
            {
                settingPtr->SetUseCurrentLocationOn(isOn);
                settingPtr->SetShowCurrentCityAgreement(isOn);
            },
            out))
        return ERR_FAIL;
    // Without the current location its city goes too, found inside the
    // delete so that a city the agent has just put in its place goes as well.
    if (!isOn)
    {
        if (DBController().DeleteCurrentLocationCityData() != ERR_OK)
            return Fail(out, "the current-location city could not be removed");
        ForgetUnusedMoonRows();
        KeepCurrentCityValid();
    }
    out += "location " + onOff + "\n";
    return ERR_OK;
}

}  // namespace NSWeather

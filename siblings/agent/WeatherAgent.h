#ifndef NSWEATHER_WEATHER_AGENT_H
#define NSWEATHER_WEATHER_AGENT_H

#include <ctime>
#include <functional>
#include <string>

#include "City.h"
#include "CityCatalogue.h"
#include "WeatherSource.h"

namespace NSWeather
{

// The weather agent's work: refresh every stored city, or add the city of
// the device position, and then tell the waiting port. Every step goes
// through the suite's data store; a failed step is logged and the port is
// told all the same, so no refresh mark is left waiting.
class WeatherAgent
{
public:
    static constexpr const char* REQUEST_ALL_WEATHER_INFO = "REQUEST_ALL_WEATHER_INFO";
    static constexpr const char* REQUEST_CURRENT_LOCATION =
        "REQUEST_CURRENT_LOCATION_WEATHER_INFO_FOR_SIMPLE_ADD_PROCESS";
    static constexpr const char* WIDGET_PORT = "com.quorvex.weather-m-widget.message.port.local";
    // Where the platform keeps the last known device position (degrees).
    static constexpr const char* POSITION_LATITUDE_KEY = "db/location/last/gps/Latitude";
    static constexpr const char* POSITION_LONGITUDE_KEY = "db/location/last/gps/Longitude";

    using ClockCb = std::function<time_t()>;

    // A null catalogue is allowed: every request then fails (logged) and
    // still posts.
    WeatherAgent(CityCataloguePtr cataloguePtr, WeatherSourcePtr sourcePtr, ClockCb clockCb = nullptr);
    virtual ~WeatherAgent() = default;

    // Runs one request ("MESSAGE") and posts to `portId`, or to the
    // widget's port when it is empty. ERR_OK when the work was done.
    int HandleRequest(const std::string& message, const std::string& portId);
    int RefreshAll();
    int AddCurrentLocation();
    // Makes a stored-city record with fresh weather for the catalogue city;
    // null when the source has nothing.
    CityPtr MakeCity(const CatalogueCity& place, bool isCurrentLocation, int contentProvider);
    // Sends one message to the port; ERR_OK when someone listened.
    static int PostDone(const std::string& portId, const std::string& request, bool isDone);

private:
    enum class CityResult
    {
        FETCHED,
        RECENT,  // the source's data is recent enough; not asked again
        FAILED,  // logged; the city keeps its rows
    };

    time_t Now() const;
    CityResult RefreshCity(const CityPtr& storedPtr, int contentProvider, time_t now);
    bool ReadPosition(double& latitude, double& longitude);
    bool StoreCurrentLocationCity(const CityPtr& cityPtr);
    bool MarkRefreshed(time_t now, bool isCurrentLocation);

    CityCataloguePtr mCataloguePtr;
    WeatherSourcePtr mSourcePtr;
    ClockCb mClockCb;
};

}  // namespace NSWeather

#endif

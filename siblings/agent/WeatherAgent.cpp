#include "WeatherAgent.h"

#include <bundle.h>
#include <message_port.h>
#include <vconf.h>

#include <unistd.h>

#include <cmath>

#include "CityTimeZone.h"
#include "ContentProvider.h"
#include "DBController.h"
#include "DataStoreInitializer.h"
#include "Location.h"
#include "SettingDBController.h"
#include "SiblingLog.h"
#include "WeatherDefine.h"

namespace NSWeather
{

namespace
{
const std::string CURRENT_LOCATION_SUFFIX = ":C";

std::string CatalogueIdOf(const std::string& locationId)
{
    size_t at = locationId.find(CURRENT_LOCATION_SUFFIX);
    return at == std::string::npos ? locationId : locationId.substr(0, at);
}

// Moves what identifies a stored city onto a record with fresh weather.
void KeepIdentity(const City& stored, City& fresh)
{
    fresh.SetLocationId(stored.GetLocationId());
    fresh.SetCityName(stored.GetCityName());
    fresh.SetCityNameEng(stored.GetCityNameEng());
    fresh.SetCountryName(stored.GetCountryName());
    fresh.SetCountryNameEng(stored.GetCountryNameEng());
    fresh.SetIsCurrentLocation(stored.GetIsCurrentLocation());
    fresh.SetWidgetReferenceCount(stored.GetWidgetReferenceCount());
}

// In-place updates cannot create rows: a stored city must have them all.
bool HasForecastRows(const City& stored)
{
    return stored.GetCurrentPtr() && stored.GetExtraPtr() && stored.GetWeeklyPtrVector() &&
           !stored.GetWeeklyPtrVector()->empty();
}
}  // namespace

WeatherAgent::WeatherAgent(CityCataloguePtr cataloguePtr, WeatherSourcePtr sourcePtr, ClockCb clockCb)
    : mCataloguePtr(std::move(cataloguePtr)), mSourcePtr(std::move(sourcePtr)), mClockCb(std::move(clockCb))
{
}

time_t WeatherAgent::Now() const
{
    return mClockCb ? mClockCb() : time(nullptr);
}

int WeatherAgent::HandleRequest(const std::string& message, const std::string& portId)
{
    SIBLING_LOG("request '%s' (port '%s'); %s", message.c_str(), portId.c_str(),
                mSourcePtr ? mSourcePtr->GetDescription().c_str() : "no weather source");
    int result = ERR_FAIL;
    if (DataStoreInitializer::Run() != ERR_OK)
        SIBLING_LOG("the data store could not be opened");
    else if (message == REQUEST_ALL_WEATHER_INFO)
        result = RefreshAll();
    else if (message == REQUEST_CURRENT_LOCATION)
        result = AddCurrentLocation();
    else
        SIBLING_LOG("unknown request '%s'", message.c_str());
    PostDone(portId.empty() ? WIDGET_PORT : portId, message, result == ERR_OK);
    return result;
}

CityPtr WeatherAgent::MakeCity(const CatalogueCity& place, bool isCurrentLocation, int contentProvider)
{
    SIBLING_RETV_IF(!mSourcePtr, nullptr);
    time_t now = Now();
    auto cityPtr = std::make_shared<City>();
    cityPtr->SetLocationId(place.GetId() + (isCurrentLocation ? CURRENT_LOCATION_SUFFIX : ""));
    cityPtr->SetCityName(place.GetName());
    cityPtr->SetCityNameEng(place.GetNameEng());
    cityPtr->SetCountryName(place.GetCountry());
    cityPtr->SetCountryNameEng(place.GetCountry());
    cityPtr->SetIsCurrentLocation(isCurrentLocation);
    double offset = 0.0;
    bool isSummerTime = false;
    SIBLING_RETV_IF(!CityTimeZone::GetOffset(place.GetTimeZone(), now, offset, isSummerTime), nullptr);
    SIBLING_RETV_IF(!mSourcePtr->Fill(place, now, contentProvider, *cityPtr), nullptr);
    cityPtr->SetGmtOffset(offset);
    cityPtr->SetIsSummerTime(isSummerTime);
    cityPtr->SetRefreshedTime(now);
    cityPtr->SetLocalTime(now + static_cast<time_t>(std::lround(offset * 3600.0)));
    cityPtr->SetNeedToUpdate(false);
    return cityPtr;
}

WeatherAgent::CityResult WeatherAgent::RefreshCity(const CityPtr& storedPtr, int contentProvider, time_t now)
{
    std::string locationId = storedPtr->GetLocationId();
    const char* id = locationId.c_str();
    CatalogueCityPtr placePtr = mCataloguePtr->FindById(CatalogueIdOf(locationId));
    if (!placePtr)
    {
        SIBLING_LOG("city '%s' is not in the catalogue; left as it is", id);
        return CityResult::FAILED;
    }
    if (!HasForecastRows(*storedPtr))
    {
        SIBLING_LOG("city '%s' has no forecast rows to update", id);
        return CityResult::FAILED;
    }
    if (mSourcePtr->IsFreshEnough(*storedPtr, now))
    {
        SIBLING_LOG("city '%s' was refreshed at %lld; kept without asking again", id,
                    static_cast<long long>(storedPtr->GetRefreshedTime()));
        return CityResult::RECENT;
    }
    CityPtr freshPtr = MakeCity(*placePtr, storedPtr->GetIsCurrentLocation(), contentProvider);
    if (!freshPtr)
    {
        SIBLING_LOG("city '%s' keeps its last weather", id);
        return CityResult::FAILED;
    }
    KeepIdentity(*storedPtr, *freshPtr);
    freshPtr->SetRefreshedTime(now);
    DBController dbController;
    // The row is found again by its location id inside the write, so a city
    // moved or removed meanwhile by another process is never overwritten.
    freshPtr->SetPageIndex(-1);
    if (dbController.UpdateCityData(freshPtr) != ERR_OK)
    {
        SIBLING_LOG("city '%s' could not be written", id);
        return CityResult::FAILED;
    }
    freshPtr->SetPageIndex(-1);
    SIBLING_RETV_IF(dbController.UpdateOnlyMoonPhaseData(freshPtr) != ERR_OK, CityResult::FAILED);
    return CityResult::FETCHED;
}

int WeatherAgent::RefreshAll()
{
    SIBLING_RETV_IF(!mCataloguePtr || !mSourcePtr, ERR_FAIL);
    CityPtrVectorPtr cityPtrVector = DBController().SelectAllCityData();
    SIBLING_RETV_IF(!cityPtrVector, ERR_FAIL);
    if (cityPtrVector->empty())
    {
        SIBLING_LOG("no cities to refresh");
        return ERR_FAIL;
    }
    int contentProvider = ContentProvider::GetContentProvider();
    time_t now = Now();
    size_t fetched = 0;
    size_t recent = 0;
    for (const CityPtr& cityPtr : *cityPtrVector)
    {
        CityResult result = cityPtr ? RefreshCity(cityPtr, contentProvider, now) : CityResult::FAILED;
        fetched += result == CityResult::FETCHED ? 1 : 0;
        recent += result == CityResult::RECENT ? 1 : 0;
    }
    if (DBController().DeleteUselessMoonPhaseData() != ERR_OK)
        SIBLING_LOG("old moon rows could not be removed");
    SIBLING_LOG("refreshed %zu of %zu cities, %zu kept as recent enough", fetched, cityPtrVector->size(),
                recent);
    SIBLING_RETV_IF(fetched + recent == 0, ERR_FAIL);
    // Nothing new came when every city was recent: the last time stays.
    if (fetched > 0)
        SIBLING_RETV_IF(!MarkRefreshed(now, false), ERR_FAIL);
    return fetched + recent == cityPtrVector->size() ? ERR_OK : ERR_FAIL;
}

bool WeatherAgent::ReadPosition(double& latitude, double& longitude)
{
    if (!Location().IsLocationEnabled())
    {
        SIBLING_LOG("the location service is off");
        return false;
    }
    bool isKnown = vconf_get_dbl(POSITION_LATITUDE_KEY, &latitude) == VCONF_OK &&
                   vconf_get_dbl(POSITION_LONGITUDE_KEY, &longitude) == VCONF_OK;
    if (!isKnown)
    {
        SIBLING_LOG("no device position in %s / %s", POSITION_LATITUDE_KEY, POSITION_LONGITUDE_KEY);
        return false;
    }
    return true;
}

bool WeatherAgent::StoreCurrentLocationCity(const CityPtr& cityPtr)
{
    DBController dbController;
    int pageIndex = dbController.GetPageIndexOfCurrentCity();
    int result = ERR_FAIL;
    if (pageIndex < 0)
    {
        result = dbController.InsertCityData(cityPtr);
    }
    else
    {
        // The device moved (or not): the current-location row takes the new
        // city in place, keeping its page.
        cityPtr->SetPageIndex(pageIndex);
        result = dbController.UpdateCityData(cityPtr);
    }
    SIBLING_RETV_IF(result != ERR_OK, false);
    cityPtr->SetPageIndex(-1);
    SIBLING_RETV_IF(dbController.UpdateOnlyMoonPhaseData(cityPtr) != ERR_OK, false);
    if (dbController.DeleteUselessMoonPhaseData() != ERR_OK)
        SIBLING_LOG("old moon rows could not be removed");
    return true;
}

int WeatherAgent::AddCurrentLocation()
{
    SIBLING_RETV_IF(!mCataloguePtr, ERR_FAIL);
    double latitude = 0.0;
    double longitude = 0.0;
    SIBLING_RETV_IF(!ReadPosition(latitude, longitude), ERR_FAIL);
    CatalogueCityPtr placePtr = mCataloguePtr->FindNearest(latitude, longitude);
    SIBLING_RETV_IF(!placePtr, ERR_FAIL);
    SIBLING_LOG("position %.4f,%.4f is nearest to %s", latitude, longitude, placePtr->GetId().c_str());
    CityPtr cityPtr = MakeCity(*placePtr, true, ContentProvider::GetContentProvider());
    SIBLING_RETV_IF(!cityPtr, ERR_FAIL);
    SIBLING_RETV_IF(!StoreCurrentLocationCity(cityPtr), ERR_FAIL);
    SIBLING_RETV_IF(!MarkRefreshed(cityPtr->GetRefreshedTime(), true), ERR_FAIL);
    return ERR_OK;
}

bool WeatherAgent::MarkRefreshed(time_t now, bool isCurrentLocation)
{
    SettingPtr settingPtr = SettingDBController().SelectAndUpdate(
        [now, isCurrentLocation](const SettingPtr& s)
        {
            s->SetLastRefreshedTime(now);
            if (isCurrentLocation)
                s->SetCurrentLocationAreaRefreshedTime(now);
        });
    if (!settingPtr)
    {
        SIBLING_LOG("LastRefreshedTime could not be stored");
        return false;
    }
    return true;
}

int WeatherAgent::PostDone(const std::string& portId, const std::string& request, bool isDone)
{
    bundle* message = bundle_create();
    SIBLING_RETV_IF(!message, ERR_FAIL);
    bundle_add_str(message, "MESSAGE", request.c_str());
    bundle_add_str(message, "RESULT", isDone ? "OK" : "FAIL");
    int result = message_port_send_message(WEATHER_WIDGET_APP_ID, portId.c_str(), message);
    bundle_free(message);
    if (result != MESSAGE_PORT_ERROR_NONE)
    {
        SIBLING_LOG("message to port '%s' failed(%d)", portId.c_str(), result);
        return ERR_FAIL;
    }
    SIBLING_LOG("posted '%s' to port '%s'", isDone ? "OK" : "FAIL", portId.c_str());
    return ERR_OK;
}

}  // namespace NSWeather

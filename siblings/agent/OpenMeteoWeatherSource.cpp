#include "OpenMeteoWeatherSource.h"

#include <algorithm>
#include <cmath>
#include <locale>
#include <sstream>

#include "MoonCalculator.h"
#include "NetworkConnection.h"
#include "SiblingLog.h"
#include "SunCalculator.h"
#include "WmoWeatherCode.h"

#ifndef WEATHER_VERSION
#define WEATHER_VERSION "0"
#endif

namespace NSWeather
{

namespace
{
constexpr time_t HOUR = 3600;
constexpr long DEFAULT_TIMEOUT_MS = 8000;
constexpr time_t DEFAULT_MINIMUM_INTERVAL = 600;
constexpr size_t DEFAULT_MAX_ANSWER_BYTES = 512 * 1024;
const char* const USER_AGENT =
    "weather-widget/" WEATHER_VERSION " weather-agent (com.quorvex.weather-m-agent)";
const char* const CURRENT_FIELDS =
    "temperature_2m,relative_humidity_2m,apparent_temperature,is_day,weather_code,wind_speed_10m,"
    "wind_direction_10m";
const char* const HOURLY_FIELDS =
    "temperature_2m,weather_code,is_day,precipitation,precipitation_probability,uv_index";
const char* const DAILY_FIELDS =
    "weather_code,temperature_2m_max,temperature_2m_min,sunrise,sunset,precipitation_sum,"
    "precipitation_probability_max";

// "Overcast, wind 14 km/h SW": the store has no wind column, so the wind
// goes with the text of the current conditions.
std::string StatusWithWind(const OpenMeteoForecast::Current& current)
{
    static const char* const POINTS[] = {"N", "NE", "E", "SE", "S", "SW", "W", "NW"};
    std::string status = WmoWeatherCode::GetStatus(current.code);
    if (!current.windSpeed)
        return status;
    long speed = std::lround(*current.windSpeed);
    if (speed == 0)
        return status + ", calm";
    status += ", wind " + std::to_string(speed) + " km/h";
    if (current.windDirection)
        status += std::string(" ") + POINTS[std::lround(*current.windDirection / 45.0) % 8];
    return status;
}
}  // namespace

OpenMeteoWeatherSource::Options OpenMeteoWeatherSource::GetDefaultOptions()
{
    return Options{DEFAULT_BASE_URL, DEFAULT_TIMEOUT_MS, DEFAULT_MINIMUM_INTERVAL, DEFAULT_MAX_ANSWER_BYTES};
}

OpenMeteoWeatherSource::OpenMeteoWeatherSource() : OpenMeteoWeatherSource(GetDefaultOptions()) {}

OpenMeteoWeatherSource::OpenMeteoWeatherSource(const Options& options)
    : mOptions(options), mClient(USER_AGENT, options.timeoutMs, options.maxAnswerBytes)
{
}

std::string OpenMeteoWeatherSource::GetDescription() const
{
    return std::string("Open-Meteo forecasts from ") + mOptions.baseUrl + " (" + CREDIT + ")";
}

bool OpenMeteoWeatherSource::IsFreshEnough(const City& stored, time_t now) const
{
    time_t age = now - stored.GetRefreshedTime();
    return stored.GetWebsiteUrl() == PAGE_URL && age >= 0 && age < mOptions.minimumInterval;
}

std::string OpenMeteoWeatherSource::MakeUrl(const CatalogueCity& place) const
{
    std::ostringstream url;
    url.imbue(std::locale::classic());
    url.setf(std::ios::fixed);
    url.precision(4);
    const std::string& zone = place.GetTimeZone();
    url << mOptions.baseUrl << (mOptions.baseUrl.find('?') == std::string::npos ? '?' : '&')
        << "latitude=" << place.GetLatitude() << "&longitude=" << place.GetLongitude()
        << "&current=" << CURRENT_FIELDS << "&hourly=" << HOURLY_FIELDS << "&daily=" << DAILY_FIELDS
        << "&timezone=" << HttpClient::Escape(zone.empty() ? "auto" : zone)
        << "&timeformat=unixtime&forecast_days=" << OpenMeteoForecast::DAY_COUNT;
    return url.str();
}

bool OpenMeteoWeatherSource::Fetch(const CatalogueCity& place, time_t now, std::string& body)
{
    const char* id = place.GetId().c_str();
    if (now < mQuietUntil)
    {
        SIBLING_LOG("%s not asked: the service was out of reach less than %lld s ago", id,
                    static_cast<long long>(QUIET_AFTER_FAILURE));
        return false;
    }
    if (!NetworkConnection().IsNetworkAvailable())
    {
        SIBLING_LOG("%s not asked: no network connection", id);
        return false;
    }
    HttpClient::Response response = mClient.Get(MakeUrl(place));
    if (response.outcome == HttpClient::Outcome::TIMED_OUT ||
        response.outcome == HttpClient::Outcome::UNREACHABLE)
        mQuietUntil = now + QUIET_AFTER_FAILURE;
    if (response.outcome != HttpClient::Outcome::ANSWERED)
    {
        SIBLING_LOG("Open-Meteo request for %s failed: %s", id, response.error.c_str());
        return false;
    }
    if (response.status != 200)
    {
        std::string reason = OpenMeteoForecast::GetErrorReason(response.body);
        SIBLING_LOG("Open-Meteo answered HTTP %ld for %s%s%s", response.status, id,
                    reason.empty() ? "" : ": ", reason.c_str());
        return false;
    }
    body = std::move(response.body);
    return true;
}

void OpenMeteoWeatherSource::FillCurrent(const OpenMeteoForecast& forecast, int provider, City& city)
{
    const OpenMeteoForecast::Current& current = forecast.GetCurrent();
    const OpenMeteoForecast::Day& today = forecast.GetDays().front();
    auto currentPtr = std::make_shared<Current>();
    currentPtr->SetWeatherIcon(WmoWeatherCode::GetProviderIcon(current.code, provider, current.isDay));
    currentPtr->SetWeatherStatus(StatusWithWind(current));
    currentPtr->GetCurTemperature()->SetCelsiusValue(current.temperature);
    // The day's forecast range, widened so that it holds what is measured now.
    currentPtr->GetLowTemperature()->SetCelsiusValue(std::min(today.low, current.temperature));
    currentPtr->GetHighTemperature()->SetCelsiusValue(std::max(today.high, current.temperature));
    currentPtr->SetDate(current.time);
    currentPtr->SetWebsiteUrl(PAGE_URL);
    city.SetCurrentPtr(currentPtr);
    city.SetIsDayTime(current.isDay);
}

void OpenMeteoWeatherSource::FillHourly(const OpenMeteoForecast& forecast, int provider, City& city)
{
    auto hourlyPtrVector = std::make_shared<HourlyPtrVector>();
    for (const OpenMeteoForecast::Hour& hour : forecast.GetHours())
    {
        auto hourlyPtr = std::make_shared<Hourly>();
        hourlyPtr->SetHour(hour.time);
        hourlyPtr->SetDate(hour.time);
        hourlyPtr->SetWeatherIcon(WmoWeatherCode::GetProviderIcon(hour.code, provider, hour.isDay));
        hourlyPtr->SetWeatherStatus(WmoWeatherCode::GetStatus(hour.code));
        hourlyPtr->GetCurTemperature()->SetCelsiusValue(hour.temperature);
        hourlyPtr->GetLowTemperature()->SetCelsiusValue(hour.temperature);
        hourlyPtr->GetHighTemperature()->SetCelsiusValue(hour.temperature);
        hourlyPtr->SetWebsiteUrl(PAGE_URL);
        hourlyPtrVector->push_back(hourlyPtr);
    }
    city.SetHourlyPtrVector(hourlyPtrVector);
}

void OpenMeteoWeatherSource::FillDaily(const OpenMeteoForecast& forecast, int provider, City& city)
{
    auto weeklyPtrVector = std::make_shared<WeeklyPtrVector>();
    for (const OpenMeteoForecast::Day& day : forecast.GetDays())
    {
        auto weeklyPtr = std::make_shared<Weekly>();
        weeklyPtr->SetWeatherIcon(WmoWeatherCode::GetProviderIcon(day.code, provider, true));
        weeklyPtr->SetWeatherStatus(WmoWeatherCode::GetStatus(day.code));
        weeklyPtr->GetCurTemperature()->SetCelsiusValue(day.high);
        weeklyPtr->GetLowTemperature()->SetCelsiusValue(day.low);
        weeklyPtr->GetHighTemperature()->SetCelsiusValue(day.high);
        weeklyPtr->SetDate(day.time + 12 * HOUR);
        weeklyPtr->SetWebsiteUrl(PAGE_URL);
        weeklyPtrVector->push_back(weeklyPtr);
    }
    city.SetWeeklyPtrVector(weeklyPtrVector);
}

void OpenMeteoWeatherSource::FillExtra(const OpenMeteoForecast& forecast, const CatalogueCity& place,
                                       time_t now, City& city)
{
    const OpenMeteoForecast::Current& current = forecast.GetCurrent();
    const OpenMeteoForecast::Day& today = forecast.GetDays().front();
    const OpenMeteoForecast::Night& tonight = forecast.GetTonight();
    auto extraPtr = std::make_shared<Extra>();
    extraPtr->SetHumidity(current.humidity);
    time_t sunrise = 0;
    time_t sunset = 0;
    // Polar days and nights have no times in the answer.
    SunCalculator::GetSunTimes(place.GetLatitude(), place.GetLongitude(), now, sunrise, sunset);
    extraPtr->SetSunriseTime(today.sunrise.value_or(sunrise));
    extraPtr->SetSunsetTime(today.sunset.value_or(sunset));
    if (current.uvIndex)
        extraPtr->SetUvIndex(static_cast<int>(std::lround(*current.uvIndex)));
    extraPtr->GetRealfeel()->SetCelsiusValue(current.feltTemperature);
    // What the answer leaves out keeps the record's "no value".
    PrecipitationPtr precipitationPtr = extraPtr->GetPrecipitationPtr();
    precipitationPtr->SetPrecType(WmoWeatherCode::GetPrecipitationType(today.code));
    if (today.precipitationProbability)
        precipitationPtr->SetPrecProbability(*today.precipitationProbability);
    if (today.precipitationSum)
        precipitationPtr->SetPrecAmount(*today.precipitationSum);
    if (tonight.precipitationProbability)
        precipitationPtr->SetPrecProbabilityNight(*tonight.precipitationProbability);
    if (tonight.precipitationSum)
        precipitationPtr->SetPrecAmountNight(*tonight.precipitationSum);
    city.SetExtraPtr(extraPtr);
}

bool OpenMeteoWeatherSource::Fill(const CatalogueCity& place, time_t now, int contentProvider, City& city)
{
    std::string body;
    if (!Fetch(place, now, body))
        return false;
    OpenMeteoForecast forecast;
    std::string reason;
    if (!OpenMeteoForecast::Parse(body, now, forecast, reason))
    {
        SIBLING_LOG("Open-Meteo answer for %s refused: %s", place.GetId().c_str(), reason.c_str());
        return false;
    }
    FillCurrent(forecast, contentProvider, city);
    FillHourly(forecast, contentProvider, city);
    FillDaily(forecast, contentProvider, city);
    FillExtra(forecast, place, now, city);
    city.SetMoonPhasePtrVector(
        MoonCalculator::MakePhases(city.GetLocationId(), place.GetLongitude(), now, MOON_COUNT));
    city.SetWebsiteUrl(PAGE_URL);
    return true;
}

}  // namespace NSWeather

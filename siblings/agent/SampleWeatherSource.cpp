#include "SampleWeatherSource.h"

#include <algorithm>
#include <cmath>

#include "CityTimeZone.h"
#include "MoonCalculator.h"
#include "SunCalculator.h"

namespace NSWeather
{

namespace
{
constexpr double PI = 3.14159265358979323846;
constexpr time_t HOUR = 3600;
constexpr time_t DAY = 86400;
constexpr time_t FRONT_SPACING = 30 * HOUR;
const char* const SAMPLE_URL = "https://weather.example/sample/";

uint64_t Mix(uint64_t x)
{
    x += 0x9e3779b97f4a7c15ULL;
    x = (x ^ (x >> 30)) * 0xbf58476d1ce4e5b9ULL;
    x = (x ^ (x >> 27)) * 0x94d049bb133111ebULL;
    return x ^ (x >> 31);
}

uint64_t SeedOf(const std::string& text)
{
    uint64_t hash = 1469598103934665603ULL;
    for (unsigned char c : text) hash = (hash ^ c) * 1099511628211ULL;
    return hash;
}

// -1 .. 1, the same for the same seed and step.
double Noise(uint64_t seed, long long step)
{
    return static_cast<double>(Mix(seed ^ Mix(static_cast<uint64_t>(step))) >> 11) / 9007199254740992.0 *
               2.0 -
           1.0;
}

double Round1(double value)
{
    return std::floor(value * 10.0 + 0.5) / 10.0;
}

time_t FloorTo(time_t when, time_t step)
{
    time_t r = when % step;
    return r < 0 ? when - r - step : when - r;
}

// Local midnight (solar) of the day that contains `when`.
time_t SolarMidnight(double longitude, time_t when)
{
    return when - static_cast<time_t>(SunCalculator::GetSolarHour(longitude, when) * 3600.0);
}

// Local (civil) midnight of the day that contains `when`: a forecast day is
// the day people in the city live, which can differ from the solar one by
// more than an hour. Solar when the zone is unknown.
time_t CivilMidnight(const CatalogueCity& place, time_t when)
{
    double offsetHours = 0.0;
    bool isSummerTime = false;
    if (!CityTimeZone::GetOffset(place.GetTimeZone(), when, offsetHours, isSummerTime))
        return SolarMidnight(place.GetLongitude(), when);
    time_t local = when + static_cast<time_t>(std::lround(offsetHours * 3600.0));
    time_t intoDay = ((local % DAY) + DAY) % DAY;
    return when - intoDay;
}

}  // namespace

std::string SampleWeatherSource::GetDescription() const
{
    return "sample weather: made up offline from season, latitude and time of day, not a forecast";
}

double SampleWeatherSource::Front(uint64_t seed, time_t when)
{
    // Smooth value noise: knots every 30 h, cosine-eased between them, plus
    // a shorter wave so that days differ within one front.
    long long knot = static_cast<long long>(FloorTo(when, FRONT_SPACING) / FRONT_SPACING);
    double t = static_cast<double>(when - knot * FRONT_SPACING) / FRONT_SPACING;
    double ease = (1.0 - std::cos(t * PI)) / 2.0;
    double slow = Noise(seed, knot) * (1.0 - ease) + Noise(seed, knot + 1) * ease;
    double fast = std::sin(2.0 * PI * static_cast<double>(when) / (17.0 * HOUR) + Noise(seed, -1) * PI);
    return std::clamp(0.8 * slow + 0.25 * fast, -1.0, 1.0);
}

double SampleWeatherSource::MeanTemperature(double latitude, time_t when)
{
    double absLat = std::fabs(latitude);
    double annual = 27.0 - 0.42 * std::max(0.0, absLat - 12.0);
    double amplitude = std::min(16.0, 0.32 * absLat);
    double season = std::cos(2.0 * PI * (SunCalculator::GetDayOfYear(when) - 200) / 365.25);
    return annual + (latitude >= 0 ? season : -season) * amplitude;
}

WeatherCondition SampleWeatherSource::ConditionOf(double cloudiness, double temperature, double solarHour,
                                                  uint64_t seed)
{
    if (cloudiness < 0.25)
        return WeatherCondition::SUNNY;
    if (cloudiness < 0.5)
        return WeatherCondition::PARTLY_SUNNY;
    if (cloudiness < 0.7)
    {
        bool isMorning = solarHour >= 4.0 && solarHour < 9.0;
        return isMorning && (seed & 3) == 0 ? WeatherCondition::FOG : WeatherCondition::CLOUDY;
    }
    if (temperature <= 0.0)
        return cloudiness < 0.8 ? WeatherCondition::FLURRIES : WeatherCondition::SNOW;
    if (temperature <= 2.5)
        return WeatherCondition::SLEET;
    if (cloudiness >= 0.9 && temperature >= 20.0)
        return WeatherCondition::THUNDERSTORM;
    return cloudiness < 0.8 ? WeatherCondition::SHOWER : WeatherCondition::RAIN;
}

SampleWeatherSource::Sample SampleWeatherSource::SampleAt(const CatalogueCity& place, time_t when)
{
    uint64_t seed = SeedOf(place.GetId());
    double front = Front(seed, when);
    double cloudiness = std::clamp(0.5 + 0.5 * front, 0.0, 1.0);
    double solarHour = SunCalculator::GetSolarHour(place.GetLongitude(), when);
    double diurnal = (5.0 - 2.5 * cloudiness) * std::cos(2.0 * PI * (solarHour - 15.0) / 24.0);
    double temperature = MeanTemperature(place.GetLatitude(), when) - 3.0 * front + diurnal;
    Sample sample;
    sample.temperature = Round1(temperature);
    sample.cloudiness = cloudiness;
    sample.isDayTime = SunCalculator::IsDayTime(place.GetLatitude(), place.GetLongitude(), when);
    sample.condition =
        ConditionOf(cloudiness, temperature, solarHour, Mix(seed ^ static_cast<uint64_t>(when / DAY)));
    return sample;
}

void SampleWeatherSource::DayRange(const CatalogueCity& place, time_t when, double& low, double& high)
{
    time_t midnight = SolarMidnight(place.GetLongitude(), when);
    low = 999.0;
    high = -999.0;
    for (time_t t = midnight; t < midnight + DAY; t += HOUR)
    {
        double value = SampleAt(place, t).temperature;
        low = std::min(low, value);
        high = std::max(high, value);
    }
}

void SampleWeatherSource::FillCurrent(const CatalogueCity& place, time_t now, int provider, City& city)
{
    Sample sample = SampleAt(place, now);
    double low = 0.0;
    double high = 0.0;
    DayRange(place, now, low, high);
    auto currentPtr = std::make_shared<Current>();
    currentPtr->SetWeatherIcon(
        WeatherConditionText::GetProviderIcon(sample.condition, provider, sample.isDayTime));
    currentPtr->SetWeatherStatus(WeatherConditionText::GetStatus(sample.condition, sample.isDayTime));
    currentPtr->GetCurTemperature()->SetCelsiusValue(sample.temperature);
    currentPtr->GetLowTemperature()->SetCelsiusValue(std::min(low, sample.temperature));
    currentPtr->GetHighTemperature()->SetCelsiusValue(std::max(high, sample.temperature));
    currentPtr->SetDate(now);
    currentPtr->SetWebsiteUrl(SAMPLE_URL + place.GetId());
    city.SetCurrentPtr(currentPtr);
    city.SetIsDayTime(sample.isDayTime);
}

void SampleWeatherSource::FillHourly(const CatalogueCity& place, time_t now, int provider, City& city)
{
    auto hourlyPtrVector = std::make_shared<HourlyPtrVector>();
    time_t first = FloorTo(now, HOUR) + HOUR;
    for (int i = 0; i < HOURLY_COUNT; ++i)
    {
        time_t hour = first + i * HOUR;
        Sample sample = SampleAt(place, hour);
        auto hourlyPtr = std::make_shared<Hourly>();
        hourlyPtr->SetHour(hour);
        hourlyPtr->SetDate(hour);
        hourlyPtr->SetWeatherIcon(
            WeatherConditionText::GetProviderIcon(sample.condition, provider, sample.isDayTime));
        hourlyPtr->SetWeatherStatus(WeatherConditionText::GetStatus(sample.condition, sample.isDayTime));
        hourlyPtr->GetCurTemperature()->SetCelsiusValue(sample.temperature);
        hourlyPtr->GetLowTemperature()->SetCelsiusValue(sample.temperature);
        hourlyPtr->GetHighTemperature()->SetCelsiusValue(sample.temperature);
        hourlyPtr->SetWebsiteUrl(SAMPLE_URL + place.GetId());
        hourlyPtrVector->push_back(hourlyPtr);
    }
    city.SetHourlyPtrVector(hourlyPtrVector);
}

void SampleWeatherSource::FillDaily(const CatalogueCity& place, time_t now, int provider, City& city)
{
    auto weeklyPtrVector = std::make_shared<WeeklyPtrVector>();
    time_t midnight = CivilMidnight(place, now);
    for (int i = 0; i < DAILY_COUNT; ++i)
    {
        time_t day = midnight + i * DAY;
        // The day's weather is that of early afternoon.
        Sample sample = SampleAt(place, day + 14 * HOUR);
        double low = 0.0;
        double high = 0.0;
        DayRange(place, day + 12 * HOUR, low, high);
        auto weeklyPtr = std::make_shared<Weekly>();
        weeklyPtr->SetWeatherIcon(WeatherConditionText::GetProviderIcon(sample.condition, provider, true));
        weeklyPtr->SetWeatherStatus(WeatherConditionText::GetStatus(sample.condition, true));
        weeklyPtr->GetCurTemperature()->SetCelsiusValue(sample.temperature);
        weeklyPtr->GetLowTemperature()->SetCelsiusValue(low);
        weeklyPtr->GetHighTemperature()->SetCelsiusValue(high);
        weeklyPtr->SetDate(day + 12 * HOUR);
        weeklyPtr->SetWebsiteUrl(SAMPLE_URL + place.GetId());
        weeklyPtrVector->push_back(weeklyPtr);
    }
    city.SetWeeklyPtrVector(weeklyPtrVector);
}

void SampleWeatherSource::FillExtra(const CatalogueCity& place, time_t now, City& city)
{
    Sample sample = SampleAt(place, now);
    uint64_t seed = Mix(SeedOf(place.GetId()) ^ static_cast<uint64_t>(now / DAY));
    time_t sunrise = 0;
    time_t sunset = 0;
    SunCalculator::GetSunTimes(place.GetLatitude(), place.GetLongitude(), now, sunrise, sunset);
    auto extraPtr = std::make_shared<Extra>();
    extraPtr->SetHumidity(static_cast<int>(35 + 60 * sample.cloudiness));
    extraPtr->SetSunriseTime(sunrise);
    extraPtr->SetSunsetTime(sunset);
    extraPtr->SetUvIndex(sample.isDayTime ? static_cast<int>(10 * (1.0 - sample.cloudiness)) : 0);
    extraPtr->SetPm10(static_cast<int>(10 + seed % 60));
    extraPtr->SetPm25(static_cast<int>(5 + (seed >> 8) % 40));
    extraPtr->SetAqi(static_cast<int>(20 + (seed >> 16) % 80));
    extraPtr->GetRealfeel()->SetCelsiusValue(sample.temperature - 2.0 * sample.cloudiness);
    double probability = std::clamp((sample.cloudiness - 0.55) * 220.0, 0.0, 100.0);
    PrecipitationPtr precipitationPtr = extraPtr->GetPrecipitationPtr();
    precipitationPtr->SetPrecType(probability <= 0 ? 0 : (sample.temperature <= 0 ? 2 : 1));
    precipitationPtr->SetPrecProbability(probability);
    precipitationPtr->SetPrecAmount(probability * 0.08);
    precipitationPtr->SetPrecProbabilityNight(probability * 0.8);
    precipitationPtr->SetPrecAmountNight(probability * 0.05);
    city.SetExtraPtr(extraPtr);
}

bool SampleWeatherSource::Fill(const CatalogueCity& place, time_t now, int contentProvider, City& city)
{
    FillCurrent(place, now, contentProvider, city);
    FillHourly(place, now, contentProvider, city);
    FillDaily(place, now, contentProvider, city);
    FillExtra(place, now, city);
    city.SetMoonPhasePtrVector(
        MoonCalculator::MakePhases(city.GetLocationId(), place.GetLongitude(), now, MOON_COUNT));
    city.SetWebsiteUrl(SAMPLE_URL + place.GetId());
    return true;
}

}  // namespace NSWeather

#include "SampleCities.h"

#include "DBController.h"
#include "WeatherDefine.h"

namespace NSWeatherWidget
{

using namespace NSWeather;

namespace
{
struct SampleCity
{
    const char* locationId;
    const char* name;
    const char* nameEng;
    double gmtOffset;
    int icon;
    double celsius;
    int dayIcons[7];
};

const SampleCity kCities[SampleCities::kCount] = {
    {"226081", "서울", "Seoul", 9.0, 3, 21.5, {1, 6, 12, 22, 4, 7, 2}},
    {"190390", "Reykjavík", "Reykjavik", 0.0, 22, -3.4, {19, 7, 12, 22, 8, 6, 1}},
    {"347629", "San Francisco", "San Francisco", -8.0, 7, 13.2, {2, 1, 8, 6, 12, 3, 1}},
    {"178087", "Berlin", "Berlin", 1.0, 12, 6.8, {12, 18, 7, 6, 3, 1, 2}},
};

const time_t kDay = 86400;
}  // namespace

CityPtr SampleCities::MakeCity(int index, time_t refreshedTime, int days)
{
    const SampleCity& sample = kCities[index % kCount];
    CityPtr city = std::make_shared<City>();
    city->SetPageIndex(index);
    city->SetLocationId(sample.locationId);
    city->SetCityName(sample.name);
    city->SetCityNameEng(sample.nameEng);
    city->SetCountryName("");
    city->SetCountryNameEng("");
    city->SetGmtOffset(sample.gmtOffset);
    city->SetRefreshedTime(refreshedTime);
    city->SetLocalTime(refreshedTime);

    CurrentPtr current = std::make_shared<Current>();
    current->SetWeatherIcon(sample.icon);
    current->GetCurTemperature()->SetCelsiusValue(sample.celsius);
    current->GetLowTemperature()->SetCelsiusValue(sample.celsius - 4);
    current->GetHighTemperature()->SetCelsiusValue(sample.celsius + 5);
    current->SetDate(refreshedTime);
    city->SetCurrentPtr(current);

    WeeklyPtrVectorPtr weekly = std::make_shared<WeeklyPtrVector>();
    for (int d = 0; d < days && d < 7; ++d)
    {
        WeeklyPtr day = std::make_shared<Weekly>();
        day->SetWeatherIcon(sample.dayIcons[d]);
        day->GetLowTemperature()->SetCelsiusValue(sample.celsius - 5 + d);
        day->GetHighTemperature()->SetCelsiusValue(sample.celsius + 3 - d);
        day->SetDate(refreshedTime + d * kDay);
        weekly->push_back(day);
    }
    city->SetWeeklyPtrVector(weekly);

    // Sun from 07:00 to 18:00 on the city's clock.
    ExtraPtr extra = std::make_shared<Extra>();
    time_t midnight = refreshedTime - refreshedTime % kDay;
    time_t offset = static_cast<time_t>(sample.gmtOffset * 3600);
    extra->SetSunriseTime(midnight + 7 * 3600 - offset);
    extra->SetSunsetTime(midnight + 18 * 3600 - offset);
    city->SetExtraPtr(extra);
    return city;
}

int SampleCities::WriteCities(int count, time_t refreshedTime, int days, bool firstIsCurrentLocation)
{
    DBController dbController;
    if (dbController.Initialize() != ERR_OK)
        return ERR_FAIL;
    CityPtrVectorPtr cities = std::make_shared<CityPtrVector>();
    for (int i = 0; i < count && i < kCount; ++i)
    {
        CityPtr city = MakeCity(i, refreshedTime, days);
        if (i == 0 && firstIsCurrentLocation)
        {
            city->SetIsCurrentLocation(true);
            city->SetLocationId(city->GetLocationId() + ":C");
        }
        cities->push_back(city);
    }
    return dbController.DeleteAllCityDataAndInsertCityPtrVector(cities);
}

}  // namespace NSWeatherWidget

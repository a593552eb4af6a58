#include "StoreSeeds.h"

#include <memory>
#include <string>

#include "City.h"
#include "DBController.h"
#include "DataStoreInitializer.h"
#include "FuzzRoot.h"
#include "SettingDBController.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace WeatherTest
{

namespace
{

CityPtr MakeCity(const std::string& locationId, int pageIndex, bool isCurrentLocation)
{
    CityPtr city = std::make_shared<City>();
    city->SetPageIndex(pageIndex);
    city->SetLocationId(locationId);
    city->SetIsCurrentLocation(isCurrentLocation);
    city->SetCityName("city " + locationId);
    city->SetCityNameEng("City " + locationId);
    city->SetGmtOffset(9.0);
    city->SetRefreshedTime(1700000000);
    CurrentPtr current = std::make_shared<Current>();
    current->SetWeatherIcon(7);
    current->GetCurTemperature()->SetCelsiusValue(21.5);
    city->SetCurrentPtr(current);
    WeeklyPtrVectorPtr weekly = std::make_shared<WeeklyPtrVector>();
    HourlyPtrVectorPtr hourly = std::make_shared<HourlyPtrVector>();
    for (int i = 0; i < 2; ++i)
    {
        WeeklyPtr day = std::make_shared<Weekly>();
        day->SetDate(1700000000 + i * 86400);
        day->GetHighTemperature()->SetCelsiusValue(20.5 + i);
        weekly->push_back(day);
        HourlyPtr hour = std::make_shared<Hourly>();
        hour->SetHour(1700000000 + i * 3600);
        hourly->push_back(hour);
    }
    city->SetWeeklyPtrVector(weekly);
    city->SetHourlyPtrVector(hourly);
    city->SetExtraPtr(std::make_shared<Extra>());
    MoonPhasePtr phase = std::make_shared<MoonPhase>();
    phase->SetLocationID(locationId);
    phase->SetDate(1700000000);
    city->SetMoonPhasePtrVector(std::make_shared<MoonPhasePtrVector>(1, phase));
    return city;
}

}  // namespace

void WriteSoundStore()
{
    FUZZ_CHECK(DataStoreInitializer::Run() == ERR_OK);
    DBController dbController;
    FUZZ_CHECK(dbController.InsertCityData(MakeCity("seoul", 0, false)) == ERR_OK);
    FUZZ_CHECK(dbController.InsertCityData(MakeCity("paris:C", 1, true)) == ERR_OK);
    FUZZ_CHECK(SettingDBController().UpdateLocationIdOfDisplayCity("seoul") == ERR_OK);
}

}  // namespace WeatherTest

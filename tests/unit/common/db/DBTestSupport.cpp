#include "DBTestSupport.h"

#include <poll.h>
#include <sqlite3.h>
#include <sys/wait.h>
#include <unistd.h>

#include "DBController.h"
#include "FileUtil.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace WeatherTest
{

void DBTest::SetUp()
{
    FileUtil::ClearCache();
    FileUtil::MakeDirectory(DBDir());
    ASSERT_EQ(DBController().Initialize(), ERR_OK) << mLog.Dump();
}

std::string DBTest::DBDir() const
{
    return mRoot.SharedDataDir() + "db";
}

std::string DBTest::WeatherDBPath() const
{
    return mRoot.SharedDataDir() + "db/.weather.db";
}

CityPtr MakeCity(const std::string& locationId, int seed, bool isCurrentLocation)
{
    CityPtr city = std::make_shared<City>();
    std::string tag = locationId + "-" + std::to_string(seed);
    city->SetPageIndex(0);
    city->SetLocationId(locationId);
    city->SetIsCurrentLocation(isCurrentLocation);
    city->SetIsSummerTime(seed % 2 == 1);
    city->SetIsDayTime(seed % 2 == 0);
    city->SetWidgetReferenceCount(seed);
    city->SetCityName("city " + tag);
    city->SetCityNameEng("City " + tag);
    city->SetCountryName("country " + tag);
    city->SetCountryNameEng("Country " + tag);
    city->SetWebsiteUrl("http://example.com/" + tag);
    city->SetGmtOffset(5.5 + seed);
    city->SetRefreshedTime(1700000000 + seed);
    city->SetLocalTime(1700003600 + seed);
    city->SetNeedToUpdate(seed % 3 == 0);

    CurrentPtr current = std::make_shared<Current>();
    current->SetWeatherIcon(7 + seed);
    current->SetWeatherStatus("Cloudy " + tag);
    current->GetCurTemperature()->SetCelsiusValue(21.46);
    current->GetLowTemperature()->SetCelsiusValue(-0.04);
    current->GetHighTemperature()->SetCelsiusValue(999.0);
    current->SetDate(1700000100 + seed);
    current->SetWebsiteUrl("http://example.com/current/" + tag);
    city->SetCurrentPtr(current);

    WeeklyPtrVectorPtr weekly = std::make_shared<WeeklyPtrVector>();
    for (int i = 0; i < 10; ++i)
    {
        WeeklyPtr day = std::make_shared<Weekly>();
        day->SetWeatherIcon(i + seed);
        day->SetWeatherStatus("day " + std::to_string(i));
        day->GetCurTemperature()->SetCelsiusValue(10.0 + i);
        day->GetLowTemperature()->SetCelsiusValue(-5.25 + i);
        day->GetHighTemperature()->SetCelsiusValue(20.5 + i);
        day->SetDate(1700000000 + i * 86400);
        day->SetWebsiteUrl("http://example.com/day/" + std::to_string(i));
        weekly->push_back(day);
    }
    city->SetWeeklyPtrVector(weekly);

    HourlyPtrVectorPtr hourly = std::make_shared<HourlyPtrVector>();
    for (int i = 0; i < 24; ++i)
    {
        HourlyPtr hour = std::make_shared<Hourly>();
        hour->SetHour(1700000000 + i * 3600);
        hour->SetWeatherIcon(30 + i);
        hour->SetWeatherStatus("hour " + std::to_string(i));
        hour->GetCurTemperature()->SetCelsiusValue(i * 0.5);
        hour->SetWebsiteUrl("http://example.com/hour/" + std::to_string(i));
        hourly->push_back(hour);
    }
    city->SetHourlyPtrVector(hourly);

    ExtraPtr extra = std::make_shared<Extra>();
    extra->SetHumidity(60 + seed);
    extra->SetSunsetTime(1700050000);
    extra->SetSunriseTime(1700010000);
    extra->SetPm25(11);
    extra->SetPm10(12);
    extra->SetAqi(13);
    extra->SetUvIndex(4);
    extra->SetOutdoorExcercise(1);
    extra->SetComfort(2);
    extra->SetClothing(3);
    extra->SetSkincare(4);
    extra->SetCarwash(5);
    extra->SetFoodPoison(6);
    extra->SetHeat(7);
    extra->SetSpoiledFood(8);
    extra->SetDiscomfort(9);
    extra->SetFrozenPipes(10);
    extra->SetFrostbite(11);
    extra->SetCold(12);
    extra->SetPollen(13);
    extra->SetAirDust(14);
    extra->SetDrySkin(15);
    extra->GetRealfeel()->SetCelsiusValue(999.0);
    extra->GetPrecipitationPtr()->SetPrecType(2);
    extra->GetPrecipitationPtr()->SetPrecProbability(0.35);
    extra->GetPrecipitationPtr()->SetPrecAmount(1.234);
    extra->GetPrecipitationPtr()->SetPrecProbabilityNight(0.75);
    extra->GetPrecipitationPtr()->SetPrecAmountNight(2.5);
    city->SetExtraPtr(extra);

    MoonPhasePtrVectorPtr moon = std::make_shared<MoonPhasePtrVector>();
    for (int i = 0; i < 3; ++i)
    {
        MoonPhasePtr phase = std::make_shared<MoonPhase>();
        phase->SetLocationID(locationId);
        phase->SetDate(1700000000 + i * 86400);
        phase->SetMoonRiseTime(1700020000 + i * 86400);
        phase->SetMoonSetTime(1700060000 + i * 86400);
        phase->SetPhaseText("phase " + std::to_string(i));
        phase->SetAge(i + 1);
        moon->push_back(phase);
    }
    city->SetMoonPhasePtrVector(moon);
    return city;
}

LockHolder::LockHolder(const std::vector<std::string>& paths, const char* lock, int holdMs)
{
    int ready[2];
    if (pipe(ready) != 0 || pipe(mRelease) != 0)
        return;
    mPid = fork();
    if (mPid == 0)
    {
        close(mRelease[1]);
        char ok = 'L';
        for (const std::string& path : paths)
        {
            sqlite3* db = nullptr;  // kept open until the child exits
            if (sqlite3_open_v2(path.c_str(), &db, SQLITE_OPEN_READWRITE, nullptr) != SQLITE_OK ||
                sqlite3_exec(db, lock, nullptr, nullptr, nullptr) != SQLITE_OK)
                ok = 'F';
        }
        (void)!write(ready[1], &ok, 1);
        struct pollfd pfd = {mRelease[0], POLLIN, 0};
        poll(&pfd, 1, holdMs);
        _exit(0);
    }
    close(ready[1]);
    close(mRelease[0]);
    char byte = 0;
    mIsLocked = mPid > 0 && read(ready[0], &byte, 1) == 1 && byte == 'L';
    close(ready[0]);
}

LockHolder::~LockHolder()
{
    Release();
    int status = 0;
    if (mPid > 0)
        waitpid(mPid, &status, 0);
}

void LockHolder::Release()
{
    if (mRelease[1] >= 0)
        close(mRelease[1]);
    mRelease[1] = -1;
}

}  // namespace WeatherTest

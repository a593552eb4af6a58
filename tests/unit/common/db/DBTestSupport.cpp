#include "DBTestSupport.h"

#include <random>
#include <sstream>

#include <poll.h>
#include <sqlite3.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include "CityDBController.h"
#include "CurrentWeatherDBController.h"
#include "DBController.h"
#include "ExtraWeatherDBController.h"
#include "FileUtil.h"
#include "HourlyWeatherDBController.h"
#include "MoonPhaseDBController.h"
#include "SettingDBController.h"
#include "WeatherDefine.h"
#include "WeeklyWeatherDBController.h"

using namespace NSWeather;

namespace WeatherTest
{

void DBTest::SetUp()
{
    MakeDBDir();
    ASSERT_EQ(DBController().Initialize(), ERR_OK) << mLog.Dump();
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
    // Distinct values, so that two swapped columns show.
    int value = 21;
    for (auto set : {&Extra::SetPm25, &Extra::SetPm10, &Extra::SetAqi, &Extra::SetUvIndex})
        ((*extra).*set)(value++);
    value = 1;
    for (auto set :
         {&Extra::SetOutdoorExcercise, &Extra::SetComfort, &Extra::SetClothing, &Extra::SetSkincare,
          &Extra::SetCarwash, &Extra::SetFoodPoison, &Extra::SetHeat, &Extra::SetSpoiledFood,
          &Extra::SetDiscomfort, &Extra::SetFrozenPipes, &Extra::SetFrostbite, &Extra::SetCold,
          &Extra::SetPollen, &Extra::SetAirDust, &Extra::SetDrySkin})
        ((*extra).*set)(value++);
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

namespace
{
void Describe(std::ostream& out, const TemperaturePtr& t)
{
    // Celsius only: the store keeps Celsius, Fahrenheit is derived again on reading.
    out << (t ? std::to_string(t->GetCelsius()) : "-") << '|';
}

void Describe(std::ostream& out, const Weather& w)
{
    out << w.GetWeatherIcon() << '|' << w.GetWeatherStatus() << '|' << w.GetDate() << '|';
    Describe(out, w.GetCurTemperature());
    Describe(out, w.GetLowTemperature());
    Describe(out, w.GetHighTemperature());
}
}  // namespace

std::string DescribeCity(const City& c)
{
    std::ostringstream out;
    out.precision(12);
    out << c.GetPageIndex() << '|' << c.GetLocationId() << '|' << c.GetCityName() << '|' << c.GetCityNameEng()
        << '|' << c.GetCountryName() << '|' << c.GetCountryNameEng() << '|' << c.GetIsCurrentLocation()
        << c.GetIsDayTime() << c.GetIsSummerTime() << '|' << c.GetGmtOffset() << '|' << c.GetRefreshedTime()
        << '|' << c.GetLocalTime() << '|' << c.GetWidgetReferenceCount() << '|' << c.GetNeedToUpdate() << '|'
        << c.GetWebsiteUrl() << "\ncurrent ";
    if (CurrentPtr current = c.GetCurrentPtr())
    {
        Describe(out, *current);
        out << current->GetWebsiteUrl();
    }
    for (const WeeklyPtr& day : *c.GetWeeklyPtrVector())
    {
        out << "\nday ";
        Describe(out, *day);
        out << day->GetWebsiteUrl();
    }
    for (const HourlyPtr& hour : *c.GetHourlyPtrVector())
    {
        out << "\nhour " << hour->GetHour() << '|';
        Describe(out, *hour);
        out << hour->GetWebsiteUrl();
    }
    if (ExtraPtr e = c.GetExtraPtr())
    {
        out << "\nextra " << e->GetHumidity() << '|' << e->GetSunsetTime() << '|' << e->GetSunriseTime();
        for (int index :
             {e->GetPm25(), e->GetPm10(), e->GetAqi(), e->GetUvIndex(), e->GetOutdoorExcercise(),
              e->GetComfort(), e->GetClothing(), e->GetSkincare(), e->GetCarwash(), e->GetFoodPoison(),
              e->GetHeat(), e->GetSpoiledFood(), e->GetDiscomfort(), e->GetFrozenPipes(), e->GetFrostbite(),
              e->GetCold(), e->GetPollen(), e->GetAirDust(), e->GetDrySkin()})
            out << ',' << index;
        out << '|';
        Describe(out, e->GetRealfeel());
        PrecipitationPtr p = e->GetPrecipitationPtr();
        out << p->GetPrecType() << '|' << p->GetPrecProbability() << '|' << p->GetPrecAmount() << '|'
            << p->GetPrecProbabilityNight() << '|' << p->GetPrecAmountNight();
    }
    for (const MoonPhasePtr& moon : *c.GetMoonPhasePtrVector())
        out << "\nmoon " << moon->GetLocationID() << '|' << moon->GetDate() << '|' << moon->GetMoonRiseTime()
            << '|' << moon->GetMoonSetTime() << '|' << moon->GetPhaseText() << '|' << moon->GetAge();
    return out.str();
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

const std::pair<const char*, const char*> WEATHER_TABLE_FORMATS[6] = {
    {CityDBController::TABLE_NAME, CityDBController::CREATE_TABLE_FORMAT},
    {CurrentWeatherDBController::TABLE_NAME, CurrentWeatherDBController::CREATE_TABLE_FORMAT},
    {HourlyWeatherDBController::TABLE_NAME, HourlyWeatherDBController::CREATE_TABLE_FORMAT},
    {WeeklyWeatherDBController::TABLE_NAME, WeeklyWeatherDBController::CREATE_TABLE_FORMAT},
    {ExtraWeatherDBController::TABLE_NAME, ExtraWeatherDBController::CREATE_TABLE_FORMAT},
    {MoonPhaseDBController::TABLE_NAME, MoonPhaseDBController::CREATE_TABLE_FORMAT},
};

namespace
{
// Columns that each schema version added to the weather tables.
struct AddedColumn
{
    const char* table;
    const char* column;
    double version;
};

const AddedColumn ADDED_COLUMNS[] = {
    {"CITY_TABLE", "countryNameEng", 0.1},
    {"HOURLY_WEATHER_TABLE", "websiteUrl", 0.2},
    {"EXTRA_WEATHER_TABLE", "aqi", 0.3},
    {"EXTRA_WEATHER_TABLE", "pm25", 0.3},
    {"EXTRA_WEATHER_TABLE", "outdoorExcercise", 0.4},
    {"EXTRA_WEATHER_TABLE", "comfort", 0.4},
    {"EXTRA_WEATHER_TABLE", "clothing", 0.4},
    {"EXTRA_WEATHER_TABLE", "skincare", 0.4},
    {"EXTRA_WEATHER_TABLE", "carwash", 0.4},
    {"CITY_TABLE", "needToUpdate", 0.5},
    {"EXTRA_WEATHER_TABLE", "foodPoison", 0.6},
    {"EXTRA_WEATHER_TABLE", "heat", 0.6},
    {"EXTRA_WEATHER_TABLE", "spoiledFood", 0.6},
    {"EXTRA_WEATHER_TABLE", "discomfort", 0.6},
    {"EXTRA_WEATHER_TABLE", "frozenPipes", 0.6},
    {"EXTRA_WEATHER_TABLE", "frostbite", 0.6},
    {"EXTRA_WEATHER_TABLE", "cold", 0.6},
    {"EXTRA_WEATHER_TABLE", "pollen", 0.6},
    {"EXTRA_WEATHER_TABLE", "airDust", 0.6},
    {"EXTRA_WEATHER_TABLE", "drySkin", 0.6},
    {"CITY_TABLE", "isSummerTime", 0.7},
    {"EXTRA_WEATHER_TABLE", "precProbabilityNight", 0.8},
    {"EXTRA_WEATHER_TABLE", "precAmountNight", 0.8},
};

bool IsAddedAfter(const std::string& table, const std::string& column, double version)
{
    for (const AddedColumn& added : ADDED_COLUMNS)
        if (table == added.table && column == added.column && version < added.version)
            return true;
    return false;
}

std::string Replace(std::string text, const std::string& from, const std::string& to)
{
    size_t pos = text.find(from);
    if (pos != std::string::npos)
        text.replace(pos, from.size(), to);
    return text;
}
}  // namespace

std::string StoredCreateSql(const std::string& format, const std::string& table)
{
    std::string sql = Replace(Replace(format, "IF NOT EXISTS ", ""), "%s", table);
    if (!sql.empty() && sql.back() == ';')
        sql.pop_back();
    return sql;
}

std::string OldWeatherTableSql(const std::string& table, double version)
{
    std::string format;
    for (const auto& entry : WEATHER_TABLE_FORMATS)
        if (table == entry.first)
            format = entry.second;
    std::string sql = StoredCreateSql(format, table);
    size_t open = sql.find('(');
    std::string body = sql.substr(open + 1, sql.size() - open - 2);
    std::string kept;
    std::stringstream pieces(body);
    for (std::string piece; std::getline(pieces, piece, ',');)
    {
        std::string name = piece.substr(0, piece.find_first_of(" \t"));
        if (IsAddedAfter(table, name, version))
            continue;
        kept += (kept.empty() ? "" : ",") + piece;
    }
    return sql.substr(0, open + 1) + kept + ")";
}

std::string RandomBytes(size_t size, unsigned seed)
{
    std::mt19937 generator(seed);
    std::string bytes(size, '\0');
    for (char& byte : bytes) byte = static_cast<char>(generator() & 0xff);
    return bytes;
}

bool FileExists(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0;
}

StoreTest::StoreTest()
{
    NSWeather::FileUtil::ClearCache();
}

StoreTest::~StoreTest()
{
    NSWeather::FileUtil::ClearCache();
}

void StoreTest::MakeDBDir() const
{
    mkdir(DBDir().c_str(), 0755);
}

void StoreTest::InitializeSettings() const
{
    MakeDBDir();
    ASSERT_EQ(NSWeather::ERR_OK, NSWeather::SettingDBController().Initialize());
}

void StoreTest::SetSettingColumn(const std::string& column, const std::string& sqlValue) const
{
    RawDB db(SettingDBPath());
    db.Exec("UPDATE SETTING_TABLE SET " + column + " = " + sqlValue);
}

}  // namespace WeatherTest

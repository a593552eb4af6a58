#include "SettingsTestSupport.h"

#include <sstream>

#include <sys/stat.h>

#include "CityDBController.h"
#include "CurrentWeatherDBController.h"
#include "ExtraWeatherDBController.h"
#include "HourlyWeatherDBController.h"
#include "MoonPhaseDBController.h"
#include "SettingDBController.h"
#include "WeeklyWeatherDBController.h"
#include "WeatherDefine.h"

namespace SettingsTest
{
using namespace NSWeather;

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

bool FileExists(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0;
}

SettingsFixture::SettingsFixture()
{
    NSWeather::FileUtil::ClearCache();
}

SettingsFixture::~SettingsFixture()
{
    NSWeather::FileUtil::ClearCache();
}

void SettingsFixture::MakeDBDir() const
{
    mkdir(DBDir().c_str(), 0755);
}

void SettingsFixture::InitializeSettings() const
{
    MakeDBDir();
    ASSERT_EQ(NSWeather::ERR_OK, NSWeather::SettingDBController().Initialize());
}

void SettingsFixture::SetSettingColumn(const std::string& column, const std::string& sqlValue) const
{
    RawDB db(SettingDBPath());
    db.Exec("UPDATE SETTING_TABLE SET " + column + " = " + sqlValue);
}

}  // namespace SettingsTest

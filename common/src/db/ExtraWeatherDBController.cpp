#include "ExtraWeatherDBController.h"

#include <string>

#include "CommonLog.h"
#include "DBStatement.h"
#include "TableQuery.h"

namespace NSWeather
{

const char* const ExtraWeatherDBController::TABLE_NAME = "EXTRA_WEATHER_TABLE";
const char* const ExtraWeatherDBController::CREATE_TABLE_FORMAT =
    "CREATE TABLE IF NOT EXISTS %s (FK_ID\t\t\t\tINTEGER,humidity\t\t\tINTEGER,sunsetTime\t\t\tINT64,"
    "sunriseTime\t\tINT64,pm25\t\t\t\tINTEGER,pm10\t\t\t\tINTEGER,aqi\t\t\t\tINTEGER,uvIndex\t\t\tINTEGER,"
    "outdoorExcercise\tINTEGER,comfort\t\t\tINTEGER,clothing\t\t\tINTEGER,skincare\t\t\tINTEGER,"
    "carwash\t\t\tINTEGER,foodPoison\t\t\tINTEGER,heat\t\t\t\tINTEGER,spoiledFood\t\tINTEGER,"
    "discomfort\t\t\tINTEGER,frozenPipes\t\tINTEGER,frostbite\t\t\tINTEGER,cold\t\t\t\tINTEGER,"
    "pollen\t\t\t\tINTEGER,airDust\t\t\tINTEGER,drySkin\t\t\tINTEGER,realfeel\t\t\tDOUBLE,"
    "precType\t\t\tINTEGER,"
    "precProbability\tDOUBLE,precAmount\t\t\tDOUBLE,precProbabilityNight\tDOUBLE,precAmountNight\t\t\tDOUBLE,"
    "FOREIGN KEY(FK_ID) REFERENCES CITY_TABLE(PK_ID) ON DELETE CASCADE ON UPDATE CASCADE);";

namespace
{
const char* const INSERT_COLUMNS =
    "FK_ID,humidity,sunsetTime,sunriseTime,pm25,pm10,aqi,uvIndex,outdoorExcercise,comfort,clothing,skincare,"
    "carwash,foodPoison,heat,spoiledFood,discomfort,frozenPipes,frostbite,cold,pollen,airDust,drySkin,"
    "realfeel,"
    "precType,precProbability,precAmount,precProbabilityNight,precAmountNight";
const char* const INSERT_PLACEHOLDERS =
    "?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?, ?";
const char* const UPDATE_ASSIGNMENTS =
    "humidity = ?,sunsetTime = ?,sunriseTime = ?,pm25 = ?,pm10 = ?,aqi = ?,uvIndex = ?,outdoorExcercise = ?,"
    "comfort = ?,clothing = ?,skincare = ?,carwash = ?,foodPoison = ?,heat = ?,spoiledFood = ?,discomfort = "
    "?,"
    "frozenPipes = ?,frostbite = ?,cold = ?,pollen = ?,airDust = ?,drySkin = ?,realfeel = ?,precType = ?,"
    "precProbability = ?,precAmount = ?,precProbabilityNight = ?,precAmountNight = ?";
const char* const SELECT_COLUMNS =
    "humidity,sunsetTime,sunriseTime,pm25,pm10,aqi,uvIndex,outdoorExcercise,comfort,clothing,skincare,"
    "carwash,"
    "foodPoison,heat,spoiledFood,discomfort,frozenPipes,frostbite,cold,pollen,airDust,drySkin,realfeel,"
    "precType,"
    "precProbability,precAmount,precProbabilityNight,precAmountNight";

int BindValues(DBStatement& stmt, int i, const ExtraPtr& extraPtr)
{
    stmt.BindInt(i++, extraPtr->GetHumidity());
    stmt.BindInt64(i++, static_cast<int64_t>(extraPtr->GetSunsetTime()));
    stmt.BindInt64(i++, static_cast<int64_t>(extraPtr->GetSunriseTime()));
    const int indexes[] = {extraPtr->GetPm25(),
                           extraPtr->GetPm10(),
                           extraPtr->GetAqi(),
                           extraPtr->GetUvIndex(),
                           extraPtr->GetOutdoorExcercise(),
                           extraPtr->GetComfort(),
                           extraPtr->GetClothing(),
                           extraPtr->GetSkincare(),
                           extraPtr->GetCarwash(),
                           extraPtr->GetFoodPoison(),
                           extraPtr->GetHeat(),
                           extraPtr->GetSpoiledFood(),
                           extraPtr->GetDiscomfort(),
                           extraPtr->GetFrozenPipes(),
                           extraPtr->GetFrostbite(),
                           extraPtr->GetCold(),
                           extraPtr->GetPollen(),
                           extraPtr->GetAirDust(),
                           extraPtr->GetDrySkin()};
    for (int value : indexes) stmt.BindInt(i++, value);
    TableQuery::BindTemperature(stmt, i++, extraPtr->GetRealfeel());
    PrecipitationPtr precipitationPtr = extraPtr->GetPrecipitationPtr();
    if (!precipitationPtr)
        precipitationPtr = std::make_shared<Precipitation>();
    stmt.BindInt(i++, precipitationPtr->GetPrecType());
    stmt.BindDouble(i++, precipitationPtr->GetPrecProbability());
    stmt.BindDouble(i++, precipitationPtr->GetPrecAmount());
    stmt.BindDouble(i++, precipitationPtr->GetPrecProbabilityNight());
    stmt.BindDouble(i++, precipitationPtr->GetPrecAmountNight());
    return i;
}

ExtraPtr ReadExtra(const DBStatement& stmt)
{
    ExtraPtr extraPtr = std::make_shared<Extra>();
    int c = 0;
    extraPtr->SetHumidity(stmt.ColumnInt(c++));
    extraPtr->SetSunsetTime(static_cast<time_t>(stmt.ColumnInt64(c++)));
    extraPtr->SetSunriseTime(static_cast<time_t>(stmt.ColumnInt64(c++)));
    extraPtr->SetPm25(stmt.ColumnInt(c++));
    extraPtr->SetPm10(stmt.ColumnInt(c++));
    extraPtr->SetAqi(stmt.ColumnInt(c++));
    extraPtr->SetUvIndex(stmt.ColumnInt(c++));
    extraPtr->SetOutdoorExcercise(stmt.ColumnInt(c++));
    extraPtr->SetComfort(stmt.ColumnInt(c++));
    extraPtr->SetClothing(stmt.ColumnInt(c++));
    extraPtr->SetSkincare(stmt.ColumnInt(c++));
    extraPtr->SetCarwash(stmt.ColumnInt(c++));
    extraPtr->SetFoodPoison(stmt.ColumnInt(c++));
    extraPtr->SetHeat(stmt.ColumnInt(c++));
    extraPtr->SetSpoiledFood(stmt.ColumnInt(c++));
    extraPtr->SetDiscomfort(stmt.ColumnInt(c++));
    extraPtr->SetFrozenPipes(stmt.ColumnInt(c++));
    extraPtr->SetFrostbite(stmt.ColumnInt(c++));
    extraPtr->SetCold(stmt.ColumnInt(c++));
    extraPtr->SetPollen(stmt.ColumnInt(c++));
    extraPtr->SetAirDust(stmt.ColumnInt(c++));
    extraPtr->SetDrySkin(stmt.ColumnInt(c++));
    extraPtr->SetRealfeel(TableQuery::ColumnTemperature(stmt, c++));
    PrecipitationPtr precipitationPtr = std::make_shared<Precipitation>();
    precipitationPtr->SetPrecType(stmt.ColumnInt(c++));
    precipitationPtr->SetPrecProbability(stmt.ColumnDouble(c++));
    precipitationPtr->SetPrecAmount(stmt.ColumnDouble(c++));
    precipitationPtr->SetPrecProbabilityNight(stmt.ColumnDouble(c++));
    precipitationPtr->SetPrecAmountNight(stmt.ColumnDouble(c++));
    extraPtr->SetPrecipitationPtr(precipitationPtr);
    return extraPtr;
}
}  // namespace

ExtraWeatherDBController::ExtraWeatherDBController() {}

ExtraWeatherDBController::~ExtraWeatherDBController() {}

bool ExtraWeatherDBController::CreateTable()
{
    return TableQuery::CreateTable(CREATE_TABLE_FORMAT, TABLE_NAME);
}

bool ExtraWeatherDBController::DeleteAll()
{
    return TableQuery::DeleteAll(TABLE_NAME);
}

bool ExtraWeatherDBController::Delete(int foreignKey)
{
    return TableQuery::Delete(TABLE_NAME, foreignKey);
}

bool ExtraWeatherDBController::Insert(int foreignKey, ExtraPtr extraPtr)
{
    COMMON_RETV_IF(!extraPtr, true);
    return TableQuery::InsertRecord(
        mQueryGenernator.MakeInsertQuery(TABLE_NAME, INSERT_COLUMNS, INSERT_PLACEHOLDERS), foreignKey,
        extraPtr, BindValues);
}

bool ExtraWeatherDBController::Update(int foreignKey, ExtraPtr extraPtr)
{
    COMMON_RETV_IF(!extraPtr, true);
    return TableQuery::UpdateRecord(
        mQueryGenernator.MakeUpdateQuery(TABLE_NAME, UPDATE_ASSIGNMENTS,
                                         mQueryGenernator.MakeWhereClause("FK_ID = ?")),
        foreignKey, extraPtr, BindValues);
}

ExtraPtr ExtraWeatherDBController::Select(int foreignKey)
{
    return TableQuery::Select(mQueryGenernator.MakeSelectQuery(TABLE_NAME, SELECT_COLUMNS,
                                                               mQueryGenernator.MakeWhereClause("FK_ID = ?")),
                              foreignKey, ReadExtra);
}

std::map<int, ExtraPtr> ExtraWeatherDBController::SelectAll()
{
    return TableQuery::SelectAllRecords(
        mQueryGenernator.MakeSelectQuery(TABLE_NAME, std::string(SELECT_COLUMNS) + ",FK_ID"), 28, ReadExtra);
}

}  // namespace NSWeather

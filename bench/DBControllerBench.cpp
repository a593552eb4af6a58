// Reading the whole city list as the widget does on every resume, and one
// city insert, on a real file in a throw-away platform root.
#include <benchmark/benchmark.h>

#include <cstdlib>
#include <string>

#include "DBController.h"
#include "FileUtil.h"

using namespace NSWeather;

namespace
{
std::string gRoot;

void MakeRoot()
{
    if (!gRoot.empty())
        return;
    std::string pattern = "/tmp/weather-bench-XXXXXX";
    gRoot = mkdtemp(&pattern[0]);
    setenv("PLATFORM_ROOT", gRoot.c_str(), 1);
    std::string dbDir = gRoot + "/apps/com.quorvex.weather-m/shared/data/db";
    std::string command = "mkdir -p '" + dbDir + "'";
    if (system(command.c_str()) != 0)
        abort();
    FileUtil::ClearCache();
}

CityPtr MakeCity(int n)
{
    CityPtr city = std::make_shared<City>();
    city->SetLocationId("LOC" + std::to_string(n));
    city->SetCityName("City " + std::to_string(n));
    city->SetRefreshedTime(1700000000);
    for (int i = 0; i < 10; ++i)
    {
        WeeklyPtr day = std::make_shared<Weekly>();
        day->SetDate(1700000000 + i * 86400);
        day->GetHighTemperature()->SetCelsiusValue(20.0 + i);
        city->GetWeeklyPtrVector()->push_back(day);
    }
    for (int i = 0; i < 24; ++i)
    {
        HourlyPtr hour = std::make_shared<Hourly>();
        hour->SetHour(1700000000 + i * 3600);
        hour->GetCurTemperature()->SetCelsiusValue(i * 0.5);
        city->GetHourlyPtrVector()->push_back(hour);
    }
    for (int i = 0; i < 30; ++i)
    {
        MoonPhasePtr phase = std::make_shared<MoonPhase>();
        phase->SetLocationID(city->GetLocationId());
        phase->SetDate(1700000000 + i * 86400);
        city->GetMoonPhasePtrVector()->push_back(phase);
    }
    return city;
}

void FillCities(int count)
{
    MakeRoot();
    DBController db;
    db.Initialize();
    CityPtrVectorPtr cities = std::make_shared<CityPtrVector>();
    for (int n = 0; n < count; ++n) cities->push_back(MakeCity(n));
    db.DeleteAllCityDataAndInsertCityPtrVector(cities);
    db.DeleteUselessMoonPhaseData();
    for (const CityPtr& city : *cities) db.UpdateOnlyMoonPhaseData(city);
}

void BM_SelectAllCityData(benchmark::State& state)
{
    FillCities(static_cast<int>(state.range(0)));
    DBController db;
    for (auto _ : state)
    {
        CityPtrVectorPtr cities = db.SelectAllCityData();
        if (!cities || cities->size() != static_cast<size_t>(state.range(0)))
            state.SkipWithError("wrong city count");
        benchmark::DoNotOptimize(cities);
    }
    state.SetComplexityN(state.range(0));
}
BENCHMARK(BM_SelectAllCityData)->Arg(1)->Arg(10)->Arg(100)->Unit(benchmark::kMicrosecond)->Complexity();

void BM_InsertCityData(benchmark::State& state)
{
    FillCities(10);
    DBController db;
    CityPtr city = MakeCity(1000);
    for (auto _ : state)
    {
        city->SetPageIndex(0);
        db.InsertCityData(city);
        state.PauseTiming();
        db.DeleteCityData(std::string("LOC1000"));
        state.ResumeTiming();
    }
}
BENCHMARK(BM_InsertCityData)->Unit(benchmark::kMicrosecond);
}  // namespace

BENCHMARK_MAIN();

// Rebuild of one widget instance after an update, as the update callback
// does it: reload the settings and cities, then resume the three pages
// (buffer engine, real layouts, real database files). Beside it, the three
// parts of that time measured alone: Edje loading, text formatting and
// database reads.
#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <vconf.h>

#include <cstdlib>
#include <string>
#include <vector>

#include "ContentProvider.h"
#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SampleCities.h"
#include "Widget4x2PageController.h"
#include "Widget4x4PageController.h"
#include "Widget4x4PageData.h"
#include "WidgetBenchRoot.h"
#include "WidgetMain.h"

using namespace NSWeatherWidget;

namespace
{
const char* const kWidgetId = "com.quorvex.weather-m-widget";

// A throw-away platform root with the build's resources, three cities and
// a connected network.
void MakeRoot()
{
    MakeWidgetBenchRoot(kWidgetId);
    vconf_set_int("db/location/setting/Usemylocation", 1);
    if (NSWeather::DataStoreInitializer::Run() != 0 ||
        SampleCities::WriteCities(3, time(nullptr), 7, false) != 0)
        abort();
}

struct Canvas
{
    Canvas(int w, int h)
    {
        win = elm_win_add(nullptr, "bench", ELM_WIN_BASIC);
        evas_object_resize(win, w, h);
        evas_object_show(win);
    }
    ~Canvas() { evas_object_del(win); }
    void Render() { evas_render(evas_object_evas_get(win)); }
    Evas_Object* win;
};

template <typename Controller>
void Rebuild(benchmark::State& state, int h)
{
    // The three pages lie on top of each other here; in a view the slots
    // clip the neighbours away, so drawing costs less there.
    Canvas canvas(712, h);
    WidgetMain* widgetMain = WidgetMain::GetInstance();
    widgetMain->LoadAllWeatherInformation();
    std::vector<WidgetPageControllerPtr> pages;
    for (int i = 0; i < 3; ++i)
    {
        pages.push_back(std::make_shared<Controller>());
        pages.back()->Initialize();
        Evas_Object* layout = pages.back()->Create(canvas.win, i);
        evas_object_resize(layout, 712, h);
        evas_object_show(layout);
    }
    for (auto _ : state)
    {
        // As the update callback does: the provider is read once per rebuild.
        NSWeather::ContentProvider::RebuildScope providerReadOnce;
        widgetMain->LoadAllWeatherInformation();
        for (int i = 0; i < 3; ++i) pages[i]->Resume(i);
        canvas.Render();
    }
}

void BM_Rebuild4x4(benchmark::State& state)
{
    Rebuild<Widget4x4PageController>(state, 712);
}
// Argument 1 draws the canvas after the rebuild, 0 leaves it undrawn.
BENCHMARK(BM_Rebuild4x4)->Arg(1)->Arg(0)->Unit(benchmark::kMillisecond);

void BM_Rebuild4x2(benchmark::State& state)
{
    Rebuild<Widget4x2PageController>(state, 354);
}
BENCHMARK(BM_Rebuild4x2)->Arg(1)->Arg(0)->Unit(benchmark::kMillisecond);

// The layouts of one 4x4 city page loaded, without any text or image.
void BM_EdjeLoad4x4Page(benchmark::State& state)
{
    Canvas canvas(712, 712);
    std::string file = std::string(WEATHER_BENCH_RES_DIR) + "/widget/Widget4x4Page.edj";
    const char* groups[] = {"widgetPage",
                            "city",
                            "cityName",
                            "iconAndTemperature",
                            "weatherForecast",
                            "bottomLine",
                            "BottomLinePressEffect",
                            "BottomLinePressEffect"};
    for (auto _ : state)
    {
        for (const char* group : groups)
        {
            Evas_Object* layout = elm_layout_add(canvas.win);
            elm_layout_file_set(layout, file.c_str(), group);
            evas_object_del(layout);
        }
    }
}
BENCHMARK(BM_EdjeLoad4x4Page)->Unit(benchmark::kMillisecond);

// Every text and image name one 4x4 page asks its data for.
void BM_TextFormatting4x4Page(benchmark::State& state)
{
    WidgetMain::GetInstance()->LoadAllWeatherInformation();
    Widget4x4PageData data;
    data.SetCityPtr(WidgetMain::GetInstance()->GetCityPtr(0));
    data.SetSettingPtr(WidgetMain::GetInstance()->GetSettingPtr());
    for (auto _ : state)
    {
        benchmark::DoNotOptimize(data.GetCityName());
        benchmark::DoNotOptimize(data.GetLocalTimeString());
        benchmark::DoNotOptimize(data.GetCurrentTemperatureString());
        benchmark::DoNotOptimize(data.GetUpdatedDate());
        benchmark::DoNotOptimize(data.GetUpdatedTime());
        benchmark::DoNotOptimize(data.GetCPLogoIconPath());
        for (bool pressed : {false, true})
        {
            benchmark::DoNotOptimize(data.GetWeatherIconPath(true, pressed));
            benchmark::DoNotOptimize(data.GetTemperatureUnitIconPath(true, pressed));
        }
        for (int d = 0; d < 4; ++d)
        {
            benchmark::DoNotOptimize(data.GetWeeklyWeekdayString(data.GetCityPtr(), d));
            benchmark::DoNotOptimize(data.GetWeeklyHighTemperatureString(data.GetCityPtr(), d));
            benchmark::DoNotOptimize(data.GetWeeklyLowTemperatureString(data.GetCityPtr(), d));
            benchmark::DoNotOptimize(data.GetWeeklyIconPath(data.GetCityPtr(), d, false));
            benchmark::DoNotOptimize(data.GetWeeklyIconPath(data.GetCityPtr(), d, true));
        }
    }
}
BENCHMARK(BM_TextFormatting4x4Page)->Unit(benchmark::kMicrosecond);

// The reads of one update: the settings row and every city.
void BM_DatabaseReads(benchmark::State& state)
{
    for (auto _ : state) WidgetMain::GetInstance()->LoadAllWeatherInformation();
}
BENCHMARK(BM_DatabaseReads)->Unit(benchmark::kMicrosecond);
}  // namespace

int main(int argc, char** argv)
{
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
    MakeRoot();
    elm_init(argc, argv);
    elm_config_scale_set(2.6);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    elm_shutdown();
    return 0;
}

// Renders the page layouts with sample content on the buffer engine and
// saves the picture, without the widget host:
//   weather-layout-snapshot <4x2|4x4> <state> <out.png> [resource dir]
// state: city, current, nonetwork, pressed, nocity or loading.

#include "LayoutSample.h"

#include <Ecore_Evas.h>
#include <libintl.h>

#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace
{

struct SnapshotJob
{
    Evas_Object* win = nullptr;
    std::string outFile;
    bool saved = false;
};

bool SavePixels(Ecore_Evas* source, const std::string& file)
{
    int w = 0;
    int h = 0;
    ecore_evas_geometry_get(source, nullptr, nullptr, &w, &h);
    const void* pixels = ecore_evas_buffer_pixels_get(source);
    Ecore_Evas* target = ecore_evas_buffer_new(w, h);
    if (!pixels || !target)
        return false;
    Evas_Object* image = evas_object_image_filled_add(ecore_evas_get(target));
    evas_object_image_size_set(image, w, h);
    evas_object_image_alpha_set(image, EINA_TRUE);
    evas_object_image_data_copy_set(image, const_cast<void*>(pixels));
    bool ok = evas_object_image_save(image, file.c_str(), nullptr, nullptr);
    ecore_evas_free(target);
    return ok;
}

Eina_Bool SnapshotTimerCb(void* data)
{
    auto* job = static_cast<SnapshotJob*>(data);
    if (job)
    {
        Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(job->win));
        job->saved = ee && SavePixels(ee, job->outFile);
    }
    elm_exit();
    return ECORE_CALLBACK_CANCEL;
}

int Usage()
{
    fprintf(stderr,
            "usage: weather-layout-snapshot <4x2|4x4> "
            "<city|current|nonetwork|pressed|nocity|loading> <out.png> [resource dir]\n");
    return 2;
}

}  // namespace

int main(int argc, char** argv)
{
    using NSWeatherWidget::LayoutSample;
    LayoutSample::PageState state;
    if (argc < 4 || !LayoutSample::ParseState(argv[2], state))
        return Usage();
    const std::string size = argv[1];
    if (size != "4x2" && size != "4x4")
        return Usage();
    std::string resDir = argc > 4 ? argv[4] : WEATHER_SAMPLE_RES_DIR;
    if (resDir.empty() || resDir.back() != '/')
        resDir += '/';

    // Sample texts in English unless the caller chose a language.
    setenv("LANGUAGE", "en", 0);
    if (!getenv("LC_ALL") && !getenv("LANG"))
        setenv("LANG", "C.UTF-8", 1);
    setlocale(LC_ALL, "");
    bindtextdomain("weather-m", (resDir + "locale").c_str());
    bind_textdomain_codeset("weather-m", "UTF-8");
    setenv("ELM_ENGINE", "buffer", 1);
    elm_init(argc, argv);
    elm_config_scale_set(2.6);

    const int width = 712;
    const int height = size == "4x4" ? 712 : 354;
    SnapshotJob job;
    job.outFile = argv[3];
    job.win = elm_win_add(nullptr, "weather-layout-snapshot", ELM_WIN_BASIC);
    Evas_Object* bg = elm_bg_add(job.win);
    elm_bg_color_set(bg, 38, 44, 54);
    elm_win_resize_object_add(job.win, bg);
    evas_object_show(bg);

    LayoutSample sample(resDir, size == "4x4");
    Evas_Object* view = sample.CreateView(job.win, state);
    if (!view)
    {
        elm_shutdown();
        return 1;
    }
    elm_win_resize_object_add(job.win, view);
    evas_object_show(job.win);
    evas_object_resize(job.win, width, height);
    ecore_timer_add(0.6, SnapshotTimerCb, &job);
    elm_run();
    elm_shutdown();
    if (!job.saved)
        fprintf(stderr, "could not save %s\n", job.outFile.c_str());
    return job.saved ? 0 : 1;
}

// The sample pages as a widget application under the host:
//   WEATHER_SAMPLE_STATE=<state> weather-layout-sample --instance 4x2 --instance 4x4
// then `widgetctl --widget-id <id> snapshot <instance> <file.png>`.
// state: city (default), current, nonetwork, pressed, nocity or loading.

#include "SampleWidgetApp.h"

#include <libintl.h>

#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <string>

int main(int argc, char** argv)
{
    using NSWeatherWidget::LayoutSample;
    const char* stateText = getenv("WEATHER_SAMPLE_STATE");
    LayoutSample::PageState state = LayoutSample::PageState::CITY;
    if (stateText && !LayoutSample::ParseState(stateText, state))
    {
        fprintf(stderr, "unknown WEATHER_SAMPLE_STATE %s\n", stateText);
        return 2;
    }
    const char* resText = getenv("WEATHER_SAMPLE_RES_DIR");
    std::string resDir = resText ? resText : WEATHER_SAMPLE_RES_DIR;
    if (resDir.empty() || resDir.back() != '/')
        resDir += '/';

    setenv("LANGUAGE", "en", 0);
    setlocale(LC_ALL, "");
    bindtextdomain("weather-m", (resDir + "locale").c_str());
    bind_textdomain_codeset("weather-m", "UTF-8");

    NSWeatherWidget::SampleWidgetApp app(resDir, state);
    return app.Run(argc, argv);
}

#include "LayoutSample.h"

#include <libintl.h>

#include <cstdio>

#include "ViewBasicElements.h"

namespace NSWeatherWidget
{

using NSWeather::ViewBasicElements;

namespace
{

const char* const kTextDomain = "weather-m";

struct SampleDay
{
    const char* weekday;
    int code;
    const char* high;
    const char* low;
};

struct SampleCity
{
    const char* name;
    const char* localTime;
    int code;
    const char* temperature;
    const char* date;
    const char* time;
    SampleDay days[4];
};

const SampleCity kCities[] = {
    {"Seoul",
     "Sun, 6 Dec 21:48",
     2,
     "22",
     "06/12",
     "21:40",
     {{"Mon", 1, "24", "15"}, {"Tue", 7, "21", "14"}, {"Wed", 4, "17", "12"}, {"Thu", 12, "3", "-2"}}},
    {"Reykjavík",
     "Sun, 6 Dec 12:48",
     12,
     "-3",
     "06/12",
     "12:31",
     {{"Mon", 10, "-1", "-6"}, {"Tue", 3, "1", "-4"}, {"Wed", 17, "2", "-3"}, {"Thu", 12, "-2", "-8"}}},
    {"San Francisco",
     "Sun, 6 Dec 04:48",
     5,
     "13",
     "06/12",
     "04:30",
     {{"Mon", 2, "17", "10"}, {"Tue", 1, "19", "11"}, {"Wed", 8, "15", "11"}, {"Thu", 6, "14", "9"}}},
};

// View types of the image names: the current weather of a 4x4 or 4x2
// page, and a day of the forecast.
const int kViewType4x4 = 6;
const int kViewType4x2 = 5;
const int kViewTypeDay = 4;

const char* Tr(const char* id)
{
    return dgettext(kTextDomain, id);
}

bool SetContent(Evas_Object* layout, const char* part, Evas_Object* content)
{
    if (!layout || !content)
        return false;
    elm_object_part_content_set(layout, part, content);
    return elm_object_part_content_get(layout, part) == content;
}

}  // namespace

LayoutSample::LayoutSample(const std::string& resDir, bool is4x4) : mResDir(resDir), mIs4x4(is4x4) {}

bool LayoutSample::ParseState(const std::string& text, PageState& state)
{
    static const struct
    {
        const char* name;
        PageState state;
    } kStates[] = {{"city", PageState::CITY},
                   {"current", PageState::CURRENT_LOCATION},
                   {"nonetwork", PageState::NO_NETWORK},
                   {"pressed", PageState::PRESSED},
                   {"nocity", PageState::NO_CITY},
                   {"loading", PageState::LOADING}};
    for (const auto& entry : kStates)
    {
        if (text == entry.name)
        {
            state = entry.state;
            return true;
        }
    }
    return false;
}

Evas_Object* LayoutSample::CreateView(Evas_Object* parent, PageState state)
{
    Evas_Object* view = Layout(parent, mResDir + "widget/WidgetView.edj", "widgetView");
    if (!view)
        return nullptr;
    bool hasCities = state != PageState::NO_CITY && state != PageState::LOADING;
    bool ok = SetContent(view, "centerLayout", CreatePage(view, state, 0));
    if (ok && hasCities)
    {
        ok = SetContent(view, "prevLayout", CreatePage(view, PageState::CITY, 2)) &&
             SetContent(view, "nextLayout", CreatePage(view, PageState::CITY, 1));
    }
    if (!ok)
    {
        evas_object_del(view);
        return nullptr;
    }
    return view;
}

Evas_Object* LayoutSample::CreatePage(Evas_Object* parent, PageState state, int cityIndex)
{
    Evas_Object* page = PageLayout(parent, "widgetPage");
    if (!page)
        return nullptr;
    Evas_Object* content = nullptr;
    if (state == PageState::NO_CITY)
        content = CreateNoCity(page);
    else if (state == PageState::LOADING)
        content = CreateLoading(page);
    else
        content = CreateCity(page, state, cityIndex);
    if (!SetContent(page, "content", content))
    {
        evas_object_del(page);
        return nullptr;
    }
    return page;
}

Evas_Object* LayoutSample::CreateNoCity(Evas_Object* parent)
{
    Evas_Object* noCity = PageLayout(parent, "noCity");
    Evas_Object* content = noCity ? PageLayout(noCity, "noCityContent") : nullptr;
    if (!SetContent(noCity, "content", content))
        return nullptr;
    elm_object_part_text_set(content, "title", Tr("IDS_DB_TAB_WEATHER"));
    elm_object_part_text_set(content, "message", Tr("IDS_DB_NPBODY_TAP_HERE_TO_ADD_A_CITY"));
    return noCity;
}

Evas_Object* LayoutSample::CreateLoading(Evas_Object* parent)
{
    Evas_Object* loading = PageLayout(parent, "loading");
    if (!loading)
        return nullptr;
    elm_object_part_text_set(loading, "message", Tr("IDS_DB_POP_LOADING_ING"));
    return loading;
}

Evas_Object* LayoutSample::CreateCity(Evas_Object* parent, PageState state, int cityIndex)
{
    Evas_Object* city = PageLayout(parent, "city");
    if (!city || !FillToday(city, state, cityIndex) || !FillBottomLine(city, state) ||
        (mIs4x4 && !FillForecast(city, cityIndex)))
        return nullptr;
    if (state == PageState::PRESSED)
    {
        const char* layouts[][2] = {{"cityNameSwallow", "cityName"},
                                    {"iconAndTemperatureSwallow", "iconAndTemperature"},
                                    {"weatherForecastSwallow", "weatherForecast"}};
        for (const auto& entry : layouts)
        {
            Evas_Object* part = elm_object_part_content_get(city, entry[0]);
            if (part)
                elm_object_signal_emit(part, "receiver,pressed,widgettoday", entry[1]);
        }
    }
    return city;
}

bool LayoutSample::FillToday(Evas_Object* city, PageState state, int cityIndex)
{
    const SampleCity& sample = kCities[cityIndex];
    bool current = state == PageState::CURRENT_LOCATION;
    Evas_Object* name = PageLayout(city, current ? "cityNameCurrentLocation" : "cityName");
    Evas_Object* today = PageLayout(city, "iconAndTemperature");
    if (!SetContent(city, "cityNameSwallow", name) || !SetContent(city, "iconAndTemperatureSwallow", today))
        return false;
    elm_object_part_text_set(name, "name", current ? "Gangnam-gu" : sample.name);
    elm_object_part_text_set(city, "localTime", sample.localTime);
    if (current)
        elm_object_signal_emit(city, "receiver,invisible,localtime", "localTime");
    const std::string icon = ViewBasicElements::MakeWeatherIconName(TodayViewType(), sample.code, false);
    const std::string iconPress = ViewBasicElements::MakeWeatherIconName(TodayViewType(), sample.code, true);
    elm_object_part_text_set(today, "current", sample.temperature);
    return SetContent(today, "icon", Image(today, icon)) &&
           SetContent(today, "iconPress", Image(today, iconPress)) &&
           SetContent(today, "currentUnit", Image(today, UnitName(false))) &&
           SetContent(today, "currentUnitPress", Image(today, UnitName(true)));
}

bool LayoutSample::FillBottomLine(Evas_Object* city, PageState state)
{
    Evas_Object* line = PageLayout(city, "bottomLine");
    if (!SetContent(city, "bottomLineSwallow", line))
        return false;
    if (state == PageState::NO_NETWORK)
    {
        elm_object_part_text_set(line, "msg", Tr("IDS_IDLE_HEADER_NO_NETWORK_CONNECTION_ABB3"));
    }
    else
    {
        elm_object_part_text_set(line, "date", kCities[0].date);
        elm_object_part_text_set(line, "time", kCities[0].time);
    }
    return SetContent(line, "cpLogoEffect", PageLayout(line, "BottomLinePressEffect")) &&
           SetContent(line, "refreshButtonEffect", PageLayout(line, "BottomLinePressEffect")) &&
           SetContent(line, "cpLogo", Image(line, "weather_box_logo_accuweather.png")) &&
           SetContent(line, "refreshButton", Image(line, "weather_box_ic_refresh.png"));
}

bool LayoutSample::FillForecast(Evas_Object* city, int cityIndex)
{
    Evas_Object* forecast = PageLayout(city, "weatherForecast");
    if (!SetContent(city, "weatherForecastSwallow", forecast))
        return false;
    const std::string degree = Tr("IDS_MF_BODY_M_DEGREE");
    for (int row = 1; row <= 4; ++row)
    {
        const SampleDay& day = kCities[cityIndex].days[row - 1];
        const std::string n = std::to_string(row);
        elm_object_part_text_set(forecast, ("weatherForecastWeek" + n).c_str(), day.weekday);
        elm_object_part_text_set(forecast, ("weatherForecastHighTemp" + n).c_str(),
                                 (day.high + degree).c_str());
        elm_object_part_text_set(forecast, ("weatherForecastLowTemp" + n).c_str(),
                                 (day.low + degree).c_str());
        const std::string icon = ViewBasicElements::MakeWeatherIconName(kViewTypeDay, day.code, false);
        const std::string iconPress = ViewBasicElements::MakeWeatherIconName(kViewTypeDay, day.code, true);
        if (!SetContent(forecast, ("weatherForecastIcon" + n).c_str(), Image(forecast, icon)) ||
            !SetContent(forecast, ("weatherForecastPressIcon" + n).c_str(), Image(forecast, iconPress)))
            return false;
    }
    return true;
}

Evas_Object* LayoutSample::Layout(Evas_Object* parent, const std::string& file, const char* group)
{
    if (!parent)
        return nullptr;
    Evas_Object* layout = elm_layout_add(parent);
    if (!layout || !elm_layout_file_set(layout, file.c_str(), group))
    {
        fprintf(stderr, "cannot load group %s of %s\n", group, file.c_str());
        evas_object_del(layout);
        return nullptr;
    }
    evas_object_show(layout);
    return layout;
}

Evas_Object* LayoutSample::PageLayout(Evas_Object* parent, const char* group)
{
    return Layout(parent, mResDir + (mIs4x4 ? "widget/Widget4x4Page.edj" : "widget/Widget4x2Page.edj"),
                  group);
}

Evas_Object* LayoutSample::Image(Evas_Object* parent, const std::string& name)
{
    Evas_Object* image = elm_image_add(parent);
    std::string file = mResDir + "widget/WidgetResources.edj";
    if (!image || !elm_image_file_set(image, file.c_str(), name.c_str()))
    {
        fprintf(stderr, "cannot load image %s\n", name.c_str());
        evas_object_del(image);
        return nullptr;
    }
    evas_object_show(image);
    return image;
}

int LayoutSample::TodayViewType() const
{
    return mIs4x4 ? kViewType4x4 : kViewType4x2;
}

std::string LayoutSample::UnitName(bool pressed) const
{
    return ViewBasicElements::MakeTemperatureUnitIconName(TodayViewType(), true, pressed);
}

}  // namespace NSWeatherWidget

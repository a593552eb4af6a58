#ifndef WEATHER_WIDGET_SAMPLES_LAYOUT_SAMPLE_H
#define WEATHER_WIDGET_SAMPLES_LAYOUT_SAMPLE_H

#include <Elementary.h>

#include <memory>
#include <string>

namespace NSWeatherWidget
{

// Fills the widget's page layouts with sample texts and images, to look at
// the layouts without the widget's data store.
class LayoutSample
{
public:
    enum class PageState
    {
        CITY,
        CURRENT_LOCATION,
        NO_NETWORK,
        PRESSED,
        NO_CITY,
        LOADING
    };

    // resDir: the widget's resource folder, ending in '/'.
    LayoutSample(const std::string& resDir, bool is4x4);

    // The "widgetView" base layout with a page in each of the three slots;
    // the centre page shows `state`. Returns nullptr if a layout is missing.
    Evas_Object* CreateView(Evas_Object* parent, PageState state);

    static bool ParseState(const std::string& text, PageState& state);

private:
    Evas_Object* CreatePage(Evas_Object* parent, PageState state, int cityIndex);
    Evas_Object* CreateCity(Evas_Object* parent, PageState state, int cityIndex);
    Evas_Object* CreateNoCity(Evas_Object* parent);
    Evas_Object* CreateLoading(Evas_Object* parent);
    bool FillToday(Evas_Object* city, PageState state, int cityIndex);
    bool FillBottomLine(Evas_Object* city, PageState state);
    bool FillForecast(Evas_Object* city, int cityIndex);
    Evas_Object* Layout(Evas_Object* parent, const std::string& file, const char* group);
    Evas_Object* PageLayout(Evas_Object* parent, const char* group);
    Evas_Object* Image(Evas_Object* parent, const std::string& name);
    int TodayViewType() const;
    std::string UnitName(bool pressed) const;

    std::string mResDir;
    bool mIs4x4;
};

}  // namespace NSWeatherWidget

#endif

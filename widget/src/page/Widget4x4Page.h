#ifndef NSWEATHERWIDGET_WIDGET_4X4_PAGE_H
#define NSWEATHERWIDGET_WIDGET_4X4_PAGE_H

#include "Widget4x2Page.h"

namespace NSWeatherWidget
{

// The 4x4 page: the 4x2 page with larger images and four forecast days
// under today's weather.
class Widget4x4Page : public Widget4x2Page
{
public:
    static constexpr int kForecastDays = 4;

    Widget4x4Page() = default;
    ~Widget4x4Page() override = default;

    // The number of rows filled.
    int UpdateWeekly(Evas_Object* forecastLayout);

protected:
    std::string GetEdjPath() const override;
    bool GetIs4x4() const override { return true; }
    bool AddCityExtras(Evas_Object* cityLayout) override;
    void UpdateCityExtras(Evas_Object* cityLayout) override;
    void EmitToday(const char* signal) override;

private:
    bool UpdateDay(Evas_Object* forecastLayout, int row);
    static void ClearDays(Evas_Object* forecastLayout, int firstRow);
};

}  // namespace NSWeatherWidget

#endif

#ifndef NSWEATHERWIDGET_WIDGET_ACCESSIBLE_TEXT_H
#define NSWEATHERWIDGET_WIDGET_ACCESSIBLE_TEXT_H

#include <string>
#include <vector>

#include "WidgetPageData.h"

namespace NSWeatherWidget
{

// What a screen reader says for a page, in the display language, made from
// the same page data the page draws. No toolkit here.
class WidgetAccessibleText
{
public:
    // Not owned; must outlive this object.
    explicit WidgetAccessibleText(const WidgetPageData& widgetPageData) : mWidgetPageData(widgetPageData) {}

    static std::string GetNoCityName();
    static std::string GetLoadingName();
    // City, temperature, condition, then `bottomLineMessage` when the
    // bottom line shows a reason instead of the update time.
    std::string GetCityName(const std::string& bottomLineMessage) const;
    static std::string GetCityDescription();
    // The first `days` forecast rows, one sentence each.
    std::string GetForecastName(int days) const;
    static std::string GetRefreshName(bool isRefreshing);
    static std::string GetRefreshDescription();
    // Empty when no logo is shown.
    static std::string GetLogoName(const std::string& logoImage);
    static std::string GetLogoDescription();
    static std::string GetConditionName(int conditionCode);

    // Puts `values` into "%s" or "%1$s".."%9$s" of a translated pattern;
    // anything else stays, so a broken translation reads no further.
    static std::string Fill(const std::string& pattern, const std::vector<std::string>& values);

private:
    std::string GetTemperaturePhrase() const;
    std::string GetUpdatedPhrase() const;

    const WidgetPageData& mWidgetPageData;
};

}  // namespace NSWeatherWidget

#endif

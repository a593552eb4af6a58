#include "WidgetAccessibleText.h"

#include <libintl.h>

#include "ICUUtil.h"
#include "TimeUtil.h"

namespace NSWeatherWidget
{

namespace
{
const char* const kTextDomain = "weather-m";
const char* const kSeparator = ", ";
const char* const kSentenceSeparator = ". ";

// One text per condition code, saying what its image shows; unknown codes
// show the first image.
const char* const kConditionNames[] = {
    "IDS_WEATHER_ACCS_SUNNY",         "IDS_WEATHER_ACCS_SUNNY",
    "IDS_WEATHER_ACCS_PARTLY_SUNNY",  "IDS_WEATHER_ACCS_CLOUDY",
    "IDS_WEATHER_ACCS_RAIN",          "IDS_WEATHER_ACCS_FOG",
    "IDS_WEATHER_ACCS_SHOWERS",       "IDS_WEATHER_ACCS_PARTLY_SUNNY_WITH_SHOWERS",
    "IDS_WEATHER_ACCS_THUNDERSTORMS", "IDS_WEATHER_ACCS_PARTLY_SUNNY_WITH_THUNDER_SHOWERS",
    "IDS_WEATHER_ACCS_FLURRIES",      "IDS_WEATHER_ACCS_PARTLY_SUNNY_WITH_FLURRIES",
    "IDS_WEATHER_ACCS_SNOW",          "IDS_WEATHER_ACCS_RAIN_AND_SNOW",
    "IDS_WEATHER_ACCS_ICE",           "IDS_WEATHER_ACCS_HOT",
    "IDS_WEATHER_ACCS_COLD",          "IDS_WEATHER_ACCS_WINDY",
    "IDS_WEATHER_ACCS_CLEAR",         "IDS_WEATHER_ACCS_MOSTLY_CLEAR",
    "IDS_WEATHER_ACCS_SUNNY",         "IDS_WEATHER_ACCS_SUNNY",
};
const int kConditionCount = sizeof(kConditionNames) / sizeof(kConditionNames[0]);

// Brand names are not translated.
const struct
{
    const char* image;
    const char* brand;
} kLogoBrands[] = {
    {"weather_box_logo_accuweather.png", "AccuWeather"},
};

std::string Tr(const char* id)
{
    return dgettext(kTextDomain, id);
}

std::string Join(const std::vector<std::string>& items, const char* separator)
{
    std::string out;
    for (const std::string& item : items)
    {
        if (item.empty())
            continue;
        out += (out.empty() ? "" : separator) + item;
    }
    return out;
}
}  // namespace

std::string WidgetAccessibleText::Fill(const std::string& pattern, const std::vector<std::string>& values)
{
    std::string out;
    size_t next = 0;
    auto value = [&values](size_t index) { return index < values.size() ? values[index] : std::string(); };
    for (size_t i = 0; i < pattern.size(); ++i)
    {
        if (pattern.compare(i, 2, "%s") == 0)
        {
            out += value(next++);
            ++i;
        }
        else if (pattern[i] == '%' && i + 3 < pattern.size() && pattern[i + 1] >= '1' &&
                 pattern[i + 1] <= '9' && pattern.compare(i + 2, 2, "$s") == 0)
        {
            out += value(static_cast<size_t>(pattern[i + 1] - '1'));
            i += 3;
        }
        else
            out += pattern[i];
    }
    return out;
}

std::string WidgetAccessibleText::GetNoCityName()
{
    return Join({Tr("IDS_DB_TAB_WEATHER"), Tr("IDS_DB_NPBODY_TAP_HERE_TO_ADD_A_CITY")}, kSentenceSeparator);
}

std::string WidgetAccessibleText::GetLoadingName()
{
    return Tr("IDS_DB_POP_LOADING_ING");
}

std::string WidgetAccessibleText::GetCityName(const std::string& bottomLineMessage) const
{
    const WidgetPageData& data = mWidgetPageData;
    bool isCurrent = data.GetIsCurrentCity(data.GetCityPtr());
    std::vector<std::string> items = {data.GetCityName()};
    if (isCurrent)
        items.push_back(Tr("IDS_WEATHER_ACCS_CURRENT_LOCATION"));
    items.push_back(GetTemperaturePhrase());
    int code = data.GetCurrentConditionCode();
    if (code >= 0)
        items.push_back(GetConditionName(code));
    items.push_back(bottomLineMessage.empty() ? GetUpdatedPhrase() : bottomLineMessage);
    // The current-location city hides its local time.
    std::string localTime = isCurrent ? std::string() : data.GetLocalTimeString();
    if (!localTime.empty())
        items.push_back(Fill(Tr("IDS_WEATHER_ACCS_LOCAL_TIME"), {localTime}));
    return Join(items, kSeparator);
}

std::string WidgetAccessibleText::GetCityDescription()
{
    return Tr("IDS_WEATHER_ACCS_OPEN_APP_DESCRIPTION");
}

// Without settings the page shows a bare number and no unit.
std::string WidgetAccessibleText::GetTemperaturePhrase() const
{
    std::string current = mWidgetPageData.GetCurrentTemperatureString();
    if (current.empty() || !mWidgetPageData.GetSettingPtr())
        return current;
    const char* id = mWidgetPageData.GetIsCelsius() ? "IDS_WEATHER_ACCS_DEGREES_CELSIUS"
                                                    : "IDS_WEATHER_ACCS_DEGREES_FAHRENHEIT";
    return Fill(Tr(id), {current});
}

// The date is said only when the update was not today.
std::string WidgetAccessibleText::GetUpdatedPhrase() const
{
    std::string date = mWidgetPageData.GetUpdatedDate();
    std::string time = mWidgetPageData.GetUpdatedTime();
    if (date.empty() || time.empty())
        return std::string();
    std::string today = NSWeather::ICUUtil::GetDateTimeString(NSWeather::TimeUtil::GetCurrentTime(),
                                                              NSWeather::ICUUtil::SKELETON_MMdd);
    return Fill(Tr("IDS_WEATHER_ACCS_UPDATED"), {date == today ? time : date + " " + time});
}

std::string WidgetAccessibleText::GetForecastName(int days) const
{
    const WidgetPageData& data = mWidgetPageData;
    NSWeather::CityPtr cityPtr = data.GetCityPtr();
    std::vector<std::string> sentences;
    for (int day = 0; day < days; ++day)
    {
        int code = data.GetWeeklyConditionCode(cityPtr, day);
        sentences.push_back(Fill(
            Tr("IDS_WEATHER_ACCS_FORECAST_DAY"),
            {data.GetWeeklyWeekdayString(cityPtr, day), code >= 0 ? GetConditionName(code) : std::string(),
             data.GetWeeklyHighTemperatureString(cityPtr, day),
             data.GetWeeklyLowTemperatureString(cityPtr, day)}));
    }
    return Join(sentences, kSentenceSeparator);
}

std::string WidgetAccessibleText::GetRefreshName(bool isRefreshing)
{
    return Tr(isRefreshing ? "IDS_WEATHER_ACCS_REFRESHING" : "IDS_WEATHER_ACCS_REFRESH");
}

std::string WidgetAccessibleText::GetRefreshDescription()
{
    return Tr("IDS_WEATHER_ACCS_REFRESH_DESCRIPTION");
}

std::string WidgetAccessibleText::GetLogoName(const std::string& logoImage)
{
    if (logoImage.empty())
        return std::string();
    for (const auto& logo : kLogoBrands)
    {
        if (logoImage == logo.image)
            return logo.brand;
    }
    return Tr("IDS_WEATHER_ACCS_WEATHER_PROVIDER");
}

std::string WidgetAccessibleText::GetLogoDescription()
{
    return Tr("IDS_WEATHER_ACCS_PROVIDER_DESCRIPTION");
}

std::string WidgetAccessibleText::GetConditionName(int conditionCode)
{
    bool isKnown = conditionCode >= 0 && conditionCode < kConditionCount;
    return Tr(kConditionNames[isKnown ? conditionCode : 0]);
}

}  // namespace NSWeatherWidget

#ifndef NSWEATHER_WEEKLY_H
#define NSWEATHER_WEEKLY_H

#include <memory>
#include <string>
#include <vector>

#include "Weather.h"

namespace NSWeather
{
// One day of a city's daily forecast.
class Weekly : public Weather
{
public:
    Weekly();
    virtual ~Weekly();

    std::string GetWebsiteUrl() const;
    void SetWebsiteUrl(const std::string& websiteUrl);
    // Weekday of the date, 0 = Sunday to 6 = Saturday; filled by the store.
    int GetDayOfWeek() const;
    void SetDayOfWeek(int dayOfWeek);

private:
    std::string mWebsiteUrl;
    int mDayOfWeek;
};

using WeeklyPtr = std::shared_ptr<Weekly>;
using WeeklyPtrVector = std::vector<WeeklyPtr>;
using WeeklyPtrVectorPtr = std::shared_ptr<WeeklyPtrVector>;
}  // namespace NSWeather

#endif

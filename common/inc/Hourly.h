#ifndef NSWEATHER_HOURLY_H
#define NSWEATHER_HOURLY_H

#include <ctime>
#include <memory>
#include <string>
#include <vector>

#include "Weather.h"

namespace NSWeather
{
// One entry of a city's hourly forecast.
class Hourly : public Weather
{
public:
    Hourly();
    virtual ~Hourly();

    // The forecast hour as the time value stored in the "hour" column.
    time_t GetHour() const;
    void SetHour(time_t hour);
    std::string GetWebsiteUrl() const;
    void SetWebsiteUrl(const std::string& websiteUrl);

private:
    time_t mHour;
    std::string mWebsiteUrl;
};

using HourlyPtr = std::shared_ptr<Hourly>;
using HourlyPtrVector = std::vector<HourlyPtr>;
using HourlyPtrVectorPtr = std::shared_ptr<HourlyPtrVector>;
}  // namespace NSWeather

#endif

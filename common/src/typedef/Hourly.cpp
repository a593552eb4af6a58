#include "Hourly.h"

namespace NSWeather
{

Hourly::Hourly() : Weather(), mHour(999), mWebsiteUrl("NULL") {}

Hourly::~Hourly() = default;

time_t Hourly::GetHour() const
{
    return mHour;
}

void Hourly::SetHour(time_t hour)
{
    mHour = hour;
}

std::string Hourly::GetWebsiteUrl() const
{
    return mWebsiteUrl;
}

void Hourly::SetWebsiteUrl(const std::string& websiteUrl)
{
    mWebsiteUrl = websiteUrl;
}

}  // namespace NSWeather

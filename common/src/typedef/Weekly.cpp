#include "Weekly.h"

namespace NSWeather
{

Weekly::Weekly() : Weather(), mWebsiteUrl("NULL"), mDayOfWeek(0) {}

Weekly::~Weekly() = default;

std::string Weekly::GetWebsiteUrl() const
{
    return mWebsiteUrl;
}

void Weekly::SetWebsiteUrl(const std::string& websiteUrl)
{
    mWebsiteUrl = websiteUrl;
}

int Weekly::GetDayOfWeek() const
{
    return mDayOfWeek;
}

void Weekly::SetDayOfWeek(int dayOfWeek)
{
    mDayOfWeek = dayOfWeek;
}

}  // namespace NSWeather

#include "Current.h"

namespace NSWeather
{

Current::Current() : Weather(), mWebsiteUrl("NULL") {}

Current::~Current() = default;

std::string Current::GetWebsiteUrl() const
{
    return mWebsiteUrl;
}

void Current::SetWebsiteUrl(const std::string& websiteUrl)
{
    mWebsiteUrl = websiteUrl;
}

}  // namespace NSWeather

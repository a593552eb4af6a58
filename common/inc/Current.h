#ifndef NSWEATHER_CURRENT_H
#define NSWEATHER_CURRENT_H

#include <memory>
#include <string>
#include <vector>

#include "Weather.h"

namespace NSWeather
{
// Current conditions of one city.
class Current : public Weather
{
public:
    Current();
    virtual ~Current();

    std::string GetWebsiteUrl() const;
    void SetWebsiteUrl(const std::string& websiteUrl);

private:
    std::string mWebsiteUrl;
};

using CurrentPtr = std::shared_ptr<Current>;
using CurrentPtrVector = std::vector<CurrentPtr>;
using CurrentPtrVectorPtr = std::shared_ptr<CurrentPtrVector>;
}  // namespace NSWeather

#endif

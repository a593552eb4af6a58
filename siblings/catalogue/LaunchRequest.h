#ifndef NSWEATHER_LAUNCH_REQUEST_H
#define NSWEATHER_LAUNCH_REQUEST_H

#include <map>
#include <string>

namespace NSWeather
{

// The launch request this process was started with, as the extra data the
// sender added (string values only).
class LaunchRequest
{
public:
    virtual ~LaunchRequest() = default;

    // False when the process was not started by a launch request or the
    // request cannot be read (logged).
    static bool Read(std::map<std::string, std::string>& extraData);
};

}  // namespace NSWeather

#endif

#ifndef NSWEATHER_LOCATION_H
#define NSWEATHER_LOCATION_H

#include <locations.h>

#include <memory>

namespace NSWeather
{

// Whether the platform's location service is switched on. The widget never
// positions the device itself; callers construct one on the stack.
class Location
{
public:
    Location();
    virtual ~Location();
    Location(const Location&) = delete;
    Location& operator=(const Location&) = delete;

    // False when the service is off or the platform cannot say.
    bool IsLocationEnabled();

private:
    location_manager_h mHandler;
};

using LocationPtr = std::shared_ptr<Location>;

}  // namespace NSWeather

#endif

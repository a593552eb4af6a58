#include "ShareTarget.h"

namespace NSWeather
{

ShareTarget::ShareTarget() : mAppID(), mPortID() {}

ShareTarget::~ShareTarget() = default;

std::string ShareTarget::GetAppID() const
{
    return mAppID;
}

void ShareTarget::SetAppID(const std::string& appID)
{
    mAppID = appID;
}

std::string ShareTarget::GetPortID() const
{
    return mPortID;
}

void ShareTarget::SetPortID(const std::string& portID)
{
    mPortID = portID;
}

}  // namespace NSWeather

#ifndef NSWEATHER_SHARE_TARGET_H
#define NSWEATHER_SHARE_TARGET_H

#include <memory>
#include <string>
#include <vector>

namespace NSWeather
{
// One receiver of the agent's messages: its application id and local port name.
class ShareTarget
{
public:
    ShareTarget();
    virtual ~ShareTarget();

    std::string GetAppID() const;
    void SetAppID(const std::string& appID);
    std::string GetPortID() const;
    void SetPortID(const std::string& portID);

private:
    std::string mAppID;
    std::string mPortID;
};

using ShareTargetPtr = std::shared_ptr<ShareTarget>;
using ShareTargetPtrVector = std::vector<ShareTargetPtr>;
using ShareTargetPtrVectorPtr = std::shared_ptr<ShareTargetPtrVector>;
}  // namespace NSWeather

#endif

#ifndef PLATFORM_MESSAGE_PORT_MESSAGE_ENVELOPE_H
#define PLATFORM_MESSAGE_PORT_MESSAGE_ENVELOPE_H

#include <string>

#include "bundle.h"

namespace platform
{

// One datagram: the sender's application id and port and the message.
struct MessageEnvelope
{
    std::string senderAppId;
    bool hasSenderPort = false;
    std::string senderPort;
    bundle* message = nullptr;  // owned by whoever decoded it
};

std::string EncodeEnvelope(const std::string& senderAppId, const char* senderPort, const bundle* message);
// False for anything but one complete, well-formed datagram.
bool DecodeEnvelope(const std::string& datagram, MessageEnvelope& envelope);

}  // namespace platform

#endif

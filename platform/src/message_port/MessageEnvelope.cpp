// The datagram form of a message: a bundle around the encoded message.
#include "message_port/MessageEnvelope.h"

#include <memory>

#include "bundle/BundleInternal.h"

namespace
{

const char* const kSenderAppKey = "__MSGPORT_SENDER_APP__";
const char* const kSenderPortKey = "__MSGPORT_SENDER_PORT__";
const char* const kMessageKey = "__MSGPORT_MESSAGE__";

struct BundleDeleter
{
    void operator()(bundle* b) const { bundle_free(b); }
};
using BundleHolder = std::unique_ptr<bundle, BundleDeleter>;

}  // namespace

namespace platform
{

std::string EncodeEnvelope(const std::string& senderAppId, const char* senderPort, const bundle* message)
{
    _bundle_t envelope;
    auto add = [&envelope](const char* key, const std::string& value) {
        envelope.items.push_back(std::make_unique<keyval_t>(keyval_t{key, BUNDLE_TYPE_STR, value}));
    };
    add(kSenderAppKey, senderAppId);
    if (senderPort)
        add(kSenderPortKey, senderPort);
    add(kMessageKey, Base64Encode(BundleToBinary(message)));
    return BundleToBinary(&envelope);
}

bool DecodeEnvelope(const std::string& datagram, MessageEnvelope& envelope)
{
    BundleHolder outer(BundleFromBinary(datagram));
    if (!outer)
        return false;
    const keyval_t* sender = BundleFind(outer.get(), kSenderAppKey);
    const keyval_t* port = BundleFind(outer.get(), kSenderPortKey);
    const keyval_t* message = BundleFind(outer.get(), kMessageKey);
    size_t expected = 2 + (port ? 1 : 0);
    std::string binary;
    if (!sender || !message || outer->items.size() != expected ||
        !Base64Decode(message->value.data(), message->value.size(), binary))
        return false;
    envelope.message = BundleFromBinary(binary);
    if (!envelope.message)
        return false;
    envelope.senderAppId = sender->value;
    envelope.hasSenderPort = port != nullptr;
    envelope.senderPort = port ? port->value : std::string();
    return true;
}

}  // namespace platform

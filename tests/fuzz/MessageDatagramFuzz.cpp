// One datagram as a local message port receives it. What decodes must say
// the same once encoded and decoded again.
#include <cstdint>
#include <string>

#include "FuzzRoot.h"
#include "bundle.h"
#include "bundle/BundleInternal.h"
#include "message_port/MessageEnvelope.h"

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    // Rejections are logged into a root of our own, never the user's.
    WeatherTest::FuzzRoot::Get();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    std::string datagram(reinterpret_cast<const char*>(data), size);
    platform::MessageEnvelope envelope;
    if (!platform::DecodeEnvelope(datagram, envelope))
    {
        FUZZ_CHECK(envelope.message == nullptr);
        return 0;
    }
    FUZZ_CHECK(envelope.message != nullptr);
    std::string again = platform::EncodeEnvelope(
        envelope.senderAppId, envelope.hasSenderPort ? envelope.senderPort.c_str() : nullptr,
        envelope.message);
    platform::MessageEnvelope reread;
    FUZZ_CHECK(platform::DecodeEnvelope(again, reread));
    FUZZ_CHECK(reread.senderAppId == envelope.senderAppId && reread.hasSenderPort == envelope.hasSenderPort &&
               reread.senderPort == envelope.senderPort);
    FUZZ_CHECK(platform::BundleToBinary(reread.message) == platform::BundleToBinary(envelope.message));
    bundle_free(reread.message);
    bundle_free(envelope.message);
    return 0;
}

// A launch request's bundle as another process hands it over: the encoded
// text (and, for the inner form, its binary). What decodes must encode back
// to the same bytes and read as a request.
#include <climits>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

#include "FuzzRoot.h"
#include "app_control/AppControlInternal.h"
#include "bundle.h"
#include "bundle/BundleInternal.h"

namespace
{

void DecodeText(const uint8_t* data, size_t size)
{
    if (size > INT_MAX)
        return;
    bundle* b = bundle_decode(reinterpret_cast<const bundle_raw*>(data), static_cast<int>(size));
    if (!b)
        return;
    bundle_raw* raw = nullptr;
    int length = 0;
    FUZZ_CHECK(bundle_encode(b, &raw, &length) == BUNDLE_ERROR_NONE);
    FUZZ_CHECK(static_cast<size_t>(length) == size && memcmp(raw, data, size) == 0);
    free(raw);
    app_control_s request;
    platform::AppControlFromBundle(b, request);
    bundle_free(b);
}

void DecodeBinary(const std::string& binary)
{
    bundle* b = platform::BundleFromBinary(binary);
    if (!b)
        return;
    FUZZ_CHECK(platform::BundleToBinary(b) == binary);
    bundle_free(b);
}

}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    // Rejections are logged into a root of our own, never the user's.
    WeatherTest::FuzzRoot::Get();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    DecodeText(data, size);
    DecodeBinary(std::string(reinterpret_cast<const char*>(data), size));
    return 0;
}

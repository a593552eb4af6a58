#ifndef PLATFORM_BUNDLE_BUNDLE_INTERNAL_H
#define PLATFORM_BUNDLE_BUNDLE_INTERNAL_H

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include "bundle.h"

// Internal to the platform library: the bundle's contents and codecs that
// the launch and message-port areas share.
struct keyval_t
{
    std::string key;
    int type;
    std::string value;
};

struct _bundle_t
{
    // Entries in the order of addition; pointers stay valid while iterating.
    std::vector<std::unique_ptr<keyval_t>> items;
};

namespace platform
{

// More entries than any message or launch request of ours carries; the
// decoder refuses more, and so does bundle_encode.
const size_t kMaxBundleEntries = 4096;

// "QBND", version, count, then per entry type, key and value, each length
// prefixed (big-endian 32-bit).
std::string BundleToBinary(const bundle* b);
// Empty pointer for anything that is not exactly one valid encoding.
bundle* BundleFromBinary(const std::string& data);

std::string Base64Encode(const std::string& data);
// Strict: canonical padding only, no whitespace.
bool Base64Decode(const char* text, size_t length, std::string& out);

const keyval_t* BundleFind(const bundle* b, const std::string& key);

}  // namespace platform

#endif

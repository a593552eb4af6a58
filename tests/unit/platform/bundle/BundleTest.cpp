#include <bundle.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

#include "TestPlatform.h"
#include "bundle/BundleInternal.h"

namespace
{

using Pairs = std::vector<std::pair<std::string, std::string>>;

struct BundleDeleter
{
    void operator()(bundle* b) const { bundle_free(b); }
};
using BundlePtr = std::unique_ptr<bundle, BundleDeleter>;

BundlePtr Make(const Pairs& pairs)
{
    BundlePtr b(bundle_create());
    for (const auto& pair : pairs)
        EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_add_str(b.get(), pair.first.c_str(), pair.second.c_str()));
    return b;
}

void CollectCb(const char* key, const int type, const bundle_keyval_t* kv, void* data)
{
    void* value = nullptr;
    size_t size = 0;
    EXPECT_EQ(BUNDLE_TYPE_STR, type);
    bundle_keyval_get_basic_val(const_cast<bundle_keyval_t*>(kv), &value, &size);
    EXPECT_EQ(strlen(static_cast<char*>(value)) + 1, size);
    static_cast<Pairs*>(data)->emplace_back(key, static_cast<char*>(value));
}

Pairs Contents(bundle* b)
{
    Pairs pairs;
    bundle_foreach(b, CollectCb, &pairs);
    return pairs;
}

std::string Encode(bundle* b)
{
    bundle_raw* raw = nullptr;
    int length = 0;
    EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_encode(b, &raw, &length));
    std::string text(reinterpret_cast<char*>(raw), static_cast<size_t>(length));
    free(raw);
    return text;
}

BundlePtr Decode(const std::string& text)
{
    return BundlePtr(
        bundle_decode(reinterpret_cast<const bundle_raw*>(text.data()), static_cast<int>(text.size())));
}

// Hand-made binary encodings, to produce inputs the encoder never would.
struct Binary
{
    std::string data;
    Binary& Raw(const std::string& bytes)
    {
        data += bytes;
        return *this;
    }
    Binary& U32(uint32_t value)
    {
        for (int shift = 24; shift >= 0; shift -= 8)
            data.push_back(static_cast<char>((value >> shift) & 0xFF));
        return *this;
    }
    Binary& Text(const std::string& text) { return U32(static_cast<uint32_t>(text.size())).Raw(text); }
    Binary& Entry(const std::string& key, const std::string& value)
    {
        return U32(BUNDLE_TYPE_STR).Text(key).Text(value);
    }
    static Binary Header(uint32_t count)
    {
        Binary b;
        b.Raw("QBND").Raw(std::string(1, '\x01')).U32(count);
        return b;
    }
    std::string Base64() const { return platform::Base64Encode(data); }
    // `count` entries with distinct keys, the last one named `lastKey`.
    static Binary Many(size_t count, const std::string& lastKey)
    {
        Binary b = Header(static_cast<uint32_t>(count));
        for (size_t i = 0; i + 1 < count; ++i) b.Entry("k" + std::to_string(i), "v");
        return b.Entry(lastKey, "v");
    }
};

class BundleTest : public WeatherTest::PlatformTest
{
};

TEST_F(BundleTest, KeepsInsertionOrderAndRejectsBadKeys)
{
    BundlePtr b = Make({{"zeta", "1"}, {"alpha", ""}, {"mid", "x=y"}});
    EXPECT_EQ((Pairs{{"zeta", "1"}, {"alpha", ""}, {"mid", "x=y"}}), Contents(b.get()));
    EXPECT_EQ(3, bundle_get_count(b.get()));
    EXPECT_EQ(BUNDLE_ERROR_KEY_EXISTS, bundle_add_str(b.get(), "zeta", "2"));
    EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str(b.get(), "", "v"));
    EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str(b.get(), nullptr, "v"));
    EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str(nullptr, "k", "v"));

    char* value = nullptr;
    EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_get_str(b.get(), "zeta", &value));
    EXPECT_STREQ("1", value);
    EXPECT_EQ(BUNDLE_ERROR_KEY_NOT_AVAILABLE, bundle_get_str(b.get(), "missing", &value));
    EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_del(b.get(), "zeta"));
    EXPECT_EQ(BUNDLE_ERROR_KEY_NOT_AVAILABLE, bundle_del(b.get(), "zeta"));
    EXPECT_EQ((Pairs{{"alpha", ""}, {"mid", "x=y"}}), Contents(b.get()));
}

TEST_F(BundleTest, DuplicateIsIndependent)
{
    BundlePtr b = Make({{"a", "1"}});
    BundlePtr copy(bundle_dup(b.get()));
    bundle_add_str(b.get(), "b", "2");
    EXPECT_EQ((Pairs{{"a", "1"}}), Contents(copy.get()));
    EXPECT_EQ(nullptr, bundle_dup(nullptr));
    EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, get_last_result());
}

TEST_F(BundleTest, EncodingRoundTripsEveryValue)
{
    Pairs pairs = {{"MESSAGE", "REQUEST_ALL_WEATHER_INFO"},
                   {"empty", ""},
                   {"utf8", "Seoul 서울 °C"},
                   {"quotes", "\"a\\b\"\n\t"},
                   {"long", std::string(5000, 'x')}};
    BundlePtr b = Make(pairs);
    std::string text = Encode(b.get());
    EXPECT_EQ(std::string::npos,
              text.find_first_not_of("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/="));
    BundlePtr decoded = Decode(text);
    ASSERT_TRUE(decoded);
    EXPECT_EQ(pairs, Contents(decoded.get()));

    BundlePtr empty(bundle_create());
    BundlePtr emptyDecoded = Decode(Encode(empty.get()));
    ASSERT_TRUE(emptyDecoded);
    EXPECT_EQ(0, bundle_get_count(emptyDecoded.get()));
}

TEST_F(BundleTest, Base64MatchesTheStandardAlphabet)
{
    EXPECT_EQ("", platform::Base64Encode(""));
    EXPECT_EQ("Zg==", platform::Base64Encode("f"));
    EXPECT_EQ("Zm8=", platform::Base64Encode("fo"));
    EXPECT_EQ("Zm9vYmFy", platform::Base64Encode("foobar"));
    EXPECT_EQ("/+8=", platform::Base64Encode("\xff\xef"));
    std::string out;
    EXPECT_TRUE(platform::Base64Decode("Zm9vYmE=", 8, out));
    EXPECT_EQ("fooba", out);
    // Non-zero bits under the padding are not canonical.
    EXPECT_FALSE(platform::Base64Decode("Zm9=", 4, out));
    EXPECT_FALSE(platform::Base64Decode("Zg=a", 4, out));
    EXPECT_FALSE(platform::Base64Decode("Zg==Zg==", 8, out));
}

TEST_F(BundleTest, DecodeRejectsEveryTruncation)
{
    BundlePtr b = Make({{"key", "value"}, {"second", "entry"}});
    std::string binary = platform::BundleToBinary(b.get());
    for (size_t length = 0; length < binary.size(); ++length)
    {
        EXPECT_FALSE(Decode(platform::Base64Encode(binary.substr(0, length)))) << "length " << length;
        EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, get_last_result());
    }
    std::string text = Encode(b.get());
    for (size_t length = 1; length < text.size(); ++length)
        EXPECT_FALSE(Decode(text.substr(0, length))) << "text length " << length;
    EXPECT_TRUE(Decode(text));
}

TEST_F(BundleTest, DecodeRejectsMalformedEncodings)
{
    const std::vector<std::pair<const char*, std::string>> cases = {
        {"not base64", "!!!!"},
        {"whitespace", Binary::Header(0).Base64() + "\n"},
        {"wrong magic",
         []
         {
             Binary b;
             b.Raw("XBND").Raw(std::string(1, '\x01')).U32(0);
             return b.Base64();
         }()},
        {"wrong version",
         []
         {
             Binary b;
             b.Raw("QBND").Raw(std::string(1, '\x02')).U32(0);
             return b.Base64();
         }()},
        {"count beyond data", Binary::Header(0xFFFFFFFF).Base64()},
        {"count larger than entries", Binary::Header(2).Entry("a", "1").Base64()},
        {"trailing bytes", Binary::Header(1).Entry("a", "1").Raw("x").Base64()},
        {"duplicate key", Binary::Header(2).Entry("a", "1").Entry("a", "2").Base64()},
        {"empty key", Binary::Header(1).Entry("", "1").Base64()},
        {"NUL in key", Binary::Header(1).Entry(std::string("a\0b", 3), "1").Base64()},
        {"NUL in value", Binary::Header(1).Entry("a", std::string("1\0", 2)).Base64()},
        {"unknown type", Binary::Header(1).U32(BUNDLE_TYPE_BYTE).Text("a").Text("1").Base64()},
        {"length beyond data", Binary::Header(1).U32(BUNDLE_TYPE_STR).U32(0x7FFFFFFF).Raw("a").Base64()},
        {"more entries than the cap", Binary::Many(platform::kMaxBundleEntries + 1, "last").Base64()},
        {"duplicate of the first key, last", Binary::Many(platform::kMaxBundleEntries, "k0").Base64()},
    };
    for (const auto& item : cases)
    {
        mLog.Clear();
        EXPECT_FALSE(Decode(item.second)) << item.first;
        EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, get_last_result()) << item.first;
        EXPECT_TRUE(mLog.Contains("rejected a malformed encoding", "BUNDLE")) << item.first;
    }
    EXPECT_TRUE(Decode(Binary::Header(1).Entry("a", "1").Base64()));
    BundlePtr full = Decode(Binary::Many(platform::kMaxBundleEntries, "last").Base64());
    ASSERT_TRUE(full);
    // What the decoder would refuse is not encoded either.
    bundle_add_str(full.get(), "one more", "v");
    bundle_raw* raw = nullptr;
    int length = 0;
    EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_encode(full.get(), &raw, &length));
    EXPECT_EQ(nullptr, raw);
    EXPECT_EQ(nullptr, bundle_decode(nullptr, 4));
    EXPECT_EQ(nullptr, bundle_decode(reinterpret_cast<const bundle_raw*>("QUJD"), 0));
}

TEST_F(BundleTest, IterateSkipsNothingAndSurvivesEdits)
{
    BundlePtr b = Make({{"a", "1"}, {"b", "2"}});
    Pairs seen;
    struct Context
    {
        bundle* b;
        Pairs* seen;
    } context{b.get(), &seen};
    bundle_iterate(
        b.get(),
        [](const char* key, const char* value, void* data)
        {
            auto* ctx = static_cast<Context*>(data);
            ctx->seen->emplace_back(key, value);
            bundle_del(ctx->b, "b");
        },
        &context);
    EXPECT_EQ((Pairs{{"a", "1"}, {"b", "2"}}), seen);
    EXPECT_EQ(1, bundle_get_count(b.get()));
}

}  // namespace

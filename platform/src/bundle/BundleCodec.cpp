// Binary, base64 and JSON forms of a bundle.
#include "bundle/BundleInternal.h"

#include <cstdint>
#include <string_view>
#include <unordered_set>

namespace
{

const char kMagic[] = {'Q', 'B', 'N', 'D'};
const unsigned char kVersion = 1;
// Type, key length and value length of an entry.
const size_t kEntryHeader = 12;

void PutU32(std::string& out, uint32_t value)
{
    for (int shift = 24; shift >= 0; shift -= 8) out.push_back(static_cast<char>((value >> shift) & 0xFF));
}

class Reader
{
public:
    explicit Reader(const std::string& data) : mData(data) {}

    bool GetU32(uint32_t& value)
    {
        if (Remaining() < 4)
            return false;
        value = 0;
        for (int i = 0; i < 4; ++i) value = (value << 8) | static_cast<unsigned char>(mData[mPos++]);
        return true;
    }

    bool GetText(std::string& text)
    {
        uint32_t length = 0;
        if (!GetU32(length) || length > Remaining())
            return false;
        text.assign(mData, mPos, length);
        mPos += length;
        // Keys and values are handed out as C strings.
        return text.find('\0') == std::string::npos;
    }

    size_t Remaining() const { return mData.size() - mPos; }
    void Skip(size_t n) { mPos += n; }

private:
    const std::string& mData;
    size_t mPos = 0;
};

// `keys` views the keys read so far (entries stay put on the heap), so that
// a duplicate costs one lookup rather than a scan of the entries.
bool ReadEntry(Reader& reader, bundle* b, std::unordered_set<std::string_view>& keys)
{
    uint32_t type = 0;
    auto item = std::make_unique<keyval_t>();
    if (!reader.GetU32(type) || type != BUNDLE_TYPE_STR)
        return false;
    if (!reader.GetText(item->key) || item->key.empty() || !reader.GetText(item->value))
        return false;
    if (!keys.insert(item->key).second)
        return false;
    item->type = BUNDLE_TYPE_STR;
    b->items.push_back(std::move(item));
    return true;
}

const char kBase64[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";

int Base64Value(char c)
{
    if (c >= 'A' && c <= 'Z')
        return c - 'A';
    if (c >= 'a' && c <= 'z')
        return c - 'a' + 26;
    if (c >= '0' && c <= '9')
        return c - '0' + 52;
    if (c == '+')
        return 62;
    if (c == '/')
        return 63;
    return -1;
}

}  // namespace

namespace platform
{

const keyval_t* BundleFind(const bundle* b, const std::string& key)
{
    for (const auto& item : b->items)
        if (item->key == key)
            return item.get();
    return nullptr;
}

std::string BundleToBinary(const bundle* b)
{
    std::string out(kMagic, sizeof(kMagic));
    out.push_back(static_cast<char>(kVersion));
    PutU32(out, static_cast<uint32_t>(b->items.size()));
    for (const auto& item : b->items)
    {
        PutU32(out, static_cast<uint32_t>(item->type));
        PutU32(out, static_cast<uint32_t>(item->key.size()));
        out += item->key;
        PutU32(out, static_cast<uint32_t>(item->value.size()));
        out += item->value;
    }
    return out;
}

bundle* BundleFromBinary(const std::string& data)
{
    if (data.size() < sizeof(kMagic) + 1 || data.compare(0, sizeof(kMagic), kMagic, sizeof(kMagic)) != 0 ||
        static_cast<unsigned char>(data[sizeof(kMagic)]) != kVersion)
        return nullptr;
    Reader reader(data);
    reader.Skip(sizeof(kMagic) + 1);
    uint32_t count = 0;
    // The count cannot promise more entries than the bytes can hold.
    if (!reader.GetU32(count) || count > reader.Remaining() / kEntryHeader || count > kMaxBundleEntries)
        return nullptr;
    auto b = std::make_unique<_bundle_t>();
    std::unordered_set<std::string_view> keys;
    keys.reserve(count);
    b->items.reserve(count);
    for (uint32_t i = 0; i < count; ++i)
        if (!ReadEntry(reader, b.get(), keys))
            return nullptr;
    if (reader.Remaining() != 0)
        return nullptr;
    return b.release();
}

std::string Base64Encode(const std::string& data)
{
    std::string out;
    out.reserve((data.size() + 2) / 3 * 4);
    for (size_t i = 0; i < data.size(); i += 3)
    {
        uint32_t chunk = static_cast<unsigned char>(data[i]) << 16;
        size_t left = data.size() - i;
        if (left > 1)
            chunk |= static_cast<unsigned char>(data[i + 1]) << 8;
        if (left > 2)
            chunk |= static_cast<unsigned char>(data[i + 2]);
        out.push_back(kBase64[(chunk >> 18) & 63]);
        out.push_back(kBase64[(chunk >> 12) & 63]);
        out.push_back(left > 1 ? kBase64[(chunk >> 6) & 63] : '=');
        out.push_back(left > 2 ? kBase64[chunk & 63] : '=');
    }
    return out;
}

bool Base64Decode(const char* text, size_t length, std::string& out)
{
    out.clear();
    if (length % 4 != 0)
        return false;
    for (size_t i = 0; i < length; i += 4)
    {
        bool last = i + 4 == length;
        int pad = (text[i + 3] == '=') + (text[i + 2] == '=' && text[i + 3] == '=');
        if (pad && !last)
            return false;
        uint32_t chunk = 0;
        for (size_t j = 0; j < 4 - static_cast<size_t>(pad); ++j)
        {
            int value = Base64Value(text[i + j]);
            if (value < 0)
                return false;
            chunk |= static_cast<uint32_t>(value) << (18 - 6 * j);
        }
        // Bits below the last full byte must be zero in a canonical text.
        if ((pad == 1 && (chunk & 0xFF)) || (pad == 2 && (chunk & 0xFFFF)))
            return false;
        out.push_back(static_cast<char>((chunk >> 16) & 0xFF));
        if (pad < 2)
            out.push_back(static_cast<char>((chunk >> 8) & 0xFF));
        if (pad < 1)
            out.push_back(static_cast<char>(chunk & 0xFF));
    }
    return true;
}

}  // namespace platform

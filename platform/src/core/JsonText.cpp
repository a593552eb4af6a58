#include "core/JsonText.h"

#include <cstdio>

#include "bundle/BundleInternal.h"

namespace
{

const char* const kReplacement = "\xEF\xBF\xBD";

// Length of the valid UTF-8 sequence at text[at], or 0: no overlong forms,
// no surrogates, nothing above U+10FFFF.
size_t Utf8Length(const std::string& text, size_t at)
{
    auto byte = [&text](size_t i) { return i < text.size() ? static_cast<unsigned char>(text[i]) : 0u; };
    auto isTail = [&byte](size_t i) { return (byte(i) & 0xC0) == 0x80; };
    unsigned lead = byte(at);
    if (lead < 0x80)
        return 1;
    if (lead >= 0xC2 && lead <= 0xDF)
        return isTail(at + 1) ? 2 : 0;
    if (lead >= 0xE0 && lead <= 0xEF)
    {
        unsigned low = lead == 0xE0 ? 0xA0 : 0x80;
        unsigned high = lead == 0xED ? 0x9F : 0xBF;
        return byte(at + 1) >= low && byte(at + 1) <= high && isTail(at + 2) ? 3 : 0;
    }
    if (lead >= 0xF0 && lead <= 0xF4)
    {
        unsigned low = lead == 0xF0 ? 0x90 : 0x80;
        unsigned high = lead == 0xF4 ? 0x8F : 0xBF;
        return byte(at + 1) >= low && byte(at + 1) <= high && isTail(at + 2) && isTail(at + 3) ? 4 : 0;
    }
    return 0;
}

}  // namespace

namespace platform
{

std::string JsonString(const std::string& text)
{
    std::string out = "\"";
    for (size_t at = 0; at < text.size();)
    {
        unsigned char c = static_cast<unsigned char>(text[at]);
        size_t length = Utf8Length(text, at);
        if (length == 0)
        {
            out += kReplacement;
            ++at;
            continue;
        }
        if (c == '"' || c == '\\')
            out += {'\\', static_cast<char>(c)};
        else if (c < 0x20)
        {
            char escaped[8];
            snprintf(escaped, sizeof(escaped), "\\u%04x", c);
            out += escaped;
        }
        else
            out.append(text, at, length);
        at += length;
    }
    out.push_back('"');
    return out;
}

std::string JsonObject(const bundle* b)
{
    std::string out = "{";
    for (const auto& item : b->items)
    {
        if (out.size() > 1)
            out.push_back(',');
        out += JsonString(item->key) + ":" + JsonString(item->value);
    }
    out.push_back('}');
    return out;
}

}  // namespace platform

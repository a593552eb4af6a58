#ifndef PLATFORM_VCONF_VCONF_STORE_H
#define PLATFORM_VCONF_VCONF_STORE_H

#include <string>

// The files behind the system keys: <root>/vconf/<key>, the key's slashes
// being folders, holding "<type>\n<value>\n". Internal to the platform
// library and its tools.
namespace platform
{
namespace vconf
{

extern const char* const kLogTag;

struct Value
{
    int type = 0;  // VCONF_TYPE_*; 0 when unset
    int intValue = 0;
    double dblValue = 0.0;
    std::string strValue;
};

// True for "a/b/c": no leading '/', no empty part, no "." or "..".
bool IsValidKey(const char* key);

// "<root>/vconf/<key>"; empty for an invalid key.
std::string KeyPath(const std::string& key);

std::string Encode(const Value& value);

// False for anything but a well-formed typed value.
bool Decode(const std::string& content, Value& value);

// Reads and decodes the key; logs why when it cannot.
bool Read(const char* key, Value& value);

// Writes the key atomically, creating its folders; logs on failure.
bool Write(const char* key, const Value& value);

// Value as text for people ("42", "1", "3.5", the string itself).
std::string ToText(const Value& value);

}  // namespace vconf
}  // namespace platform

#endif

#include "vconf/VconfStore.h"

#include <cerrno>
#include <climits>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <locale>
#include <sstream>

#include "core/PlatformRoot.h"
#include "dlog.h"
#include "vconf.h"

namespace platform
{
namespace vconf
{

const char* const kLogTag = "VCONF";

namespace
{
const size_t kMaxContent = 64 * 1024;

std::string Trim(const std::string& text)
{
    const char* blanks = " \t\r\n";
    size_t begin = text.find_first_not_of(blanks);
    if (begin == std::string::npos)
        return std::string();
    size_t end = text.find_last_not_of(blanks);
    return text.substr(begin, end - begin + 1);
}

bool ParseInt(const std::string& text, int& out)
{
    std::string trimmed = Trim(text);
    if (trimmed.empty())
        return false;
    errno = 0;
    char* end = nullptr;
    long value = strtol(trimmed.c_str(), &end, 10);
    if (errno != 0 || *end != '\0' || value < INT_MIN || value > INT_MAX)
        return false;
    out = static_cast<int>(value);
    return true;
}

bool ParseDouble(const std::string& text, double& out)
{
    std::string trimmed = Trim(text);
    if (trimmed.empty())
        return false;
    // Always the C notation, whatever LC_NUMERIC says.
    std::istringstream in(trimmed);
    in.imbue(std::locale::classic());
    double value = 0.0;
    in >> value;
    if (in.fail() || !in.eof() || !std::isfinite(value))
        return false;
    out = value;
    return true;
}

std::string FormatDouble(double value)
{
    std::ostringstream out;
    out.imbue(std::locale::classic());
    out.precision(17);
    out << value;
    return out.str();
}

const char* TypeWord(int type)
{
    switch (type)
    {
        case VCONF_TYPE_INT:
            return "int";
        case VCONF_TYPE_BOOL:
            return "bool";
        case VCONF_TYPE_DOUBLE:
            return "double";
        case VCONF_TYPE_STRING:
            return "string";
        default:
            return nullptr;
    }
}

int TypeOfWord(const std::string& word)
{
    for (int type : {VCONF_TYPE_INT, VCONF_TYPE_BOOL, VCONF_TYPE_DOUBLE, VCONF_TYPE_STRING})
        if (word == TypeWord(type))
            return type;
    return VCONF_TYPE_NONE;
}
}  // namespace

bool IsValidKey(const char* key)
{
    if (!key || !*key || *key == '/')
        return false;
    std::string text(key);
    size_t start = 0;
    while (true)
    {
        size_t slash = text.find('/', start);
        std::string part = text.substr(start, slash == std::string::npos ? std::string::npos : slash - start);
        if (part.empty() || part == "." || part == "..")
            return false;
        if (slash == std::string::npos)
            return true;
        start = slash + 1;
    }
}

std::string KeyPath(const std::string& key)
{
    if (!IsValidKey(key.c_str()))
        return std::string();
    return RootPath("vconf/" + key);
}

std::string Encode(const Value& value)
{
    const char* word = TypeWord(value.type);
    if (!word)
        return std::string();
    std::string body;
    if (value.type == VCONF_TYPE_STRING)
        body = value.strValue;
    else if (value.type == VCONF_TYPE_DOUBLE)
        body = FormatDouble(value.dblValue);
    else
        body = std::to_string(value.intValue);
    return std::string(word) + "\n" + body + "\n";
}

bool Decode(const std::string& content, Value& value)
{
    size_t newline = content.find('\n');
    if (newline == std::string::npos || content.size() > kMaxContent)
        return false;
    int type = TypeOfWord(Trim(content.substr(0, newline)));
    std::string body = content.substr(newline + 1);
    Value parsed;
    parsed.type = type;
    bool ok = false;
    switch (type)
    {
        case VCONF_TYPE_INT:
            ok = ParseInt(body, parsed.intValue);
            break;
        case VCONF_TYPE_BOOL:
            ok = ParseInt(body, parsed.intValue) && (parsed.intValue == 0 || parsed.intValue == 1);
            break;
        case VCONF_TYPE_DOUBLE:
            ok = ParseDouble(body, parsed.dblValue);
            break;
        case VCONF_TYPE_STRING:
            if (!body.empty() && body.back() == '\n')
                body.pop_back();
            ok = body.find('\0') == std::string::npos;
            parsed.strValue = body;
            break;
        default:
            break;
    }
    if (ok)
        value = parsed;
    return ok;
}

namespace
{
// The key's file, or empty with a log line saying why there is none.
std::string CheckedKeyPath(const char* key)
{
    if (!IsValidKey(key))
    {
        dlog_print(DLOG_ERROR, kLogTag, "invalid key name \"%s\"", key ? key : "(null)");
        return std::string();
    }
    std::string path = KeyPath(key);
    if (path.empty())
        dlog_print(DLOG_ERROR, kLogTag, "key %s: the platform root is refused", key);
    return path;
}
}  // namespace

bool Read(const char* key, Value& value)
{
    std::string path = CheckedKeyPath(key);
    if (path.empty())
        return false;
    std::string content;
    if (!ReadFile(path, content, kMaxContent))
    {
        dlog_print(DLOG_ERROR, kLogTag, "key %s cannot be read (%s)", key, strerror(errno));
        return false;
    }
    if (!Decode(content, value))
    {
        dlog_print(DLOG_ERROR, kLogTag, "key %s holds no valid typed value", key);
        return false;
    }
    return true;
}

bool Write(const char* key, const Value& value)
{
    std::string path = CheckedKeyPath(key);
    if (path.empty())
        return false;
    std::string content = Encode(value);
    Value check;
    // Nothing is stored that readers would refuse.
    if (content.empty() || !Decode(content, check))
    {
        dlog_print(DLOG_ERROR, kLogTag,
                   "key %s: the value would not read back (over %zu bytes or not finite)", key, kMaxContent);
        return false;
    }
    std::string dir = path.substr(0, path.rfind('/'));
    if (!MakeDirs(dir) || !WriteFileAtomic(path, content))
    {
        dlog_print(DLOG_ERROR, kLogTag, "key %s cannot be written (%s)", key, strerror(errno));
        return false;
    }
    return true;
}

std::string ToText(const Value& value)
{
    if (value.type == VCONF_TYPE_STRING)
        return value.strValue;
    if (value.type == VCONF_TYPE_DOUBLE)
        return FormatDouble(value.dblValue);
    return std::to_string(value.intValue);
}

}  // namespace vconf
}  // namespace platform

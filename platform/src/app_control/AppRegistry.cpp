// Registered applications: <root>/apps/<id>/app.conf.
#include "app_control/AppControlInternal.h"

#include <dirent.h>
#include <sys/stat.h>

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <cstring>
#include <sstream>

#include "core/PlatformRoot.h"
#include "dlog.h"

namespace
{

const size_t kMaxConfBytes = 64 * 1024;

std::string Trim(const std::string& text)
{
    size_t begin = text.find_first_not_of(" \t\r");
    if (begin == std::string::npos)
        return std::string();
    size_t end = text.find_last_not_of(" \t\r");
    return text.substr(begin, end - begin + 1);
}

std::vector<std::string> SplitList(const std::string& text)
{
    std::vector<std::string> items;
    std::stringstream stream(text);
    std::string item;
    while (std::getline(stream, item, ','))
    {
        item = Trim(item);
        if (!item.empty())
            items.push_back(item);
    }
    return items;
}

std::string Lower(std::string text)
{
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text;
}

void ParseLine(const std::string& line, platform::AppEntry& entry)
{
    size_t equal = line.find('=');
    if (line.empty() || line[0] == '#' || equal == std::string::npos)
        return;
    std::string key = Trim(line.substr(0, equal));
    std::string value = Trim(line.substr(equal + 1));
    if (key == "exec")
        entry.exec = value;
    else if (key == "view-uri")
        for (const std::string& scheme : SplitList(value)) entry.viewSchemes.push_back(Lower(scheme));
    else if (key == "operation")
        entry.operations = SplitList(value);
}

std::vector<std::string> RegisteredIds()
{
    std::vector<std::string> ids;
    DIR* dir = opendir(platform::RootPath("apps").c_str());
    if (!dir)
        return ids;
    while (dirent* item = readdir(dir))
        if (platform::IsSafeName(item->d_name))
            ids.push_back(item->d_name);
    closedir(dir);
    std::sort(ids.begin(), ids.end());
    return ids;
}

bool Contains(const std::vector<std::string>& items, const std::string& wanted)
{
    return std::find(items.begin(), items.end(), wanted) != items.end();
}

// "http" of "HTTP://example.com"; empty when there is no scheme.
std::string UriScheme(const std::string& uri)
{
    size_t colon = uri.find(':');
    if (colon == std::string::npos || colon == 0)
        return std::string();
    return Lower(uri.substr(0, colon));
}

}  // namespace

namespace platform
{

bool LoadAppEntry(const std::string& appId, AppEntry& entry)
{
    std::string dir = AppDir(appId);
    std::string content;
    if (dir.empty())
        return false;
    // A linked folder or app.conf could hand our launch to another user's program.
    struct stat st;
    if (!IsRealDir(dir))
    {
        if (lstat(dir.c_str(), &st) == 0)
            dlog_print(DLOG_ERROR, kAppControlLogTag, "%s is not a real folder: refused", dir.c_str());
        return false;
    }
    if (!ReadFile(dir + "/app.conf", content, kMaxConfBytes))
    {
        if (errno != ENOENT)
            dlog_print(DLOG_ERROR, kAppControlLogTag, "%s/app.conf refused (%s)", dir.c_str(),
                       strerror(errno));
        return false;
    }
    entry = AppEntry();
    entry.appId = appId;
    std::stringstream stream(content);
    std::string line;
    while (std::getline(stream, line)) ParseLine(Trim(line), entry);
    return !entry.exec.empty();
}

bool FindHandler(const app_control_s& request, AppEntry& entry)
{
    bool view = request.operation == APP_CONTROL_OPERATION_VIEW;
    std::string scheme = UriScheme(request.uri);
    if (view && scheme.empty())
        return false;
    for (const std::string& id : RegisteredIds())
    {
        AppEntry candidate;
        if (!LoadAppEntry(id, candidate))
            continue;
        if ((view && Contains(candidate.viewSchemes, scheme)) ||
            Contains(candidate.operations, request.operation))
        {
            entry = candidate;
            return true;
        }
    }
    return false;
}

}  // namespace platform

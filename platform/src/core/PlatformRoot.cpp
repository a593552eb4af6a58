#include "core/PlatformRoot.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <mutex>
#include <sys/stat.h>
#include <unistd.h>

#include "app_common.h"
#include "tizen_error.h"

namespace
{
thread_local int gLastResult = TIZEN_ERROR_NONE;

std::mutex gOwnIdMutex;
std::string gOwnAppId;
}  // namespace

extern "C" int get_last_result(void)
{
    return gLastResult;
}

extern "C" void set_last_result(int err)
{
    gLastResult = err;
}

extern "C" int app_set_own_id(const char* id)
{
    if (!id || !platform::IsSafeName(id))
        return APP_ERROR_INVALID_PARAMETER;
    std::lock_guard<std::mutex> lock(gOwnIdMutex);
    gOwnAppId = id;
    return APP_ERROR_NONE;
}

namespace platform
{

std::string RootDir()
{
    std::string root;
    const char* env = getenv("PLATFORM_ROOT");
    if (env && *env)
        root = env;
    else if (const char* xdg = getenv("XDG_RUNTIME_DIR"); xdg && *xdg)
        root = std::string(xdg) + "/weather-platform";
    else
        root = "/tmp/weather-platform-" + std::to_string(getuid());
    while (root.size() > 1 && root.back() == '/')
        root.pop_back();
    return root;
}

std::string RootPath(const std::string& relative)
{
    return RootDir() + "/" + relative;
}

bool IsSafeName(const std::string& name)
{
    return !name.empty() && name != "." && name != ".." && name.find('/') == std::string::npos;
}

std::string AppDir(const std::string& appId)
{
    if (!IsSafeName(appId))
        return std::string();
    return RootPath("apps/" + appId);
}

std::string OwnAppId()
{
    {
        std::lock_guard<std::mutex> lock(gOwnIdMutex);
        if (!gOwnAppId.empty())
            return gOwnAppId;
    }
    const char* env = getenv("PLATFORM_APP_ID");
    if (env && IsSafeName(env))
        return env;
    return std::string();
}

bool MakeDirs(const std::string& path)
{
    if (path.empty())
        return false;
    std::string partial;
    size_t pos = 0;
    while (pos != std::string::npos)
    {
        pos = path.find('/', pos + 1);
        partial = path.substr(0, pos);
        if (partial.empty())
            continue;
        if (mkdir(partial.c_str(), 0755) != 0 && errno != EEXIST)
            return false;
    }
    struct stat st;
    return stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

bool ReadFile(const std::string& path, std::string& content)
{
    int fd = open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (fd < 0)
        return false;
    content.clear();
    char buffer[4096];
    ssize_t n;
    while ((n = read(fd, buffer, sizeof(buffer))) > 0)
        content.append(buffer, static_cast<size_t>(n));
    close(fd);
    return n == 0;
}

bool WriteFileAtomic(const std::string& path, const std::string& content, int mode)
{
    size_t slash = path.rfind('/');
    std::string dir = slash == std::string::npos ? "." : path.substr(0, slash);
    std::string temp = dir + "/.tmp." + std::to_string(getpid()) + "." +
                       (slash == std::string::npos ? path : path.substr(slash + 1)) + ".XXXXXX";
    int fd = mkstemp(&temp[0]);
    if (fd < 0)
        return false;
    bool ok = fchmod(fd, static_cast<mode_t>(mode)) == 0;
    size_t written = 0;
    while (ok && written < content.size())
    {
        ssize_t n = write(fd, content.data() + written, content.size() - written);
        if (n < 0 && errno == EINTR)
            continue;
        ok = n > 0;
        if (ok)
            written += static_cast<size_t>(n);
    }
    ok = close(fd) == 0 && ok;
    if (ok)
        ok = rename(temp.c_str(), path.c_str()) == 0;
    if (!ok)
        unlink(temp.c_str());
    return ok;
}

char* CopyString(const std::string& text)
{
    char* copy = strdup(text.c_str());
    set_last_result(copy ? TIZEN_ERROR_NONE : TIZEN_ERROR_OUT_OF_MEMORY);
    return copy;
}

}  // namespace platform

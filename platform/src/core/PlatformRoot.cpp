#include "core/PlatformRoot.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <mutex>
#include <sys/stat.h>
#include <unistd.h>

#include "app_common.h"
#include "core/ApiGuard.h"
#include "tizen_error.h"

namespace
{
thread_local int gLastResult = TIZEN_ERROR_NONE;

std::mutex gOwnIdMutex;
std::string gOwnAppId;

std::mutex gReportMutex;
std::string gLastRefusal;

// Not through dlog: its file lives under the root that was just refused.
void ReportRefusedRoot(const std::string& why)
{
    std::lock_guard<std::mutex> lock(gReportMutex);
    if (why == gLastRefusal)
        return;
    gLastRefusal = why;
    fprintf(stderr, "platform: %s\n", why.c_str());
}

std::string Octal(mode_t mode)
{
    char text[8];
    snprintf(text, sizeof(text), "%04o", static_cast<unsigned>(mode & 07777));
    return text;
}

int SetOwnId(const char* id)
{
    if (!id || !platform::IsSafeName(id))
        return APP_ERROR_INVALID_PARAMETER;
    std::lock_guard<std::mutex> lock(gOwnIdMutex);
    gOwnAppId = id;
    return APP_ERROR_NONE;
}

bool CheckRootAt(const std::string& root, std::string& why)
{
    const std::string refused = "the platform root " + root + " is refused: ";
    struct stat st;
    if (lstat(root.c_str(), &st) != 0 && errno == ENOENT)
    {
        size_t slash = root.rfind('/');
        if (slash != std::string::npos && slash > 0)
            platform::MakeDirs(root.substr(0, slash));
        if (mkdir(root.c_str(), 0700) != 0 && errno != EEXIST)
        {
            why = refused + "it cannot be created (" + strerror(errno) + ")";
            return false;
        }
    }
    // Checked after creating: someone may have made it first.
    if (lstat(root.c_str(), &st) != 0)
        why = refused + strerror(errno);
    else if (S_ISLNK(st.st_mode))
        why = refused + "it is a symbolic link";
    else if (!S_ISDIR(st.st_mode))
        why = refused + "it is not a folder";
    else if (st.st_uid != geteuid())
        why =
            refused + "it belongs to uid " + std::to_string(st.st_uid) + ", not " + std::to_string(geteuid());
    else if (st.st_mode & (S_IWGRP | S_IWOTH))
        why = refused + "others can write to it (mode " + Octal(st.st_mode) + ")";
    else
        return true;
    return false;
}
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
    return platform::GuardedCall("APP", APP_ERROR_OUT_OF_MEMORY, [id] { return SetOwnId(id); });
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
    while (root.size() > 1 && root.back() == '/') root.pop_back();
    return root;
}

bool CheckRoot(std::string& why)
{
    return CheckRootAt(RootDir(), why);
}

std::string RootPath(const std::string& relative)
{
    std::string root = RootDir();
    std::string why;
    if (!CheckRootAt(root, why))
    {
        ReportRefusedRoot(why);
        return std::string();
    }
    return root + "/" + relative;
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
        if (mkdir(partial.c_str(), 0700) != 0 && errno != EEXIST)
            return false;
    }
    struct stat st;
    return stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

bool IsRealDir(const std::string& path)
{
    struct stat st;
    return !path.empty() && lstat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

bool ReadFile(const std::string& path, std::string& content, size_t limit, bool followLink)
{
    int flags = O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY | (followLink ? 0 : O_NOFOLLOW);
    int fd = open(path.c_str(), flags);
    if (fd < 0)
        return false;
    struct stat st;
    int error = fstat(fd, &st) != 0 ? errno : S_ISDIR(st.st_mode) ? EISDIR : S_ISREG(st.st_mode) ? 0 : EINVAL;
    if (error != 0)
    {
        close(fd);
        errno = error;
        return false;
    }
    content.clear();
    char buffer[4096];
    ssize_t n = 0;
    // One byte past the limit tells a file that is too large.
    while (content.size() <= limit)
    {
        size_t want = std::min(sizeof(buffer), limit + 1 - content.size());
        n = read(fd, buffer, want);
        if (n < 0 && errno == EINTR)
            continue;
        if (n <= 0)
            break;
        content.append(buffer, static_cast<size_t>(n));
    }
    error = n < 0 ? errno : 0;
    close(fd);
    if (content.size() > limit)
        error = EFBIG;
    errno = error;
    return error == 0;
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

int OpenPrivateAppend(const std::string& path)
{
    int fd = open(path.c_str(),
                  O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC | O_NOFOLLOW | O_NONBLOCK | O_NOCTTY, 0600);
    if (fd < 0)
        return -1;
    struct stat st;
    int error = 0;
    if (fstat(fd, &st) != 0)
        error = errno;
    else if (!S_ISREG(st.st_mode))
        error = EINVAL;
    else if (st.st_uid != geteuid())
        error = EPERM;
    else if ((st.st_mode & 077) != 0 && fchmod(fd, 0600) != 0)
        error = errno;
    if (error != 0)
    {
        close(fd);
        errno = error;
        return -1;
    }
    return fd;
}

char* CopyString(const std::string& text)
{
    char* copy = strdup(text.c_str());
    set_last_result(copy ? TIZEN_ERROR_NONE : TIZEN_ERROR_OUT_OF_MEMORY);
    return copy;
}

}  // namespace platform

#include "dlog.h"

#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <mutex>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

#include "core/PlatformRoot.h"

namespace
{

std::mutex gMutex;
dlog_capture_cb gCaptureCb = nullptr;
void* gCaptureData = nullptr;
// The log file stays open while the root stays the same.
std::string gOpenPath;
int gFd = -1;

char PriorityLetter(log_priority prio)
{
    static const char kLetters[] = "??VDIWEFS";
    return prio >= DLOG_UNKNOWN && prio < DLOG_PRIO_MAX ? kLetters[prio] : '?';
}

// One old file is kept beside the current one, so the log stays bounded.
const off_t kRotateBytes = 2 * 1024 * 1024;

// Our own regular file only: never a planted link, FIFO or device.
int OpenLogFile(const std::string& path)
{
    int fd = open(path.c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC | O_NOFOLLOW | O_NONBLOCK, 0600);
    struct stat info;
    if (fd >= 0 && (fstat(fd, &info) != 0 || !S_ISREG(info.st_mode) || info.st_uid != geteuid()))
    {
        close(fd);
        return -1;
    }
    // A file left by an older build may still be readable by others.
    if (fd >= 0 && (info.st_mode & 077) != 0)
        fchmod(fd, 0600);
    return fd;
}

void CloseLog()
{
    if (gFd >= 0)
        close(gFd);
    gFd = -1;
    gOpenPath.clear();
}

int LogFd()
{
    std::string path = platform::RootPath("log/dlog.log");
    if (gFd >= 0 && path == gOpenPath)
        return gFd;
    CloseLog();
    if (platform::MakeDirs(platform::RootPath("log")))
        gFd = OpenLogFile(path);
    if (gFd >= 0)
        gOpenPath = path;
    return gFd;
}

// Once the file is full it becomes dlog.log.1. Another process may have
// moved it already; then only the new file is opened.
void RotateIfFull()
{
    struct stat open;
    struct stat named;
    if (gFd < 0 || fstat(gFd, &open) != 0 || open.st_size < kRotateBytes)
        return;
    std::string path = gOpenPath;
    if (lstat(path.c_str(), &named) == 0 && named.st_ino == open.st_ino && named.st_dev == open.st_dev)
        rename(path.c_str(), (path + ".1").c_str());
    CloseLog();
    gFd = OpenLogFile(path);
    if (gFd >= 0)
        gOpenPath = path;
}

void WriteAll(int fd, const std::string& line)
{
    size_t done = 0;
    while (done < line.size())
    {
        ssize_t n = write(fd, line.data() + done, line.size() - done);
        if (n <= 0)
            return;
        done += static_cast<size_t>(n);
    }
}

}  // namespace

extern "C" int dlog_vprint(log_priority prio, const char* tag, const char* fmt, va_list ap)
{
    if (!tag || !fmt || prio <= DLOG_DEFAULT || prio >= DLOG_PRIO_MAX)
        return DLOG_ERROR_INVALID_PARAMETER;
    if (prio == DLOG_SILENT)
        return 0;

    char stackBuffer[1024];
    va_list copy;
    va_copy(copy, ap);
    int length = vsnprintf(stackBuffer, sizeof(stackBuffer), fmt, copy);
    va_end(copy);
    if (length < 0)
        return DLOG_ERROR_INVALID_PARAMETER;
    std::string text;
    if (static_cast<size_t>(length) < sizeof(stackBuffer))
        text.assign(stackBuffer, static_cast<size_t>(length));
    else
    {
        text.resize(static_cast<size_t>(length) + 1);
        vsnprintf(&text[0], text.size(), fmt, ap);
        text.resize(static_cast<size_t>(length));
    }

    std::string line;
    line.reserve(text.size() + 32);
    line += PriorityLetter(prio);
    line += '/';
    line += tag;
    line += '(' + std::to_string(getpid()) + "): ";
    line += text;
    if (line.back() != '\n')
        line += '\n';

    std::lock_guard<std::mutex> lock(gMutex);
    int fd = LogFd();
    if (fd >= 0)
    {
        WriteAll(fd, line);
        RotateIfFull();
    }
    const char* toStderr = getenv("DLOG_STDERR");
    if (toStderr && toStderr[0] == '1')
        WriteAll(STDERR_FILENO, line);
    if (gCaptureCb)
        gCaptureCb(prio, tag, text.c_str(), gCaptureData);
    return length;
}

extern "C" int dlog_print(log_priority prio, const char* tag, const char* fmt, ...)
{
    va_list ap;
    va_start(ap, fmt);
    int result = dlog_vprint(prio, tag, fmt, ap);
    va_end(ap);
    return result;
}

extern "C" void dlog_set_capture(dlog_capture_cb cb, void* userData)
{
    std::lock_guard<std::mutex> lock(gMutex);
    gCaptureCb = cb;
    gCaptureData = userData;
}

#include "dlog.h"

#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <mutex>
#include <string>
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

int LogFd()
{
    std::string path = platform::RootPath("log/dlog.log");
    if (gFd >= 0 && path == gOpenPath)
        return gFd;
    if (gFd >= 0)
        close(gFd);
    gFd = -1;
    if (platform::MakeDirs(platform::RootPath("log")))
        gFd = open(path.c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0644);
    gOpenPath = gFd >= 0 ? path : std::string();
    return gFd;
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
        WriteAll(fd, line);
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

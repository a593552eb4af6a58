// Sending a launch request: find the target, start it, log the launch.
#include "app_control.h"

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <ctime>

#include "app_control/AppControlInternal.h"
#include "app_control_launch.h"
#include "core/ApiGuard.h"
#include "core/JsonText.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

extern char** environ;

namespace
{

using platform::kAppControlLogTag;

std::vector<std::string> LaunchEnvironment(const std::string& appId, const std::string& encoded)
{
    const std::string overridden[] = {
        "PLATFORM_ROOT=", "PLATFORM_APP_ID=", std::string(APP_CONTROL_LAUNCH_REQUEST_ENV) + "="};
    std::vector<std::string> env;
    for (char** item = environ; item && *item; ++item)
    {
        bool skip = false;
        for (const std::string& prefix : overridden)
            skip = skip || strncmp(*item, prefix.c_str(), prefix.size()) == 0;
        if (!skip)
            env.push_back(*item);
    }
    env.push_back(overridden[0] + platform::RootDir());
    env.push_back(overridden[1] + appId);
    env.push_back(overridden[2] + encoded);
    return env;
}

// Runs in the forked child: only async-signal-safe calls from here on.
[[noreturn]] void RunDetached(char* const* argv, char* const* envp, int errorFd)
{
    setsid();
    pid_t grandchild = fork();
    if (grandchild != 0)
        _exit(grandchild < 0 ? 1 : 0);
    int devNull = open("/dev/null", O_RDONLY);
    if (devNull >= 0)
        dup2(devNull, STDIN_FILENO);
    execve(argv[0], argv, envp);
    int error = errno;
    ssize_t ignored = write(errorFd, &error, sizeof(error));
    (void)ignored;
    _exit(127);
}

// True when the detached program reached exec; the pipe closes on exec.
bool WaitForExec(pid_t child, int readFd)
{
    int error = 0;
    ssize_t n;
    do n = read(readFd, &error, sizeof(error));
    while (n < 0 && errno == EINTR);
    int status = 0;
    while (waitpid(child, &status, 0) < 0 && errno == EINTR)
    {
    }
    bool childOk = WIFEXITED(status) && WEXITSTATUS(status) == 0;
    return childOk && n == 0;
}

void AppendLaunchLog(const platform::AppEntry& entry, const app_control_s& request)
{
    using platform::JsonString;
    std::string line =
        "{\"time\":" + std::to_string(time(nullptr)) + ",\"caller\":" + JsonString(platform::OwnAppId()) +
        ",\"app_id\":" + JsonString(entry.appId) + ",\"operation\":" + JsonString(request.operation) +
        ",\"uri\":" + JsonString(request.uri) + ",\"extra\":" + platform::JsonObject(&request.extra) + "}\n";
    std::string dir = platform::RootPath("log");
    int fd = platform::MakeDirs(dir) ? platform::OpenPrivateAppend(dir + "/launch.log") : -1;
    // One write, so that lines of several processes never interleave.
    if (fd < 0 || write(fd, line.data(), line.size()) != static_cast<ssize_t>(line.size()))
        dlog_print(DLOG_ERROR, kAppControlLogTag, "cannot write the launch log (errno %d)", errno);
    if (fd >= 0)
        close(fd);
}

int ResolveTarget(const app_control_s& request, platform::AppEntry& entry)
{
    if (request.hasAppId && !request.appId.empty())
    {
        if (platform::LoadAppEntry(request.appId, entry))
            return APP_CONTROL_ERROR_NONE;
        dlog_print(DLOG_ERROR, kAppControlLogTag, "application %s is not registered", request.appId.c_str());
        return APP_CONTROL_ERROR_APP_NOT_FOUND;
    }
    if (!request.hasOperation || request.operation.empty() ||
        request.operation == APP_CONTROL_OPERATION_DEFAULT)
    {
        dlog_print(DLOG_ERROR, kAppControlLogTag, "launch request without application id or operation");
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    }
    if (platform::FindHandler(request, entry))
        return APP_CONTROL_ERROR_NONE;
    dlog_print(DLOG_ERROR, kAppControlLogTag, "no application handles %s (uri \"%s\")",
               request.operation.c_str(), request.uri.c_str());
    return APP_CONTROL_ERROR_APP_NOT_FOUND;
}

}  // namespace

namespace platform
{

int SpawnApp(const AppEntry& entry, const std::string& encodedRequest)
{
    if (access(entry.exec.c_str(), X_OK) != 0)
        return APP_CONTROL_ERROR_LAUNCH_FAILED;
    std::vector<std::string> env = LaunchEnvironment(entry.appId, encodedRequest);
    std::vector<char*> envp;
    for (std::string& item : env) envp.push_back(&item[0]);
    envp.push_back(nullptr);
    std::string program = entry.exec;
    char* argv[] = {&program[0], nullptr};
    int pipeFds[2];
    if (pipe2(pipeFds, O_CLOEXEC) != 0)
        return APP_CONTROL_ERROR_IO_ERROR;
    pid_t child = fork();
    if (child == 0)
    {
        close(pipeFds[0]);
        RunDetached(argv, envp.data(), pipeFds[1]);
    }
    close(pipeFds[1]);
    bool started = child > 0 && WaitForExec(child, pipeFds[0]);
    close(pipeFds[0]);
    return started ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_LAUNCH_FAILED;
}

}  // namespace platform

namespace
{

int SendLaunchRequest(app_control_h appControl)
{
    if (!appControl)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    platform::AppEntry entry;
    int result = ResolveTarget(*appControl, entry);
    if (result != APP_CONTROL_ERROR_NONE)
        return result;
    bundle* b = platform::AppControlToBundle(*appControl, platform::OwnAppId());
    if (!b)
        return APP_CONTROL_ERROR_OUT_OF_MEMORY;
    std::string encoded = platform::Base64Encode(platform::BundleToBinary(b));
    bundle_free(b);
    result = platform::SpawnApp(entry, encoded);
    if (result != APP_CONTROL_ERROR_NONE)
    {
        dlog_print(DLOG_ERROR, kAppControlLogTag, "cannot start %s (%s): %d", entry.appId.c_str(),
                   entry.exec.c_str(), result);
        return result;
    }
    AppendLaunchLog(entry, *appControl);
    return APP_CONTROL_ERROR_NONE;
}

}  // namespace

extern "C" int app_control_send_launch_request(app_control_h appControl, app_control_reply_cb, void*)
{
    return platform::GuardedCall(kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return SendLaunchRequest(appControl); });
}

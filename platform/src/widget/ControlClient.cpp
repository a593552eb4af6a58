#include "widget/ControlClient.h"

#include <cerrno>
#include <chrono>
#include <cstring>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include "core/PlatformRoot.h"
#include "core/UnixSocket.h"

namespace platform
{

namespace
{
double Now()
{
    using namespace std::chrono;
    return duration<double>(steady_clock::now().time_since_epoch()).count();
}
}  // namespace

ControlClient::~ControlClient()
{
    Disconnect();
}

std::string ControlClient::SocketPath(const std::string& widgetId)
{
    return RootPath("run/widget/" + widgetId + ".ctl");
}

bool ControlClient::Connect(const std::string& socketPath)
{
    Disconnect();
    mFd = ConnectUnixSocket(socketPath, SOCK_STREAM);
    return mFd >= 0;
}

void ControlClient::Disconnect()
{
    if (mFd >= 0)
        close(mFd);
    mFd = -1;
    mBuffer.clear();
}

bool ControlClient::ReadLine(std::string& line, double deadline)
{
    while (true)
    {
        size_t end = mBuffer.find('\n');
        if (end != std::string::npos)
        {
            line = mBuffer.substr(0, end);
            mBuffer.erase(0, end + 1);
            return true;
        }
        double left = deadline - Now();
        if (left <= 0)
            return false;
        pollfd waitFor = {mFd, POLLIN, 0};
        int ready = poll(&waitFor, 1, static_cast<int>(left * 1000) + 1);
        if (ready < 0 && errno == EINTR)
            continue;
        if (ready <= 0)
            return false;
        char chunk[4096];
        ssize_t got = read(mFd, chunk, sizeof(chunk));
        if (got <= 0)
            return false;
        mBuffer.append(chunk, static_cast<size_t>(got));
    }
}

// All of `commands` in one send: a host reads them together and handles
// them one after the other before its loop turns again.
bool ControlClient::SendCommands(const std::vector<std::string>& commands)
{
    std::string lines;
    for (const std::string& command : commands)
    {
        if (command.find('\n') != std::string::npos)
            return false;
        lines += command + "\n";
    }
    return mFd >= 0 &&
           send(mFd, lines.data(), lines.size(), MSG_NOSIGNAL) == static_cast<ssize_t>(lines.size());
}

bool ControlClient::RequestTogether(const std::vector<std::string>& commands,
                                    std::vector<std::string>& replies, double timeoutSeconds)
{
    replies.clear();
    if (!SendCommands(commands))
        return false;
    double deadline = Now() + timeoutSeconds;
    std::string reply;
    while (replies.size() < commands.size() && ReadLine(reply, deadline)) replies.push_back(reply);
    return replies.size() == commands.size();
}

bool ControlClient::Request(const std::string& command, std::string& reply, double timeoutSeconds)
{
    reply.clear();
    if (!SendCommands({command}))
        return false;
    double deadline = Now() + timeoutSeconds;
    if (!ReadLine(reply, deadline))
        return false;
    bool isList = command.compare(0, 4, "list") == 0 && (command.size() == 4 || isspace(command[4]));
    if (!isList || reply.compare(0, 3, "OK ") != 0)
        return true;
    long count = strtol(reply.c_str() + 3, nullptr, 10);
    for (long i = 0; i < count; ++i)
    {
        std::string entry;
        if (!ReadLine(entry, deadline))
            return false;
        reply += "\n" + entry;
    }
    return true;
}

}  // namespace platform

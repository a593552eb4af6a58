#include "widget/ControlServer.h"

#include <cerrno>
#include <cstring>
#include <sys/socket.h>
#include <unistd.h>

#include "core/PlatformRoot.h"
#include "core/UnixSocket.h"
#include "dlog.h"
#include "widget_errno.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";

// A socket address can hold it and its folder exists (or has been made).
bool IsUsablePath(const std::string& path)
{
    sockaddr_un address;
    size_t slash = path.rfind('/');
    return MakeUnixAddress(path, address) && slash != std::string::npos && MakeDirs(path.substr(0, slash));
}

void WriteAll(int fd, const std::string& text)
{
    size_t done = 0;
    while (done < text.size())
    {
        ssize_t written = send(fd, text.data() + done, text.size() - done, MSG_NOSIGNAL);
        if (written < 0 && errno == EINTR)
            continue;
        if (written <= 0)
            return;
        done += static_cast<size_t>(written);
    }
}
}  // namespace

ControlServer::ControlServer(CommandCb handler) : mHandler(std::move(handler)) {}

ControlServer::~ControlServer()
{
    *mAlive = false;
    Stop();
}

int ControlServer::Start(const std::string& path)
{
    if (!IsUsablePath(path))
    {
        dlog_print(DLOG_ERROR, kLogTag, "control socket path %s is unusable", path.c_str());
        return WIDGET_ERROR_IO_ERROR;
    }
    // Only the owner may drive the widget.
    UnixBindResult result = BindUnixSocket(path, SOCK_STREAM, 0600, mListenFd);
    if (result == UnixBindResult::IN_USE)
    {
        dlog_print(DLOG_ERROR, kLogTag, "another host already answers on %s", path.c_str());
        return WIDGET_ERROR_ALREADY_STARTED;
    }
    if (result != UnixBindResult::BOUND || listen(mListenFd, 16) != 0)
    {
        dlog_print(DLOG_ERROR, kLogTag, "control socket %s: %s", path.c_str(), strerror(errno));
        Stop();
        return WIDGET_ERROR_IO_ERROR;
    }
    mPath = path;
    mListenHandler = ecore_main_fd_handler_add(mListenFd, ECORE_FD_READ, AcceptCb, this, nullptr, nullptr);
    return WIDGET_ERROR_NONE;
}

void ControlServer::Stop()
{
    while (!mClients.empty())
        Close(mClients.begin()->first);
    if (mListenHandler)
        ecore_main_fd_handler_del(mListenHandler);
    mListenHandler = nullptr;
    if (mListenFd >= 0)
        close(mListenFd);
    mListenFd = -1;
    if (!mPath.empty())
        unlink(mPath.c_str());
    mPath.clear();
}

Eina_Bool ControlServer::AcceptCb(void* data, Ecore_Fd_Handler*)
{
    if (!data)
        return ECORE_CALLBACK_RENEW;
    try
    {
        static_cast<ControlServer*>(data)->Accept();
    }
    catch (...)
    {
        dlog_print(DLOG_ERROR, kLogTag, "accept failed with an exception");
    }
    return ECORE_CALLBACK_RENEW;
}

void ControlServer::Accept()
{
    int fd = accept4(mListenFd, nullptr, nullptr, SOCK_CLOEXEC);
    if (fd < 0)
        return;
    auto client = std::make_unique<Client>();
    client->server = this;
    client->id = mNextClientId++;
    client->fd = fd;
    client->handler = ecore_main_fd_handler_add(fd, ECORE_FD_READ, ClientCb, client.get(), nullptr, nullptr);
    mClients[client->id] = std::move(client);
}

Eina_Bool ControlServer::ClientCb(void* data, Ecore_Fd_Handler*)
{
    auto* client = static_cast<Client*>(data);
    if (!client || !client->server)
        return ECORE_CALLBACK_RENEW;
    try
    {
        client->server->Read(client->id);
    }
    catch (...)
    {
        dlog_print(DLOG_ERROR, kLogTag, "control client failed with an exception");
    }
    return ECORE_CALLBACK_RENEW;
}

ControlServer::Client* ControlServer::Find(unsigned clientId)
{
    auto found = mClients.find(clientId);
    return found == mClients.end() ? nullptr : found->second.get();
}

void ControlServer::Read(unsigned clientId)
{
    Client* client = Find(clientId);
    if (!client)
        return;
    char buffer[4096];
    ssize_t got = read(client->fd, buffer, sizeof(buffer));
    if (got < 0 && (errno == EINTR || errno == EAGAIN))
        return;
    if (got <= 0)
    {
        // The client has said all it will; answer what is buffered, then close.
        client->isAtEnd = true;
        ecore_main_fd_handler_del(client->handler);
        client->handler = nullptr;
    }
    else
        client->input.append(buffer, static_cast<size_t>(got));
    ProcessLines(clientId);
}

void ControlServer::ProcessLines(unsigned clientId)
{
    Client* client = Find(clientId);
    while (client && !client->isBusy)
    {
        size_t end = client->input.find('\n');
        if (end == std::string::npos)
        {
            if (client->input.size() > kMaxLineLength)
            {
                WriteAll(client->fd, "ERR line too long\n");
                Close(clientId);
            }
            else if (client->isAtEnd)
                Close(clientId);
            return;
        }
        std::string line = client->input.substr(0, end);
        client->input.erase(0, end + 1);
        if (!line.empty() && line.back() == '\r')
            line.pop_back();
        client->isBusy = true;
        client->isDispatching = true;
        std::weak_ptr<bool> alive = mAlive;
        mHandler(line, [this, alive, clientId](const std::string& reply) {
            if (auto token = alive.lock(); token && *token)
                Reply(clientId, reply);
        });
        client = Find(clientId);
        if (client)
            client->isDispatching = false;
    }
}

void ControlServer::Reply(unsigned clientId, const std::string& reply)
{
    Client* client = Find(clientId);
    if (!client || !client->isBusy)
        return;
    WriteAll(client->fd, reply.empty() || reply.back() != '\n' ? reply + "\n" : reply);
    client->isBusy = false;
    if (!client->isDispatching)
        ProcessLines(clientId);
}

void ControlServer::Close(unsigned clientId)
{
    Client* client = Find(clientId);
    if (!client)
        return;
    if (client->handler)
        ecore_main_fd_handler_del(client->handler);
    close(client->fd);
    mClients.erase(clientId);
}

}  // namespace platform

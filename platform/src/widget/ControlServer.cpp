#include "widget/ControlServer.h"

#include <cerrno>
#include <cstring>
#include <sys/socket.h>
#include <unistd.h>

#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "core/UnixSocket.h"
#include "widget_errno.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";
const size_t kReadChunk = 16384;
// Out of descriptors: connections wait in the backlog instead of waking the
// loop over and over.
const double kAcceptPauseSeconds = 0.2;

// A socket address can hold it and its folder exists (or has been made).
bool IsUsablePath(const std::string& path)
{
    sockaddr_un address;
    size_t slash = path.rfind('/');
    return MakeUnixAddress(path, address) && slash != std::string::npos && MakeDirs(path.substr(0, slash));
}

bool IsOutOfDescriptors(int error)
{
    return error == EMFILE || error == ENFILE || error == ENOBUFS || error == ENOMEM;
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
    if (result != UnixBindResult::BOUND || listen(mListenFd, kBacklog) != 0)
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
    while (!mClients.empty()) Close(mClients.begin()->first);
    if (mAcceptPauseTimer)
        ecore_timer_del(mAcceptPauseTimer);
    mAcceptPauseTimer = nullptr;
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
    NSWeather::ForwardCallback<ControlServer>(
        data, [](ControlServer& server) { server.Accept(); }, PLATFORM_CALLBACK_SITE(kLogTag));
    return ECORE_CALLBACK_RENEW;
}

void ControlServer::Accept()
{
    int fd = accept4(mListenFd, nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK);
    if (fd < 0)
    {
        if (IsOutOfDescriptors(errno))
        {
            mLimitLog.Log(std::string("cannot accept a control client: ") + strerror(errno));
            PauseAccept();
        }
        return;
    }
    if (mClients.size() >= kMaxClients)
    {
        static const char kRefusal[] = "ERR too many clients\n";
        send(fd, kRefusal, sizeof(kRefusal) - 1, MSG_NOSIGNAL | MSG_DONTWAIT);
        close(fd);
        mLimitLog.Log("refused a control client: " + std::to_string(kMaxClients) + " are connected");
        return;
    }
    auto client = std::make_unique<Client>();
    client->server = this;
    client->id = mNextClientId++;
    client->fd = fd;
    client->handler = ecore_main_fd_handler_add(fd, ECORE_FD_READ, ClientCb, client.get(), nullptr, nullptr);
    if (!client->handler)
    {
        close(fd);
        return;
    }
    mClients[client->id] = std::move(client);
}

void ControlServer::PauseAccept()
{
    if (mAcceptPauseTimer || !mListenHandler)
        return;
    ecore_main_fd_handler_del(mListenHandler);
    mListenHandler = nullptr;
    mAcceptPauseTimer = ecore_timer_add(kAcceptPauseSeconds, ResumeAcceptCb, this);
}

Eina_Bool ControlServer::ResumeAcceptCb(void* data)
{
    NSWeather::ForwardCallback<ControlServer>(
        data, [](ControlServer& server) { server.ResumeAccept(); }, PLATFORM_CALLBACK_SITE(kLogTag));
    return ECORE_CALLBACK_CANCEL;
}

void ControlServer::ResumeAccept()
{
    mAcceptPauseTimer = nullptr;
    if (mListenFd >= 0 && !mListenHandler)
        mListenHandler =
            ecore_main_fd_handler_add(mListenFd, ECORE_FD_READ, AcceptCb, this, nullptr, nullptr);
}

Eina_Bool ControlServer::ClientCb(void* data, Ecore_Fd_Handler* handler)
{
    NSWeather::ForwardCallback<Client>(
        data,
        [handler](Client& client)
        {
            bool isReadable = ecore_main_fd_handler_active_get(handler, ECORE_FD_READ);
            bool isWritable = ecore_main_fd_handler_active_get(handler, ECORE_FD_WRITE);
            client.server->OnClientReady(client.id, isReadable, isWritable);
        },
        PLATFORM_CALLBACK_SITE(kLogTag));
    return ECORE_CALLBACK_RENEW;
}

ControlServer::Client* ControlServer::Find(unsigned clientId)
{
    auto found = mClients.find(clientId);
    return found == mClients.end() ? nullptr : found->second.get();
}

void ControlServer::OnClientReady(unsigned clientId, bool isReadable, bool isWritable)
{
    if (isWritable && !Flush(clientId))
        return;
    if (isReadable)
        Read(clientId);
    else
        ProcessLines(clientId);
}

void ControlServer::Read(unsigned clientId)
{
    Client* client = Find(clientId);
    if (!client || client->isBusy || !client->output.empty() || client->isAtEnd)
        return;
    char buffer[kReadChunk];
    ssize_t got = read(client->fd, buffer, sizeof(buffer));
    if (got < 0 && (errno == EINTR || errno == EAGAIN || errno == EWOULDBLOCK))
        return;
    // The client has said all it will; answer what is buffered, then close.
    if (got <= 0)
        client->isAtEnd = true;
    else
        client->input.append(buffer, static_cast<size_t>(got));
    ProcessLines(clientId);
}

// Reads stop while a reply is pending or unsent, so a client's input is at
// most one line and one read beyond it.
void ControlServer::ProcessLines(unsigned clientId)
{
    Client* client = Find(clientId);
    while (client && !client->isBusy && client->output.empty())
    {
        size_t end = client->input.find('\n');
        if (end == std::string::npos)
        {
            if (client->input.size() > kMaxLineLength)
                Drop(clientId, "line too long");
            else if (client->isAtEnd)
                Close(clientId);
            else
                UpdateInterest(*client);
            return;
        }
        std::string line = client->input.substr(0, end);
        client->input.erase(0, end + 1);
        if (!line.empty() && line.back() == '\r')
            line.pop_back();
        client->isBusy = true;
        client->isDispatching = true;
        std::weak_ptr<bool> alive = mAlive;
        mHandler(line,
                 [this, alive, clientId](const std::string& reply)
                 {
                     if (auto token = alive.lock(); token && *token)
                         Reply(clientId, reply);
                 });
        client = Find(clientId);
        if (client)
            client->isDispatching = false;
    }
    if (client)
        UpdateInterest(*client);
}

void ControlServer::Reply(unsigned clientId, const std::string& reply)
{
    Client* client = Find(clientId);
    if (!client || !client->isBusy)
        return;
    client->isBusy = false;
    client->output += reply;
    if (reply.empty() || reply.back() != '\n')
        client->output += '\n';
    if (!Flush(clientId))
        return;
    if (client->output.size() > kMaxPendingOutput)
        Drop(clientId, "reply too large for a client that does not read");
    else if (!client->isDispatching)
        ProcessLines(clientId);
}

bool ControlServer::Flush(unsigned clientId)
{
    Client* client = Find(clientId);
    if (!client)
        return false;
    while (!client->output.empty())
    {
        ssize_t sent =
            send(client->fd, client->output.data(), client->output.size(), MSG_NOSIGNAL | MSG_DONTWAIT);
        if (sent > 0)
            client->output.erase(0, static_cast<size_t>(sent));
        else if (sent < 0 && errno == EINTR)
            continue;
        else if (sent < 0 && (errno == EAGAIN || errno == EWOULDBLOCK))
            break;
        else
        {
            Close(clientId);
            return false;
        }
    }
    UpdateInterest(*client);
    return true;
}

// Waits for the socket to take output, or for the next command once the
// last reply is out; for nothing while a reply is pending (a handler that
// waited for nothing would still wake on a hang-up, again and again).
void ControlServer::UpdateInterest(Client& client)
{
    int flags = 0;
    if (!client.output.empty())
        flags = ECORE_FD_WRITE;
    else if (!client.isBusy && !client.isAtEnd)
        flags = ECORE_FD_READ;
    if (flags == 0)
    {
        if (client.handler)
            ecore_main_fd_handler_del(client.handler);
        client.handler = nullptr;
    }
    else if (client.handler)
        ecore_main_fd_handler_active_set(client.handler, static_cast<Ecore_Fd_Handler_Flags>(flags));
    else
        client.handler = ecore_main_fd_handler_add(client.fd, static_cast<Ecore_Fd_Handler_Flags>(flags),
                                                   ClientCb, &client, nullptr, nullptr);
}

void ControlServer::Drop(unsigned clientId, const std::string& why)
{
    Client* client = Find(clientId);
    if (!client)
        return;
    mLimitLog.Log("control client " + std::to_string(clientId) + " disconnected: " + why);
    std::string notice = "ERR " + why + "\n";
    send(client->fd, notice.data(), notice.size(), MSG_NOSIGNAL | MSG_DONTWAIT);
    Close(clientId);
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

// Local message ports: one Unix datagram socket per port, read on the
// Ecore main loop.
#include "message_port.h"

#include <Ecore.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <map>
#include <memory>
#include <mutex>
#include <string>

#include "core/PlatformRoot.h"
#include "core/UnixSocket.h"
#include "dlog.h"
#include "dlog/LogLimiter.h"
#include "message_port/MessageEnvelope.h"

namespace
{

const char* const kLogTag = "MESSAGE_PORT";
const size_t kMaxMessageBytes = 16 * 1024;
// The envelope adds base64 and the sender's names to the message.
const size_t kMaxDatagramBytes = 64 * 1024;
// Work per wake-up, so that a flood cannot starve the loop: a count for
// small datagrams, bytes for large ones.
const int kMaxReadsPerWake = 64;
const size_t kMaxBytesPerWake = 256 * 1024;

struct LocalPort
{
    int id = 0;
    std::string name;
    std::string path;
    int fd = -1;
    Ecore_Fd_Handler* handler = nullptr;
    message_port_message_cb callback = nullptr;
    void* userData = nullptr;
    // Main loop only; released when the port is unregistered.
    std::unique_ptr<platform::LogLimiter> dropLog;
};
using LocalPortPtr = std::shared_ptr<LocalPort>;

std::mutex gMutex;
std::map<int, LocalPortPtr> gPorts;
int gNextId = 1;

LocalPortPtr FindPort(int id)
{
    std::lock_guard<std::mutex> lock(gMutex);
    auto it = gPorts.find(id);
    return it == gPorts.end() ? nullptr : it->second;
}

LocalPortPtr FindPortByName(const std::string& name)
{
    std::lock_guard<std::mutex> lock(gMutex);
    for (auto& item : gPorts)
        if (item.second->name == name)
            return item.second;
    return nullptr;
}

std::string PortDir()
{
    return platform::RootPath("run/msgport");
}

bool IsValidPortName(const char* name)
{
    return name && platform::IsSafeName(name) && strlen(name) <= 255;
}

void LogDrop(const LocalPortPtr& port, const char* what, size_t bytes)
{
    std::string line =
        std::string("dropped ") + what + " of " + std::to_string(bytes) + " bytes on port " + port->name;
    if (port->dropLog)
        port->dropLog->Log(line);
}

void Deliver(const LocalPortPtr& port, const std::string& datagram)
{
    platform::MessageEnvelope envelope;
    if (!platform::DecodeEnvelope(datagram, envelope))
    {
        LogDrop(port, "a malformed message", datagram.size());
        return;
    }
    port->callback(port->id, envelope.senderAppId.c_str(),
                   envelope.hasSenderPort ? envelope.senderPort.c_str() : nullptr, false, envelope.message,
                   port->userData);
    bundle_free(envelope.message);
}

// The size of the datagram read, or -1 when nothing more is waiting (or the
// port went away).
ssize_t ReadOne(int id, std::string& buffer)
{
    LocalPortPtr port = FindPort(id);
    if (!port)
        return -1;
    buffer.resize(kMaxDatagramBytes);
    ssize_t n = recv(port->fd, &buffer[0], buffer.size(), MSG_DONTWAIT | MSG_TRUNC);
    if (n < 0)
    {
        if (errno == EINTR)
            return 0;
        if (errno != EAGAIN && errno != EWOULDBLOCK)
            dlog_print(DLOG_ERROR, kLogTag, "recv on port %s failed (errno %d)", port->name.c_str(), errno);
        return -1;
    }
    if (static_cast<size_t>(n) > buffer.size())
    {
        LogDrop(port, "an oversized message", static_cast<size_t>(n));
        return static_cast<ssize_t>(buffer.size());
    }
    buffer.resize(static_cast<size_t>(n));
    Deliver(port, buffer);
    return n;
}

Eina_Bool PortReadableCb(void* data, Ecore_Fd_Handler*)
{
    try
    {
        int id = static_cast<int>(reinterpret_cast<intptr_t>(data));
        std::string buffer;
        size_t bytes = 0;
        for (int i = 0; i < kMaxReadsPerWake && bytes < kMaxBytesPerWake; ++i)
        {
            ssize_t n = ReadOne(id, buffer);
            if (n < 0)
                break;
            bytes += static_cast<size_t>(n);
        }
    }
    catch (...)
    {
        dlog_print(DLOG_ERROR, kLogTag, "exception while delivering a message");
    }
    return ECORE_CALLBACK_RENEW;
}

int OpenPortSocket(const std::string& name, const std::string& path)
{
    int fd = -1;
    switch (platform::BindUnixSocket(path, SOCK_DGRAM, 0600, fd))
    {
        case platform::UnixBindResult::BOUND:
            return fd;
        case platform::UnixBindResult::PATH_TOO_LONG:
            dlog_print(DLOG_ERROR, kLogTag, "port path too long: %s", path.c_str());
            return MESSAGE_PORT_ERROR_IO_ERROR;
        case platform::UnixBindResult::IN_USE:
            dlog_print(DLOG_ERROR, kLogTag, "port %s is held by another process", name.c_str());
            return MESSAGE_PORT_ERROR_RESOURCE_UNAVAILABLE;
        default:
            dlog_print(DLOG_ERROR, kLogTag, "cannot open port %s (errno %d)", name.c_str(), errno);
            return MESSAGE_PORT_ERROR_IO_ERROR;
    }
}

// The sockets' folder is ours alone; a link planted in its place is refused.
bool PreparePortDir()
{
    struct stat info;
    return platform::MakeDirs(PortDir()) && lstat(PortDir().c_str(), &info) == 0 && S_ISDIR(info.st_mode) &&
           info.st_uid == geteuid() && chmod(PortDir().c_str(), 0700) == 0;
}

int AddPort(const char* name, message_port_message_cb callback, void* userData)
{
    if (!PreparePortDir())
    {
        dlog_print(DLOG_ERROR, kLogTag, "cannot create %s (errno %d)", PortDir().c_str(), errno);
        return MESSAGE_PORT_ERROR_IO_ERROR;
    }
    auto port = std::make_shared<LocalPort>();
    port->name = name;
    port->path = PortDir() + "/" + port->name + ".sock";
    port->fd = OpenPortSocket(port->name, port->path);
    if (port->fd < 0)
        return port->fd;
    port->callback = callback;
    port->userData = userData;
    port->dropLog = std::make_unique<platform::LogLimiter>(DLOG_ERROR, kLogTag);
    {
        std::lock_guard<std::mutex> lock(gMutex);
        port->id = gNextId++;
        gPorts[port->id] = port;
    }
    ecore_init();
    port->handler =
        ecore_main_fd_handler_add(port->fd, ECORE_FD_READ, PortReadableCb,
                                  reinterpret_cast<void*>(static_cast<intptr_t>(port->id)), nullptr, nullptr);
    if (!port->handler)
    {
        dlog_print(DLOG_ERROR, kLogTag, "cannot watch port %s", port->name.c_str());
        ecore_shutdown();
        message_port_unregister_local_port(port->id);
        return MESSAGE_PORT_ERROR_IO_ERROR;
    }
    return port->id;
}

int MapSendError(int error, const char* port)
{
    dlog_print(DLOG_ERROR, kLogTag, "sending to port %s failed (errno %d)", port, error);
    switch (error)
    {
        case ENOENT:
        case ECONNREFUSED:
            return MESSAGE_PORT_ERROR_PORT_NOT_FOUND;
        case EAGAIN:
        case ENOBUFS:
            return MESSAGE_PORT_ERROR_RESOURCE_UNAVAILABLE;
        case EMSGSIZE:
            return MESSAGE_PORT_ERROR_MAX_EXCEEDED;
        default:
            return MESSAGE_PORT_ERROR_IO_ERROR;
    }
}

int SendDatagram(const char* remotePort, const std::string& datagram)
{
    sockaddr_un address;
    if (!platform::MakeUnixAddress(PortDir() + "/" + remotePort + ".sock", address))
        return MESSAGE_PORT_ERROR_PORT_NOT_FOUND;
    int fd = socket(AF_UNIX, SOCK_DGRAM | SOCK_CLOEXEC, 0);
    if (fd < 0)
        return MESSAGE_PORT_ERROR_IO_ERROR;
    ssize_t sent = sendto(fd, datagram.data(), datagram.size(), MSG_DONTWAIT,
                          reinterpret_cast<const sockaddr*>(&address), sizeof(address));
    int error = errno;
    close(fd);
    if (sent == static_cast<ssize_t>(datagram.size()))
        return MESSAGE_PORT_ERROR_NONE;
    return MapSendError(sent < 0 ? error : EMSGSIZE, remotePort);
}

int Send(const char* remoteAppId, const char* remotePort, bundle* message, const char* localPort)
{
    if (!remoteAppId || !*remoteAppId || !IsValidPortName(remotePort) || !message)
        return MESSAGE_PORT_ERROR_INVALID_PARAMETER;
    bundle_raw* raw = nullptr;
    int length = 0;
    if (bundle_encode(message, &raw, &length) != BUNDLE_ERROR_NONE)
        return MESSAGE_PORT_ERROR_OUT_OF_MEMORY;
    free(raw);
    if (static_cast<size_t>(length) > kMaxMessageBytes)
        return MESSAGE_PORT_ERROR_MAX_EXCEEDED;
    std::string datagram = platform::EncodeEnvelope(platform::OwnAppId(), localPort, message);
    return SendDatagram(remotePort, datagram);
}

}  // namespace

extern "C" int message_port_register_local_port(const char* localPort, message_port_message_cb callback,
                                                void* userData)
{
    if (!IsValidPortName(localPort) || !callback)
        return MESSAGE_PORT_ERROR_INVALID_PARAMETER;
    if (LocalPortPtr existing = FindPortByName(localPort))
    {
        std::lock_guard<std::mutex> lock(gMutex);
        existing->callback = callback;
        existing->userData = userData;
        return existing->id;
    }
    return AddPort(localPort, callback, userData);
}

extern "C" int message_port_unregister_local_port(int localPortId)
{
    if (localPortId <= 0)
        return MESSAGE_PORT_ERROR_INVALID_PARAMETER;
    LocalPortPtr port;
    {
        std::lock_guard<std::mutex> lock(gMutex);
        auto it = gPorts.find(localPortId);
        if (it == gPorts.end())
            return MESSAGE_PORT_ERROR_PORT_NOT_FOUND;
        port = it->second;
        gPorts.erase(it);
    }
    port->dropLog.reset();
    if (port->handler)
    {
        ecore_main_fd_handler_del(port->handler);
        ecore_shutdown();
    }
    close(port->fd);
    unlink(port->path.c_str());
    return MESSAGE_PORT_ERROR_NONE;
}

extern "C" int message_port_send_message(const char* remoteAppId, const char* remotePort, bundle* message)
{
    return Send(remoteAppId, remotePort, message, nullptr);
}

extern "C" int message_port_send_message_with_local_port(const char* remoteAppId, const char* remotePort,
                                                         bundle* message, int localPortId)
{
    LocalPortPtr local = FindPort(localPortId);
    if (!local)
        return MESSAGE_PORT_ERROR_INVALID_PARAMETER;
    return Send(remoteAppId, remotePort, message, local->name.c_str());
}

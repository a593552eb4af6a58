#ifndef PLATFORM_CORE_UNIX_SOCKET_H
#define PLATFORM_CORE_UNIX_SOCKET_H

#include <sys/types.h>
#include <sys/un.h>

#include <string>

// Unix socket files under the platform root, shared by the message ports
// and the widget host's control socket. Internal to the platform library.
namespace platform
{

// False when the path does not fit a socket address.
bool MakeUnixAddress(const std::string& path, sockaddr_un& address);

// A new socket of `type` (SOCK_STREAM or SOCK_DGRAM) connected to `path`;
// -1 when the path is too long or nothing answers there.
int ConnectUnixSocket(const std::string& path, int type);

enum class UnixBindResult
{
    BOUND,
    PATH_TOO_LONG,
    IN_USE,
    FAILED
};

// Binds a new non-blocking socket of `type` at `path`, with file mode
// `mode` from the moment it appears. A socket file that nobody answers on
// is the left-over of an ended process and is replaced; one that answers
// is left alone (IN_USE). `fd` is -1 unless BOUND; on FAILED errno says why.
UnixBindResult BindUnixSocket(const std::string& path, int type, mode_t mode, int& fd);

}  // namespace platform

#endif

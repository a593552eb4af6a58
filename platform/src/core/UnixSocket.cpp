#include "core/UnixSocket.h"

#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

namespace platform
{

bool MakeUnixAddress(const std::string& path, sockaddr_un& address)
{
    memset(&address, 0, sizeof(address));
    address.sun_family = AF_UNIX;
    if (path.size() >= sizeof(address.sun_path))
        return false;
    memcpy(address.sun_path, path.c_str(), path.size() + 1);
    return true;
}

namespace
{
int Connect(const sockaddr_un& address, int type)
{
    int fd = socket(AF_UNIX, type | SOCK_CLOEXEC, 0);
    if (fd < 0)
        return -1;
    if (connect(fd, reinterpret_cast<const sockaddr*>(&address), sizeof(address)) == 0)
        return fd;
    int error = errno;
    close(fd);
    errno = error;
    return -1;
}

// The socket file appears with the final mode, so that no other user can
// connect in the moment between bind and a chmod.
bool BindWithMode(int fd, const sockaddr_un& address, mode_t mode)
{
    mode_t oldMask = umask(~mode & 0777);
    bool bound = bind(fd, reinterpret_cast<const sockaddr*>(&address), sizeof(address)) == 0;
    int error = errno;
    umask(oldMask);
    errno = error;
    return bound;
}
}  // namespace

int ConnectUnixSocket(const std::string& path, int type)
{
    sockaddr_un address;
    if (!MakeUnixAddress(path, address))
        return -1;
    return Connect(address, type);
}

UnixBindResult BindUnixSocket(const std::string& path, int type, mode_t mode, int& fd)
{
    fd = -1;
    sockaddr_un address;
    if (!MakeUnixAddress(path, address))
        return UnixBindResult::PATH_TOO_LONG;
    int probe = Connect(address, type);
    if (probe >= 0)
    {
        close(probe);
        return UnixBindResult::IN_USE;
    }
    unlink(path.c_str());
    fd = socket(AF_UNIX, type | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    if (fd >= 0 && BindWithMode(fd, address, mode))
        return UnixBindResult::BOUND;
    int error = errno;
    if (fd >= 0)
        close(fd);
    fd = -1;
    errno = error;
    return UnixBindResult::FAILED;
}

}  // namespace platform

#include "vconf/VconfWatch.h"

#include <cerrno>
#include <climits>
#include <cstring>
#include <sys/inotify.h>
#include <sys/stat.h>
#include <unistd.h>

#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

namespace platform
{
namespace vconf
{

namespace
{
// A finished write: our atomic rename, or a person writing the file in place.
const uint32_t kWriteDone = IN_MOVED_TO | IN_CLOSE_WRITE;
// The folder going away, or a missing folder below it coming back.
const uint32_t kFolderChange = IN_CREATE | IN_DELETE_SELF | IN_MOVE_SELF;
const uint32_t kWatchMask = kWriteDone | kFolderChange | IN_ONLYDIR;

bool Exists(const std::string& path)
{
    struct stat st;
    return lstat(path.c_str(), &st) == 0;
}
}  // namespace

WatchRegistry& WatchRegistry::GetInstance()
{
    // Never destroyed: callbacks may still arrive while statics go away.
    static WatchRegistry* instance = new WatchRegistry();
    return *instance;
}

bool WatchRegistry::EnsureDescriptor()
{
    if (mFd >= 0)
        return true;
    int fd = inotify_init1(IN_NONBLOCK | IN_CLOEXEC);
    if (fd < 0)
    {
        dlog_print(DLOG_ERROR, kLogTag, "inotify_init1 failed (errno %d)", errno);
        return false;
    }
    // Our own reference keeps the loop's fd handler valid for the process.
    ecore_init();
    mHandler = ecore_main_fd_handler_add(fd, ECORE_FD_READ, FdReadableCb, this, nullptr, nullptr);
    if (!mHandler)
    {
        dlog_print(DLOG_ERROR, kLogTag, "ecore_main_fd_handler_add failed");
        close(fd);
        ecore_shutdown();
        return false;
    }
    mFd = fd;
    return true;
}

int WatchRegistry::Add(const char* key, vconf_callback_fn cb, void* userData)
{
    std::string path = KeyPath(key ? key : "");
    if (path.empty() || !cb)
    {
        dlog_print(DLOG_ERROR, kLogTag, "cannot watch key \"%s\": invalid argument", key ? key : "(null)");
        errno = EINVAL;
        return VCONF_ERROR;
    }
    for (const Registration& reg : mRegistrations)
    {
        if (reg.key == key && reg.cb == cb)
        {
            dlog_print(DLOG_ERROR, kLogTag, "the same callback is already registered for %s", key);
            errno = EALREADY;
            return VCONF_ERROR;
        }
    }
    size_t slash = path.rfind('/');
    std::string dir = path.substr(0, slash);
    if (!EnsureDescriptor() || !MakeDirs(dir))
        return VCONF_ERROR;
    int wd = inotify_add_watch(mFd, dir.c_str(), kWatchMask);
    if (wd < 0)
    {
        dlog_print(DLOG_ERROR, kLogTag, "cannot watch %s (errno %d)", dir.c_str(), errno);
        return VCONF_ERROR;
    }
    mRegistrations.push_back(
        {mNextId++, key, RootDir(), dir, path.substr(slash + 1), wd, true, cb, userData});
    return VCONF_OK;
}

int WatchRegistry::Remove(const char* key, vconf_callback_fn cb)
{
    if (!key || !cb)
        return VCONF_ERROR;
    for (auto it = mRegistrations.begin(); it != mRegistrations.end(); ++it)
    {
        if (it->key != key || it->cb != cb)
            continue;
        int wd = it->wd;
        mRegistrations.erase(it);
        DropWdIfUnused(wd);
        return VCONF_OK;
    }
    dlog_print(DLOG_ERROR, kLogTag, "no such callback registered for %s", key);
    errno = ENOENT;
    return VCONF_ERROR;
}

void WatchRegistry::DropWdIfUnused(int wd)
{
    if (wd >= 0 && !IsWdInUse(wd))
        inotify_rm_watch(mFd, wd);
}

bool WatchRegistry::IsWdInUse(int wd) const
{
    for (const Registration& reg : mRegistrations)
        if (reg.wd == wd)
            return true;
    return false;
}

const WatchRegistry::Registration* WatchRegistry::Find(uint64_t id) const
{
    for (const Registration& reg : mRegistrations)
        if (reg.id == id)
            return &reg;
    return nullptr;
}

Eina_Bool WatchRegistry::FdReadableCb(void* data, Ecore_Fd_Handler*)
{
    NSWeather::ForwardCallback<WatchRegistry>(
        data, [](WatchRegistry& registry) { registry.OnReadable(); }, PLATFORM_CALLBACK_SITE(kLogTag));
    return ECORE_CALLBACK_RENEW;
}

void WatchRegistry::OnReadable()
{
    std::vector<Pending> pending;
    CollectEvents(pending);
    // Callbacks may add or remove registrations; each is looked up afresh.
    for (const Pending& item : pending) Dispatch(item);
}

void WatchRegistry::CollectEvents(std::vector<Pending>& pending)
{
    alignas(struct inotify_event) char buffer[8192];
    while (true)
    {
        ssize_t length = read(mFd, buffer, sizeof(buffer));
        if (length <= 0)
            return;
        for (ssize_t offset = 0; offset < length;)
        {
            const auto* event = reinterpret_cast<const struct inotify_event*>(buffer + offset);
            offset += static_cast<ssize_t>(sizeof(struct inotify_event) + event->len);
            OnEvent(*event, pending);
        }
    }
}

void WatchRegistry::OnEvent(const struct inotify_event& event, std::vector<Pending>& pending)
{
    if (event.mask & IN_Q_OVERFLOW)
    {
        // Changes were lost: every key may have changed.
        for (const Registration& reg : mRegistrations)
            if (reg.atDir)
                pending.push_back({reg.id, reg.key});
        return;
    }
    bool folderLost = (event.mask & (IN_IGNORED | IN_DELETE_SELF | IN_MOVE_SELF)) != 0;
    for (Registration& reg : mRegistrations)
    {
        if (reg.wd != event.wd)
            continue;
        if (folderLost || (!reg.atDir && (event.mask & (IN_CREATE | IN_MOVED_TO))))
            Rearm(reg, pending);
        else if (reg.atDir && (event.mask & kWriteDone) && event.len > 0 && reg.fileName == event.name)
            pending.push_back({reg.id, reg.key});
    }
}

void WatchRegistry::Rearm(Registration& reg, std::vector<Pending>& pending)
{
    int oldWd = reg.wd;
    reg.wd = -1;
    reg.atDir = false;
    // A folder made between two tries is found by the next one.
    for (int attempt = 0; attempt < 8; ++attempt)
    {
        std::string path = reg.dir;
        int wd;
        while ((wd = inotify_add_watch(mFd, path.c_str(), kWatchMask)) < 0 &&
               (errno == ENOENT || errno == ENOTDIR) && path.size() > reg.root.size())
            path = path.substr(0, path.rfind('/'));
        reg.wd = wd;
        reg.atDir = wd >= 0 && path == reg.dir;
        if (wd < 0 || reg.atDir || !Exists(reg.dir.substr(0, reg.dir.find('/', path.size() + 1))))
            break;
    }
    int error = errno;
    if (reg.wd != oldWd)
        DropWdIfUnused(oldWd);
    if (reg.wd < 0)
        dlog_print(DLOG_ERROR, kLogTag, "key %s is no longer watched: %s is gone (%s)", reg.key.c_str(),
                   reg.root.c_str(), strerror(error));
    // The key may have been written before its folder was watched again.
    else if (reg.atDir && Exists(reg.dir + "/" + reg.fileName))
        pending.push_back({reg.id, reg.key});
}

void WatchRegistry::Dispatch(const Pending& pending)
{
    const Registration* reg = Find(pending.id);
    if (!reg)
        return;
    keynode_t node;
    node.name = pending.key;
    if (!Read(pending.key.c_str(), node.value))
        return;
    vconf_callback_fn cb = reg->cb;
    void* userData = reg->userData;
    cb(&node, userData);
}

}  // namespace vconf
}  // namespace platform

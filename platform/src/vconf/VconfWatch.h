#ifndef PLATFORM_VCONF_VCONF_WATCH_H
#define PLATFORM_VCONF_VCONF_WATCH_H

#include <Ecore.h>

#include <sys/inotify.h>

#include <cstdint>
#include <string>
#include <vector>

#include "vconf.h"
#include "vconf/VconfStore.h"

struct _keynode_t
{
    std::string name;
    platform::vconf::Value value;
};

namespace platform
{
namespace vconf
{

// The key watches of this process: one inotify descriptor watching the
// folders of the watched keys, read on the Ecore main loop. Main loop only.
// When a key's folder is removed, its nearest remaining folder inside the
// root is watched until the key's folder is back; a key whose root is gone
// is reported as no longer watched.
class WatchRegistry
{
public:
    static WatchRegistry& GetInstance();

    // VCONF_OK, or VCONF_ERROR (errno EALREADY for a (key, cb) pair that
    // is already registered, EINVAL for a bad key).
    int Add(const char* key, vconf_callback_fn cb, void* userData);
    int Remove(const char* key, vconf_callback_fn cb);

private:
    struct Registration
    {
        uint64_t id;
        std::string key;
        std::string root;
        std::string dir;  // the key's folder
        std::string fileName;
        int wd;
        bool atDir;  // wd watches `dir`, not one of its parents
        vconf_callback_fn cb;
        void* userData;
    };
    struct Pending
    {
        uint64_t id;
        std::string key;
    };

    WatchRegistry() = default;
    bool EnsureDescriptor();
    static Eina_Bool FdReadableCb(void* data, Ecore_Fd_Handler* handler);
    void OnReadable();
    void CollectEvents(std::vector<Pending>& pending);
    void OnEvent(const struct inotify_event& event, std::vector<Pending>& pending);
    // Watches the key's folder again, or its nearest existing parent.
    void Rearm(Registration& reg, std::vector<Pending>& pending);
    void DropWdIfUnused(int wd);
    void Dispatch(const Pending& pending);
    const Registration* Find(uint64_t id) const;
    bool IsWdInUse(int wd) const;

    int mFd = -1;
    Ecore_Fd_Handler* mHandler = nullptr;
    std::vector<Registration> mRegistrations;
    uint64_t mNextId = 1;
};

}  // namespace vconf
}  // namespace platform

#endif

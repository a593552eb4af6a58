#ifndef PLATFORM_APP_CONTROL_APP_CONTROL_INTERNAL_H
#define PLATFORM_APP_CONTROL_APP_CONTROL_INTERNAL_H

#include <string>
#include <vector>

#include "app_control.h"
#include "bundle/BundleInternal.h"

struct app_control_s
{
    bool hasOperation = false;
    std::string operation;
    bool hasUri = false;
    std::string uri;
    bool hasAppId = false;
    std::string appId;
    _bundle_t extra;
};

namespace platform
{

extern const char* const kAppControlLogTag;

// The request as one bundle: the system keys first, then the extra data.
bundle* AppControlToBundle(const app_control_s& request, const std::string& caller);
// False when a system key is malformed.
bool AppControlFromBundle(const bundle* b, app_control_s& request);

// What <root>/apps/<id>/app.conf says about an application.
struct AppEntry
{
    std::string appId;
    std::string exec;
    std::vector<std::string> viewSchemes;
    std::vector<std::string> operations;
};

// False when the id is unsafe, not registered or has no program.
bool LoadAppEntry(const std::string& appId, AppEntry& entry);
// The first registered application (by id) that handles the operation,
// for VIEW the scheme of the URI.
bool FindHandler(const app_control_s& request, AppEntry& entry);

// Starts the program detached with the environment of a launched
// application; APP_CONTROL_ERROR_NONE once exec has succeeded.
int SpawnApp(const AppEntry& entry, const std::string& encodedRequest);

}  // namespace platform

#endif

// Launch request handles and their bundle form.
#include "app_control.h"

#include <cstdlib>
#include <cstring>
#include <new>

#include "app_control/AppControlInternal.h"
#include "app_control_launch.h"
#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

namespace
{

const char* const kOperationKey = "__APP_SVC_OP_TYPE__";
const char* const kUriKey = "__APP_SVC_URI__";
const char* const kAppIdKey = "__APP_SVC_PKG__";
const char* const kCallerKey = "__AUL_CALLER_APPID__";

bool IsSystemKey(const char* key)
{
    return strncmp(key, "__APP_SVC", 9) == 0 || strncmp(key, "__AUL_", 6) == 0;
}

int SetText(app_control_h handle, const char* text, bool app_control_s::*has,
            std::string app_control_s::*field)
{
    if (!handle)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    handle->*has = text != nullptr;
    handle->*field = text ? text : "";
    return APP_CONTROL_ERROR_NONE;
}

int GetText(app_control_h handle, char** out, bool app_control_s::*has, std::string app_control_s::*field)
{
    if (!handle || !out)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    *out = nullptr;
    if (!(handle->*has))
        return APP_CONTROL_ERROR_NONE;
    *out = platform::CopyString(handle->*field);
    return *out ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

void AddIfSet(bundle* b, bool has, const char* key, const std::string& value)
{
    if (has)
        bundle_add_str(b, key, value.c_str());
}

}  // namespace

namespace platform
{

const char* const kAppControlLogTag = "APP_CONTROL";

bundle* AppControlToBundle(const app_control_s& request, const std::string& caller)
{
    bundle* b = bundle_create();
    if (!b)
        return nullptr;
    AddIfSet(b, request.hasOperation, kOperationKey, request.operation);
    AddIfSet(b, request.hasUri, kUriKey, request.uri);
    AddIfSet(b, request.hasAppId, kAppIdKey, request.appId);
    AddIfSet(b, !caller.empty(), kCallerKey, caller);
    for (const auto& item : request.extra.items) bundle_add_str(b, item->key.c_str(), item->value.c_str());
    return b;
}

bool AppControlFromBundle(const bundle* b, app_control_s& request)
{
    for (const auto& item : b->items)
    {
        const std::string& key = item->key;
        if (key == kOperationKey)
            request.hasOperation = true, request.operation = item->value;
        else if (key == kUriKey)
            request.hasUri = true, request.uri = item->value;
        else if (key == kAppIdKey)
            request.hasAppId = true, request.appId = item->value;
        else if (key == kCallerKey)
            continue;
        else if (IsSystemKey(key.c_str()) || item->value.empty())
            return false;
        else
            request.extra.items.push_back(std::make_unique<keyval_t>(*item));
    }
    return true;
}

}  // namespace platform

namespace
{

int AppControlCreate(app_control_h* appControl)
{
    if (!appControl)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    *appControl = new (std::nothrow) app_control_s();
    return *appControl ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int AppControlDestroy(app_control_h appControl)
{
    if (!appControl)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    delete appControl;
    return APP_CONTROL_ERROR_NONE;
}

int AppControlSetOperation(app_control_h appControl, const char* operation)
{
    return SetText(appControl, operation, &app_control_s::hasOperation, &app_control_s::operation);
}

int AppControlGetOperation(app_control_h appControl, char** operation)
{
    return GetText(appControl, operation, &app_control_s::hasOperation, &app_control_s::operation);
}

int AppControlSetUri(app_control_h appControl, const char* uri)
{
    return SetText(appControl, uri, &app_control_s::hasUri, &app_control_s::uri);
}

int AppControlGetUri(app_control_h appControl, char** uri)
{
    return GetText(appControl, uri, &app_control_s::hasUri, &app_control_s::uri);
}

int AppControlSetAppId(app_control_h appControl, const char* appId)
{
    return SetText(appControl, appId, &app_control_s::hasAppId, &app_control_s::appId);
}

int AppControlGetAppId(app_control_h appControl, char** appId)
{
    return GetText(appControl, appId, &app_control_s::hasAppId, &app_control_s::appId);
}

int AppControlAddExtraData(app_control_h appControl, const char* key, const char* value)
{
    if (!appControl || !key || !*key || !value || !*value)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    if (IsSystemKey(key))
        return APP_CONTROL_ERROR_KEY_REJECTED;
    // A repeated key keeps its place in the order of the extra data.
    if (keyval_t* existing = const_cast<keyval_t*>(platform::BundleFind(&appControl->extra, key)))
    {
        existing->value = value;
        return APP_CONTROL_ERROR_NONE;
    }
    int result = bundle_add_str(&appControl->extra, key, value);
    return result == BUNDLE_ERROR_NONE ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int AppControlGetExtraData(app_control_h appControl, const char* key, char** value)
{
    if (!appControl || !key || !value)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    const keyval_t* item = platform::BundleFind(&appControl->extra, key);
    if (!item)
        return APP_CONTROL_ERROR_KEY_NOT_FOUND;
    *value = platform::CopyString(item->value);
    return *value ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int AppControlForeachExtraData(app_control_h appControl, app_control_extra_data_cb callback, void* userData)
{
    if (!appControl || !callback)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    std::vector<std::string> keys;
    for (const auto& item : appControl->extra.items) keys.push_back(item->key);
    for (const std::string& key : keys)
        if (!callback(appControl, key.c_str(), userData))
            break;
    return APP_CONTROL_ERROR_NONE;
}

int AppControlGetLaunchRequest(app_control_h* appControl)
{
    if (!appControl)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    *appControl = nullptr;
    const char* encoded = getenv(APP_CONTROL_LAUNCH_REQUEST_ENV);
    if (!encoded || !*encoded)
        return APP_CONTROL_ERROR_KEY_NOT_FOUND;
    bundle* b =
        bundle_decode(reinterpret_cast<const bundle_raw*>(encoded), static_cast<int>(strlen(encoded)));
    auto request = std::make_unique<app_control_s>();
    bool ok = b && platform::AppControlFromBundle(b, *request);
    if (b)
        bundle_free(b);
    if (!ok)
    {
        dlog_print(DLOG_ERROR, platform::kAppControlLogTag, "malformed launch request in %s",
                   APP_CONTROL_LAUNCH_REQUEST_ENV);
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    }
    *appControl = request.release();
    return APP_CONTROL_ERROR_NONE;
}

}  // namespace

extern "C" int app_control_create(app_control_h* appControl)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlCreate(appControl); });
}

extern "C" int app_control_destroy(app_control_h appControl)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlDestroy(appControl); });
}

extern "C" int app_control_set_operation(app_control_h appControl, const char* operation)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlSetOperation(appControl, operation); });
}

extern "C" int app_control_get_operation(app_control_h appControl, char** operation)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlGetOperation(appControl, operation); });
}

extern "C" int app_control_set_uri(app_control_h appControl, const char* uri)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlSetUri(appControl, uri); });
}

extern "C" int app_control_get_uri(app_control_h appControl, char** uri)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlGetUri(appControl, uri); });
}

extern "C" int app_control_set_app_id(app_control_h appControl, const char* appId)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlSetAppId(appControl, appId); });
}

extern "C" int app_control_get_app_id(app_control_h appControl, char** appId)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlGetAppId(appControl, appId); });
}

extern "C" int app_control_add_extra_data(app_control_h appControl, const char* key, const char* value)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlAddExtraData(appControl, key, value); });
}

extern "C" int app_control_get_extra_data(app_control_h appControl, const char* key, char** value)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlGetExtraData(appControl, key, value); });
}

extern "C" int app_control_foreach_extra_data(app_control_h appControl, app_control_extra_data_cb callback,
                                              void* userData)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlForeachExtraData(appControl, callback, userData); });
}

extern "C" int app_control_get_launch_request(app_control_h* appControl)
{
    return platform::GuardedCall(platform::kAppControlLogTag, APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                 [&] { return AppControlGetLaunchRequest(appControl); });
}

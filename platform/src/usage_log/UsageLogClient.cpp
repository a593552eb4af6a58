// Usage-log client: records are appended to <root>/log/usage.log and their
// completion is reported on the Ecore main loop.
#include "quorvex_log_manager.h"

#include <Ecore.h>
#include <fcntl.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <list>
#include <memory>
#include <new>
#include <string>

#include "bundle/BundleInternal.h"
#include "core/ApiGuard.h"
#include "core/JsonText.h"
#include "core/PlatformRoot.h"
#include "dlog.h"

namespace
{

const char* const kLogTag = "USAGE_LOG";
std::atomic<int> gNextRequestId{1};

struct Completion
{
    quorvex_log_manager_h manager = nullptr;
    Ecore_Job* job = nullptr;
    int requestId = 0;
    std::string uri;
    quorvex_log_manager_insert_cb callback = nullptr;
    void* userData = nullptr;
};

bool AppendRecord(const std::string& line)
{
    std::string dir = platform::RootPath("log");
    int fd = platform::MakeDirs(dir) ? platform::OpenPrivateAppend(dir + "/usage.log") : -1;
    bool ok = fd >= 0 && write(fd, line.data(), line.size()) == static_cast<ssize_t>(line.size());
    int error = errno;
    if (fd >= 0)
        close(fd);
    if (!ok)
        dlog_print(DLOG_ERROR, kLogTag, "cannot write the usage log (errno %d)", error);
    return ok;
}

}  // namespace

struct quorvex_log_manager_s
{
    std::list<Completion*> pending;
};

namespace
{

void CompletionCb(void* data)
{
    NSWeather::ForwardCallback<Completion>(
        data,
        [](Completion& completion)
        {
            std::unique_ptr<Completion> owned(&completion);
            completion.manager->pending.remove(&completion);
            completion.callback(completion.requestId, completion.uri.c_str(), completion.userData);
        },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

void ScheduleCompletion(quorvex_log_manager_h manager, int requestId, const char* uri,
                        quorvex_log_manager_insert_cb callback, void* userData)
{
    auto completion =
        std::make_unique<Completion>(Completion{manager, nullptr, requestId, uri, callback, userData});
    manager->pending.push_back(completion.get());
    completion->job = ecore_job_add(CompletionCb, completion.get());
    if (!completion->job)
    {
        dlog_print(DLOG_ERROR, kLogTag, "cannot report the completion of request %d", requestId);
        manager->pending.pop_back();
        return;
    }
    completion.release();
}

int QuorvexLogManagerCreate(quorvex_log_manager_h* manager)
{
    if (!manager)
        return QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER;
    *manager = new (std::nothrow) quorvex_log_manager_s();
    if (!*manager)
        return QUORVEX_LOG_MANAGER_ERROR_OUT_OF_MEMORY;
    ecore_init();
    return QUORVEX_LOG_MANAGER_ERROR_NONE;
}

int QuorvexLogManagerDestroy(quorvex_log_manager_h manager)
{
    if (!manager)
        return QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER;
    for (Completion* completion : manager->pending)
    {
        ecore_job_del(completion->job);
        delete completion;
    }
    delete manager;
    ecore_shutdown();
    return QUORVEX_LOG_MANAGER_ERROR_NONE;
}

int QuorvexLogManagerInsert(quorvex_log_manager_h manager, const char* uri, bundle* data,
                            quorvex_log_manager_insert_cb callback, void* userData)
{
    if (!manager || !uri || !*uri || !data || data->items.empty())
    {
        dlog_print(DLOG_ERROR, kLogTag, "rejected a record (uri \"%s\")", uri ? uri : "(null)");
        return QUORVEX_LOG_MANAGER_ERROR_INVALID_PARAMETER;
    }
    int requestId = gNextRequestId++;
    std::string line = "{\"request_id\":" + std::to_string(requestId) +
                       ",\"uri\":" + platform::JsonString(uri) + ",\"data\":" + platform::JsonObject(data) +
                       "}\n";
    if (!AppendRecord(line))
        return QUORVEX_LOG_MANAGER_ERROR_IO_ERROR;
    if (callback)
        ScheduleCompletion(manager, requestId, uri, callback, userData);
    return requestId;
}

}  // namespace

extern "C" int quorvex_log_manager_create(quorvex_log_manager_h* manager)
{
    return platform::GuardedCall(kLogTag, QUORVEX_LOG_MANAGER_ERROR_OUT_OF_MEMORY,
                                 [&] { return QuorvexLogManagerCreate(manager); });
}

extern "C" int quorvex_log_manager_destroy(quorvex_log_manager_h manager)
{
    return platform::GuardedCall(kLogTag, QUORVEX_LOG_MANAGER_ERROR_OUT_OF_MEMORY,
                                 [&] { return QuorvexLogManagerDestroy(manager); });
}

extern "C" int quorvex_log_manager_insert(quorvex_log_manager_h manager, const char* uri, bundle* data,
                                          quorvex_log_manager_insert_cb callback, void* userData)
{
    return platform::GuardedCall(kLogTag, QUORVEX_LOG_MANAGER_ERROR_OUT_OF_MEMORY,
                                 [&]
                                 { return QuorvexLogManagerInsert(manager, uri, data, callback, userData); });
}

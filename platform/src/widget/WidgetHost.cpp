#include "widget/WidgetHost.h"

#include <Elementary.h>

#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <cstring>

#include "core/ApiGuard.h"
#include "app_common.h"
#include "core/PlatformRoot.h"
#include "dlog.h"
#include "widget/AppEventDispatcher.h"
#include "widget/ControlCommandHandler.h"
#include "widget_service.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";
const char* const kDefaultWidgetId = "com.quorvex.weather-m-widget";
// Layout pixels of the phone's widgets map one to one at this scale.
const double kBaseScale = 2.6;

bool HasValue(const char* name)
{
    const char* value = getenv(name);
    return value && *value;
}
}  // namespace

int SizeTypeFromName(const std::string& name)
{
    if (name == "4x2")
        return WIDGET_SIZE_TYPE_4x2;
    if (name == "4x4")
        return WIDGET_SIZE_TYPE_4x4;
    return -1;
}

std::string SizeTypeName(int sizeType)
{
    if (sizeType == WIDGET_SIZE_TYPE_4x2)
        return "4x2";
    if (sizeType == WIDGET_SIZE_TYPE_4x4)
        return "4x4";
    return "unknown";
}

WidgetHost& WidgetHost::GetInstance()
{
    static WidgetHost host;
    return host;
}

int WidgetHost::Run(int argc, char** argv, widget_app_lifecycle_callback_s* callback, void* userData)
{
    if (argc <= 0 || !argv || !callback || !callback->create)
        return WIDGET_ERROR_INVALID_PARAMETER;
    if (mIsRunning)
        return WIDGET_ERROR_ALREADY_STARTED;
    if (!ParseOptions(argc, argv))
        return WIDGET_ERROR_INVALID_PARAMETER;
    PrepareEnvironment();
    elm_init(argc, argv);
    elm_app_base_scale_set(kBaseScale);
    elm_config_scale_set(kBaseScale);
    mIsRunning = true;
    mIsExitRequested = false;
    if (!StartApplication(callback, userData))
    {
        AppEventDispatcher::GetInstance().FollowTimeZone(false);
        mIsRunning = false;
        elm_shutdown();
        return WIDGET_ERROR_FAULT;
    }
    mControl = std::make_unique<ControlCommandHandler>(*this);
    int result = mControl->Start(RootPath("run/widget/" + mWidgetId + ".ctl"));
    if (result == WIDGET_ERROR_NONE)
    {
        CreateStartupInstances();
        if (!mIsExitRequested)
            ecore_main_loop_begin();
    }
    StopApplication();
    return result;
}

bool WidgetHost::ParseOptions(int argc, char** argv)
{
    mWidgetId = HasValue("PLATFORM_APP_ID") ? getenv("PLATFORM_APP_ID") : kDefaultWidgetId;
    mStartupSizes.clear();
    for (int i = 1; i < argc; ++i)
    {
        std::string option = argv[i] ? argv[i] : "";
        if (option != "--widget-id" && option != "--instance")
            continue;
        if (i + 1 >= argc || !argv[i + 1])
        {
            dlog_print(DLOG_ERROR, kLogTag, "%s needs a value", option.c_str());
            return false;
        }
        std::string value = argv[++i];
        if (option == "--widget-id")
            mWidgetId = value;
        else if (SizeTypeFromName(value) < 0)
        {
            dlog_print(DLOG_ERROR, kLogTag, "--instance %s: the sizes are 4x2 and 4x4", value.c_str());
            return false;
        }
        else
            mStartupSizes.push_back(SizeTypeFromName(value));
    }
    if (!IsSafeName(mWidgetId))
    {
        dlog_print(DLOG_ERROR, kLogTag, "unusable widget id \"%s\"", mWidgetId.c_str());
        return false;
    }
    return true;
}

void WidgetHost::PrepareEnvironment()
{
    if (!HasValue("DISPLAY") && !HasValue("WAYLAND_DISPLAY"))
    {
        setenv("ELM_ENGINE", "buffer", 1);
        // Elementary resizes a window's canvas from several places; with the
        // buffer engine each resize frees the pixels a render thread may still
        // be drawing into. Off screen, nothing is gained by drawing in a thread.
        setenv("ECORE_EVAS_FORCE_SYNC_RENDER", "1", 1);
    }
    // glibc ignores LANGUAGE under the C locale, so catalogues would never load.
    const char* lang = getenv("LANG");
    if (!HasValue("LC_ALL") && (!lang || !*lang || !strcmp(lang, "C") || !strcmp(lang, "POSIX")))
        setenv("LANG", "C.UTF-8", 1);
    AppEventDispatcher::ApplyStartupKeys();
    if (!setlocale(LC_ALL, ""))
        dlog_print(DLOG_ERROR, kLogTag, "setlocale(LC_ALL, \"\") failed; staying with C");
    app_set_own_id(mWidgetId.c_str());
}

bool WidgetHost::StartApplication(widget_app_lifecycle_callback_s* callback, void* userData)
{
    mAppCallbacks = *callback;
    mAppUserData = userData;
    AppEventDispatcher::GetInstance().FollowTimeZone(true);
    widget_class_h widgetClass = mAppCallbacks.create(mAppUserData);
    if (!widgetClass)
    {
        dlog_print(DLOG_ERROR, kLogTag, "the create callback gave no widget class");
        return false;
    }
    mClass.reset(widgetClass);
    return true;
}

void WidgetHost::CreateStartupInstances()
{
    for (int sizeType : mStartupSizes)
    {
        std::string id;
        CreateInstance(sizeType, id);
    }
}

void WidgetHost::StopApplication()
{
    AppEventDispatcher::GetInstance().FollowTimeZone(false);
    if (mControl)
        mControl->Stop();
    DestroyAllInstances();
    if (mUpdateJob)
        ecore_job_del(mUpdateJob);
    mUpdateJob = nullptr;
    for (auto& pending : mPendingUpdates)
        if (pending.content)
            bundle_free(pending.content);
    mPendingUpdates.clear();
    if (mTerminateJob)
        ecore_job_del(mTerminateJob);
    mTerminateJob = nullptr;
    mTerminateIds.clear();
    if (mAppCallbacks.terminate)
        mAppCallbacks.terminate(mAppUserData);
    AppEventDispatcher::GetInstance().Clear();
    mControl.reset();
    mClass.reset();
    elm_shutdown();
    mIsRunning = false;
}

void WidgetHost::DestroyAllInstances()
{
    std::vector<std::string> ids;
    for (auto& instance : mInstances) ids.push_back(instance->GetId());
    for (auto& id : ids) DestroyInstance(id, WIDGET_APP_DESTROY_TYPE_TEMPORARY);
}

int WidgetHost::Exit()
{
    if (!mIsRunning)
        return WIDGET_ERROR_FAULT;
    mIsExitRequested = true;
    ecore_main_loop_quit();
    return WIDGET_ERROR_NONE;
}

int WidgetHost::CreateInstance(int sizeType, std::string& id, bool withWindow)
{
    int width = 0;
    int height = 0;
    if (!mClass || widget_service_get_size(static_cast<widget_size_type_e>(sizeType), &width, &height) != 0)
        return WIDGET_ERROR_INVALID_PARAMETER;
    id = mWidgetId + ":" + std::to_string(mNextInstanceNumber++);
    mInstances.push_back(std::make_unique<WidgetInstance>(id, sizeType, width, height));
    WidgetInstance* instance = mInstances.back().get();
    instance->SetIsWindowWithheld(!withWindow);
    const auto& cb = mClass->callbacks;
    int result =
        cb.create ? cb.create(instance, nullptr, width, height, mClass->userData) : WIDGET_ERROR_NONE;
    if (!withWindow)
    {
        dlog_print(DLOG_INFO, kLogTag, "create of %s without a window returned %d", id.c_str(), result);
        return result;
    }
    if (result != WIDGET_ERROR_NONE)
    {
        dlog_print(DLOG_ERROR, kLogTag, "create of %s failed (%d); removed", id.c_str(), result);
        RemoveInstance(instance);
        return result;
    }
    ResizeInstance(id, sizeType);
    ResumeInstance(id);
    return WIDGET_ERROR_NONE;
}

int WidgetHost::ResizeInstance(const std::string& id, int sizeType)
{
    WidgetInstance* instance = FindInstance(id);
    int width = 0;
    int height = 0;
    if (!instance)
        return WIDGET_ERROR_NOT_EXIST;
    if (widget_service_get_size(static_cast<widget_size_type_e>(sizeType), &width, &height) != 0)
        return WIDGET_ERROR_INVALID_PARAMETER;
    bool isFirstLayout = instance->GetIsWindowWithheld();
    instance->SetIsWindowWithheld(false);
    instance->SetSize(sizeType, width, height);
    const auto& cb = mClass->callbacks;
    int result = cb.resize ? cb.resize(instance, width, height, mClass->userData) : WIDGET_ERROR_NONE;
    if (isFirstLayout && FindInstance(id))
        ResumeInstance(id);
    return result;
}

int WidgetHost::PauseInstance(const std::string& id)
{
    WidgetInstance* instance = FindInstance(id);
    if (!instance)
        return WIDGET_ERROR_NOT_EXIST;
    if (instance->GetState() != WidgetInstanceState::Running)
        return WIDGET_ERROR_NONE;
    instance->SetState(WidgetInstanceState::Paused);
    const auto& cb = mClass->callbacks;
    return cb.pause ? cb.pause(instance, mClass->userData) : WIDGET_ERROR_NONE;
}

int WidgetHost::ResumeInstance(const std::string& id)
{
    WidgetInstance* instance = FindInstance(id);
    if (!instance)
        return WIDGET_ERROR_NOT_EXIST;
    if (instance->GetState() == WidgetInstanceState::Running)
        return WIDGET_ERROR_NONE;
    instance->SetState(WidgetInstanceState::Running);
    const auto& cb = mClass->callbacks;
    int result = cb.resume ? cb.resume(instance, mClass->userData) : WIDGET_ERROR_NONE;
    // The callback may have ended the instance (terminate is deferred, but be safe).
    instance = FindInstance(id);
    if (instance && instance->GetIsUpdatePending())
    {
        bundle* content = instance->TakePendingUpdate();
        UpdateInstance(id, content, 0);
        if (content)
            bundle_free(content);
    }
    return result;
}

int WidgetHost::UpdateInstance(const std::string& id, bundle* content, int force)
{
    WidgetInstance* instance = FindInstance(id);
    if (!instance)
        return WIDGET_ERROR_NOT_EXIST;
    if (instance->GetState() != WidgetInstanceState::Running && !force)
    {
        instance->SetPendingUpdate(content ? bundle_dup(content) : nullptr);
        return WIDGET_ERROR_NONE;
    }
    const auto& cb = mClass->callbacks;
    return cb.update ? cb.update(instance, content, force, mClass->userData) : WIDGET_ERROR_NONE;
}

int WidgetHost::DestroyInstance(const std::string& id, widget_app_destroy_type_e reason)
{
    WidgetInstance* instance = FindInstance(id);
    if (!instance)
        return WIDGET_ERROR_NOT_EXIST;
    if (instance->GetState() == WidgetInstanceState::Running)
        PauseInstance(id);
    instance = FindInstance(id);
    if (!instance)
        return WIDGET_ERROR_NONE;
    instance->SetState(WidgetInstanceState::Destroyed);
    bundle* content = bundle_create();
    const auto& cb = mClass->callbacks;
    int result = cb.destroy ? cb.destroy(instance, reason, content, mClass->userData) : WIDGET_ERROR_NONE;
    if (content)
        bundle_free(content);
    RemoveInstance(instance);
    return result;
}

void WidgetHost::RemoveInstance(WidgetInstance* instance)
{
    auto found = std::find_if(mInstances.begin(), mInstances.end(),
                              [instance](const auto& item) { return item.get() == instance; });
    if (found != mInstances.end())
        mInstances.erase(found);
}

int WidgetHost::TriggerUpdate(const std::string& id, bundle* content, int force)
{
    if (!mIsRunning)
        return WIDGET_ERROR_FAULT;
    if (!id.empty() && !FindInstance(id))
        return WIDGET_ERROR_NOT_EXIST;
    mPendingUpdates.push_back({id, content ? bundle_dup(content) : nullptr, force});
    if (!mUpdateJob)
        mUpdateJob = ecore_job_add(FlushUpdatesCb, this);
    return WIDGET_ERROR_NONE;
}

void WidgetHost::FlushUpdatesCb(void* data)
{
    NSWeather::ForwardCallback<WidgetHost>(
        data, [](WidgetHost& host) { host.FlushUpdates(); }, PLATFORM_CALLBACK_SITE(kLogTag));
}

void WidgetHost::FlushUpdates()
{
    mUpdateJob = nullptr;
    std::vector<PendingUpdate> updates;
    updates.swap(mPendingUpdates);
    for (auto& update : updates)
    {
        std::vector<std::string> ids;
        if (!update.id.empty())
            ids.push_back(update.id);
        else
            for (auto& instance : mInstances) ids.push_back(instance->GetId());
        for (auto& id : ids) UpdateInstance(id, update.content, update.force);
        if (update.content)
            bundle_free(update.content);
    }
}

int WidgetHost::TerminateContext(widget_context_h context)
{
    WidgetInstance* instance = FindInstance(context);
    if (!instance)
        return WIDGET_ERROR_INVALID_PARAMETER;
    mTerminateIds.push_back(instance->GetId());
    if (!mTerminateJob)
        mTerminateJob = ecore_job_add(TerminateJobCb, this);
    return WIDGET_ERROR_NONE;
}

void WidgetHost::TerminateJobCb(void* data)
{
    NSWeather::ForwardCallback<WidgetHost>(
        data, [](WidgetHost& host) { host.FlushTerminations(); }, PLATFORM_CALLBACK_SITE(kLogTag));
}

void WidgetHost::FlushTerminations()
{
    mTerminateJob = nullptr;
    std::vector<std::string> ids;
    ids.swap(mTerminateIds);
    for (auto& id : ids)
    {
        WidgetInstance* instance = FindInstance(id);
        if (!instance)
            continue;
        if (instance->GetState() == WidgetInstanceState::Created)
            ResumeInstance(id);
        DestroyInstance(id, WIDGET_APP_DESTROY_TYPE_DEFAULT);
    }
}

WidgetInstance* WidgetHost::FindInstance(const std::string& id) const
{
    for (auto& instance : mInstances)
        if (instance->GetId() == id)
            return instance.get();
    return nullptr;
}

WidgetInstance* WidgetHost::FindInstance(widget_context_h context) const
{
    for (auto& instance : mInstances)
        if (static_cast<_widget_context*>(instance.get()) == context)
            return instance.get();
    return nullptr;
}

WidgetInstance* WidgetHost::FindInstanceByCanvas(const Evas* canvas) const
{
    for (auto& instance : mInstances)
        if (instance->OwnsCanvas(canvas))
            return instance.get();
    return nullptr;
}

std::vector<WidgetInstance*> WidgetHost::GetInstances() const
{
    std::vector<WidgetInstance*> result;
    for (auto& instance : mInstances) result.push_back(instance.get());
    return result;
}

}  // namespace platform

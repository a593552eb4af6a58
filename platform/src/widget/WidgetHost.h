#ifndef PLATFORM_WIDGET_WIDGET_HOST_H
#define PLATFORM_WIDGET_WIDGET_HOST_H

#include <Ecore.h>

#include <memory>
#include <string>
#include <vector>

#include "widget/WidgetInstance.h"
#include "widget_app.h"

struct _widget_class
{
    widget_instance_lifecycle_callback_s callbacks;
    void* userData;
};

namespace platform
{

class ControlCommandHandler;

// The widget framework of this process: runs the main loop, keeps the
// instances and calls the widget's callbacks in the order a home screen
// would. Main loop only.
class WidgetHost
{
public:
    static WidgetHost& GetInstance();

    int Run(int argc, char** argv, widget_app_lifecycle_callback_s* callback, void* userData);
    int Exit();
    bool GetIsRunning() const { return mIsRunning; }
    const std::string& GetWidgetId() const { return mWidgetId; }

    // Lifecycle as driven by a home screen. Create does create, resize and
    // resume; the id of the new instance goes to `id`. Without a window the
    // instance has no parent object until its first resize, which then also
    // resumes it; it stays even when the create callback fails for that.
    int CreateInstance(int sizeType, std::string& id, bool withWindow = true);
    int ResizeInstance(const std::string& id, int sizeType);
    int PauseInstance(const std::string& id);
    int ResumeInstance(const std::string& id);
    int UpdateInstance(const std::string& id, bundle* content, int force);
    int DestroyInstance(const std::string& id, widget_app_destroy_type_e reason);
    // Queues updates on the main loop; an empty id means every instance.
    int TriggerUpdate(const std::string& id, bundle* content, int force);
    // Queues pause + destroy of a context, as the platform does.
    int TerminateContext(widget_context_h context);

    WidgetInstance* FindInstance(const std::string& id) const;
    WidgetInstance* FindInstance(widget_context_h context) const;
    WidgetInstance* FindInstanceByCanvas(const Evas* canvas) const;
    std::vector<WidgetInstance*> GetInstances() const;

private:
    struct PendingUpdate
    {
        std::string id;  // empty: all
        bundle* content;
        int force;
    };

    WidgetHost() = default;
    ~WidgetHost() = default;

    bool ParseOptions(int argc, char** argv);
    void PrepareEnvironment();
    bool StartApplication(widget_app_lifecycle_callback_s* callback, void* userData);
    void CreateStartupInstances();
    void StopApplication();
    void DestroyAllInstances();
    void RemoveInstance(WidgetInstance* instance);
    void FlushTerminations();
    void FlushUpdates();

    static void FlushUpdatesCb(void* data);
    static void TerminateJobCb(void* data);

    std::string mWidgetId;
    std::vector<int> mStartupSizes;
    widget_app_lifecycle_callback_s mAppCallbacks{};
    void* mAppUserData = nullptr;
    std::unique_ptr<_widget_class> mClass;  // made by widget_app_class_create
    std::vector<std::unique_ptr<WidgetInstance>> mInstances;
    std::vector<PendingUpdate> mPendingUpdates;
    std::vector<std::string> mTerminateIds;
    Ecore_Job* mTerminateJob = nullptr;
    Ecore_Job* mUpdateJob = nullptr;
    std::unique_ptr<ControlCommandHandler> mControl;
    unsigned mNextInstanceNumber = 1;
    bool mIsRunning = false;
    bool mIsExitRequested = false;
};

// "4x2" -> WIDGET_SIZE_TYPE_4x2 etc.; -1 for a name we do not host.
int SizeTypeFromName(const std::string& name);
// The reverse; "unknown" for others.
std::string SizeTypeName(int sizeType);

}  // namespace platform

#endif

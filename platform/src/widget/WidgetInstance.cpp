#include "widget/WidgetInstance.h"

#include <Elementary.h>

#include "core/ApiGuard.h"
#include "dlog.h"
#include "widget/WidgetHost.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";
}

const char* WidgetInstanceStateName(WidgetInstanceState state)
{
    switch (state)
    {
        case WidgetInstanceState::Created:
            return "created";
        case WidgetInstanceState::Running:
            return "running";
        case WidgetInstanceState::Paused:
            return "paused";
        case WidgetInstanceState::Destroyed:
            return "destroyed";
    }
    return "unknown";
}

WidgetInstance::WidgetInstance(const std::string& id, int sizeType, int width, int height)
    : mId(id), mSizeType(sizeType), mWidth(width), mHeight(height)
{
}

WidgetInstance::~WidgetInstance()
{
    if (mWindow)
    {
        // Nothing when the first frame already took it away.
        evas_event_callback_del_full(GetWindowCanvas(), EVAS_CALLBACK_RENDER_POST, FirstFrameCb, this);
        evas_object_event_callback_del_full(mWindow, EVAS_CALLBACK_DEL, WindowDelCb, this);
        evas_object_del(mWindow);
    }
    if (mParentObject)
        evas_object_event_callback_del_full(mParentObject, EVAS_CALLBACK_DEL, ParentDelCb, this);
    if (mParentCanvas)
        ecore_evas_free(mParentCanvas);
    if (mPendingContent)
        bundle_free(mPendingContent);
}

void WidgetInstance::SetPendingUpdate(bundle* content)
{
    if (mPendingContent)
        bundle_free(mPendingContent);
    mPendingContent = content;
    mIsUpdatePending = true;
}

bundle* WidgetInstance::TakePendingUpdate()
{
    bundle* content = mPendingContent;
    mPendingContent = nullptr;
    mIsUpdatePending = false;
    return content;
}

void WidgetInstance::SetSize(int sizeType, int width, int height)
{
    mSizeType = sizeType;
    mWidth = width;
    mHeight = height;
    if (mParentObject)
        evas_object_resize(mParentObject, width, height);
    if (mWindow)
        evas_object_resize(mWindow, width, height);
}

Evas_Object* WidgetInstance::GetParentObject()
{
    if (mIsWindowWithheld)
        return nullptr;
    if (mParentObject)
        return mParentObject;
    // The rectangle only carries the canvas to the window; it is never drawn.
    if (!mParentCanvas)
        mParentCanvas = ecore_evas_buffer_new(1, 1);
    if (!mParentCanvas)
    {
        dlog_print(DLOG_ERROR, kLogTag, "no off-screen canvas for %s", mId.c_str());
        return nullptr;
    }
    mParentObject = evas_object_rectangle_add(ecore_evas_get(mParentCanvas));
    evas_object_color_set(mParentObject, 0, 0, 0, 0);
    evas_object_resize(mParentObject, mWidth, mHeight);
    evas_object_event_callback_add(mParentObject, EVAS_CALLBACK_DEL, ParentDelCb, this);
    return mParentObject;
}

bool WidgetInstance::OwnsCanvas(const Evas* canvas) const
{
    return canvas && mParentCanvas && ecore_evas_get(mParentCanvas) == canvas;
}

Evas_Object* WidgetInstance::CreateWindow(const char* name)
{
    if (mWindow)
    {
        dlog_print(DLOG_ERROR, kLogTag, "instance %s already has a window", mId.c_str());
        return nullptr;
    }
    mWindow = elm_win_add(nullptr, name ? name : mId.c_str(), ELM_WIN_BASIC);
    if (!mWindow)
    {
        dlog_print(DLOG_ERROR, kLogTag, "elm_win_add failed for %s", mId.c_str());
        return nullptr;
    }
    elm_win_title_set(mWindow, mId.c_str());
    // As on the phone, the home screen shows through where the widget draws
    // nothing; an opaque window kept a slide's pixels in the page corners.
    elm_win_alpha_set(mWindow, EINA_TRUE);
    evas_object_resize(mWindow, mWidth, mHeight);
    evas_object_intercept_resize_callback_add(mWindow, WindowResizeCb, nullptr);
    evas_object_event_callback_add(mWindow, EVAS_CALLBACK_DEL, WindowDelCb, this);
    evas_object_smart_callback_add(mWindow, "delete,request", CloseRequestCb, this);
    evas_event_callback_add(GetWindowCanvas(), EVAS_CALLBACK_RENDER_POST, FirstFrameCb, this);
    return mWindow;
}

// The moment a user first sees the instance; start-up is measured to it.
void WidgetInstance::FirstFrameCb(void* data, Evas* canvas, void* eventInfo)
{
    auto* post = static_cast<Evas_Event_Render_Post*>(eventInfo);
    if (post && !post->updated_area)
        return;
    NSWeather::ForwardCallback<WidgetInstance>(
        data,
        [canvas](WidgetInstance& instance)
        {
            evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, FirstFrameCb, &instance);
            dlog_print(DLOG_INFO, kLogTag, "instance %s drew its first frame", instance.mId.c_str());
        },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

Evas* WidgetInstance::GetWindowCanvas() const
{
    return mWindow ? evas_object_evas_get(mWindow) : nullptr;
}

// The buffer engine frees the window's pixels on a resize while the render
// thread may still be drawing the last frame into them; wait for it first.
void WidgetInstance::WindowResizeCb(void*, Evas_Object* window, Evas_Coord width, Evas_Coord height)
{
    if (!window)
        return;
    evas_sync(evas_object_evas_get(window));
    evas_object_resize(window, width, height);
}

void WidgetInstance::WindowDelCb(void* data, Evas*, Evas_Object*, void*)
{
    NSWeather::ForwardCallback<WidgetInstance>(
        data, [](WidgetInstance& instance) { instance.OnWindowDeleted(); }, PLATFORM_CALLBACK_SITE(kLogTag));
}

void WidgetInstance::ParentDelCb(void* data, Evas*, Evas_Object*, void*)
{
    NSWeather::ForwardCallback<WidgetInstance>(
        data, [](WidgetInstance& instance) { instance.mParentObject = nullptr; },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

// Closing a window on a display removes the instance, as removing it from a
// home screen would; the end itself runs later on the main loop.
void WidgetInstance::CloseRequestCb(void* data, Evas_Object*, void*)
{
    NSWeather::ForwardCallback<WidgetInstance>(
        data, [](WidgetInstance& instance) { WidgetHost::GetInstance().TerminateContext(&instance); },
        PLATFORM_CALLBACK_SITE(kLogTag));
}

void WidgetInstance::OnWindowDeleted()
{
    mWindow = nullptr;
}

}  // namespace platform

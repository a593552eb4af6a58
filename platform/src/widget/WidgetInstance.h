#ifndef PLATFORM_WIDGET_WIDGET_INSTANCE_H
#define PLATFORM_WIDGET_WIDGET_INSTANCE_H

#include <Ecore_Evas.h>
#include <Evas.h>

#include <string>

#include "bundle.h"
#include "widget_app.h"

// The handle the widget sees; the instance below is the only kind of it.
struct _widget_context
{
    virtual ~_widget_context() = default;
};

namespace platform
{

enum class WidgetInstanceState
{
    Created,  // create callback done, never resumed
    Running,
    Paused,
    Destroyed
};

const char* WidgetInstanceStateName(WidgetInstanceState state);

// One widget instance: its id, size, state, the values the widget hands
// back (title, content, tag), the off-screen parent canvas and the window.
class WidgetInstance : public _widget_context
{
public:
    WidgetInstance(const std::string& id, int sizeType, int width, int height);
    ~WidgetInstance() override;
    WidgetInstance(const WidgetInstance&) = delete;
    WidgetInstance& operator=(const WidgetInstance&) = delete;

    const std::string& GetId() const { return mId; }
    int GetSizeType() const { return mSizeType; }
    int GetWidth() const { return mWidth; }
    int GetHeight() const { return mHeight; }
    void SetSize(int sizeType, int width, int height);

    WidgetInstanceState GetState() const { return mState; }
    void SetState(WidgetInstanceState state) { mState = state; }

    const std::string& GetTitle() const { return mTitle; }
    void SetTitle(const std::string& title) { mTitle = title; }
    const std::string& GetContentInfo() const { return mContentInfo; }
    void SetContentInfo(const std::string& content) { mContentInfo = content; }
    void* GetTag() const { return mTag; }
    void SetTag(void* tag) { mTag = tag; }

    // An update that arrived while paused without force, given at resume.
    // The instance owns the content until it is taken back.
    bool GetIsUpdatePending() const { return mIsUpdatePending; }
    void SetPendingUpdate(bundle* content);
    bundle* TakePendingUpdate();

    // The transparent parent rectangle (owned by its canvas, which the
    // instance owns); made again when the widget deleted the last one.
    // None while the window is withheld: a home screen that has not laid
    // the instance out yet.
    Evas_Object* GetParentObject();
    bool GetIsWindowWithheld() const { return mIsWindowWithheld; }
    void SetIsWindowWithheld(bool withheld) { mIsWindowWithheld = withheld; }
    bool OwnsCanvas(const Evas* canvas) const;

    // Makes the instance's window; null when it already has one.
    Evas_Object* CreateWindow(const char* name);
    Evas_Object* GetWindow() const { return mWindow; }
    Evas* GetWindowCanvas() const;

private:
    static void WindowResizeCb(void* data, Evas_Object* window, Evas_Coord width, Evas_Coord height);
    static void WindowDelCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void ParentDelCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
    static void CloseRequestCb(void* data, Evas_Object* obj, void* eventInfo);
    static void FirstFrameCb(void* data, Evas* evas, void* eventInfo);
    void OnWindowDeleted();

    std::string mId;
    int mSizeType;
    int mWidth;
    int mHeight;
    WidgetInstanceState mState = WidgetInstanceState::Created;
    std::string mTitle;
    std::string mContentInfo;
    void* mTag = nullptr;
    bool mIsUpdatePending = false;
    bool mIsWindowWithheld = false;
    bundle* mPendingContent = nullptr;
    Ecore_Evas* mParentCanvas = nullptr;
    Evas_Object* mParentObject = nullptr;
    Evas_Object* mWindow = nullptr;
};

}  // namespace platform

#endif

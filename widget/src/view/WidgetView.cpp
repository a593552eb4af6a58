#include "WidgetView.h"

#include <Elementary.h>
#include <elm_win_tizen.h>
#include <widget_service.h>

#include "ContentProvider.h"
#include "ElementaryHelper.h"
#include "TimeUtil.h"
#include "WeatherDefine.h"
#include "Widget4x2PageController.h"
#include "Widget4x4PageController.h"
#include "CallbackTrampoline.h"
#include "WidgetLog.h"
#include "WidgetMain.h"
#include "WidgetSettingWriter.h"

namespace NSWeatherWidget
{

namespace
{
const char* const kPrevSlot = "prevLayout";
const char* const kCenterSlot = "centerLayout";
const char* const kNextSlot = "nextLayout";
}  // namespace

WidgetView::~WidgetView()
{
    CancelNeighbours();
    mWidgetFlickControllerPtr.reset();
    mPrevPageControllerPtr.reset();
    mCenterPageControllerPtr.reset();
    mNextPageControllerPtr.reset();
    mChangeableThemePtr.reset();
    if (mWin)
    {
        evas_object_event_callback_del_full(mWin, EVAS_CALLBACK_DEL, WindowDelCb, this);
        evas_object_del(mWin);
    }
}

// The host may close a window on its own (a display closing it).
void WidgetView::WindowDelCb(void* data, Evas*, Evas_Object*, void*)
{
    NSWeather::ForwardCallback<WidgetView>(
        data,
        [](WidgetView& self)
        {
            self.mWidgetFlickControllerPtr.reset();
            self.mWin = nullptr;
            self.mBaseLayout = nullptr;
        },
        WIDGET_CALLBACK_SITE);
}

Evas_Object* WidgetView::LayoutOf(const WidgetPageControllerPtr& controller)
{
    return controller ? controller->GetBaseLayout() : nullptr;
}

Evas_Object* WidgetView::OnGetPrevLayout()
{
    WIDGET_RETV_IF(!mPrevPageControllerPtr, nullptr);
    return mPrevPageControllerPtr->GetBaseLayout();
}

Evas_Object* WidgetView::OnGetCenterLayout()
{
    WIDGET_RETV_IF(!mCenterPageControllerPtr, nullptr);
    return mCenterPageControllerPtr->GetBaseLayout();
}

Evas_Object* WidgetView::OnGetNextLayout()
{
    WIDGET_RETV_IF(!mNextPageControllerPtr, nullptr);
    return mNextPageControllerPtr->GetBaseLayout();
}

int WidgetView::OnGetPrevCityIndex()
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, 0);
    return mWidgetViewDataPtr->GetPrevCityIndex();
}

int WidgetView::OnGetIndexOfDisplayCity()
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, 0);
    return mWidgetViewDataPtr->GetIndexOfDisplayCity();
}

int WidgetView::OnGetNextCityIndex()
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, 0);
    return mWidgetViewDataPtr->GetNextCityIndex();
}

int WidgetView::OnGetSizeType()
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, 0);
    return mWidgetViewDataPtr->GetSizeType();
}

int WidgetView::OnGetNumberOfCities()
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, 0);
    return mWidgetViewDataPtr->GetNumberOfCities();
}

void WidgetView::OnStartFlick(bool toNext)
{
    EnsureNeighbours();
    WidgetPageControllerPtr& incoming = toNext ? mNextPageControllerPtr : mPrevPageControllerPtr;
    if (incoming)
        incoming->UpdateRefreshButton(false);
}

WidgetPageControllerPtr WidgetView::CreatePage(Evas_Object* parent, int index)
{
    WIDGET_RETV_IF(!parent, nullptr);
    WIDGET_RETV_IF(!mWidgetViewDataPtr, nullptr);
    // Pages are also built from the idler and at the end of a slide.
    NSWeather::ContentProvider::RebuildScope providerReadOnce;
    WidgetPageControllerPtr widgetPageControllerPtr;
    if (mWidgetViewDataPtr->GetSizeType() == WIDGET_SIZE_TYPE_4x4)
        widgetPageControllerPtr = std::make_shared<Widget4x4PageController>();
    else if (mWidgetViewDataPtr->GetSizeType() == WIDGET_SIZE_TYPE_4x2)
        widgetPageControllerPtr = std::make_shared<Widget4x2PageController>();
    WIDGET_RETV_IF(!widgetPageControllerPtr, nullptr);
    widgetPageControllerPtr->Initialize();
    widgetPageControllerPtr->Create(parent, index);
    return widgetPageControllerPtr;
}

void WidgetView::PutPage(const WidgetPageControllerPtr& controller, const char* slot)
{
    Evas_Object* layout = LayoutOf(controller);
    if (layout && mBaseLayout)
        elm_object_part_content_set(mBaseLayout, slot, layout);
}

Evas_Object* WidgetView::Create(Evas_Object* parent, const WidgetViewDataPtr& widgetViewDataPtr)
{
    WIDGET_RETV_IF(parent == NULL, nullptr);
    WIDGET_RETV_IF(!widgetViewDataPtr, nullptr);
    mWidgetViewDataPtr = widgetViewDataPtr;
    mWin = elm_win_tizen_widget_add("weather-widget", parent);
    WIDGET_RETV_IF(mWin == NULL, nullptr);
    evas_object_del(parent);
    evas_object_event_callback_add(mWin, EVAS_CALLBACK_DEL, WindowDelCb, this);
    evas_object_show(mWin);
    mChangeableThemePtr = std::make_shared<NSWeather::ChangeableTheme>();
    if (mChangeableThemePtr->InitChangeableTheme() != NSWeather::ERR_OK)
        WIDGET_LOG("InitChangeableTheme failed");
    NSWeather::ElementaryHelper helper;
    mBaseLayout = helper.CreateMultiLayout(mWin, WidgetViewData::GetEdjPath(), "widgetView");
    WIDGET_RETV_IF(mBaseLayout == NULL, nullptr);
    evas_object_show(mBaseLayout);
    if (!BuildPages())
    {
        mCenterPageControllerPtr.reset();
        mPrevPageControllerPtr.reset();
        mNextPageControllerPtr.reset();
        evas_object_del(mBaseLayout);
        mBaseLayout = nullptr;
        return nullptr;
    }
    return mBaseLayout;
}

bool WidgetView::BuildPages()
{
    bool isBuilt = false;
    do
    {
        if (mWidgetViewDataPtr->GetNumberOfCities() <= 0)
        {
            mCenterPageControllerPtr = CreatePage(mBaseLayout, -1);
            WIDGET_BREAK_IF(!mCenterPageControllerPtr);
            PutPage(mCenterPageControllerPtr, kCenterSlot);
            isBuilt = true;
            break;
        }
        WIDGET_BREAK_IF(AppendLayout(mBaseLayout) != NSWeather::ERR_OK);
        CreateFlickController();
        WIDGET_BREAK_IF(!mWidgetFlickControllerPtr);
        isBuilt = true;
    } while (0);
    return isBuilt;
}

void WidgetView::CreateFlickController()
{
    mWidgetFlickControllerPtr = std::make_shared<WidgetFlickController>();
    mWidgetFlickControllerPtr->SetWidgetFlickEventListener(this);
    mWidgetFlickControllerPtr->Activate("flickArea");
}

int WidgetView::AppendLayout(Evas_Object* parent)
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, -1);
    WIDGET_RETV_IF(!parent, -1);
    mCenterPageControllerPtr = CreatePage(parent, mWidgetViewDataPtr->GetIndexOfDisplayCity());
    WIDGET_RETV_IF(!mCenterPageControllerPtr, -1);
    PutPage(mCenterPageControllerPtr, kCenterSlot);
    ScheduleNeighbours();
    return NSWeather::ERR_OK;
}

// An idler runs after the idle enterer that draws the frame.
void WidgetView::ScheduleNeighbours()
{
    if (!mNeighbourIdler && mWidgetViewDataPtr && mWidgetViewDataPtr->GetNumberOfCities() >= 2)
        mNeighbourIdler = ecore_idler_add(NeighbourIdlerCb, this);
}

Eina_Bool WidgetView::NeighbourIdlerCb(void* data)
{
    NSWeather::ForwardCallback<WidgetView>(
        data,
        [](WidgetView& self)
        {
            self.mNeighbourIdler = nullptr;
            self.BuildMissingNeighbours();
        },
        WIDGET_CALLBACK_SITE);
    return ECORE_CALLBACK_CANCEL;
}

bool WidgetView::CancelNeighbours()
{
    if (!mNeighbourIdler)
        return false;
    ecore_idler_del(mNeighbourIdler);
    mNeighbourIdler = nullptr;
    return true;
}

void WidgetView::EnsureNeighbours()
{
    if (CancelNeighbours())
        BuildMissingNeighbours();
}

void WidgetView::BuildMissingNeighbours()
{
    if (!mBaseLayout || !mWidgetViewDataPtr || mWidgetViewDataPtr->GetNumberOfCities() < 2)
        return;
    if (!mPrevPageControllerPtr)
        ResumeNeighbour(mPrevPageControllerPtr, kPrevSlot, mWidgetViewDataPtr->GetPrevCityIndex());
    if (!mNextPageControllerPtr)
        ResumeNeighbour(mNextPageControllerPtr, kNextSlot, mWidgetViewDataPtr->GetNextCityIndex());
}

// Follows the city the settings name, and rebuilds only when the indexes,
// the refresh time or the refreshing state changed (or when forced).
void WidgetView::Resume(bool forceUpdate)
{
    WIDGET_RET_IF(!mWidgetViewDataPtr);
    WidgetViewData& data = *mWidgetViewDataPtr;
    time_t lastRefreshedTime = data.GetLastRefreshedTime();
    int displayIndex = data.GetIndexOfDisplayCity();
    int prevIndex = data.GetPrevCityIndex();
    int nextIndex = data.GetNextCityIndex();
    int count = data.GetNumberOfCities();
    if (!mWidgetFlickControllerPtr && mBaseLayout)
        CreateFlickController();
    if (!mBaseLayout)
    {
        WIDGET_LOG("no need to update!");
        return;
    }
    if (count < 1)
    {
        mCenterPageControllerPtr.reset();
        mCenterPageControllerPtr = CreatePage(mBaseLayout, -1);
        if (!mCenterPageControllerPtr)
            WIDGET_LOG("mCenterPageControllerPtr NULL");
        PutPage(mCenterPageControllerPtr, kCenterSlot);
        mPrevPageControllerPtr.reset();
        mNextPageControllerPtr.reset();
        return;
    }
    WidgetMain* widgetMain = WidgetMain::GetInstance();
    WIDGET_RET_IF(!widgetMain);
    NSWeather::SettingPtr settingPtr = widgetMain->GetSettingPtr();
    WIDGET_RET_IF(!settingPtr);
    std::string locationId = settingPtr->GetCurrentCityLocationId();
    NSWeather::CityPtr cityPtr = data.GetCityPtrWithLocationId(locationId);
    if (!cityPtr)
    {
        WIDGET_LOG("mWidgetViewDataPtr->GetCityPtrWithLocationId(%s) failed. so we get the first city",
                   locationId.c_str());
        cityPtr = data.GetCityPtr(0);
    }
    WIDGET_RET_IF(!cityPtr);
    int p = data.GetPositionOfCity(cityPtr);
    int newNext = p + 1 >= count ? 0 : p + 1;
    int newPrev = p <= 0 ? count - 1 : p - 1;
    if (newPrev == prevIndex && newNext == nextIndex && displayIndex == p &&
        lastRefreshedTime == settingPtr->GetLastRefreshedTime() && !settingPtr->GetIsNowRefreshing() &&
        !forceUpdate)
    {
        WIDGET_LOG("No need to Update");
        return;
    }
    WIDGET_LOG("Update City Information on Widget");
    data.SetLocationIdOfDisplayCity(data.GetLocationId(p));
    data.SetLastRefreshedTime(settingPtr->GetLastRefreshedTime());
    if (mCenterPageControllerPtr)
        mCenterPageControllerPtr->Resume(data.GetIndexOfDisplayCity());
    if (count == 1)
    {
        mPrevPageControllerPtr.reset();
        mNextPageControllerPtr.reset();
        return;
    }
    if (mNeighbourIdler)
        return;
    ResumeNeighbour(mPrevPageControllerPtr, kPrevSlot, data.GetPrevCityIndex());
    ResumeNeighbour(mNextPageControllerPtr, kNextSlot, data.GetNextCityIndex());
}

void WidgetView::ResumeNeighbour(WidgetPageControllerPtr& controller, const char* slot, int index)
{
    if (controller)
    {
        controller->Resume(index);
        return;
    }
    controller = CreatePage(mBaseLayout, index);
    if (!controller)
    {
        WIDGET_LOG("%s NULL", slot == kPrevSlot ? "mPrevPageControllerPtr" : "mNextPageControllerPtr");
        return;
    }
    PutPage(controller, slot);
}

void WidgetView::Pause()
{
    for (auto* controller : {&mCenterPageControllerPtr, &mPrevPageControllerPtr, &mNextPageControllerPtr})
        if (*controller)
            (*controller)->Pause();
}

void WidgetView::Destroy()
{
    CancelNeighbours();
    if (mChangeableThemePtr)
        mChangeableThemePtr->DeinitChangeableTheme();
    for (auto* controller : {&mCenterPageControllerPtr, &mPrevPageControllerPtr, &mNextPageControllerPtr})
        if (*controller)
            (*controller)->Destroy();
    mWidgetFlickControllerPtr.reset();
    if (mWin)
    {
        evas_object_event_callback_del_full(mWin, EVAS_CALLBACK_DEL, WindowDelCb, this);
        evas_object_del(mWin);
        mWin = nullptr;
        mBaseLayout = nullptr;
    }
}

void WidgetView::TimeTick()
{
    for (auto* controller : {&mCenterPageControllerPtr, &mPrevPageControllerPtr, &mNextPageControllerPtr})
        if (*controller)
            (*controller)->TimeTick();
}

void WidgetView::Click(int x, int y)
{
    if (mCenterPageControllerPtr)
        mCenterPageControllerPtr->Click(x, y);
}

void WidgetView::ResizeWindow(int width, int height)
{
    WIDGET_RET_IF(mWin == NULL);
    evas_object_resize(mWin, width, height);
}

void WidgetView::ResizeBaseLayout(int width, int height)
{
    WIDGET_RET_IF(mBaseLayout == NULL);
    evas_object_resize(mBaseLayout, width, height);
}

// Shows the city at `index` and shares the choice through the settings
// row; the record as written, or null when it could not be written.
NSWeather::SettingPtr WidgetView::ShowCity(int index)
{
    std::string locationId = mWidgetViewDataPtr->GetLocationId(index);
    mWidgetViewDataPtr->SetLocationIdOfDisplayCity(locationId);
    time_t now = NSWeather::TimeUtil::GetCurrentTime();
    NSWeather::SettingPtr written = WidgetSettingWriter::Change(
        [&](const NSWeather::SettingPtr& settingPtr)
        {
            settingPtr->SetCurrentCityLocationId(locationId);
            settingPtr->SetLastRefreshedTime(now);
        });
    if (!written)
        WIDGET_LOG("the displayed city %s was not stored", locationId.c_str());
    return written;
}

void WidgetView::OnDisplayedNextCity()
{
    if (ShowNeighbourCity(true) != NSWeather::ERR_OK)
        WIDGET_LOG("Failed: OnDisplayedNextCity [%d]", -1);
}

void WidgetView::OnDisplayedPrevCity()
{
    if (ShowNeighbourCity(false) != NSWeather::ERR_OK)
        WIDGET_LOG("Failed: OnDisplayedPrevCity [%d]", -1);
}

// The end of a slide: the neighbour on the slide's side becomes the centre,
// and the slot it left gets the page of the city beyond it.
int WidgetView::ShowNeighbourCity(bool toNext)
{
    WIDGET_RETV_IF(!mWidgetViewDataPtr, -1);
    int cur = mWidgetViewDataPtr->GetIndexOfDisplayCity();
    int neighbour = toNext ? mWidgetViewDataPtr->GetNextCityIndex() : mWidgetViewDataPtr->GetPrevCityIndex();
    if (cur == neighbour)
        return NSWeather::ERR_OK;
    NSWeather::SettingPtr settingPtr = ShowCity(neighbour < 0 ? cur : neighbour);
    RotateSlots(toNext);
    WidgetPageControllerPtr& refilled = toNext ? mNextPageControllerPtr : mPrevPageControllerPtr;
    WidgetPageControllerPtr& kept = toNext ? mPrevPageControllerPtr : mNextPageControllerPtr;
    for (WidgetPageControllerPtr* controller : {&kept, &mCenterPageControllerPtr})
        if (*controller && settingPtr)
            (*controller)->SetSettingPtr(settingPtr);
    refilled.reset();
    refilled = CreatePage(mBaseLayout, toNext ? mWidgetViewDataPtr->GetNextCityIndex()
                                              : mWidgetViewDataPtr->GetPrevCityIndex());
    WIDGET_RETV_IF(!refilled, -1);
    PutPage(refilled, toNext ? kNextSlot : kPrevSlot);
    return NSWeather::ERR_OK;
}

// The incoming page becomes the centre, the centre the outgoing side's
// neighbour; the page pushed out is deleted with its slot content. The
// slide left its offset on the pages: they go back to their slots' places.
void WidgetView::RotateSlots(bool toNext)
{
    WIDGET_RET_IF(mBaseLayout == NULL);
    const char* incomingSlot = toNext ? kNextSlot : kPrevSlot;
    const char* outgoingSlot = toNext ? kPrevSlot : kNextSlot;
    for (const char* slot : {kPrevSlot, kCenterSlot, kNextSlot})
    {
        Evas_Object* content = elm_object_part_content_get(mBaseLayout, slot);
        if (content)
            evas_object_map_enable_set(content, EINA_FALSE);
    }
    Evas_Object* incoming = elm_object_part_content_unset(mBaseLayout, incomingSlot);
    Evas_Object* center = elm_object_part_content_unset(mBaseLayout, kCenterSlot);
    if (center)
        elm_object_part_content_set(mBaseLayout, outgoingSlot, center);
    if (incoming)
        elm_object_part_content_set(mBaseLayout, kCenterSlot, incoming);
    WidgetPageControllerPtr& incomingController = toNext ? mNextPageControllerPtr : mPrevPageControllerPtr;
    WidgetPageControllerPtr& outgoingController = toNext ? mPrevPageControllerPtr : mNextPageControllerPtr;
    outgoingController = mCenterPageControllerPtr;
    mCenterPageControllerPtr = incomingController;
    incomingController.reset();
}

}  // namespace NSWeatherWidget

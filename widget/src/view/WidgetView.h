#ifndef NSWEATHERWIDGET_WIDGET_VIEW_H
#define NSWEATHERWIDGET_WIDGET_VIEW_H

#include <Ecore.h>
#include <Evas.h>

#include <memory>

#include "ChangeableTheme.h"
#include "WidgetFlickController.h"
#include "WidgetFlickEventListener.h"
#include "WidgetPageController.h"
#include "WidgetViewData.h"

namespace NSWeatherWidget
{

// One instance's window: a base layout with three page slots (previous,
// centre, next) that the flick controller slides between cities.
class WidgetView : public WidgetFlickEventListener
{
public:
    WidgetView() = default;
    ~WidgetView() override;
    WidgetView(const WidgetView&) = delete;
    WidgetView& operator=(const WidgetView&) = delete;

    void OnDisplayedPrevCity() override;
    void OnDisplayedNextCity() override;
    void OnStartFlick(bool toNext) override;
    Evas_Object* OnGetPrevLayout() override;
    Evas_Object* OnGetCenterLayout() override;
    Evas_Object* OnGetNextLayout() override;
    Evas_Object* OnGetBaseLayout() override { return mBaseLayout; }
    int OnGetPrevCityIndex() override;
    int OnGetIndexOfDisplayCity() override;
    int OnGetNextCityIndex() override;
    int OnGetSizeType() override;
    int OnGetNumberOfCities() override;

    virtual void Resume(bool forceUpdate);
    virtual void Pause();
    virtual void Destroy();
    virtual void TimeTick();
    virtual void Click(int x, int y);
    virtual void Resize(Evas_Object*) {}
    // The base layout, or null; the view owns what it makes.
    virtual Evas_Object* Create(Evas_Object* parent, const WidgetViewDataPtr& widgetViewDataPtr);
    virtual void ResizeWindow(int width, int height);
    virtual void ResizeBaseLayout(int width, int height);

    WidgetPageControllerPtr CreatePage(Evas_Object* parent, int index);
    int AppendLayout(Evas_Object* parent);

    Evas_Object* GetWindow() const { return mWin; }
    WidgetPageControllerPtr GetCenterPageController() const { return mCenterPageControllerPtr; }
    WidgetPageControllerPtr GetPrevPageController() const { return mPrevPageControllerPtr; }
    WidgetPageControllerPtr GetNextPageController() const { return mNextPageControllerPtr; }

private:
    bool BuildPages();
    // Neighbour pages are off-screen: they are built once the first frame
    // is out, or at once when something needs them before that.
    void ScheduleNeighbours();
    // True when a build was pending.
    bool CancelNeighbours();
    void EnsureNeighbours();
    void BuildMissingNeighbours();
    static Eina_Bool NeighbourIdlerCb(void* data);
    void CreateFlickController();
    void PutPage(const WidgetPageControllerPtr& controller, const char* slot);
    // Keeps or creates the neighbour page of `slot` for the city at `index`.
    void ResumeNeighbour(WidgetPageControllerPtr& controller, const char* slot, int index);
    NSWeather::SettingPtr ShowCity(int index);
    void RotateSlots(bool toNext);
    int ShowNeighbourCity(bool toNext);
    static Evas_Object* LayoutOf(const WidgetPageControllerPtr& controller);
    static void WindowDelCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);

    Evas_Object* mWin = nullptr;
    Ecore_Idler* mNeighbourIdler = nullptr;
    Evas_Object* mBaseLayout = nullptr;
    WidgetPageControllerPtr mPrevPageControllerPtr;
    WidgetPageControllerPtr mCenterPageControllerPtr;
    WidgetPageControllerPtr mNextPageControllerPtr;
    WidgetViewDataPtr mWidgetViewDataPtr;
    WidgetFlickControllerPtr mWidgetFlickControllerPtr;
    NSWeather::ChangeableThemePtr mChangeableThemePtr;
};

}  // namespace NSWeatherWidget

#endif

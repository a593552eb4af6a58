#ifndef NSWEATHERWIDGET_WIDGET_PAGE_CONTROLLER_H
#define NSWEATHERWIDGET_WIDGET_PAGE_CONTROLLER_H

#include <Evas.h>

#include <memory>

#include "Setting.h"
#include "WidgetPage.h"
#include "WidgetPageData.h"

namespace NSWeatherWidget
{

// Drives one page and its data for the view: which city a page shows is
// given as a position in the city list; -1 asks for the no-city page.
class WidgetPageController
{
public:
    virtual ~WidgetPageController() = default;
    virtual void Initialize() = 0;
    virtual Evas_Object* Create(Evas_Object* parent, int index);
    virtual void Resume(int index);
    virtual void Pause();
    virtual void Destroy();
    virtual void Click(int x, int y);
    virtual void TimeTick();
    virtual void UpdateRefreshButton(bool stop);

    Evas_Object* GetBaseLayout() const;
    void SetSettingPtr(const NSWeather::SettingPtr& settingPtr);
    WidgetPagePtr GetWidgetPage() const { return mWidgetPagePtr; }
    WidgetPageDataPtr GetWidgetPageData() const { return mWidgetPageDataPtr; }

protected:
    WidgetPagePtr mWidgetPagePtr;
    WidgetPageDataPtr mWidgetPageDataPtr;
};

using WidgetPageControllerPtr = std::shared_ptr<WidgetPageController>;

}  // namespace NSWeatherWidget

#endif

#ifndef NSWEATHERWIDGET_WIDGET_PAGE_H
#define NSWEATHERWIDGET_WIDGET_PAGE_H

#include <Evas.h>

#include <memory>

#include "WidgetPageData.h"

namespace NSWeatherWidget
{

// One page of a widget view: owns its toolkit layouts and draws the state
// of its page data.
class WidgetPage
{
public:
    virtual ~WidgetPage() = default;
    virtual void Resume() = 0;
    virtual void Pause() = 0;
    virtual void Destroy() = 0;
    virtual void TimeTick() = 0;
    virtual void Click(int x, int y) = 0;
    // The page's base layout (owned by the page until a parent takes it),
    // or null on failure.
    virtual Evas_Object* Create(Evas_Object* parent, const WidgetPageDataPtr& widgetPageDataPtr) = 0;
    virtual void UpdateRefreshButton(bool stop) = 0;

    Evas_Object* GetBaseLayout() const { return mBaseLayout; }

protected:
    Evas_Object* mBaseLayout = nullptr;
};

using WidgetPagePtr = std::shared_ptr<WidgetPage>;

}  // namespace NSWeatherWidget

#endif

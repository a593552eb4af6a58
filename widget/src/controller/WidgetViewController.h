#ifndef NSWEATHERWIDGET_WIDGET_VIEW_CONTROLLER_H
#define NSWEATHERWIDGET_WIDGET_VIEW_CONTROLLER_H

#include <Evas.h>

#include <memory>
#include <string>

#include "WidgetViewData.h"

namespace NSWeatherWidget
{

class WidgetView;
using WidgetViewPtr = std::shared_ptr<WidgetView>;

// Joins one widget instance's model and view to the application: loads
// the city list and settings into the model and forwards the lifecycle.
class WidgetViewController
{
public:
    WidgetViewController() = default;
    virtual ~WidgetViewController() = default;

    void Initialize();
    // The view's base layout, or null (the instance then has no view).
    Evas_Object* Create(Evas_Object* parent);
    void Resume(bool force);
    void Pause();
    void Destroy();
    void Resize(Evas_Object* parent);
    void ResizeWindow(int width, int height);
    void ResizeBaseLayout(int width, int height);
    int GetSizeType() const;
    void SetSizeType(int sizeType);
    std::shared_ptr<std::string> GetIdStringPtr() const;
    void SetIdStringPtr(const std::shared_ptr<std::string>& idStringPtr);
    void SetLocationIdOfDisplayCity(const std::string& locationId);
    WidgetViewDataPtr GetWidgetViewData() const { return mWidgetViewDataPtr; }
    WidgetViewPtr GetWidgetView() const { return mWidgetViewPtr; }

private:
    WidgetViewPtr mWidgetViewPtr;
    WidgetViewDataPtr mWidgetViewDataPtr;
};

}  // namespace NSWeatherWidget

#endif

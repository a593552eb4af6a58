#ifndef NSWEATHERWIDGET_WIDGET_4X2_PAGE_H
#define NSWEATHERWIDGET_WIDGET_4X2_PAGE_H

#include <Evas.h>

#include <string>

#include "WidgetPage.h"
#include "WidgetTouchController.h"
#include "WidgetTouchEventListener.h"

namespace NSWeatherWidget
{

// The 4x2 page: one city (or no city, or loading) with its current
// weather, a bottom line with the update time, the provider logo and the
// refresh button. The 4x4 page extends it with the forecast.
class Widget4x2Page : public WidgetPage, public WidgetTouchEventListener
{
public:
    Widget4x2Page() = default;
    ~Widget4x2Page() override;
    Widget4x2Page(const Widget4x2Page&) = delete;
    Widget4x2Page& operator=(const Widget4x2Page&) = delete;

    void Resume() override;
    void Pause() override { UpdateRefreshButton(true); }
    void Destroy() override {}
    void TimeTick() override {}
    void Click(int, int) override {}
    Evas_Object* Create(Evas_Object* parent, const WidgetPageDataPtr& widgetPageDataPtr) override;
    void UpdateRefreshButton(bool stop) override;
    int RequestUrl() override;
    int LaunchApp() override;
    int Refresh() override;

    int UpdatePage();

protected:
    virtual std::string GetEdjPath() const;
    virtual bool GetIs4x4() const { return false; }
    // Hooks for the sizes with more to show under today's weather.
    virtual bool AddCityExtras(Evas_Object*) { return true; }
    virtual void UpdateCityExtras(Evas_Object*) {}
    virtual void EmitToday(const char* signal);

    Evas_Object* LoadLayout(Evas_Object* parent, const char* group);
    Evas_Object* LoadImage(Evas_Object* parent, const std::string& imageName);
    bool SetPartImage(Evas_Object* layout, const char* part, const std::string& imageName);
    Evas_Object* GetCityPart(const char* part) const;

    Evas_Object* mNoCityLayout = nullptr;
    Evas_Object* mCityLayout = nullptr;
    Evas_Object* mActivityIndicator = nullptr;
    Evas_Object* mRefreshButtonIcon = nullptr;
    WidgetPageDataPtr mWidgetPageDataPtr;
    WidgetTouchControllerPtr mWidgetTouchControllerPtr;

private:
    bool BuildState();
    bool GetIsCityLayoutReusable() const;
    static const char* GetCityNameGroup(bool isCurrentLocation);
    bool GetIsLoading(bool isNetworkAvailable, bool isLocationEnabled) const;
    Evas_Object* CreateNoCityLayout(bool isLoading);
    Evas_Object* CreateCityLayout();
    void ReleaseStateLayouts();
    int UpdateNoCityPage();
    int UpdateCityPage();
    void ShowBottomLineMessage(const char* message);
    void UpdateCityAccessibleName();
    static void SetButtonAccessibleName(Evas_Object* bottomLine, const char* effectPart,
                                        const std::string& name, const std::string& description);
    bool UpdateBottomLine(Evas_Object* bottomLine);
    void UpdateLogo(Evas_Object* bottomLine);
    Evas_Object* CreateActivityIndicator(Evas_Object* parent);
    static void TodaySignalCb(void* data, Evas_Object* obj, const char* emission, const char* source);
    static void BaseLayoutDelCb(void* data, Evas* evas, Evas_Object* obj, void* eventInfo);
};

}  // namespace NSWeatherWidget

#endif

#include "Widget4x2Page.h"

#include <Edje.h>
#include <Elementary.h>
#include <libintl.h>
#include <uxt_theme.h>

#include "AppLauncher.h"
#include "ContentProvider.h"
#include "ElementaryHelper.h"
#include "Location.h"
#include "NetworkConnection.h"
#include "WeatherDefine.h"
#include "Widget4x2PageData.h"
#include "WidgetAccessible.h"
#include "WidgetAccessibleText.h"
#include "CallbackTrampoline.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

namespace
{
const char* const kTextDomain = "weather-m";
const char* const kRefreshImage = "weather_box_ic_refresh.png";
// What the bottom line emits for a tap on the logo or the refresh button.
const WidgetAccessible::TapSignal kLogoTap = {"cpLogoClicked", "cpLogoEffect"};
const WidgetAccessible::TapSignal kRefreshTap = {"refreshIconClicked", "refreshButtonEffect"};
// The providers' home pages, with our partner code.
const char* const kProviderUrls[] = {"https://www.accuweather.com/?partner=quorvexweather",
                                     "https://www.weather.com.cn/?partner=quorvexweather",
                                     "https://www.kweather.co.kr/?partner=quorvexweather",
                                     "https://www.weathernews.co.kr/?partner=quorvexweather",
                                     "https://weathernews.jp/?partner=quorvexweather"};

const char* Tr(const char* id)
{
    return dgettext(kTextDomain, id);
}

bool IsNetworkAvailable()
{
    NSWeather::NetworkConnection networkConnection;
    return networkConnection.IsNetworkAvailable();
}

bool IsLocationEnabled()
{
    NSWeather::Location location;
    return location.IsLocationEnabled();
}
}  // namespace

Widget4x2Page::~Widget4x2Page()
{
    mWidgetTouchControllerPtr.reset();
    if (mBaseLayout)
    {
        evas_object_event_callback_del_full(mBaseLayout, EVAS_CALLBACK_DEL, BaseLayoutDelCb, this);
        evas_object_del(mBaseLayout);
    }
}

std::string Widget4x2Page::GetEdjPath() const
{
    return Widget4x2PageData::GetEdjPath();
}

// A parent that deletes the page's layout (a view slot taking other
// content) leaves the page with nothing to draw on.
void Widget4x2Page::BaseLayoutDelCb(void* data, Evas*, Evas_Object*, void*)
{
    NSWeather::ForwardCallback<Widget4x2Page>(
        data,
        [](Widget4x2Page& self)
        {
            self.mWidgetTouchControllerPtr.reset();
            self.mBaseLayout = nullptr;
            self.mNoCityLayout = nullptr;
            self.mCityLayout = nullptr;
            self.mActivityIndicator = nullptr;
            self.mRefreshButtonIcon = nullptr;
        },
        WIDGET_CALLBACK_SITE);
}

Evas_Object* Widget4x2Page::LoadLayout(Evas_Object* parent, const char* group)
{
    NSWeather::ElementaryHelper helper;
    Evas_Object* layout = helper.CreateMultiLayout(parent, GetEdjPath(), group);
    if (layout)
        evas_object_show(layout);
    return layout;
}

Evas_Object* Widget4x2Page::LoadImage(Evas_Object* parent, const std::string& imageName)
{
    if (imageName.empty())
        return nullptr;
    NSWeather::ElementaryHelper helper;
    return helper.CreateMultiImage(parent, WidgetPageData::GetResourceEdjPath(), imageName);
}

// Keeps the image a part already shows under that name: a page filled
// again mostly shows the same images.
bool Widget4x2Page::SetPartImage(Evas_Object* layout, const char* part, const std::string& imageName)
{
    Evas_Object* shown = elm_object_part_content_get(layout, part);
    const char* group = nullptr;
    if (shown && !imageName.empty())
    {
        elm_image_file_get(shown, nullptr, &group);
        if (group && imageName == group)
            return true;
    }
    Evas_Object* image = LoadImage(layout, imageName);
    if (!image)
        return false;
    elm_object_part_content_set(layout, part, image);
    return true;
}

Evas_Object* Widget4x2Page::GetCityPart(const char* part) const
{
    return mCityLayout ? elm_object_part_content_get(mCityLayout, part) : nullptr;
}

Evas_Object* Widget4x2Page::Create(Evas_Object* parent, const WidgetPageDataPtr& widgetPageDataPtr)
{
    WIDGET_RETV_IF(parent == NULL, nullptr);
    mWidgetPageDataPtr = widgetPageDataPtr;
    WIDGET_RETV_IF(!mWidgetPageDataPtr, nullptr);
    mBaseLayout = LoadLayout(parent, "widgetPage");
    WIDGET_RETV_IF(mBaseLayout == NULL, nullptr);
    evas_object_event_callback_add(mBaseLayout, EVAS_CALLBACK_DEL, BaseLayoutDelCb, this);
    if (!BuildState())
    {
        evas_object_del(mBaseLayout);
        return nullptr;
    }
    return mBaseLayout;
}

// A city page that stays a city page of the same kind is filled again in
// place: loading its layouts anew would cost most of an update.
void Widget4x2Page::Resume()
{
    WIDGET_RET_IF(mBaseLayout == NULL);
    if (GetIsCityLayoutReusable() && UpdatePage() == NSWeather::ERR_OK)
        return;
    ReleaseStateLayouts();
    BuildState();
}

bool Widget4x2Page::GetIsCityLayoutReusable() const
{
    NSWeather::CityPtr cityPtr = mWidgetPageDataPtr ? mWidgetPageDataPtr->GetCityPtr() : nullptr;
    Evas_Object* cityNameLayout = GetCityPart("cityNameSwallow");
    if (!cityPtr || !cityNameLayout)
        return false;
    const char* group = nullptr;
    elm_layout_file_get(cityNameLayout, nullptr, &group);
    return group && std::string(group) == GetCityNameGroup(mWidgetPageDataPtr->GetIsCurrentCity(cityPtr));
}

const char* Widget4x2Page::GetCityNameGroup(bool isCurrentLocation)
{
    return isCurrentLocation ? "cityNameCurrentLocation" : "cityName";
}

void Widget4x2Page::ReleaseStateLayouts()
{
    mWidgetTouchControllerPtr.reset();
    for (Evas_Object** layout : {&mCityLayout, &mNoCityLayout})
    {
        if (*layout)
            evas_object_del(*layout);
        *layout = nullptr;
    }
    mActivityIndicator = nullptr;
    mRefreshButtonIcon = nullptr;
}

bool Widget4x2Page::GetIsLoading(bool isNetworkAvailable, bool isLocationEnabled) const
{
    NSWeather::SettingPtr settingPtr = mWidgetPageDataPtr->GetSettingPtr();
    return settingPtr && settingPtr->GetUseCurrentLocationOn() && settingPtr->GetShowCurrentCityAgreement() &&
           mWidgetPageDataPtr->GetIsNowRefreshing() && isNetworkAvailable && isLocationEnabled;
}

bool Widget4x2Page::BuildState()
{
    if (!mWidgetPageDataPtr->GetCityPtr())
    {
        mNoCityLayout = CreateNoCityLayout(GetIsLoading(IsNetworkAvailable(), IsLocationEnabled()));
        WIDGET_RETV_IF(mNoCityLayout == NULL, false);
    }
    else
    {
        mCityLayout = CreateCityLayout();
        WIDGET_RETV_IF(mCityLayout == NULL, false);
    }
    WIDGET_RETV_IF(UpdatePage() != NSWeather::ERR_OK, false);
    return true;
}

Evas_Object* Widget4x2Page::CreateNoCityLayout(bool isLoading)
{
    mWidgetTouchControllerPtr.reset();
    Evas_Object* layout = LoadLayout(mBaseLayout, isLoading ? "loading" : "noCity");
    if (!layout)
        return nullptr;
    if (!isLoading)
    {
        Evas_Object* content = LoadLayout(layout, "noCityContent");
        if (content)
            elm_object_part_content_set(layout, "content", content);
    }
    elm_object_part_content_set(mBaseLayout, "content", layout);
    mWidgetTouchControllerPtr = std::make_shared<WidgetTouchController>();
    mWidgetTouchControllerPtr->Add(layout, "backgroundTouchArea");
    mWidgetTouchControllerPtr->SetWidgetTouchEventListener(this);
    return layout;
}

Evas_Object* Widget4x2Page::CreateCityLayout()
{
    Evas_Object* cityLayout = LoadLayout(mBaseLayout, "city");
    WIDGET_RETV_IF(cityLayout == NULL, nullptr);
    elm_object_part_content_set(mBaseLayout, "content", cityLayout);
    bool isCurrent = mWidgetPageDataPtr->GetIsCurrentCity(mWidgetPageDataPtr->GetCityPtr());
    Evas_Object* cityNameLayout = LoadLayout(cityLayout, GetCityNameGroup(isCurrent));
    Evas_Object* iconAndtemperatureLayout = LoadLayout(cityLayout, "iconAndTemperature");
    Evas_Object* bottomLineLayout = LoadLayout(cityLayout, "bottomLine");
    Evas_Object* cpLogoLayout =
        bottomLineLayout ? LoadLayout(bottomLineLayout, "BottomLinePressEffect") : nullptr;
    Evas_Object* refreshButtonEffect =
        bottomLineLayout ? LoadLayout(bottomLineLayout, "BottomLinePressEffect") : nullptr;
    bool isComplete = false;
    do
    {
        WIDGET_BREAK_IF(cityNameLayout == NULL);
        WIDGET_BREAK_IF(iconAndtemperatureLayout == NULL);
        WIDGET_BREAK_IF(bottomLineLayout == NULL);
        WIDGET_BREAK_IF(cpLogoLayout == NULL);
        WIDGET_BREAK_IF(refreshButtonEffect == NULL);
        elm_object_part_content_set(cityLayout, "cityNameSwallow", cityNameLayout);
        elm_object_part_content_set(cityLayout, "iconAndTemperatureSwallow", iconAndtemperatureLayout);
        elm_object_part_content_set(cityLayout, "bottomLineSwallow", bottomLineLayout);
        elm_object_part_content_set(bottomLineLayout, "cpLogoEffect", cpLogoLayout);
        elm_object_part_content_set(bottomLineLayout, "refreshButtonEffect", refreshButtonEffect);
        WidgetAccessible::AddButton(cpLogoLayout, kLogoTap);
        WidgetAccessible::AddButton(refreshButtonEffect, kRefreshTap);
        if (isCurrent)
            elm_object_signal_emit(cityLayout, "receiver,invisible,localtime", "localTime");
        isComplete = AddCityExtras(cityLayout);
    } while (0);
    if (!isComplete)
    {
        evas_object_del(cityLayout);
        return nullptr;
    }
    elm_object_signal_callback_add(cityLayout, "sender,pressed,widgettoday", "todayTouchArea", TodaySignalCb,
                                   this);
    elm_object_signal_callback_add(cityLayout, "sender,unpressed,widgettoday", "todayTouchArea",
                                   TodaySignalCb, this);
    mWidgetTouchControllerPtr = std::make_shared<WidgetTouchController>();
    mWidgetTouchControllerPtr->Add(cityLayout, "todayTouchArea");
    mWidgetTouchControllerPtr->SetWidgetTouchEventListener(this);
    return cityLayout;
}

void Widget4x2Page::TodaySignalCb(void* data, Evas_Object*, const char* emission, const char*)
{
    NSWeather::ForwardCallback<Widget4x2Page>(
        data,
        [emission](Widget4x2Page& self)
        {
            WIDGET_RET_IF(emission == NULL);
            bool pressed = std::string(emission) == "sender,pressed,widgettoday";
            self.EmitToday(pressed ? "receiver,pressed,widgettoday" : "receiver,unpressed,widgettoday");
        },
        WIDGET_CALLBACK_SITE);
}

void Widget4x2Page::EmitToday(const char* signal)
{
    Evas_Object* cityNameLayout = GetCityPart("cityNameSwallow");
    Evas_Object* iconAndTemperatureLayout = GetCityPart("iconAndTemperatureSwallow");
    WIDGET_RET_IF(cityNameLayout == NULL || iconAndTemperatureLayout == NULL);
    elm_object_signal_emit(cityNameLayout, signal, "cityName");
    elm_object_signal_emit(iconAndTemperatureLayout, signal, "iconAndTemperature");
}

int Widget4x2Page::UpdatePage()
{
    WIDGET_RETV_IF(mBaseLayout == NULL, -1);
    WIDGET_RETV_IF(!mWidgetPageDataPtr, -1);
    if (!mWidgetPageDataPtr->GetCityPtr())
        return UpdateNoCityPage();
    return UpdateCityPage();
}

int Widget4x2Page::UpdateNoCityPage()
{
    WIDGET_RETV_IF(mNoCityLayout == NULL, -1);
    bool isLoading = GetIsLoading(IsNetworkAvailable(), IsLocationEnabled());
    // A no-city layout has a "content" part, a loading layout has none.
    bool isNoCityLayout = edje_object_part_exists(elm_layout_edje_get(mNoCityLayout), "content");
    if (isLoading == isNoCityLayout)
    {
        Evas_Object* replacement = CreateNoCityLayout(isLoading);
        WIDGET_RETV_IF(replacement == NULL, -1);
        mNoCityLayout = replacement;
    }
    if (isLoading)
    {
        elm_object_part_text_set(mNoCityLayout, "message", Tr("IDS_DB_POP_LOADING_ING"));
        WidgetAccessible::Set(mNoCityLayout, WidgetAccessible::ROLE_BUTTON,
                              WidgetAccessibleText::GetLoadingName());
        return NSWeather::ERR_OK;
    }
    Evas_Object* content = elm_object_part_content_get(mNoCityLayout, "content");
    WIDGET_RETV_IF(content == NULL, -1);
    elm_object_part_text_set(content, "title", Tr("IDS_DB_TAB_WEATHER"));
    elm_object_part_text_set(content, "message", Tr("IDS_DB_NPBODY_TAP_HERE_TO_ADD_A_CITY"));
    WidgetAccessible::Set(mNoCityLayout, WidgetAccessible::ROLE_BUTTON,
                          WidgetAccessibleText::GetNoCityName());
    return NSWeather::ERR_OK;
}

int Widget4x2Page::UpdateCityPage()
{
    WIDGET_RETV_IF(mCityLayout == NULL, -1);
    const WidgetPageData& data = *mWidgetPageDataPtr;
    Evas_Object* cityNameLayout = GetCityPart("cityNameSwallow");
    Evas_Object* iconLayout = GetCityPart("iconAndTemperatureSwallow");
    Evas_Object* bottomLine = GetCityPart("bottomLineSwallow");
    WIDGET_RETV_IF(cityNameLayout == NULL || iconLayout == NULL || bottomLine == NULL, -1);

    std::string cityNameStr = data.GetCityName();
    WIDGET_RETV_IF(cityNameStr.length() < 1, -1);
    elm_object_part_text_set(cityNameLayout, "name", cityNameStr.c_str());
    elm_object_part_text_set(mCityLayout, "localTime", data.GetLocalTimeString().c_str());

    bool is4x4 = GetIs4x4();
    bool icon = SetPartImage(iconLayout, "icon", data.GetWeatherIconPath(is4x4, false));
    bool iconPress = SetPartImage(iconLayout, "iconPress", data.GetWeatherIconPath(is4x4, true));
    WIDGET_RETV_IF(!icon || !iconPress, -1);
    std::string current = data.GetCurrentTemperatureString();
    WIDGET_RETV_IF(current.length() < 1, -1);
    elm_object_part_text_set(iconLayout, "current", current.c_str());
    bool unit = SetPartImage(iconLayout, "currentUnit", data.GetTemperatureUnitIconPath(is4x4, false));
    bool unitPress =
        SetPartImage(iconLayout, "currentUnitPress", data.GetTemperatureUnitIconPath(is4x4, true));
    WIDGET_RETV_IF(!unit || !unitPress, -1);

    UpdateCityExtras(mCityLayout);
    WIDGET_RETV_IF(!UpdateBottomLine(bottomLine), -1);
    UpdateLogo(bottomLine);
    UpdateRefreshButton(false);
    UpdateCityAccessibleName();
    return NSWeather::ERR_OK;
}

// Read as drawn: the bottom line's reason instead of the update time when
// it shows one.
void Widget4x2Page::UpdateCityAccessibleName()
{
    Evas_Object* bottomLine = GetCityPart("bottomLineSwallow");
    WIDGET_RET_IF(bottomLine == NULL || !mWidgetPageDataPtr);
    const char* message = elm_object_part_text_get(bottomLine, "msg");
    WidgetAccessibleText text(*mWidgetPageDataPtr);
    WidgetAccessible::Set(mCityLayout, WidgetAccessible::ROLE_PANEL, text.GetCityName(message ? message : ""),
                          WidgetAccessibleText::GetCityDescription());
}

void Widget4x2Page::SetButtonAccessibleName(Evas_Object* bottomLine, const char* effectPart,
                                            const std::string& name, const std::string& description)
{
    Evas_Object* effect = elm_object_part_content_get(bottomLine, effectPart);
    WidgetAccessible::Set(WidgetAccessible::GetButton(effect), WidgetAccessible::ROLE_BUTTON, name,
                          description);
}

bool Widget4x2Page::UpdateBottomLine(Evas_Object* bottomLine)
{
    NSWeather::CityPtr cityPtr = mWidgetPageDataPtr->GetCityPtr();
    if (!IsNetworkAvailable())
    {
        WIDGET_LOG("Not updated bottomline : network is not available");
        ShowBottomLineMessage("IDS_IDLE_HEADER_NO_NETWORK_CONNECTION_ABB3");
        return true;
    }
    if (mWidgetPageDataPtr->GetIsCurrentCity(cityPtr) && !IsLocationEnabled())
    {
        WIDGET_LOG("Not updated bottomline : Location service is not available");
        ShowBottomLineMessage("IDS_AW_BODY_FAILED_TO_FIND_LOCATION_ABB2");
        return true;
    }
    std::string date = mWidgetPageDataPtr->GetUpdatedDate();
    std::string time = mWidgetPageDataPtr->GetUpdatedTime();
    WIDGET_RETV_IF(date.length() < 1, false);
    WIDGET_RETV_IF(time.length() < 1, false);
    elm_object_part_text_set(bottomLine, "date", date.c_str());
    elm_object_part_text_set(bottomLine, "time", time.c_str());
    elm_object_part_text_set(bottomLine, "msg", "");
    return true;
}

void Widget4x2Page::ShowBottomLineMessage(const char* message)
{
    Evas_Object* bottomLine = GetCityPart("bottomLineSwallow");
    WIDGET_RET_IF(bottomLine == NULL);
    elm_object_part_text_set(bottomLine, "date", "");
    elm_object_part_text_set(bottomLine, "time", "");
    elm_object_part_text_set(bottomLine, "msg", Tr(message));
    UpdateCityAccessibleName();
}

// A provider without a widget logo gets a page without one, not a
// failed page.
void Widget4x2Page::UpdateLogo(Evas_Object* bottomLine)
{
    std::string logo = mWidgetPageDataPtr->GetCPLogoIconPath();
    bool isShown = !logo.empty() && SetPartImage(bottomLine, "cpLogo", logo);
    // Where no logo is drawn, a tap must not open the provider's site.
    Evas_Object* effect = elm_object_part_content_get(bottomLine, "cpLogoEffect");
    if (effect)
        evas_object_pass_events_set(effect, !isShown);
    SetButtonAccessibleName(bottomLine, "cpLogoEffect",
                            WidgetAccessibleText::GetLogoName(isShown ? logo : ""),
                            isShown ? WidgetAccessibleText::GetLogoDescription() : std::string());
    if (isShown)
        return;
    WIDGET_LOG("no provider logo: %s", logo.c_str());
    Evas_Object* old = elm_object_part_content_unset(bottomLine, "cpLogo");
    if (old)
        evas_object_del(old);
}

Evas_Object* Widget4x2Page::CreateActivityIndicator(Evas_Object* parent)
{
    NSWeather::ElementaryHelper helper;
    Evas_Object* indicator = helper.CreateActivityIndicator(parent, "process_small");
    if (!indicator)
        return nullptr;
    // Desktop themes have no small process style; their wheel is the same
    // spinning circle.
    if (!elm_theme_group_path_find(nullptr, "elm/progressbar/horizontal/process_small"))
    {
        const double kWheelScale = 0.6;  // fits the refresh button's square
        elm_object_style_set(indicator, "wheel");
        elm_object_scale_set(indicator, kWheelScale);
    }
    uxt_theme_object_replace_color(indicator, "W157E1", "AO803E1");
    uxt_theme_object_replace_color(indicator, "W157E2", "AO803E2");
    uxt_theme_object_replace_color(indicator, "W157E3", "AO803E3");
    return indicator;
}

void Widget4x2Page::UpdateRefreshButton(bool stop)
{
    WIDGET_RET_IF(!mWidgetPageDataPtr);
    Evas_Object* bottomLine = GetCityPart("bottomLineSwallow");
    if (!bottomLine)
        return;
    bool isRefreshing = !stop && mWidgetPageDataPtr->GetIsNowRefreshing();
    SetButtonAccessibleName(bottomLine, "refreshButtonEffect",
                            WidgetAccessibleText::GetRefreshName(isRefreshing),
                            WidgetAccessibleText::GetRefreshDescription());
    if (isRefreshing)
    {
        if (!mActivityIndicator)
            mActivityIndicator = CreateActivityIndicator(bottomLine);
        elm_object_part_content_set(bottomLine, "refreshButton", mActivityIndicator);
        mRefreshButtonIcon = nullptr;
        return;
    }
    if (!mRefreshButtonIcon)
        mRefreshButtonIcon = LoadImage(bottomLine, kRefreshImage);
    elm_object_part_content_set(bottomLine, "refreshButton", mRefreshButtonIcon);
    mActivityIndicator = nullptr;
}

int Widget4x2Page::Refresh()
{
    WIDGET_RETV_IF(mActivityIndicator != NULL, -1);
    WIDGET_RETV_IF(!mWidgetPageDataPtr, -1);
    Evas_Object* bottomLine = GetCityPart("bottomLineSwallow");
    WIDGET_RETV_IF(bottomLine == NULL, -1);
    if (!IsNetworkAvailable())
    {
        ShowBottomLineMessage("IDS_IDLE_HEADER_NO_NETWORK_CONNECTION_ABB3");
        return -1;
    }
    if (mWidgetPageDataPtr->GetIsCurrentCity(mWidgetPageDataPtr->GetCityPtr()) && !IsLocationEnabled())
    {
        ShowBottomLineMessage("IDS_AW_BODY_FAILED_TO_FIND_LOCATION_ABB2");
        return -1;
    }
    // No indicator and no mark for a request the agent never got: the
    // page would spin for 90 s over nothing.
    NSWeather::AppLauncher appLauncher;
    if (appLauncher.RequestRefreshToAgent() != NSWeather::ERR_OK)
    {
        WIDGET_LOG("RequestRefreshToAgent failed");
        return -1;
    }
    mActivityIndicator = CreateActivityIndicator(bottomLine);
    elm_object_part_content_set(bottomLine, "refreshButton", mActivityIndicator);
    elm_object_part_text_set(bottomLine, "msg", "");
    if (!mWidgetPageDataPtr->SetIsNowRefreshing(true))
        WIDGET_LOG("SetIsNowRefreshing failed");
    mRefreshButtonIcon = nullptr;
    SetButtonAccessibleName(bottomLine, "refreshButtonEffect", WidgetAccessibleText::GetRefreshName(true),
                            WidgetAccessibleText::GetRefreshDescription());
    UpdateCityAccessibleName();
    WIDGET_LOG("refresh button clicked");
    return NSWeather::ERR_OK;
}

int Widget4x2Page::LaunchApp()
{
    NSWeather::AppLauncher appLauncher;
    NSWeather::CityPtr cityPtr = mWidgetPageDataPtr ? mWidgetPageDataPtr->GetCityPtr() : nullptr;
    int result = (!mNoCityLayout && cityPtr)
                     ? appLauncher.RequestLaunchApplicationWithLocationId(cityPtr->GetLocationId())
                     : appLauncher.RequestLaunchApplicationForAddCity();
    if (result != NSWeather::ERR_OK)
        WIDGET_LOG("RequestLaunchApplication failed");
    if (mBaseLayout)
        elm_object_signal_emit(mBaseLayout, "play,touchSound", "elm");
    return result;
}

int Widget4x2Page::RequestUrl()
{
    int provider = NSWeather::ContentProvider::GetContentProvider();
    const int count = static_cast<int>(sizeof(kProviderUrls) / sizeof(kProviderUrls[0]));
    const char* url = kProviderUrls[provider >= 0 && provider < count ? provider : 0];
    NSWeather::AppLauncher appLauncher;
    int result = appLauncher.RequestLaunchingBrowserWithUrl(url);
    if (result != NSWeather::ERR_OK)
        WIDGET_LOG("RequestLaunchingBrowserWithUrl failed");
    return result;
}

}  // namespace NSWeatherWidget

// The accessibility interface of Elementary 1.26 is behind the beta switch;
// announcing a change takes its protected part.
#define EFL_BETA_API_SUPPORT 1
#define EFL_ACCESS_OBJECT_PROTECTED 1
#include "WidgetAccessible.h"

#include <Elementary.h>

#include "CallbackTrampoline.h"
#include "WidgetLog.h"

namespace NSWeatherWidget
{

namespace
{
Efl_Access_Role GetEflRole(WidgetAccessible::Role role)
{
    return role == WidgetAccessible::ROLE_BUTTON ? EFL_ACCESS_ROLE_PUSH_BUTTON : EFL_ACCESS_ROLE_PANEL;
}

bool IsAccessible(const Evas_Object* object)
{
    return object && efl_isa(object, EFL_ACCESS_OBJECT_MIXIN);
}

const char* OrNull(const std::string& text)
{
    return text.empty() ? nullptr : text.c_str();
}

// The button's parent is its target; the target's parent holds it.
Eina_Bool ButtonActivateCb(void* data, Evas_Object* button, Elm_Access_Action_Info*)
{
    return NSWeather::ForwardCallback<const WidgetAccessible::TapSignal>(
        data,
        [button](const WidgetAccessible::TapSignal& tap) -> Eina_Bool
        {
            Evas_Object* target = elm_object_parent_widget_get(button);
            Evas_Object* holder = target ? elm_object_parent_widget_get(target) : nullptr;
            WIDGET_RETV_IF(holder == NULL, EINA_FALSE);
            elm_object_signal_emit(holder, tap.emission, tap.source);
            return EINA_TRUE;
        },
        WIDGET_CALLBACK_SITE, EINA_FALSE);
}
}  // namespace

void WidgetAccessible::Set(Evas_Object* object, Role role, const std::string& name,
                           const std::string& description)
{
    WIDGET_RET_IF(!IsAccessible(object));
    efl_access_object_role_set(object, GetEflRole(role));
    efl_access_object_description_set(object, OrNull(description));
    efl_access_object_access_type_set(object,
                                      name.empty() ? EFL_ACCESS_TYPE_SKIPPED : EFL_ACCESS_TYPE_REGULAR);
    if (GetName(object) == name)
        return;
    efl_access_object_i18n_name_set(object, OrNull(name));
    efl_access_object_event_emit(object, EFL_ACCESS_OBJECT_EVENT_PROPERTY_CHANGED,
                                 const_cast<char*>("i18n_name"));
}

std::string WidgetAccessible::GetName(const Evas_Object* object)
{
    const char* name = IsAccessible(object) ? efl_access_object_i18n_name_get(object) : nullptr;
    return name ? name : std::string();
}

Evas_Object* WidgetAccessible::AddButton(Evas_Object* target, const TapSignal& tap)
{
    WIDGET_RETV_IF(target == NULL, nullptr);
    Evas_Object* button = elm_access_object_register(target, target);
    WIDGET_RETV_IF(button == NULL, nullptr);
    elm_access_action_cb_set(button, ELM_ACCESS_ACTION_ACTIVATE, ButtonActivateCb, &tap);
    Set(button, ROLE_BUTTON, std::string());
    return button;
}

Evas_Object* WidgetAccessible::GetButton(const Evas_Object* target)
{
    return target ? elm_access_object_get(target) : nullptr;
}

}  // namespace NSWeatherWidget

#include "ElementaryHelper.h"

#include <cstdlib>
#include <memory>

#include <app_resource_manager.h>

#include "UICommonLog.h"

namespace NSWeather
{

std::string ElementaryHelper::CreateMultiResPath(const std::string& name)
{
    std::string id = "edje/" + name;
    char* edjPath = nullptr;
    int ret = app_resource_manager_init();
    if (ret == APP_RESOURCE_ERROR_NONE)
        ret = app_resource_manager_get(APP_RESOURCE_TYPE_LAYOUT, id.c_str(), &edjPath);
    std::unique_ptr<char, decltype(&free)> owner(edjPath, &free);
    UI_COMMON_LOG("[CreateMultiResPath] input : %s, edj path : %s, ret = %d", id.c_str(),
                  edjPath ? edjPath : "(null)", ret);
    UI_COMMON_RETV_IF(ret != 0 || edjPath == NULL, std::string());
    return std::string(edjPath);
}

Evas_Object* ElementaryHelper::CreateLayout(Evas_Object* parent, const std::string& file,
                                            const std::string& group)
{
    UI_COMMON_RETV_IF(parent == NULL, nullptr);
    Evas_Object* layout = elm_layout_add(parent);
    if (layout && !file.empty() && !group.empty() &&
        !elm_layout_file_set(layout, file.c_str(), group.c_str()))
    {
        UI_COMMON_LOG("elm_layout_file_set is failed. file: %s, group: %s", file.c_str(), group.c_str());
        evas_object_del(layout);
        return nullptr;
    }
    return layout;
}

Evas_Object* ElementaryHelper::CreateMultiLayout(Evas_Object* parent, const std::string& name,
                                                 const std::string& group)
{
    std::string str = CreateMultiResPath(name);
    UI_COMMON_RETV_IF(str.length() < 1, nullptr);
    Evas_Object* retEvas = CreateLayout(parent, str, group);
    UI_COMMON_RETV_IF(retEvas == NULL, nullptr);
    return retEvas;
}

Evas_Object* ElementaryHelper::CreateImage(Evas_Object* parent, const std::string& file,
                                           const std::string& group)
{
    UI_COMMON_RETV_IF(parent == NULL, nullptr);
    Evas_Object* image = elm_image_add(parent);
    UI_COMMON_RETV_IF(image == NULL, nullptr);
    elm_image_file_set(image, file.c_str(), group.empty() ? nullptr : group.c_str());
    return image;
}

Evas_Object* ElementaryHelper::CreateMultiImage(Evas_Object* parent, const std::string& name,
                                                const std::string& group)
{
    std::string str = CreateMultiResPath(name);
    UI_COMMON_RETV_IF(str.length() < 1, nullptr);
    Evas_Object* retEvas = CreateImage(parent, str, group);
    UI_COMMON_RETV_IF(retEvas == NULL, nullptr);
    return retEvas;
}

Evas_Object* ElementaryHelper::CreateActivityIndicator(Evas_Object* parent, const std::string& style)
{
    UI_COMMON_RETV_IF(parent == NULL, nullptr);
    UI_COMMON_RETV_IF(style.length() <= 0, nullptr);
    Evas_Object* progressbar = elm_progressbar_add(parent);
    UI_COMMON_RETV_IF(progressbar == NULL, nullptr);
    if (!elm_object_style_set(progressbar, style.c_str()))
        UI_COMMON_LOG("elm_object_style_set failed");
    evas_object_size_hint_align_set(progressbar, EVAS_HINT_FILL, 0.5);
    evas_object_size_hint_weight_set(progressbar, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_show(progressbar);
    elm_progressbar_pulse_set(progressbar, EINA_TRUE);
    elm_progressbar_pulse(progressbar, EINA_TRUE);
    return progressbar;
}

}  // namespace NSWeather

#define EDJE_EDIT_IS_UNSTABLE_AND_I_KNOW_ABOUT_IT
#include "widget/ObjectTreeDumper.h"

#include <Edje_Edit.h>
#include <Elementary.h>

#include <algorithm>
#include <cstring>

#include "core/JsonText.h"

// Stable class getters of Evas and Edje whose headers sit behind the beta switch.
extern "C" const Efl_Class* efl_canvas_layout_class_get(void);
extern "C" const Efl_Class* efl_canvas_group_class_get(void);
extern "C" const Efl_Class* efl_access_object_mixin_get(void);
extern "C" const char* efl_access_object_i18n_name_get(const Eo* obj);

namespace platform
{

namespace
{
// Deeper trees than this are not drawn by any widget; stop runaway walks.
const int kMaxDepth = 64;

bool IsType(Evas_Object* object, const char* type)
{
    const char* actual = evas_object_type_get(object);
    return actual && strcmp(actual, type) == 0;
}

bool IsElmImage(Evas_Object* object)
{
    return IsType(object, "elm_image") || IsType(object, "elm_icon") ||
           IsType(object, "Efl.Ui.Image_Legacy") || IsType(object, "Elm.Icon");
}

std::string Field(const std::string& name, const std::string& jsonValue)
{
    return ObjectTreeDumper::Quote(name) + ":" + jsonValue;
}

// What a screen reader reads for the object, if anything.
std::string GetAccessibleName(Evas_Object* object)
{
    const char* name =
        efl_isa(object, efl_access_object_mixin_get()) ? efl_access_object_i18n_name_get(object) : nullptr;
    return name ? name : std::string();
}

std::string Join(const std::vector<std::string>& items)
{
    std::string out;
    for (const auto& item : items) out += (out.empty() ? "" : ",") + item;
    return out;
}
}  // namespace

ObjectTreeDumper::ObjectTreeDumper() = default;

ObjectTreeDumper::~ObjectTreeDumper()
{
    if (mScratch)
        ecore_evas_free(mScratch);
}

// Canvas texts come from stored files another process wrote: bytes that
// are not UTF-8 must not break the line's JSON.
std::string ObjectTreeDumper::Quote(const std::string& text)
{
    return JsonString(text);
}

std::string ObjectTreeDumper::Dump(Evas* canvas)
{
    if (!canvas)
        return "null";
    evas_smart_objects_calculate(canvas);
    // Widgets put their layouts straight on the canvas, beside the window
    // object: walk every top-level object, bottom to top.
    std::vector<std::string> objects;
    for (Evas_Object* object = evas_object_bottom_get(canvas); object; object = evas_object_above_get(object))
    {
        std::string node = DumpObject(object, 0);
        if (!node.empty())
            objects.push_back(node);
    }
    return "{" + Field("objects", "[" + Join(objects) + "]") + "}";
}

long ObjectTreeDumper::Count(Evas* canvas)
{
    long count = 0;
    for (Evas_Object* object = canvas ? evas_object_bottom_get(canvas) : nullptr; object;
         object = evas_object_above_get(object))
        count += CountObject(object, 0);
    return count;
}

long ObjectTreeDumper::CountObject(Evas_Object* object, int depth)
{
    long count = 1;
    if (depth > kMaxDepth || !efl_isa(object, efl_canvas_group_class_get()))
        return count;
    Eina_List* members = evas_object_smart_members_get(object);
    void* item = nullptr;
    EINA_LIST_FREE(members, item) count += CountObject(static_cast<Evas_Object*>(item), depth + 1);
    return count;
}

std::string ObjectTreeDumper::DumpObject(Evas_Object* object, int depth)
{
    if (!object || depth > kMaxDepth)
        return std::string();
    std::vector<std::string> fields;
    std::vector<Evas_Object*> swallowed;
    bool interesting = false;
    const char* type = evas_object_type_get(object);
    fields.push_back(Field("type", Quote(type ? type : "")));
    if (const char* name = evas_object_name_get(object))
        fields.push_back(Field("name", Quote(name)));
    int x = 0, y = 0, w = 0, h = 0;
    evas_object_geometry_get(object, &x, &y, &w, &h);
    fields.push_back(Field("visible", evas_object_visible_get(object) ? "true" : "false"));
    fields.push_back(Field("geometry", "[" + std::to_string(x) + "," + std::to_string(y) + "," +
                                           std::to_string(w) + "," + std::to_string(h) + "]"));
    std::string accessibleName = GetAccessibleName(object);
    if (!accessibleName.empty())
        fields.push_back(Field("accessibleName", Quote(accessibleName)));
    if (efl_isa(object, efl_canvas_layout_class_get()))
    {
        fields.push_back(DescribeLayout(object, swallowed, depth));
        interesting = true;
    }
    else if (IsElmImage(object) || IsType(object, "image"))
    {
        fields.push_back(DescribeImage(object));
        interesting = true;
    }
    else if (IsType(object, "text") || IsType(object, "textblock"))
    {
        const char* text = IsType(object, "text") ? evas_object_text_text_get(object)
                                                  : evas_object_textblock_text_markup_get(object);
        fields.push_back(Field("text", Quote(text ? text : "")));
        interesting = true;
    }
    std::string children = DumpChildren(object, swallowed, depth);
    if (!children.empty())
        fields.push_back(Field("children", "[" + children + "]"));
    if (!interesting && children.empty())
        return std::string();
    return "{" + Join(fields) + "}";
}

std::string ObjectTreeDumper::DescribeLayout(Evas_Object* layout, std::vector<Evas_Object*>& swallowed,
                                             int depth)
{
    const char* file = nullptr;
    const char* group = nullptr;
    edje_object_file_get(layout, &file, &group);
    std::vector<std::string> texts;
    std::vector<std::string> swallows;
    for (const auto& part : GetParts(file ? file : "", group ? group : ""))
    {
        if (part.second == EDJE_PART_TYPE_TEXT || part.second == EDJE_PART_TYPE_TEXTBLOCK)
        {
            const char* text = edje_object_part_text_get(layout, part.first.c_str());
            texts.push_back(Field(part.first, Quote(text ? text : "")));
        }
        else if (part.second == EDJE_PART_TYPE_SWALLOW)
        {
            Evas_Object* content = edje_object_part_swallow_get(layout, part.first.c_str());
            std::string node = content ? DumpObject(content, depth + 1) : std::string();
            if (content)
                swallowed.push_back(content);
            swallows.push_back(Field(part.first, node.empty() ? "null" : node));
        }
    }
    return Field("file", Quote(file ? file : "")) + "," + Field("group", Quote(group ? group : "")) + "," +
           Field("texts", "{" + Join(texts) + "}") + "," + Field("swallows", "{" + Join(swallows) + "}");
}

std::string ObjectTreeDumper::DescribeImage(Evas_Object* object)
{
    const char* file = nullptr;
    const char* group = nullptr;
    if (IsElmImage(object))
        elm_image_file_get(object, &file, &group);
    else
        evas_object_image_file_get(object, &file, &group);
    return Field("file", Quote(file ? file : "")) + "," + Field("group", Quote(group ? group : ""));
}

std::string ObjectTreeDumper::DumpChildren(Evas_Object* object, const std::vector<Evas_Object*>& skip,
                                           int depth)
{
    if (!efl_isa(object, efl_canvas_group_class_get()))
        return std::string();
    Eina_List* members = evas_object_smart_members_get(object);
    std::vector<std::string> children;
    void* item = nullptr;
    EINA_LIST_FREE(members, item)
    {
        auto* child = static_cast<Evas_Object*>(item);
        if (std::find(skip.begin(), skip.end(), child) != skip.end())
            continue;
        std::string node = DumpObject(child, depth + 1);
        if (!node.empty())
            children.push_back(node);
    }
    return Join(children);
}

const ObjectTreeDumper::PartList& ObjectTreeDumper::GetParts(const std::string& file,
                                                             const std::string& group)
{
    std::string key = file + "\n" + group;
    auto found = mPartCache.find(key);
    if (found != mPartCache.end())
        return found->second;
    PartList& parts = mPartCache[key];
    if (file.empty() || group.empty())
        return parts;
    if (!mScratch)
        mScratch = ecore_evas_buffer_new(1, 1);
    Evas_Object* editor = mScratch ? edje_edit_object_add(ecore_evas_get(mScratch)) : nullptr;
    if (editor && edje_object_file_set(editor, file.c_str(), group.c_str()))
    {
        Eina_List* names = edje_edit_parts_list_get(editor);
        Eina_List* node = nullptr;
        void* name = nullptr;
        EINA_LIST_FOREACH(names, node, name)
        {
            auto* partName = static_cast<const char*>(name);
            parts.emplace_back(partName, edje_edit_part_type_get(editor, partName));
        }
        edje_edit_string_list_free(names);
    }
    if (editor)
        evas_object_del(editor);
    return parts;
}

}  // namespace platform

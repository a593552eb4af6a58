#ifndef NSWEATHER_ELEMENTARY_HELPER_H
#define NSWEATHER_ELEMENTARY_HELPER_H

#include <memory>
#include <string>

#include <Elementary.h>

namespace NSWeather
{

// Makes the toolkit objects that pages are built from. Every object made
// here belongs to its parent and dies with it; an empty result (nullptr or
// empty text) means failure and has been logged.
class ElementaryHelper
{
public:
    ElementaryHelper() = default;
    ~ElementaryHelper() = default;

    // Full path of a resource file (e.g. "widget/WidgetResources.edj") for
    // the device's resolution, through the resource manager.
    std::string CreateMultiResPath(const std::string& name);

    // An empty file or group makes a bare layout.
    Evas_Object* CreateLayout(Evas_Object* parent, const std::string& file, const std::string& group);
    Evas_Object* CreateMultiLayout(Evas_Object* parent, const std::string& name, const std::string& group);

    // An empty group loads `file` as a plain image.
    Evas_Object* CreateImage(Evas_Object* parent, const std::string& file, const std::string& group);
    Evas_Object* CreateMultiImage(Evas_Object* parent, const std::string& name, const std::string& group);

    // A pulsing, shown progress bar of the given style.
    Evas_Object* CreateActivityIndicator(Evas_Object* parent, const std::string& style);
};

typedef std::shared_ptr<ElementaryHelper> ElementaryHelperPtr;

}  // namespace NSWeather

#endif

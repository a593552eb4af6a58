#ifndef PLATFORM_WIDGET_OBJECT_TREE_DUMPER_H
#define PLATFORM_WIDGET_OBJECT_TREE_DUMPER_H

#include <Ecore_Evas.h>
#include <Evas.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace platform
{

// Describes the content of a canvas as one line of JSON, {"objects": [...]}
// with its top-level objects bottom to top: for each
// layout object its file, group, the texts of its text parts and what each
// swallow part holds; for each image its file and group (or key); texts of
// text objects; the name a screen reader reads, for objects that have
// one. Objects that hold none of these (rectangles, clippers) are
// left out unless something below them counts.
class ObjectTreeDumper
{
public:
    ObjectTreeDumper();
    ~ObjectTreeDumper();
    ObjectTreeDumper(const ObjectTreeDumper&) = delete;
    ObjectTreeDumper& operator=(const ObjectTreeDumper&) = delete;

    std::string Dump(Evas* canvas);
    // Every object of the canvas, the members of smart objects included:
    // what a leak of objects makes grow.
    static long Count(Evas* canvas);

    static std::string Quote(const std::string& text);

private:
    static long CountObject(Evas_Object* object, int depth);
    using PartList = std::vector<std::pair<std::string, int>>;  // name, Edje_Part_Type

    // Empty when the object and everything below it hold nothing of interest.
    std::string DumpObject(Evas_Object* object, int depth);
    std::string DescribeLayout(Evas_Object* layout, std::vector<Evas_Object*>& swallowed, int depth);
    std::string DescribeImage(Evas_Object* object);
    std::string DumpChildren(Evas_Object* object, const std::vector<Evas_Object*>& skip, int depth);
    const PartList& GetParts(const std::string& file, const std::string& group);

    std::map<std::string, PartList> mPartCache;
    Ecore_Evas* mScratch = nullptr;
};

}  // namespace platform

#endif

#include "widget/CanvasSnapshot.h"

#include <cstring>

namespace platform
{

std::string CanvasSnapshot::Save(Evas_Object* window, const std::string& path, int& width, int& height)
{
    Ecore_Evas* ee = window ? ecore_evas_ecore_evas_get(evas_object_evas_get(window)) : nullptr;
    if (!ee)
        return "the instance has no window";
    const char* engine = ecore_evas_engine_name_get(ee);
    evas_smart_objects_calculate(ecore_evas_get(ee));
    ecore_evas_manual_render(ee);
    ecore_evas_geometry_get(ee, nullptr, nullptr, &width, &height);
    if (!engine || strcmp(engine, "buffer") != 0)
        return CaptureWithSnapshotObject(ee, path, width, height);
    const void* pixels = ecore_evas_buffer_pixels_get(ee);
    if (!pixels || width <= 0 || height <= 0)
        return "the window has no pixels";
    return WritePixels(pixels, width, height, path);
}

std::string CanvasSnapshot::CaptureWithSnapshotObject(Ecore_Evas* ee, const std::string& path, int width,
                                                      int height)
{
    if (width <= 0 || height <= 0)
        return "the window has no size";
    Evas_Object* snapshot = evas_object_image_filled_add(ecore_evas_get(ee));
    evas_object_image_snapshot_set(snapshot, EINA_TRUE);
    evas_object_layer_set(snapshot, EVAS_LAYER_MAX);
    evas_object_geometry_set(snapshot, 0, 0, width, height);
    evas_object_pass_events_set(snapshot, EINA_TRUE);
    evas_object_show(snapshot);
    // The first render places the object, the second fills it.
    ecore_evas_manual_render(ee);
    ecore_evas_manual_render(ee);
    Eina_Bool saved = evas_object_image_save(snapshot, path.c_str(), nullptr, nullptr);
    evas_object_del(snapshot);
    return saved ? std::string() : "could not write " + path;
}

std::string CanvasSnapshot::WritePixels(const void* pixels, int width, int height, const std::string& path)
{
    Ecore_Evas* scratch = ecore_evas_buffer_new(width, height);
    if (!scratch)
        return "no canvas for the copy";
    Evas_Object* image = evas_object_image_filled_add(ecore_evas_get(scratch));
    evas_object_image_colorspace_set(image, EVAS_COLORSPACE_ARGB8888);
    evas_object_image_alpha_set(image, EINA_TRUE);
    evas_object_image_size_set(image, width, height);
    evas_object_image_data_copy_set(image, const_cast<void*>(pixels));
    Eina_Bool saved = evas_object_image_save(image, path.c_str(), nullptr, nullptr);
    ecore_evas_free(scratch);
    return saved ? std::string() : "could not write " + path;
}

}  // namespace platform

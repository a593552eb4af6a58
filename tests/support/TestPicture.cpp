#include "TestPicture.h"

#include <Ecore_Evas.h>

namespace WeatherTest
{

TestPicture TestPicture::Load(const std::string& path)
{
    TestPicture picture;
    ecore_evas_init();
    Ecore_Evas* canvas = ecore_evas_buffer_new(1, 1);
    Evas_Object* image = evas_object_image_add(ecore_evas_get(canvas));
    evas_object_image_file_set(image, path.c_str(), nullptr);
    if (evas_object_image_load_error_get(image) == EVAS_LOAD_ERROR_NONE)
    {
        evas_object_image_size_get(image, &picture.width, &picture.height);
        auto* data = static_cast<const uint32_t*>(evas_object_image_data_get(image, EINA_FALSE));
        if (data)
            picture.pixels.assign(data, data + static_cast<size_t>(picture.width) * picture.height);
        else
            picture.width = picture.height = 0;
    }
    ecore_evas_free(canvas);
    ecore_evas_shutdown();
    return picture;
}

uint32_t TestPicture::At(int x, int y) const
{
    if (x < 0 || y < 0 || x >= width || y >= height)
        return 1;
    return pixels[static_cast<size_t>(y) * width + x];
}

}  // namespace WeatherTest

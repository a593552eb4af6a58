// picture-check [--colours N] [WxH] FILE [[WxH] FILE]...: fails unless
// every picture loads, has the size named before it (if any) and shows at
// least N distinct colours (default 16), so a blank or one-colour
// picture is caught. Evas reads the files, as the widget's own images.
#include <Ecore_Evas.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <unordered_set>

namespace
{

struct Expectation
{
    int width = 0;  // 0: any size
    int height = 0;
    size_t colours = 16;
};

bool ParseSize(const char* text, Expectation& expectation)
{
    int width = 0;
    int height = 0;
    char end = 0;
    if (sscanf(text, "%dx%d%c", &width, &height, &end) != 2 || width <= 0 || height <= 0)
        return false;
    expectation.width = width;
    expectation.height = height;
    return true;
}

// Distinct pixel values, counted up to `limit`.
size_t CountColours(const uint32_t* pixels, int width, int height, int strideBytes, size_t limit)
{
    std::unordered_set<uint32_t> seen;
    for (int y = 0; y < height && seen.size() < limit; ++y)
    {
        const uint32_t* row = pixels + static_cast<size_t>(y) * (strideBytes / 4);
        for (int x = 0; x < width && seen.size() < limit; ++x) seen.insert(row[x]);
    }
    return seen.size();
}

bool Check(Evas* canvas, const char* file, const Expectation& expectation)
{
    Evas_Object* image = evas_object_image_add(canvas);
    evas_object_image_file_set(image, file, nullptr);
    Evas_Load_Error error = evas_object_image_load_error_get(image);
    int width = 0;
    int height = 0;
    evas_object_image_size_get(image, &width, &height);
    const void* data =
        error == EVAS_LOAD_ERROR_NONE ? evas_object_image_data_get(image, EINA_FALSE) : nullptr;
    bool ok = false;
    if (!data)
        printf("%s: cannot be read (%s)\n", file, evas_load_error_str(error));
    else if (expectation.width && (width != expectation.width || height != expectation.height))
        printf("%s: %dx%d, not %dx%d\n", file, width, height, expectation.width, expectation.height);
    else
    {
        size_t colours = CountColours(static_cast<const uint32_t*>(data), width, height,
                                      evas_object_image_stride_get(image), expectation.colours);
        ok = colours >= expectation.colours;
        printf("%s: %dx%d, %s%zu colours\n", file, width, height, ok ? "at least " : "only ", colours);
    }
    evas_object_del(image);
    return ok;
}

}  // namespace

int main(int argc, char** argv)
{
    Expectation expectation;
    int first = 1;
    if (argc > 2 && strcmp(argv[1], "--colours") == 0)
    {
        expectation.colours = static_cast<size_t>(std::max(1, atoi(argv[2])));
        first = 3;
    }
    if (first >= argc)
    {
        fprintf(stderr, "usage: picture-check [--colours N] [WxH] FILE [[WxH] FILE]...\n");
        return 2;
    }
    if (!ecore_evas_init())
        return 2;
    Ecore_Evas* scratch = ecore_evas_buffer_new(1, 1);
    int failures = 0;
    for (int i = first; i < argc; ++i)
        if (!ParseSize(argv[i], expectation))
            failures += scratch && Check(ecore_evas_get(scratch), argv[i], expectation) ? 0 : 1;
    if (scratch)
        ecore_evas_free(scratch);
    ecore_evas_shutdown();
    return failures == 0 ? 0 : 1;
}

#ifndef WEATHER_TESTS_TEST_PICTURE_H
#define WEATHER_TESTS_TEST_PICTURE_H

#include <cstdint>
#include <string>
#include <vector>

namespace WeatherTest
{

// A picture file read through Evas, as the widget's own images are:
// premultiplied ARGB pixels, row by row. Empty when it cannot be read.
struct TestPicture
{
    static TestPicture Load(const std::string& path);
    // The pixel at (x, y); 1 (not a colour Evas writes) outside the picture.
    uint32_t At(int x, int y) const;

    int width = 0;
    int height = 0;
    std::vector<uint32_t> pixels;
};

}  // namespace WeatherTest

#endif

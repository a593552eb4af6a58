// Elementary is initialised once for the whole test binary, headless.
#include <Elementary.h>
#include <gtest/gtest.h>

#include <cstdlib>

namespace
{
class ElmEnvironment : public ::testing::Environment
{
public:
    void SetUp() override
    {
        // CTest does not always pass the build folder on; the tests that
        // read built resources need it.
        setenv("WEATHER_BUILD_DIR", WEATHER_TEST_BUILD_DIR, 0);
        setenv("ELM_ENGINE", "buffer", 1);
        ASSERT_GT(elm_init(0, nullptr), 0);
    }
    void TearDown() override { elm_shutdown(); }
};

const ::testing::Environment* const gElmEnvironment = ::testing::AddGlobalTestEnvironment(new ElmEnvironment);
}  // namespace

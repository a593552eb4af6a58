// Elementary is initialised once for the whole test binary, headless.
// Test binaries that make widgets link the weather-test-elm objects.
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
        setenv("ELM_ENGINE", "buffer", 1);
        ASSERT_GT(elm_init(0, nullptr), 0);
    }
    void TearDown() override { elm_shutdown(); }
};

const ::testing::Environment* const gElmEnvironment = ::testing::AddGlobalTestEnvironment(new ElmEnvironment);
}  // namespace

// Every test of every test program runs on a fresh platform root of its
// own, with or without a platform fixture, so that nothing a test writes or
// logs reaches the user's default root. The fixtures' roots nest inside.
// Linked into each test program by the weather-test-root object library.
#include <gtest/gtest.h>

#include <memory>

#include "TestPlatform.h"

namespace
{
using WeatherTest::TestPlatformRoot;

class PerTestRoot : public ::testing::EmptyTestEventListener
{
public:
    // The program's root serves the test environments' set-up and tear-down.
    void OnTestProgramStart(const ::testing::UnitTest&) override
    {
        mProgramRoot = std::make_unique<TestPlatformRoot>();
    }
    void OnTestStart(const ::testing::TestInfo&) override
    {
        mTestRoot = std::make_unique<TestPlatformRoot>();
    }
    void OnTestEnd(const ::testing::TestInfo&) override { mTestRoot.reset(); }
    void OnTestProgramEnd(const ::testing::UnitTest&) override { mProgramRoot.reset(); }

private:
    std::unique_ptr<TestPlatformRoot> mProgramRoot;
    std::unique_ptr<TestPlatformRoot> mTestRoot;
};

const bool gRootPerTest = (::testing::UnitTest::GetInstance()->listeners().Append(new PerTestRoot), true);
}  // namespace

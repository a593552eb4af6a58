#include "core/PlatformRoot.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cstdlib>

#include "TestPlatform.h"

namespace
{
using WeatherTest::PlatformTest;

class PlatformRootTest : public PlatformTest
{
};

TEST_F(PlatformRootTest, RootComesFromEnvironmentWithoutTrailingSlash)
{
    EXPECT_EQ(platform::RootDir(), mRoot.GetPath());
    setenv("PLATFORM_ROOT", (mRoot.GetPath() + "//").c_str(), 1);
    EXPECT_EQ(platform::RootDir(), mRoot.GetPath());
    EXPECT_EQ(platform::AppDir("a/b"), "");
    EXPECT_EQ(platform::AppDir(".."), "");
}

TEST_F(PlatformRootTest, AtomicWriteReplacesContentAndMode)
{
    std::string file = mRoot.Path("key");
    ASSERT_TRUE(platform::WriteFileAtomic(file, "first"));
    ASSERT_TRUE(platform::WriteFileAtomic(file, "second", 0600));
    std::string content;
    ASSERT_TRUE(platform::ReadFile(file, content));
    EXPECT_EQ(content, "second");
    struct stat st;
    ASSERT_EQ(stat(file.c_str(), &st), 0);
    EXPECT_EQ(st.st_mode & 0777, 0600u);
}

TEST_F(PlatformRootTest, AtomicWriteIntoMissingFolderFailsCleanly)
{
    EXPECT_FALSE(platform::WriteFileAtomic(mRoot.Path("missing/key"), "x"));
    EXPECT_TRUE(platform::MakeDirs(mRoot.Path("a/b/c")));
    EXPECT_TRUE(platform::MakeDirs(mRoot.Path("a/b/c")));
    EXPECT_FALSE(platform::MakeDirs(""));
}
}  // namespace

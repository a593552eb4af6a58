#include "core/PlatformRoot.h"

#include <gtest/gtest.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <functional>

#include "TestFiles.h"
#include "TestPlatform.h"

namespace
{
using WeatherTest::PlatformTest;

class PlatformRootTest : public PlatformTest
{
protected:
    unsigned Mode(const std::string& path) const
    {
        struct stat st;
        return lstat(path.c_str(), &st) == 0 ? st.st_mode & 07777 : 0u;
    }
    void ExpectRefused(const std::string& root)
    {
        SCOPED_TRACE(root);
        setenv("PLATFORM_ROOT", root.c_str(), 1);
        std::string why;
        EXPECT_FALSE(platform::CheckRoot(why));
        EXPECT_NE(why.find(root), std::string::npos) << why;
        EXPECT_EQ(platform::RootPath("vconf"), "");
        EXPECT_EQ(platform::AppDir("com.quorvex.weather-m"), "");
        setenv("PLATFORM_ROOT", mRoot.GetPath().c_str(), 1);
    }
};

TEST_F(PlatformRootTest, RootComesFromEnvironmentWithoutTrailingSlash)
{
    EXPECT_EQ(platform::RootDir(), mRoot.GetPath());
    setenv("PLATFORM_ROOT", (mRoot.GetPath() + "//").c_str(), 1);
    EXPECT_EQ(platform::RootDir(), mRoot.GetPath());
    EXPECT_EQ(platform::AppDir("a/b"), "");
    EXPECT_EQ(platform::AppDir(".."), "");
}

TEST_F(PlatformRootTest, RootThatOthersCanWriteOrRedirectIsRefused)
{
    const std::string good = mRoot.Path("good");
    ASSERT_EQ(mkdir(good.c_str(), 0700), 0);
    const struct
    {
        const char* name;
        std::function<bool(const std::string&)> make;
    } kCases[] = {
        {"mode 0777",
         [](const std::string& p) { return mkdir(p.c_str(), 0700) == 0 && chmod(p.c_str(), 0777) == 0; }},
        {"group write",
         [](const std::string& p) { return mkdir(p.c_str(), 0700) == 0 && chmod(p.c_str(), 0770) == 0; }},
        {"link", [&good](const std::string& p) { return symlink(good.c_str(), p.c_str()) == 0; }},
        {"file", [](const std::string& p) { return mknod(p.c_str(), S_IFREG | 0600, 0) == 0; }},
    };
    for (const auto& item : kCases)
    {
        std::string root = mRoot.Path(item.name);
        ASSERT_TRUE(item.make(root)) << item.name;
        ExpectRefused(root);
    }
    EXPECT_EQ(Mode(good + "/vconf"), 0u) << "nothing made through the link";
}

TEST_F(PlatformRootTest, RootOfAnotherUserIsRefused)
{
    if (geteuid() != 0)
        GTEST_SKIP() << "giving a folder to another user needs root";
    std::string root = mRoot.Path("theirs");
    ASSERT_EQ(mkdir(root.c_str(), 0700), 0);
    ASSERT_EQ(chown(root.c_str(), 65534, 65534), 0);
    ExpectRefused(root);
}

TEST_F(PlatformRootTest, WhatThePlatformCreatesIsOwnerOnly)
{
    // The XDG fallback takes the path the /tmp fallback takes.
    unsetenv("PLATFORM_ROOT");
    setenv("XDG_RUNTIME_DIR", mRoot.GetPath().c_str(), 1);
    std::string root = mRoot.Path("weather-platform");
    EXPECT_EQ(platform::RootPath("log"), root + "/log");
    unsetenv("XDG_RUNTIME_DIR");
    EXPECT_EQ(Mode(root), 0700u);

    ASSERT_TRUE(platform::MakeDirs(mRoot.Path("a/b")));
    EXPECT_EQ(Mode(mRoot.Path("a/b")), 0700u);
    ASSERT_TRUE(platform::WriteFileAtomic(mRoot.Path("a/key"), "first"));
    EXPECT_EQ(Mode(mRoot.Path("a/key")), 0600u);
    WeatherTest::WriteText(mRoot.Path("a/old.log"), "old\n");
    chmod(mRoot.Path("a/old.log").c_str(), 0644);
    int fd = platform::OpenPrivateAppend(mRoot.Path("a/old.log"));
    ASSERT_GE(fd, 0);
    close(fd);
    EXPECT_EQ(Mode(mRoot.Path("a/old.log")), 0600u);
    EXPECT_FALSE(platform::WriteFileAtomic(mRoot.Path("missing/key"), "x"));
    EXPECT_FALSE(platform::MakeDirs(""));
}

TEST_F(PlatformRootTest, LinksAndSpecialFilesAreNeverFollowedOrRead)
{
    std::string target = mRoot.Path("target");
    WeatherTest::WriteText(target, "secret");
    std::string link = mRoot.Path("link");
    ASSERT_EQ(symlink(target.c_str(), link.c_str()), 0);
    std::string fifo = mRoot.Path("fifo");
    ASSERT_EQ(mkfifo(fifo.c_str(), 0600), 0);

    std::string content;
    EXPECT_FALSE(platform::ReadFile(link, content));
    EXPECT_EQ(errno, ELOOP);
    EXPECT_TRUE(platform::ReadFile(link, content, 64, true));
    EXPECT_EQ(content, "secret");
    for (const std::string& path : {fifo, mRoot.GetPath(), std::string("/dev/zero")})
    {
        EXPECT_FALSE(platform::ReadFile(path, content, 64, true)) << path;
        EXPECT_EQ(platform::OpenPrivateAppend(path), -1) << path;
    }
    EXPECT_EQ(platform::OpenPrivateAppend(link), -1);
    ASSERT_TRUE(platform::WriteFileAtomic(link, "replaced"));
    EXPECT_EQ(WeatherTest::ReadText(target), "secret");
}

TEST_F(PlatformRootTest, ReadsStopOneBytePastTheLimit)
{
    std::string file = mRoot.Path("big");
    WeatherTest::MakeSparseFile(file, 6);
    std::string content;
    EXPECT_TRUE(platform::ReadFile(file, content, 6));
    EXPECT_EQ(content.size(), 6u);
    EXPECT_FALSE(platform::ReadFile(file, content, 5));
    EXPECT_EQ(errno, EFBIG);

    WeatherTest::MakeSparseFile(file, 64L * 1024 * 1024);
    long before = WeatherTest::BytesReadSoFar();
    EXPECT_FALSE(platform::ReadFile(file, content, 1000));
    EXPECT_LT(WeatherTest::BytesReadSoFar() - before, 64 * 1024);
}

}  // namespace

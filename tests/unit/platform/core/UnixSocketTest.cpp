#include "core/UnixSocket.h"

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <string>
#include <vector>

#include "TestPlatform.h"

namespace
{
using platform::UnixBindResult;

class UnixSocketTest : public WeatherTest::PlatformTest
{
protected:
    void TearDown() override
    {
        for (int fd : mFds) close(fd);
    }

    UnixBindResult Bind(const std::string& path, int type, int& fd)
    {
        UnixBindResult result = platform::BindUnixSocket(path, type, 0600, fd);
        if (fd >= 0)
            mFds.push_back(fd);
        return result;
    }

    std::vector<int> mFds;
};

TEST_F(UnixSocketTest, PathThatDoesNotFitIsRefused)
{
    std::string path = mRoot.Path(std::string(sizeof(sockaddr_un::sun_path), 'p'));
    sockaddr_un address;
    EXPECT_FALSE(platform::MakeUnixAddress(path, address));
    int fd = 0;
    EXPECT_EQ(UnixBindResult::PATH_TOO_LONG, Bind(path, SOCK_STREAM, fd));
    EXPECT_EQ(-1, fd);
    EXPECT_EQ(-1, platform::ConnectUnixSocket(path, SOCK_STREAM));
}

TEST_F(UnixSocketTest, LiveSocketIsKeptAndStaleOneReplaced)
{
    std::string path = mRoot.Path("control.sock");
    int first = -1;
    mode_t oldMask = umask(022);
    ASSERT_EQ(UnixBindResult::BOUND, Bind(path, SOCK_STREAM, first));
    EXPECT_EQ(022u, umask(oldMask)) << "the process's mask must come back";
    struct stat st;
    ASSERT_EQ(0, stat(path.c_str(), &st));
    EXPECT_EQ(0600u, st.st_mode & 0777);
    ASSERT_EQ(0, listen(first, 1));

    int second = -1;
    EXPECT_EQ(UnixBindResult::IN_USE, Bind(path, SOCK_STREAM, second));
    EXPECT_EQ(-1, second);
    int client = platform::ConnectUnixSocket(path, SOCK_STREAM);
    EXPECT_GE(client, 0) << "the first owner must still answer";
    close(client);

    // Its owner ends without removing the file: the next one takes the path.
    close(mFds.back());
    mFds.pop_back();
    EXPECT_EQ(-1, platform::ConnectUnixSocket(path, SOCK_STREAM));
    EXPECT_EQ(UnixBindResult::BOUND, Bind(path, SOCK_STREAM, second));
    EXPECT_GE(second, 0);
}

TEST_F(UnixSocketTest, MissingFolderFailsWithoutADescriptor)
{
    int fd = 0;
    EXPECT_EQ(UnixBindResult::FAILED, Bind(mRoot.Path("no/such/folder/x.sock"), SOCK_DGRAM, fd));
    EXPECT_EQ(-1, fd);
    EXPECT_EQ(ENOENT, errno);
}

}  // namespace

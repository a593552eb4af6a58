#include "FileUtil.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include <ftw.h>
#include <sys/stat.h>

#include "TestPlatform.h"

namespace
{
using NSWeather::FileUtil;

const char* const kWidgetId = "com.quorvex.weather-m-widget";

int RemoveEntry(const char* path, const struct stat*, int, struct FTW*)
{
    return remove(path);
}

void RemoveTree(const std::string& path)
{
    nftw(path.c_str(), RemoveEntry, 16, FTW_DEPTH | FTW_PHYS);
}

bool IsDirectory(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

class FileUtilTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        // The caches are process-wide and every test has its own root.
        FileUtil::ClearCache();
        setenv("PLATFORM_APP_ID", kWidgetId, 1);
    }

    void TearDown() override
    {
        FileUtil::ClearCache();
        unsetenv("PLATFORM_APP_ID");
    }

    std::string WeatherAppDir() const { return mRoot.Path("apps/com.quorvex.weather-m"); }
    std::string WidgetResDir() const { return mRoot.Path("apps/com.quorvex.weather-m-widget/res/"); }
};

TEST_F(FileUtilTest, DatabasePathsLieInTheSharedDataDirectory)
{
    const std::string data = mRoot.SharedDataDir();
    EXPECT_EQ(FileUtil::GetSharedDataDirectoryPath(), data);
    EXPECT_EQ(FileUtil::GetWeatherDBFilePath(), data + "db/.weather.db");
    EXPECT_EQ(FileUtil::GetSettingDBFilePath(), data + "db/.setting.db");
    EXPECT_EQ(FileUtil::GetVersionDBFilePath(), data + "db/.version.db");
    EXPECT_EQ(FileUtil::GetShareTargetDataDBFilePath(), data + "db/.share_target.db");
    EXPECT_EQ(FileUtil::GetDBDirectoryPath(), data + "db");
    EXPECT_EQ(FileUtil::GetSharedResourceDirectoryPath(), WeatherAppDir() + "/shared/res/");
    EXPECT_EQ(FileUtil::GetResourceDirectoryPath(), WidgetResDir());
    EXPECT_EQ(FileUtil::GetWeatherNewsIconDBFilePath(), WidgetResDir() + "data/weathernews_icon.db");
}

TEST_F(FileUtilTest, FirstAnswerIsKeptEvenWhenThePlatformChanges)
{
    const std::string data = FileUtil::GetSharedDataDirectoryPath();
    const std::string sharedRes = FileUtil::GetSharedResourceDirectoryPath();
    const std::string res = FileUtil::GetResourceDirectoryPath();
    {
        WeatherTest::TestPlatformRoot other;
        ASSERT_NE(other.SharedDataDir(), data);
        EXPECT_EQ(FileUtil::GetSharedDataDirectoryPath(), data);
        EXPECT_EQ(FileUtil::GetSharedResourceDirectoryPath(), sharedRes);
        EXPECT_EQ(FileUtil::GetResourceDirectoryPath(), res);
    }
    FileUtil::ClearCache();
    WeatherTest::TestPlatformRoot other;
    EXPECT_EQ(FileUtil::GetSharedDataDirectoryPath(), other.SharedDataDir());
}

// Without the weather application every path is empty, and a failed
// lookup is not cached: the next call asks again.
TEST_F(FileUtilTest, FailedSharedLookupGivesEmptyPathsAndIsAskedAgain)
{
    RemoveTree(WeatherAppDir());
    for (auto get :
         {FileUtil::GetSharedDataDirectoryPath, FileUtil::GetSharedResourceDirectoryPath,
          FileUtil::GetWeatherDBFilePath, FileUtil::GetSettingDBFilePath, FileUtil::GetVersionDBFilePath,
          FileUtil::GetShareTargetDataDBFilePath, FileUtil::GetDBDirectoryPath})
        EXPECT_EQ(get(), "");

    mRoot.RegisterApp("com.quorvex.weather-m");
    EXPECT_EQ(FileUtil::GetSharedDataDirectoryPath(), mRoot.SharedDataDir());
    EXPECT_EQ(FileUtil::GetSharedResourceDirectoryPath(), WeatherAppDir() + "/shared/res/");
}

TEST_F(FileUtilTest, MissingOwnAppIdIsLoggedAndAskedAgain)
{
    unsetenv("PLATFORM_APP_ID");
    EXPECT_EQ(FileUtil::GetResourceDirectoryPath(), "");
    EXPECT_TRUE(mLog.Contains("app_get_resource_path : NULL", "weather-common")) << mLog.Dump();
    EXPECT_TRUE(mLog.Contains("(resourceDirPath == NULL) [return]", "weather-common"));

    EXPECT_EQ(FileUtil::GetWeatherNewsIconDBFilePath(), "");
    EXPECT_TRUE(mLog.Contains("[GetWeatherNewsIconDBFilePath(): "));

    setenv("PLATFORM_APP_ID", kWidgetId, 1);
    EXPECT_EQ(FileUtil::GetResourceDirectoryPath(), WidgetResDir());
}

TEST_F(FileUtilTest, MakeDirectoryCreatesOnlyNewDirectories)
{
    const std::string dir = mRoot.SharedDataDir() + "db";
    mode_t oldMask = umask(022);
    EXPECT_TRUE(FileUtil::MakeDirectory(dir));
    umask(oldMask);
    struct stat st;
    ASSERT_EQ(stat(dir.c_str(), &st), 0);
    EXPECT_TRUE(S_ISDIR(st.st_mode));
    EXPECT_EQ(st.st_mode & 0777, 0755u);

    mLog.Clear();
    EXPECT_FALSE(FileUtil::MakeDirectory(dir));
    EXPECT_TRUE(mLog.GetLines().empty()) << mLog.Dump();
}

TEST_F(FileUtilTest, MakeDirectoryReportsBadPaths)
{
    EXPECT_FALSE(FileUtil::MakeDirectory(""));
    EXPECT_TRUE(mLog.Contains("(path.length() < 1) [return]", "weather-common")) << mLog.Dump();

    const std::string orphan = mRoot.Path("no/such/parent");
    EXPECT_FALSE(FileUtil::MakeDirectory(orphan));
    EXPECT_FALSE(IsDirectory(orphan));
    EXPECT_TRUE(mLog.Contains("mkdir failed(path:" + orphan + "), errno:2", "weather-common")) << mLog.Dump();
}

}  // namespace

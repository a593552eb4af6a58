#ifndef WEATHER_TESTS_TEST_PLATFORM_H
#define WEATHER_TESTS_TEST_PLATFORM_H

#include <gtest/gtest.h>

#include <mutex>
#include <string>
#include <vector>

#include <dlog.h>

namespace WeatherTest
{

// A fresh platform root in a temporary folder, with the three applications
// of the suite registered (their folders exist). PLATFORM_ROOT points at it
// while the object lives; the folder is removed afterwards.
class TestPlatformRoot
{
public:
    TestPlatformRoot();
    ~TestPlatformRoot();
    TestPlatformRoot(const TestPlatformRoot&) = delete;
    TestPlatformRoot& operator=(const TestPlatformRoot&) = delete;

    const std::string& GetPath() const { return mPath; }
    std::string Path(const std::string& relative) const { return mPath + "/" + relative; }
    // "<root>/apps/com.quorvex.weather-m/shared/data/"
    std::string SharedDataDir() const;
    void RegisterApp(const std::string& appId) const;
    // Registers the application with `conf` as its app.conf.
    void RegisterApp(const std::string& appId, const std::string& conf) const;
    // Points each suite application's res/ and shared/res/ at the build
    // tree's resource folders (<build>/res/<app id>/...), as an install would.
    void UseBuildResources() const;

private:
    std::string mPath;
    std::string mOldRoot;
    bool mHadOldRoot = false;
};

struct LogLine
{
    log_priority prio;
    std::string tag;
    std::string text;
};

// Collects every dlog line of this process while it lives.
class LogCapture
{
public:
    LogCapture();
    ~LogCapture();
    LogCapture(const LogCapture&) = delete;
    LogCapture& operator=(const LogCapture&) = delete;

    std::vector<LogLine> GetLines() const;
    // Lines whose text contains `part` (and, if given, whose tag is `tag`).
    int Count(const std::string& part, const std::string& tag = std::string()) const;
    bool Contains(const std::string& part, const std::string& tag = std::string()) const
    {
        return Count(part, tag) > 0;
    }
    void Clear();
    // All texts, one per line, for failure messages.
    std::string Dump() const;

private:
    static void CaptureCb(log_priority prio, const char* tag, const char* text, void* data);
    mutable std::mutex mMutex;
    std::vector<LogLine> mLines;
};

// Base fixture: each test runs on its own fresh root with log capture.
class PlatformTest : public ::testing::Test
{
protected:
    TestPlatformRoot mRoot;
    LogCapture mLog;
};

// Root of the build tree: WEATHER_BUILD_DIR from the environment, else the
// folder this build was configured in.
std::string BuildDir();

}  // namespace WeatherTest

#endif

#include "TestPlatform.h"

#include <cstdlib>
#include <fstream>
#include <stdexcept>
#include <ftw.h>
#include <sys/stat.h>
#include <unistd.h>

#include "SuiteFolders.h"

namespace WeatherTest
{

namespace
{
int RemoveEntry(const char* path, const struct stat*, int, struct FTW*)
{
    // Tests may leave read-only folders behind; make them removable.
    chmod(path, 0700);
    return remove(path);
}
}  // namespace

TestPlatformRoot::TestPlatformRoot()
{
    const char* tmp = getenv("TMPDIR");
    std::string pattern = std::string(tmp && *tmp ? tmp : "/tmp") + "/weather-test-XXXXXX";
    char* made = mkdtemp(&pattern[0]);
    if (!made)
        throw std::runtime_error("mkdtemp failed");
    mPath = made;
    if (const char* old = getenv("PLATFORM_ROOT"))
    {
        mHadOldRoot = true;
        mOldRoot = old;
    }
    setenv("PLATFORM_ROOT", mPath.c_str(), 1);
    for (const char* app : kSuiteApps) RegisterApp(app);
}

TestPlatformRoot::~TestPlatformRoot()
{
    if (mHadOldRoot)
        setenv("PLATFORM_ROOT", mOldRoot.c_str(), 1);
    else
        unsetenv("PLATFORM_ROOT");
    // Fix permissions top-down first so that nftw can enter every folder.
    nftw(
        mPath.c_str(),
        [](const char* p, const struct stat* st, int, struct FTW*)
        {
            if (S_ISDIR(st->st_mode))
                chmod(p, 0700);
            return 0;
        },
        16, FTW_PHYS);
    nftw(mPath.c_str(), RemoveEntry, 16, FTW_DEPTH | FTW_PHYS);
}

std::string TestPlatformRoot::SharedDataDir() const
{
    return Path("apps/com.quorvex.weather-m/shared/data/");
}

void TestPlatformRoot::RegisterApp(const std::string& appId) const
{
    std::string dir = Path("apps/" + appId);
    MakeDirs(dir + "/shared/data", 0755);
    MakeDirs(dir + "/shared/res", 0755);
    MakeDirs(dir + "/res", 0755);
}

void TestPlatformRoot::RegisterApp(const std::string& appId, const std::string& conf) const
{
    RegisterApp(appId);
    std::ofstream(Path("apps/" + appId + "/app.conf")) << conf;
}

void TestPlatformRoot::UseBuildResources() const
{
    for (const char* app : kSuiteApps)
    {
        for (const char* sub : {"/res", "/shared/res"})
        {
            std::string built = BuildDir() + "/res/" + app + sub;
            std::string installed = Path(std::string("apps/") + app + sub);
            struct stat st;
            if (stat(built.c_str(), &st) != 0)
                continue;
            rmdir(installed.c_str());
            if (symlink(built.c_str(), installed.c_str()) != 0)
                throw std::runtime_error("cannot link " + installed);
        }
    }
}

LogCapture::LogCapture()
{
    dlog_set_capture(&LogCapture::CaptureCb, this);
}

LogCapture::~LogCapture()
{
    dlog_set_capture(nullptr, nullptr);
}

void LogCapture::CaptureCb(log_priority prio, const char* tag, const char* text, void* data)
{
    auto* self = static_cast<LogCapture*>(data);
    std::lock_guard<std::mutex> lock(self->mMutex);
    self->mLines.push_back({prio, tag, text});
}

std::vector<LogLine> LogCapture::GetLines() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mLines;
}

int LogCapture::Count(const std::string& part, const std::string& tag) const
{
    std::lock_guard<std::mutex> lock(mMutex);
    int count = 0;
    for (const LogLine& line : mLines)
        if ((tag.empty() || line.tag == tag) && line.text.find(part) != std::string::npos)
            ++count;
    return count;
}

void LogCapture::Clear()
{
    std::lock_guard<std::mutex> lock(mMutex);
    mLines.clear();
}

std::string LogCapture::Dump() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    std::string all;
    for (const LogLine& line : mLines) all += line.tag + ": " + line.text + "\n";
    return all;
}

std::string BuildDir()
{
    const char* dir = getenv("WEATHER_BUILD_DIR");
    return dir && *dir ? dir : WEATHER_BUILD_DIR;
}

namespace
{
// EFL stays quiet and off D-Bus in every test program, however it is run.
struct QuietEfl
{
    QuietEfl()
    {
        setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
        setenv("EINA_LOG_BACKTRACE", "0", 0);
        setenv("EINA_LOG_LEVELS", "ecore_con:0", 0);
    }
} gQuietEfl;
}  // namespace

}  // namespace WeatherTest

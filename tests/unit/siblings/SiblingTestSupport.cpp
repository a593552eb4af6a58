#include "SiblingTestSupport.h"

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "WeatherDefine.h"

namespace SiblingTest
{

void SiblingFixture::SetUp()
{
    NSWeather::FileUtil::ClearCache();
    unsetenv("DISPLAY");
    unsetenv("WAYLAND_DISPLAY");
    mRoot.UseBuildResources();
    ASSERT_EQ(NSWeather::ERR_OK, NSWeather::DataStoreInitializer::Run());
    mCataloguePtr = NSWeather::CityCatalogue::Load(NSWeather::CityCatalogue::GetDefaultPath());
    ASSERT_TRUE(mCataloguePtr) << mLog.Dump();
}

void SiblingFixture::TearDown()
{
    NSWeather::FileUtil::ClearCache();
}

void SiblingFixture::RegisterPrograms() const
{
    SiblingTest::RegisterPrograms(mRoot);
}

void RegisterPrograms(const WeatherTest::TestPlatformRoot& root)
{
    root.RegisterApp(NSWeather::WEATHER_AGENT_APP_ID, "exec=" + AgentProgram() + "\n");
    root.RegisterApp(NSWeather::WEATHER_APP_ID, "exec=" + AppProgram() + "\n");
}

std::string AgentProgram()
{
    return WeatherTest::BuildDir() + "/siblings/agent/weather-agent";
}

std::string AppProgram()
{
    return WeatherTest::BuildDir() + "/siblings/app/weather-app";
}

pid_t Start(const std::vector<std::string>& args, const std::string& outputPath)
{
    std::vector<char*> argv;
    for (const std::string& arg : args) argv.push_back(const_cast<char*>(arg.c_str()));
    argv.push_back(nullptr);
    pid_t pid = fork();
    if (pid == 0)
    {
        int output = open(outputPath.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
        dup2(output, STDOUT_FILENO);
        dup2(output, STDERR_FILENO);
        execv(argv[0], argv.data());
        _exit(127);
    }
    return pid;
}

int Finish(pid_t pid)
{
    int status = 0;
    if (pid <= 0 || waitpid(pid, &status, 0) != pid || !WIFEXITED(status))
        return -1;
    return WEXITSTATUS(status);
}

int Run(const std::vector<std::string>& args, const std::string& outputPath)
{
    return Finish(Start(args, outputPath));
}

}  // namespace SiblingTest

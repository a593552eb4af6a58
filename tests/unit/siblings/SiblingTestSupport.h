#ifndef WEATHER_TESTS_SIBLING_TEST_SUPPORT_H
#define WEATHER_TESTS_SIBLING_TEST_SUPPORT_H

#include <sys/types.h>

#include <string>
#include <vector>

#include "CityCatalogue.h"
#include "TestPlatform.h"

namespace SiblingTest
{

// A fresh root with the build's resources (the catalogue among them) and
// the data store made, as the suite's processes find it.
class SiblingFixture : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override;
    void TearDown() override;
    // Registers the built agent and app as the suite's sibling programs.
    void RegisterPrograms() const;

    NSWeather::CityCataloguePtr mCataloguePtr;
};

std::string AgentProgram();
std::string AppProgram();
// Registers the built agent and app under `root` as the suite's programs.
void RegisterPrograms(const WeatherTest::TestPlatformRoot& root);
// Starts a built program with the test's environment; its output goes to
// `outputPath`.
pid_t Start(const std::vector<std::string>& args, const std::string& outputPath = "/dev/null");
// The program's exit status, -1 when it did not exit normally.
int Finish(pid_t pid);
int Run(const std::vector<std::string>& args, const std::string& outputPath = "/dev/null");

}  // namespace SiblingTest

#endif

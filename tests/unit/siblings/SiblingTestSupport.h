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
// Starts a built program with the test's environment, output discarded.
pid_t Start(const std::vector<std::string>& args);
// The program's exit status, -1 when it did not exit normally.
int Finish(pid_t pid);
int Run(const std::vector<std::string>& args);

}  // namespace SiblingTest

#endif

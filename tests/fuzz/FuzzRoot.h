#ifndef WEATHER_TESTS_FUZZ_FUZZ_ROOT_H
#define WEATHER_TESTS_FUZZ_FUZZ_ROOT_H

#include <string>

namespace WeatherTest
{

// The platform root of one fuzz run: a fresh temporary folder with the
// suite's applications registered, made on first use and removed at exit.
// PLATFORM_ROOT points at it for the whole process.
class FuzzRoot
{
public:
    static const FuzzRoot& Get();

    const std::string& GetPath() const { return mPath; }
    // "<root>/apps/com.quorvex.weather-m/shared/data/"
    std::string SharedDataDir() const;

private:
    FuzzRoot();
    ~FuzzRoot();

    std::string mPath;
};

// Writes the bytes as the whole file; false when it cannot.
bool WriteBytes(const std::string& path, const std::string& bytes);
// The whole file; empty when it cannot be read.
std::string ReadBytes(const std::string& path);

[[noreturn]] void FuzzFail(const char* what, const char* file, int line);

}  // namespace WeatherTest

// A broken promise of the code under test stops the run like a crash, so
// that the fuzzer keeps the input.
#define FUZZ_CHECK(cond) ((cond) ? (void)0 : WeatherTest::FuzzFail(#cond, __FILE__, __LINE__))

#endif

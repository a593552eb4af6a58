#include "FuzzRoot.h"

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <ftw.h>
#include <stdexcept>
#include <sys/stat.h>

#include "SuiteFolders.h"

namespace WeatherTest
{

const FuzzRoot& FuzzRoot::Get()
{
    static FuzzRoot root;
    return root;
}

FuzzRoot::FuzzRoot()
{
    const char* tmp = getenv("TMPDIR");
    std::string pattern = std::string(tmp && *tmp ? tmp : "/tmp") + "/weather-fuzz-XXXXXX";
    if (!mkdtemp(&pattern[0]))
        throw std::runtime_error("mkdtemp failed for " + pattern);
    mPath = pattern;
    setenv("PLATFORM_ROOT", mPath.c_str(), 1);
    for (const char* app : kSuiteApps)
        for (const char* sub : {"/shared/data", "/shared/res", "/res"})
            MakeDirs(mPath + "/apps/" + app + sub, 0700);
}

FuzzRoot::~FuzzRoot()
{
    nftw(
        mPath.c_str(), [](const char* path, const struct stat*, int, struct FTW*) { return remove(path); },
        16, FTW_DEPTH | FTW_PHYS);
}

std::string FuzzRoot::SharedDataDir() const
{
    return mPath + "/apps/com.quorvex.weather-m/shared/data/";
}

bool WriteBytes(const std::string& path, const std::string& bytes)
{
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    return static_cast<bool>(out.flush());
}

std::string ReadBytes(const std::string& path)
{
    std::ifstream in(path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

void FuzzFail(const char* what, const char* file, int line)
{
    fprintf(stderr, "%s:%d: check failed: %s\n", file, line, what);
    abort();
}

}  // namespace WeatherTest

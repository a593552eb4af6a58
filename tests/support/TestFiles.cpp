#include "TestFiles.h"

#include <sys/stat.h>
#include <unistd.h>

#include <fstream>
#include <sstream>
#include <stdexcept>

#include "MainLoop.h"

namespace WeatherTest
{

std::string ReadText(const std::string& path)
{
    std::ifstream file(path, std::ios::binary);
    std::stringstream content;
    content << file.rdbuf();
    return content.str();
}

void WriteText(const std::string& path, const std::string& text)
{
    std::ofstream(path, std::ios::binary | std::ios::trunc) << text;
}

std::vector<std::string> ReadLines(const std::string& path)
{
    std::ifstream file(path);
    std::vector<std::string> lines;
    for (std::string line; std::getline(file, line);) lines.push_back(line);
    return lines;
}

void MakeSparseFile(const std::string& path, long size)
{
    std::ofstream(path, std::ios::binary | std::ios::trunc);
    if (truncate(path.c_str(), size) != 0)
        throw std::runtime_error("cannot size " + path);
}

long BytesReadSoFar()
{
    std::ifstream io("/proc/self/io");
    std::string name;
    long value = -1;
    while (io >> name >> value)
        if (name == "rchar:")
            return value;
    return -1;
}

bool WaitForFile(const std::string& path, double timeoutSeconds)
{
    struct stat st;
    return RunLoopUntil([&path, &st] { return stat(path.c_str(), &st) == 0; }, timeoutSeconds);
}

}  // namespace WeatherTest

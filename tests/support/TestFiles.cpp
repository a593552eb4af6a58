#include "TestFiles.h"

#include <sys/stat.h>

#include <fstream>
#include <sstream>

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
    for (std::string line; std::getline(file, line);)
        lines.push_back(line);
    return lines;
}

bool WaitForFile(const std::string& path, double timeoutSeconds)
{
    struct stat st;
    return RunLoopUntil([&path, &st] { return stat(path.c_str(), &st) == 0; }, timeoutSeconds);
}

}  // namespace WeatherTest

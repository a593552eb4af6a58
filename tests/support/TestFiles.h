#ifndef WEATHER_TESTS_TEST_FILES_H
#define WEATHER_TESTS_TEST_FILES_H

#include <string>
#include <vector>

namespace WeatherTest
{

// The whole file; empty when it cannot be read.
std::string ReadText(const std::string& path);

// Replaces the file's content with `text`.
void WriteText(const std::string& path, const std::string& text);

// The file's lines without their line ends; none when it cannot be read.
std::vector<std::string> ReadLines(const std::string& path);

// A file of `size` bytes that takes no disk space (a hole).
void MakeSparseFile(const std::string& path, long size);

// Bytes this process has read through read() so far (rchar of /proc/self/io):
// shows how much of a file a reader really took.
long BytesReadSoFar();

// Runs the Ecore main loop until `path` exists or `timeoutSeconds` pass;
// true when it exists.
bool WaitForFile(const std::string& path, double timeoutSeconds);

}  // namespace WeatherTest

#endif

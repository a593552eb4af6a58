#ifndef PLATFORM_CORE_PLATFORM_ROOT_H
#define PLATFORM_CORE_PLATFORM_ROOT_H

#include <string>

// Shared helpers of the platform areas: where the platform root is and
// small file operations on it. Internal to the platform library.
namespace platform
{

// PLATFORM_ROOT, else $XDG_RUNTIME_DIR/weather-platform, else
// /tmp/weather-platform-<uid>; read anew on every call so that tests can
// switch roots. Never ends with '/'.
std::string RootDir();

// RootDir() + "/" + relative.
std::string RootPath(const std::string& relative);

// "<root>/apps/<appId>"; empty for an empty or unsafe id ('/' or "..").
std::string AppDir(const std::string& appId);

// True for an id that can name a folder: non-empty, no '/', not "." or "..".
bool IsSafeName(const std::string& name);

// The process's own application id (app_set_own_id, else PLATFORM_APP_ID).
std::string OwnAppId();

// mkdir -p with mode 0755; true when the directory exists afterwards.
bool MakeDirs(const std::string& path);

bool ReadFile(const std::string& path, std::string& content);

// Writes a temporary file beside `path` and renames it over `path`, so that
// readers in other processes see the old or the new content, never a part.
bool WriteFileAtomic(const std::string& path, const std::string& content, int mode = 0644);

// strdup that reports OUT_OF_MEMORY through set_last_result.
char* CopyString(const std::string& text);

}  // namespace platform

#endif

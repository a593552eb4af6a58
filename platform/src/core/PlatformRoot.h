#ifndef PLATFORM_CORE_PLATFORM_ROOT_H
#define PLATFORM_CORE_PLATFORM_ROOT_H

#include <cstddef>
#include <string>

// Shared helpers of the platform areas: where the platform root is and
// small file operations on it. Internal to the platform library.
namespace platform
{

// Reads never take more than this unless the caller gives its own bound.
const size_t kReadLimit = 4 * 1024 * 1024;

// PLATFORM_ROOT, else $XDG_RUNTIME_DIR/weather-platform, else
// /tmp/weather-platform-<uid>; read anew on every call so that tests can
// switch roots. Never ends with '/'. Only a path: see CheckRoot.
std::string RootDir();

// Creates the root 0700 when it is missing, then checks (without following
// a link) that it is a folder of this user that no one else can write.
// Another user who made the folder first must not get our keys, logs or
// launch entries. On refusal `why` names the path and the reason.
bool CheckRoot(std::string& why);

// RootDir() + "/" + relative once CheckRoot passes; empty (and the reason
// on stderr, once per root) when it does not, so that every caller fails.
std::string RootPath(const std::string& relative);

// "<root>/apps/<appId>"; empty for an empty or unsafe id ('/' or "..") or
// a refused root.
std::string AppDir(const std::string& appId);

// True when `path` is a real folder, not a link to one: an application
// folder that is a link could lead our writes anywhere.
bool IsRealDir(const std::string& path);

// True for an id that can name a folder: non-empty, no '/', not "." or "..".
bool IsSafeName(const std::string& name);

// The process's own application id (app_set_own_id, else PLATFORM_APP_ID).
std::string OwnAppId();

// mkdir -p, new folders 0700; true when the directory exists afterwards.
bool MakeDirs(const std::string& path);

// Reads a regular file of at most `limit` bytes, reading no more than
// limit + 1. Opened non-blocking, so a FIFO cannot stall the caller; FIFOs,
// devices and folders are refused, and so is a link in place of the file
// unless `followLink`. False with errno set (EFBIG when too large, EINVAL
// for what is not a regular file, ELOOP for a link).
bool ReadFile(const std::string& path, std::string& content, size_t limit = kReadLimit,
              bool followLink = false);

// Writes a temporary file beside `path` and renames it over `path`, so that
// readers in other processes see the old or the new content, never a part;
// a link at `path` is replaced, never followed.
bool WriteFileAtomic(const std::string& path, const std::string& content, int mode = 0600);

// Opens `path` for appending, created 0600 (an older file is made 0600).
// Refuses a link, a FIFO, anything but a regular file, and a file of
// another user. Returns the descriptor, or -1 with errno set.
int OpenPrivateAppend(const std::string& path);

// strdup that reports OUT_OF_MEMORY through set_last_result.
char* CopyString(const std::string& text);

}  // namespace platform

#endif

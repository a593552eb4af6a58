// platform-setup: prepares a platform root with the system keys of a
// fresh phone and registers the weather suite and its stand-ins.
#include <getopt.h>
#include <limits.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <map>
#include <utility>
#include <string>

#include "app_control.h"
#include "app_control_launch.h"
#include "core/PlatformRoot.h"
#include "vconf.h"

namespace
{

struct Options
{
    std::map<std::string, std::string> programs;  // app id -> program
    std::string resDir;
    std::string browser = "/bin/true";
    bool reset = false;
    bool help = false;
};

void Usage(FILE* out)
{
    fprintf(
        out,
        "usage: platform-setup [--help] [--root DIR] [--app PROGRAM] [--agent PROGRAM] [--widget PROGRAM]\n"
        "                      [--res RES_DIR] [--browser PROGRAM] [--reset]\n"
        "Keys that exist are kept unless --reset is given. Without --res, an installed\n"
        "platform-setup registers the resources and programs installed with it.\n");
}

bool ParseOptions(int argc, char** argv, Options& options)
{
    static const option kOptions[] = {{"root", required_argument, nullptr, 'r'},
                                      {"app", required_argument, nullptr, 'a'},
                                      {"agent", required_argument, nullptr, 'g'},
                                      {"widget", required_argument, nullptr, 'w'},
                                      {"res", required_argument, nullptr, 's'},
                                      {"browser", required_argument, nullptr, 'b'},
                                      {"reset", no_argument, nullptr, 'x'},
                                      {"help", no_argument, nullptr, 'h'},
                                      {nullptr, 0, nullptr, 0}};
    int c;
    while ((c = getopt_long(argc, argv, "h", kOptions, nullptr)) != -1)
    {
        // A line break would add lines of its own to an app.conf.
        if (optarg && strpbrk(optarg, "\r\n"))
        {
            fprintf(stderr, "platform-setup: option values must not contain line breaks\n");
            return false;
        }
        switch (c)
        {
            case 'r':
                setenv("PLATFORM_ROOT", optarg, 1);
                break;
            case 'a':
                options.programs["com.quorvex.weather-m"] = optarg;
                break;
            case 'g':
                options.programs["com.quorvex.weather-m-agent"] = optarg;
                break;
            case 'w':
                options.programs["com.quorvex.weather-m-widget"] = optarg;
                break;
            case 's':
                options.resDir = optarg;
                break;
            case 'b':
                options.browser = optarg;
                break;
            case 'x':
                options.reset = true;
                break;
            case 'h':
                options.help = true;
                break;
            default:
                return false;
        }
    }
    return optind == argc;
}

std::string Absolute(const std::string& path)
{
    char resolved[PATH_MAX];
    return realpath(path.c_str(), resolved) ? std::string(resolved) : path;
}

bool IsDir(const std::string& path)
{
    struct stat st;
    return stat(path.c_str(), &st) == 0 && S_ISDIR(st.st_mode);
}

// The folder this program runs from; empty when the kernel cannot say.
std::string OwnProgramDir()
{
    char path[PATH_MAX];
    ssize_t n = readlink("/proc/self/exe", path, sizeof(path) - 1);
    if (n <= 0)
        return std::string();
    std::string self(path, static_cast<size_t>(n));
    return self.substr(0, self.rfind('/'));
}

// Installed, the prefix's own resources and programs serve unless --res
// names others; found from this program so that the prefix can move. In a
// build tree the folder is not there and nothing changes.
void UseInstalledSuite(Options& options)
{
    std::string bin = OwnProgramDir();
    std::string res = bin + "/" WEATHER_SETUP_RES_FROM_BIN;
    if (!options.resDir.empty() || bin.empty() || !IsDir(res))
        return;
    options.resDir = Absolute(res);
    const std::pair<const char*, const char*> kPrograms[] = {
        {"com.quorvex.weather-m", "weather-app"},
        {"com.quorvex.weather-m-agent", "weather-agent"},
        {"com.quorvex.weather-m-widget", "weather-widget"}};
    for (const auto& [appId, name] : kPrograms)
    {
        std::string program = bin + "/" + name;
        if (options.programs.count(appId) == 0 && access(program.c_str(), X_OK) == 0)
            options.programs[appId] = program;
    }
}

// "Europe/Berlin" from TZ, /etc/localtime or /etc/timezone; "UTC" if none.
std::string HostTimeZone()
{
    const char* tz = getenv("TZ");
    if (tz && *tz && tz[0] != ':' && strchr(tz, '/'))
        return tz;
    char target[PATH_MAX];
    ssize_t n = readlink("/etc/localtime", target, sizeof(target) - 1);
    if (n > 0)
    {
        std::string link(target, static_cast<size_t>(n));
        size_t at = link.find("zoneinfo/");
        if (at != std::string::npos)
            return link.substr(at + 9);
    }
    std::ifstream file("/etc/timezone");
    std::string zone;
    if (std::getline(file, zone) && !zone.empty())
        return zone;
    return "UTC";
}

bool SetInt(const char* key, int value, bool reset)
{
    int current = 0;
    if (!reset && vconf_get_int(key, &current) == VCONF_OK)
        return true;
    return vconf_set_int(key, value) == VCONF_OK;
}

bool SetStr(const char* key, const std::string& value, bool reset)
{
    char* current = reset ? nullptr : vconf_get_str(key);
    if (current)
    {
        free(current);
        return true;
    }
    return vconf_set_str(key, value.c_str()) == VCONF_OK;
}

bool SetDefaultKeys(bool reset)
{
    bool ok = SetStr(VCONFKEY_LANGSET, "en_US.UTF-8", reset);
    ok = SetStr(VCONFKEY_REGIONFORMAT, "en_US.UTF-8", reset) && ok;
    ok = SetInt(VCONFKEY_REGIONFORMAT_TIME1224, 2, reset) && ok;
    ok = SetInt(VCONFKEY_NETWORK_STATUS, 2, reset) && ok;
    ok = SetInt(VCONFKEY_LOCATION_USE_MY_LOCATION, 1, reset) && ok;
    ok = SetInt(VCONFKEY_LOCATION_ENABLED, 1, reset) && ok;
    ok = SetInt(VCONFKEY_LOCATION_NETWORK_ENABLED, 1, reset) && ok;
    ok = SetStr(VCONFKEY_SETAPPL_TIMEZONE_ID, HostTimeZone(), reset) && ok;
    ok = SetInt(VCONFKEY_SETAPPL_DATE_FORMAT_INT, 0, reset) && ok;
    ok = SetInt(VCONFKEY_SYSMAN_BATTERY_STATUS_LOW, 4, reset) && ok;
    ok = SetInt(VCONFKEY_SYSMAN_LOW_MEMORY, 1, reset) && ok;
    return ok;
}

// Points <app>/<sub> at <resDir>/<app id>/<sub> when the build has it;
// otherwise makes sure the folder exists.
bool LinkResources(const std::string& appId, const std::string& resDir, const char* sub)
{
    std::string installed = platform::AppDir(appId) + "/" + sub;
    std::string built = resDir.empty() ? std::string() : Absolute(resDir) + "/" + appId + "/" + sub;
    struct stat st;
    if (built.empty() || stat(built.c_str(), &st) != 0 || !S_ISDIR(st.st_mode))
        return platform::MakeDirs(installed);
    if (lstat(installed.c_str(), &st) == 0)
    {
        if (S_ISLNK(st.st_mode))
            unlink(installed.c_str());
        else if (rmdir(installed.c_str()) != 0)
        {
            fprintf(stderr, "platform-setup: %s is not empty; left as it is\n", installed.c_str());
            return false;
        }
    }
    size_t slash = installed.rfind('/');
    return platform::MakeDirs(installed.substr(0, slash)) && symlink(built.c_str(), installed.c_str()) == 0;
}

bool RegisterApp(const std::string& appId, const std::string& conf)
{
    std::string dir = platform::AppDir(appId);
    struct stat st;
    if (dir.empty() || (lstat(dir.c_str(), &st) == 0 && !platform::IsRealDir(dir)))
    {
        fprintf(stderr, "platform-setup: %s is not a real folder; %s is not registered\n", dir.c_str(),
                appId.c_str());
        return false;
    }
    return platform::MakeDirs(dir + "/shared/data") &&
           (conf.empty() || platform::WriteFileAtomic(dir + "/app.conf", conf));
}

// "exec=<absolute program>\n"; empty when it cannot run (a mistyped path
// would register fine and fail only at the first launch) or the path would
// break the line.
std::string ExecLine(const std::string& program)
{
    std::string path = Absolute(program);
    struct stat st;
    if (stat(path.c_str(), &st) != 0 || !S_ISREG(st.st_mode) || access(path.c_str(), X_OK) != 0)
    {
        fprintf(stderr, "platform-setup: %s is not a program that can run\n", path.c_str());
        return std::string();
    }
    if (path.find_first_of("\r\n") != std::string::npos)
    {
        fprintf(stderr, "platform-setup: %s contains a line break\n", path.c_str());
        return std::string();
    }
    return "exec=" + path + "\n";
}

bool RegisterSuite(const Options& options)
{
    bool ok = true;
    for (const char* appId :
         {"com.quorvex.weather-m", "com.quorvex.weather-m-agent", "com.quorvex.weather-m-widget"})
    {
        auto program = options.programs.find(appId);
        std::string path = program != options.programs.end() ? program->second : std::string();
        // Without a program named, the build's own one (<res>/<id>/bin/<id>).
        std::string built = options.resDir + "/" + appId + "/bin/" + appId;
        if (path.empty() && !options.resDir.empty() && access(built.c_str(), X_OK) == 0)
            path = built;
        bool hasProgram = !path.empty();
        std::string conf = hasProgram ? ExecLine(path) : std::string();
        // Nothing is linked into a folder that was not registered.
        if ((hasProgram && conf.empty()) || !RegisterApp(appId, conf))
        {
            ok = false;
            continue;
        }
        ok = LinkResources(appId, options.resDir, "res") && ok;
        ok = LinkResources(appId, options.resDir, "shared/res") && ok;
    }
    std::string browser = ExecLine(options.browser);
    ok = !browser.empty() && RegisterApp(APP_CONTROL_BROWSER_APP_ID, browser + "view-uri=http,https\n") && ok;
    ok =
        RegisterApp(APP_CONTROL_LOCATION_SETTING_APP_ID, std::string("exec=/bin/true\noperation=") +
                                                             APP_CONTROL_OPERATION_SETTING_LOCATION + "\n") &&
        ok;
    return ok;
}

}  // namespace

int main(int argc, char** argv)
{
    Options options;
    if (!ParseOptions(argc, argv, options))
    {
        Usage(stderr);
        return 2;
    }
    if (options.help)
    {
        Usage(stdout);
        return 0;
    }
    UseInstalledSuite(options);
    std::string root = platform::RootDir();
    std::string why;
    if (!platform::CheckRoot(why))
    {
        fprintf(stderr, "platform-setup: %s\n", why.c_str());
        return 1;
    }
    for (const char* sub : {"apps", "log", "run"})
    {
        if (!platform::MakeDirs(platform::RootPath(sub)))
        {
            fprintf(stderr, "platform-setup: cannot create %s\n", platform::RootPath(sub).c_str());
            return 1;
        }
    }
    bool keys = SetDefaultKeys(options.reset);
    bool apps = RegisterSuite(options);
    if (!keys)
        fprintf(stderr, "platform-setup: some system keys could not be written\n");
    if (!apps)
        fprintf(stderr, "platform-setup: some applications could not be registered\n");
    printf("%s\n", root.c_str());
    return keys && apps ? 0 : 1;
}

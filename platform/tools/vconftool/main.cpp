// vconftool: read, write and watch system keys from a shell.
//   vconftool set -t int|bool|double|string <key> <value>
//   vconftool get <key>
//   vconftool watch <key> [count]
//   vconftool --help

#include <Ecore.h>

#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

#include "vconf.h"
#include "vconf/VconfStore.h"

namespace
{

int gRemaining = -1;

void PrintUsage(FILE* out)
{
    fprintf(out,
            "usage: vconftool set -t int|bool|double|string <key> <value>\n"
            "       vconftool get <key>\n"
            "       vconftool watch <key> [count]\n"
            "       vconftool --help\n");
}

int Usage()
{
    PrintUsage(stderr);
    return 2;
}

bool ParseLong(const char* text, long& out)
{
    errno = 0;
    char* end = nullptr;
    out = strtol(text, &end, 10);
    return errno == 0 && end != text && *end == '\0';
}

int Set(int argc, char** argv)
{
    if (argc != 6 || strcmp(argv[2], "-t") != 0)
        return Usage();
    std::string type = argv[3];
    const char* key = argv[4];
    const char* text = argv[5];
    std::string content;
    platform::vconf::Value parsed;
    // Decode checks the value exactly as readers will.
    if (type == "int" || type == "bool" || type == "double" || type == "string")
        content = type + "\n" + text + "\n";
    if (content.empty() || !platform::vconf::Decode(content, parsed))
    {
        fprintf(stderr, "vconftool: \"%s\" is not a valid %s value\n", text, type.c_str());
        return 1;
    }
    if (!platform::vconf::Write(key, parsed))
    {
        fprintf(stderr, "vconftool: cannot write key \"%s\"\n", key);
        return 1;
    }
    return 0;
}

int Get(int argc, char** argv)
{
    if (argc != 3)
        return Usage();
    platform::vconf::Value value;
    if (!platform::vconf::Read(argv[2], value))
    {
        fprintf(stderr, "vconftool: cannot read key \"%s\"\n", argv[2]);
        return 1;
    }
    printf("%s\n", platform::vconf::ToText(value).c_str());
    return 0;
}

void KeyChangedCb(keynode_t* node, void*)
{
    if (!node)
        return;
    platform::vconf::Value value;
    value.type = vconf_keynode_get_type(node);
    if (value.type == VCONF_TYPE_STRING)
        value.strValue = vconf_keynode_get_str(node);
    else if (value.type == VCONF_TYPE_DOUBLE)
        value.dblValue = vconf_keynode_get_dbl(node);
    else if (value.type == VCONF_TYPE_BOOL)
        value.intValue = vconf_keynode_get_bool(node);
    else
        value.intValue = vconf_keynode_get_int(node);
    printf("%s\n", platform::vconf::ToText(value).c_str());
    fflush(stdout);
    if (gRemaining > 0 && --gRemaining == 0)
        ecore_main_loop_quit();
}

int Watch(int argc, char** argv)
{
    if (argc != 3 && argc != 4)
        return Usage();
    if (argc == 4)
    {
        long count = 0;
        if (!ParseLong(argv[3], count) || count < 1 || count > INT_MAX)
            return Usage();
        gRemaining = static_cast<int>(count);
    }
    // No session services are needed to watch files.
    setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
    ecore_init();
    int result = 0;
    if (vconf_notify_key_changed(argv[2], KeyChangedCb, nullptr) != VCONF_OK)
    {
        fprintf(stderr, "vconftool: cannot watch key \"%s\"\n", argv[2]);
        result = 1;
    }
    else
    {
        ecore_main_loop_begin();
        vconf_ignore_key_changed(argv[2], KeyChangedCb);
    }
    ecore_shutdown();
    return result;
}

}  // namespace

int main(int argc, char** argv)
{
    if (argc < 2)
        return Usage();
    std::string command = argv[1];
    if (command == "--help" || command == "-h")
    {
        PrintUsage(stdout);
        return 0;
    }
    if (command == "set")
        return Set(argc, argv);
    if (command == "get")
        return Get(argc, argv);
    if (command == "watch")
        return Watch(argc, argv);
    return Usage();
}

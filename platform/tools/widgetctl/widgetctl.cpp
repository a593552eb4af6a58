// widgetctl [--widget-id ID] <command> [args]: sends one command to the
// widget host's control socket and prints the reply. Exit code 0 for OK,
// 1 for ERR (or bad usage), 2 when no host answers.
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <unistd.h>

#include "widget/ControlClient.h"

namespace
{
const char* const kDefaultWidgetId = "com.quorvex.weather-m-widget";
// Extra time over an idle command's own timeout for the reply to arrive.
const double kReplyMargin = 5.0;

std::string Absolute(const std::string& path)
{
    if (path.empty() || path[0] == '/')
        return path;
    char cwd[4096];
    if (!getcwd(cwd, sizeof(cwd)))
        return path;
    return std::string(cwd) + "/" + path;
}

void PrintUsage(FILE* out)
{
    fprintf(out,
            "usage: widgetctl [--widget-id ID] <command> [args]\n"
            "       widgetctl --help\n"
            "commands: create <4x2|4x4> [nowindow] | resize <id> <4x2|4x4> | pause <id> | resume <id>\n"
            "  | update <id> [force] | destroy <id> | list | tap <id> <x> <y> [ms]\n"
            "  | swipe <id> <x1> <y1> <x2> <y2> <ms> | snapshot <id> <file.png> | dump <id>\n"
            "  | count <id> | idle [seconds] | event <language|region|low-battery|low-memory> | exit\n");
}

int Usage()
{
    PrintUsage(stderr);
    return 1;
}
}  // namespace

int main(int argc, char** argv)
{
    if (argc == 2 && (strcmp(argv[1], "--help") == 0 || strcmp(argv[1], "-h") == 0))
    {
        PrintUsage(stdout);
        return 0;
    }
    std::string widgetId = kDefaultWidgetId;
    int first = 1;
    if (argc > 2 && strcmp(argv[1], "--widget-id") == 0)
    {
        widgetId = argv[2];
        first = 3;
    }
    if (first >= argc)
        return Usage();
    std::string command = argv[first];
    double timeout = 30.0;
    for (int i = first + 1; i < argc; ++i)
    {
        std::string word = argv[i];
        if (command == "snapshot" && i == first + 2)
            word = Absolute(word);
        if (command == "idle" && i == first + 1)
            timeout = atof(word.c_str()) + kReplyMargin;
        command += " " + word;
    }
    platform::ControlClient client;
    if (!client.Connect(platform::ControlClient::SocketPath(widgetId)))
    {
        fprintf(stderr, "widgetctl: no widget host for %s\n", widgetId.c_str());
        return 2;
    }
    std::string reply;
    if (!client.Request(command, reply, timeout))
    {
        fprintf(stderr, "widgetctl: the widget host did not answer\n");
        return 2;
    }
    printf("%s\n", reply.c_str());
    return reply.compare(0, 2, "OK") == 0 ? 0 : 1;
}

// msgport-send <app id> <port> [key=value ...]: posts one message to a
// local message port, as another application of the suite would.
#include <cstdio>
#include <cstring>
#include <string>

#include "bundle.h"
#include "message_port.h"

namespace
{

void Usage(FILE* out)
{
    fprintf(out,
            "usage: msgport-send <app id> <port> [key=value ...]\n"
            "       msgport-send --help\n");
}

const char* ErrorName(int error)
{
    switch (error)
    {
        case MESSAGE_PORT_ERROR_PORT_NOT_FOUND:
            return "port not found";
        case MESSAGE_PORT_ERROR_INVALID_PARAMETER:
            return "invalid parameter";
        case MESSAGE_PORT_ERROR_MAX_EXCEEDED:
            return "message too large";
        case MESSAGE_PORT_ERROR_RESOURCE_UNAVAILABLE:
            return "receiver busy";
        default:
            return "i/o error";
    }
}

// False (after a message) for an argument that is not key=value or
// repeats a key.
bool AddPairs(bundle* message, int count, char** pairs)
{
    for (int i = 0; i < count; ++i)
    {
        const char* equal = strchr(pairs[i], '=');
        if (!equal || equal == pairs[i])
        {
            fprintf(stderr, "msgport-send: not key=value: %s\n", pairs[i]);
            return false;
        }
        std::string key(pairs[i], static_cast<size_t>(equal - pairs[i]));
        if (bundle_add_str(message, key.c_str(), equal + 1) != BUNDLE_ERROR_NONE)
        {
            fprintf(stderr, "msgport-send: cannot add %s\n", key.c_str());
            return false;
        }
    }
    return true;
}

}  // namespace

int main(int argc, char** argv)
{
    if (argc == 2 && (strcmp(argv[1], "--help") == 0 || strcmp(argv[1], "-h") == 0))
    {
        Usage(stdout);
        return 0;
    }
    if (argc < 3)
    {
        Usage(stderr);
        return 2;
    }
    bundle* message = bundle_create();
    if (!message || !AddPairs(message, argc - 3, argv + 3))
    {
        bundle_free(message);
        return 2;
    }
    int result = message_port_send_message(argv[1], argv[2], message);
    bundle_free(message);
    if (result != MESSAGE_PORT_ERROR_NONE)
    {
        fprintf(stderr, "msgport-send: %s (%d)\n", ErrorName(result), result);
        return 1;
    }
    return 0;
}

// One request line of the widget host's control socket, handled by a host
// without instances: every command is parsed and answered "OK ..." or
// "ERR ..." on one line, except idle, which answers later.
#include <Ecore.h>

#include <cstdint>
#include <cstdlib>
#include <string>

#include "FuzzRoot.h"
#include "widget/ControlCommandHandler.h"
#include "widget/WidgetHost.h"

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    WeatherTest::FuzzRoot::Get();
    // No D-Bus modules: there is no bus here, and they leak when they fail.
    setenv("ECORE_NO_SYSTEM_MODULES", "1", 1);
    setenv("EINA_LOG_BACKTRACE", "0", 1);
    ecore_init();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    // The server hands over what comes before the newline, without a '\r'.
    std::string line(reinterpret_cast<const char*>(data), size);
    line = line.substr(0, line.find('\n'));
    if (!line.empty() && line.back() == '\r')
        line.pop_back();
    platform::ControlCommandHandler handler(platform::WidgetHost::GetInstance());
    int replies = 0;
    handler.Handle(
        line,
        [&replies, &line](const std::string& reply)
        {
            ++replies;
            FUZZ_CHECK(reply.compare(0, 3, "OK ") == 0 || reply == "OK" || reply.compare(0, 4, "ERR ") == 0);
            FUZZ_CHECK(reply.find('\n') == std::string::npos ||
                       platform::ControlCommandHandler::Split(line)[0] == "list");
        });
    bool isIdle = !platform::ControlCommandHandler::Split(line).empty() &&
                  platform::ControlCommandHandler::Split(line)[0] == "idle";
    FUZZ_CHECK(replies == 1 || (isIdle && replies == 0));
    return 0;
}

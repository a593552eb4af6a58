#ifndef PLATFORM_WIDGET_CONTROL_COMMAND_HANDLER_H
#define PLATFORM_WIDGET_CONTROL_COMMAND_HANDLER_H

#include <memory>
#include <string>
#include <vector>

#include "widget/ControlServer.h"
#include "widget/IdleWatcher.h"
#include "widget/ObjectTreeDumper.h"

namespace platform
{

class WidgetHost;
class WidgetInstance;

// The commands of the control socket, one per line, each answered with a
// line "OK ..." or "ERR ..." (list adds one line per instance).
class ControlCommandHandler
{
public:
    using Words = std::vector<std::string>;
    using ReplyCb = ControlServer::ReplyCb;

    explicit ControlCommandHandler(WidgetHost& host);
    ~ControlCommandHandler();

    int Start(const std::string& socketPath);
    void Stop();

    void Handle(const std::string& line, const ReplyCb& reply);

    static Words Split(const std::string& line);
    // Whole decimal integers only ("12", "-3"); false for "12a", "", overflow.
    static bool ParseInt(const std::string& text, int& value);
    // "ERR <what> returned <code>" for a callback failure, else "OK".
    static std::string Result(const std::string& what, int code);

private:
    std::string Create(const Words& words);
    std::string Lifecycle(const Words& words);
    std::string Update(const Words& words);
    std::string List(const Words& words);
    std::string Exit(const Words& words);
    std::string Tap(const Words& words);
    std::string Swipe(const Words& words);
    std::string Snapshot(const Words& words);
    std::string Dump(const Words& words);
    std::string Count(const Words& words);
    std::string Event(const Words& words);
    void Idle(const Words& words, const ReplyCb& reply);
    // The instance named by words[1] with a window, or null with `error` set.
    WidgetInstance* FindDrawn(const Words& words, std::string& error);

    WidgetHost& mHost;
    std::unique_ptr<ControlServer> mServer;
    std::unique_ptr<IdleWatcher> mIdleWatcher;
    ObjectTreeDumper mDumper;
};

}  // namespace platform

#endif

#include "widget/ControlCommandHandler.h"

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <map>
#include <sstream>

#include "dlog.h"
#include "widget/AppEventDispatcher.h"
#include "widget/CanvasSnapshot.h"
#include "widget/InputFeeder.h"
#include "widget/WidgetHost.h"

namespace platform
{

namespace
{
const char* const kLogTag = "widget-host";
const unsigned kTapMs = 80;
const double kDefaultIdleSeconds = 10.0;
const double kMaxIdleSeconds = 600.0;
const int kMaxGestureMs = 60000;

std::string Flatten(std::string text)
{
    for (char& c : text)
        if (c == '\t' || c == '\n' || c == '\r')
            c = ' ';
    return text;
}
}  // namespace

ControlCommandHandler::ControlCommandHandler(WidgetHost& host) : mHost(host)
{
    mIdleWatcher = std::make_unique<IdleWatcher>(
        [this]()
        {
            std::vector<Evas*> canvases;
            for (WidgetInstance* instance : mHost.GetInstances())
                if (Evas* canvas = instance->GetWindowCanvas())
                    canvases.push_back(canvas);
            return canvases;
        });
}

ControlCommandHandler::~ControlCommandHandler()
{
    Stop();
}

int ControlCommandHandler::Start(const std::string& socketPath)
{
    mServer = std::make_unique<ControlServer>([this](const std::string& line, const ReplyCb& reply)
                                              { Handle(line, reply); });
    return mServer->Start(socketPath);
}

void ControlCommandHandler::Stop()
{
    mServer.reset();
    mIdleWatcher.reset();
}

ControlCommandHandler::Words ControlCommandHandler::Split(const std::string& line)
{
    Words words;
    std::istringstream stream(line);
    std::string word;
    while (stream >> word) words.push_back(word);
    return words;
}

bool ControlCommandHandler::ParseInt(const std::string& text, int& value)
{
    if (text.empty())
        return false;
    errno = 0;
    char* end = nullptr;
    long parsed = strtol(text.c_str(), &end, 10);
    if (errno != 0 || *end != '\0' || parsed < INT_MIN || parsed > INT_MAX || isspace(text[0]))
        return false;
    value = static_cast<int>(parsed);
    return true;
}

std::string ControlCommandHandler::Result(const std::string& what, int code)
{
    if (code == 0)
        return "OK";
    return "ERR " + what + " returned " + std::to_string(code);
}

void ControlCommandHandler::Handle(const std::string& line, const ReplyCb& reply)
{
    using Command = std::string (ControlCommandHandler::*)(const Words&);
    static const std::map<std::string, Command> kCommands = {
        {"create", &ControlCommandHandler::Create},     {"resize", &ControlCommandHandler::Lifecycle},
        {"pause", &ControlCommandHandler::Lifecycle},   {"resume", &ControlCommandHandler::Lifecycle},
        {"destroy", &ControlCommandHandler::Lifecycle}, {"update", &ControlCommandHandler::Update},
        {"list", &ControlCommandHandler::List},         {"tap", &ControlCommandHandler::Tap},
        {"swipe", &ControlCommandHandler::Swipe},       {"snapshot", &ControlCommandHandler::Snapshot},
        {"dump", &ControlCommandHandler::Dump},         {"event", &ControlCommandHandler::Event},
        {"exit", &ControlCommandHandler::Exit},         {"count", &ControlCommandHandler::Count},
    };
    Words words = Split(line);
    const std::string command = words.empty() ? std::string() : words[0];
    try
    {
        auto found = kCommands.find(command);
        if (command == "idle")
            Idle(words, reply);
        else if (found != kCommands.end())
            reply((this->*found->second)(words));
        else
            reply("ERR unknown command \"" + Flatten(command) + "\"");
    }
    catch (const std::exception& error)
    {
        dlog_print(DLOG_ERROR, kLogTag, "command \"%s\" failed: %s", line.c_str(), error.what());
        reply(std::string("ERR ") + error.what());
    }
}

std::string ControlCommandHandler::Create(const Words& words)
{
    bool withWindow = words.size() == 2;
    if ((words.size() != 2 && (words.size() != 3 || words[2] != "nowindow")) ||
        SizeTypeFromName(words[1]) < 0)
        return "ERR usage: create <4x2|4x4> [nowindow]";
    std::string id;
    int result = mHost.CreateInstance(SizeTypeFromName(words[1]), id, withWindow);
    if (!withWindow && mHost.FindInstance(id))
        return "OK " + id + " " + std::to_string(result);
    return result == 0 ? "OK " + id : Result("create", result);
}

std::string ControlCommandHandler::Lifecycle(const Words& words)
{
    const std::string& command = words[0];
    bool isResize = command == "resize";
    if (words.size() != (isResize ? 3u : 2u) || (isResize && SizeTypeFromName(words[2]) < 0))
        return isResize ? "ERR usage: resize <id> <4x2|4x4>" : "ERR usage: " + command + " <id>";
    if (!mHost.FindInstance(words[1]))
        return "ERR unknown instance " + words[1];
    int result = 0;
    if (isResize)
        result = mHost.ResizeInstance(words[1], SizeTypeFromName(words[2]));
    else if (command == "pause")
        result = mHost.PauseInstance(words[1]);
    else if (command == "resume")
        result = mHost.ResumeInstance(words[1]);
    else
        result = mHost.DestroyInstance(words[1], WIDGET_APP_DESTROY_TYPE_DEFAULT);
    return Result(command, result);
}

std::string ControlCommandHandler::Update(const Words& words)
{
    int force = 1;
    if (words.size() < 2 || words.size() > 3 ||
        (words.size() == 3 && (!ParseInt(words[2], force) || force < 0)))
        return "ERR usage: update <id> [force 0|1]";
    if (!mHost.FindInstance(words[1]))
        return "ERR unknown instance " + words[1];
    return Result("update", mHost.UpdateInstance(words[1], nullptr, force != 0));
}

std::string ControlCommandHandler::Exit(const Words& words)
{
    // "exit now" from a script is more likely a mistake than a request.
    if (words.size() != 1)
        return "ERR usage: exit";
    return mHost.Exit() == 0 ? "OK" : "ERR not running";
}

std::string ControlCommandHandler::List(const Words& words)
{
    if (words.size() != 1)
        return "ERR usage: list";
    auto instances = mHost.GetInstances();
    std::string reply = "OK " + std::to_string(instances.size());
    for (WidgetInstance* instance : instances)
        reply += "\n" + instance->GetId() + "\t" + SizeTypeName(instance->GetSizeType()) + "\t" +
                 Flatten(instance->GetTitle()) + "\t" + WidgetInstanceStateName(instance->GetState());
    return reply;
}

WidgetInstance* ControlCommandHandler::FindDrawn(const Words& words, std::string& error)
{
    WidgetInstance* instance = words.size() > 1 ? mHost.FindInstance(words[1]) : nullptr;
    if (!instance)
        error = "ERR unknown instance " + (words.size() > 1 ? words[1] : std::string());
    else if (!instance->GetWindow())
        error = "ERR instance " + words[1] + " has no window";
    return error.empty() ? instance : nullptr;
}

std::string ControlCommandHandler::Tap(const Words& words)
{
    int x = 0, y = 0, ms = static_cast<int>(kTapMs);
    if (words.size() < 4 || words.size() > 5 || !ParseInt(words[2], x) || !ParseInt(words[3], y) ||
        (words.size() == 5 && (!ParseInt(words[4], ms) || ms < 0 || ms > kMaxGestureMs)))
        return "ERR usage: tap <id> <x> <y> [ms]";
    std::string error;
    WidgetInstance* instance = FindDrawn(words, error);
    if (!instance)
        return error;
    unsigned start = InputFeeder::Tap(instance->GetWindowCanvas(), x, y, static_cast<unsigned>(ms));
    return "OK " + std::to_string(start);
}

std::string ControlCommandHandler::Swipe(const Words& words)
{
    int values[5] = {};
    bool parsed = words.size() == 7;
    for (size_t i = 0; parsed && i < 5; ++i) parsed = ParseInt(words[i + 2], values[i]);
    if (!parsed || values[4] < 0 || values[4] > kMaxGestureMs)
        return "ERR usage: swipe <id> <x1> <y1> <x2> <y2> <ms>";
    std::string error;
    WidgetInstance* instance = FindDrawn(words, error);
    if (!instance)
        return error;
    unsigned start = InputFeeder::Swipe(instance->GetWindowCanvas(), values[0], values[1], values[2],
                                        values[3], static_cast<unsigned>(values[4]));
    return "OK " + std::to_string(start);
}

std::string ControlCommandHandler::Snapshot(const Words& words)
{
    if (words.size() != 3)
        return "ERR usage: snapshot <id> <file.png>";
    std::string error;
    WidgetInstance* instance = FindDrawn(words, error);
    if (!instance)
        return error;
    int width = 0, height = 0;
    error = CanvasSnapshot::Save(instance->GetWindow(), words[2], width, height);
    if (!error.empty())
        return "ERR " + error;
    return "OK " + words[2] + " " + std::to_string(width) + "x" + std::to_string(height);
}

std::string ControlCommandHandler::Dump(const Words& words)
{
    if (words.size() != 2)
        return "ERR usage: dump <id>";
    std::string error;
    WidgetInstance* instance = FindDrawn(words, error);
    if (!instance)
        return error;
    return "OK " + mDumper.Dump(instance->GetWindowCanvas());
}

std::string ControlCommandHandler::Count(const Words& words)
{
    if (words.size() != 2)
        return "ERR usage: count <id>";
    std::string error;
    WidgetInstance* instance = FindDrawn(words, error);
    if (!instance)
        return error;
    return "OK " + std::to_string(ObjectTreeDumper::Count(instance->GetWindowCanvas()));
}

std::string ControlCommandHandler::Event(const Words& words)
{
    static const std::pair<const char*, app_event_type_e> kEvents[] = {
        {"language", APP_EVENT_LANGUAGE_CHANGED},
        {"region", APP_EVENT_REGION_FORMAT_CHANGED},
        {"low-battery", APP_EVENT_LOW_BATTERY},
        {"low-memory", APP_EVENT_LOW_MEMORY},
    };
    for (const auto& event : kEvents)
        if (words.size() == 2 && words[1] == event.first)
            return Result("event", AppEventDispatcher::GetInstance().Raise(event.second));
    return "ERR usage: event <language|region|low-battery|low-memory>";
}

void ControlCommandHandler::Idle(const Words& words, const ReplyCb& reply)
{
    double seconds = kDefaultIdleSeconds;
    if (words.size() == 2)
    {
        char* end = nullptr;
        seconds = strtod(words[1].c_str(), &end);
        if (*end != '\0' || !(seconds > 0.0) || seconds > kMaxIdleSeconds)
        {
            reply("ERR usage: idle [seconds]");
            return;
        }
    }
    else if (words.size() > 2)
    {
        reply("ERR usage: idle [seconds]");
        return;
    }
    mIdleWatcher->Wait(seconds, [reply](const std::string& pending)
                       { reply(pending.empty() ? "OK" : "ERR timeout: " + pending); });
}

}  // namespace platform

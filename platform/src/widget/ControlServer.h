#ifndef PLATFORM_WIDGET_CONTROL_SERVER_H
#define PLATFORM_WIDGET_CONTROL_SERVER_H

#include <Ecore.h>

#include <functional>
#include <map>
#include <memory>
#include <string>

namespace platform
{

// A Unix stream socket (mode 0600) that reads one command per line and
// writes each reply before it reads the client's next command. Replies may
// come later (from the main loop); a reply to a client that has gone is
// dropped.
class ControlServer
{
public:
    using ReplyCb = std::function<void(const std::string& reply)>;
    using CommandCb = std::function<void(const std::string& line, const ReplyCb& reply)>;

    explicit ControlServer(CommandCb handler);
    ~ControlServer();
    ControlServer(const ControlServer&) = delete;
    ControlServer& operator=(const ControlServer&) = delete;

    // A WIDGET_ERROR_* code: ALREADY_STARTED when another process answers
    // on the path, IO_ERROR when the socket cannot be made.
    int Start(const std::string& path);
    void Stop();

    static const size_t kMaxLineLength = 65536;

private:
    struct Client
    {
        ControlServer* server = nullptr;
        unsigned id = 0;
        int fd = -1;
        Ecore_Fd_Handler* handler = nullptr;
        std::string input;
        bool isBusy = false;
        bool isDispatching = false;
        bool isAtEnd = false;
    };

    static Eina_Bool AcceptCb(void* data, Ecore_Fd_Handler* handler);
    static Eina_Bool ClientCb(void* data, Ecore_Fd_Handler* handler);
    void Accept();
    void Read(unsigned clientId);
    void ProcessLines(unsigned clientId);
    void Reply(unsigned clientId, const std::string& reply);
    void Close(unsigned clientId);
    Client* Find(unsigned clientId);

    CommandCb mHandler;
    std::string mPath;
    int mListenFd = -1;
    Ecore_Fd_Handler* mListenHandler = nullptr;
    std::map<unsigned, std::unique_ptr<Client>> mClients;
    unsigned mNextClientId = 1;
    std::shared_ptr<bool> mAlive = std::make_shared<bool>(true);
};

}  // namespace platform

#endif

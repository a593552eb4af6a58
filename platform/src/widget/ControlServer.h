#ifndef PLATFORM_WIDGET_CONTROL_SERVER_H
#define PLATFORM_WIDGET_CONTROL_SERVER_H

#include <Ecore.h>

#include <functional>
#include <map>
#include <memory>
#include <string>

#include "dlog/LogLimiter.h"

namespace platform
{

// A Unix stream socket (mode 0600) that reads one command per line and
// writes each reply before it reads the client's next command. Replies may
// come later (from the main loop); a reply to a client that has gone is
// dropped. No client can stall the others: sockets are non-blocking, each
// client's input and output are bounded, and so is the number of clients.
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
    // Replies not yet taken by a client; one reply never comes near it.
    static const size_t kMaxPendingOutput = 8 * 1024 * 1024;
    static const size_t kMaxClients = 64;
    static const int kBacklog = 128;

private:
    struct Client
    {
        ControlServer* server = nullptr;
        unsigned id = 0;
        int fd = -1;
        Ecore_Fd_Handler* handler = nullptr;
        std::string input;
        std::string output;
        bool isBusy = false;
        bool isDispatching = false;
        bool isAtEnd = false;
    };

    static Eina_Bool AcceptCb(void* data, Ecore_Fd_Handler* handler);
    static Eina_Bool ClientCb(void* data, Ecore_Fd_Handler* handler);
    static Eina_Bool ResumeAcceptCb(void* data);
    void ResumeAccept();
    void Accept();
    void PauseAccept();
    void OnClientReady(unsigned clientId, bool isReadable, bool isWritable);
    void Read(unsigned clientId);
    void ProcessLines(unsigned clientId);
    void Reply(unsigned clientId, const std::string& reply);
    // False when the client was closed.
    bool Flush(unsigned clientId);
    void UpdateInterest(Client& client);
    void Drop(unsigned clientId, const std::string& why);
    void Close(unsigned clientId);
    Client* Find(unsigned clientId);

    CommandCb mHandler;
    std::string mPath;
    int mListenFd = -1;
    Ecore_Fd_Handler* mListenHandler = nullptr;
    Ecore_Timer* mAcceptPauseTimer = nullptr;
    std::map<unsigned, std::unique_ptr<Client>> mClients;
    unsigned mNextClientId = 1;
    LogLimiter mLimitLog{DLOG_ERROR, "widget-host"};
    std::shared_ptr<bool> mAlive = std::make_shared<bool>(true);
};

}  // namespace platform

#endif

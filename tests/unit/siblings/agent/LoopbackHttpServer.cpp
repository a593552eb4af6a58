#include "LoopbackHttpServer.h"

#include <arpa/inet.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <chrono>

namespace SiblingTest
{

namespace
{
constexpr int POLL_MS = 20;
constexpr size_t MAX_HEAD = 16 * 1024;

bool WaitReadable(int fd, int ms)
{
    pollfd entry{fd, POLLIN, 0};
    return poll(&entry, 1, ms) > 0;
}

void SendAll(int fd, const std::string& data)
{
    size_t sent = 0;
    while (sent < data.size())
    {
        ssize_t n = send(fd, data.data() + sent, data.size() - sent, MSG_NOSIGNAL);
        if (n <= 0)
            return;  // the client gave up (a timeout test)
        sent += static_cast<size_t>(n);
    }
}
}  // namespace

LoopbackHttpServer::LoopbackHttpServer()
{
    mListenFd = socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    socklen_t length = sizeof(address);
    if (mListenFd < 0 || bind(mListenFd, reinterpret_cast<sockaddr*>(&address), sizeof(address)) != 0 ||
        listen(mListenFd, 8) != 0 ||
        getsockname(mListenFd, reinterpret_cast<sockaddr*>(&address), &length) != 0)
        return;
    mPort = ntohs(address.sin_port);
    mThread = std::thread(&LoopbackHttpServer::Run, this);
}

LoopbackHttpServer::~LoopbackHttpServer()
{
    mIsStopping = true;
    if (mThread.joinable())
        mThread.join();
    if (mListenFd >= 0)
        close(mListenFd);
}

void LoopbackHttpServer::SetAnswer(const Answer& answer)
{
    std::lock_guard<std::mutex> lock(mMutex);
    mAnswer = answer;
}

std::string LoopbackHttpServer::GetBaseUrl() const
{
    return mPort ? "http://127.0.0.1:" + std::to_string(mPort) + "/v1/forecast" : std::string();
}

std::vector<std::string> LoopbackHttpServer::GetRequests() const
{
    std::lock_guard<std::mutex> lock(mMutex);
    return mRequests;
}

void LoopbackHttpServer::Run()
{
    while (!mIsStopping)
    {
        if (!WaitReadable(mListenFd, POLL_MS))
            continue;
        int client = accept4(mListenFd, nullptr, nullptr, SOCK_CLOEXEC);
        if (client < 0)
            continue;
        Serve(client);
        close(client);
    }
}

void LoopbackHttpServer::Serve(int client)
{
    std::string head;
    char buffer[4096];
    while (head.find("\r\n\r\n") == std::string::npos && head.size() < MAX_HEAD && !mIsStopping)
    {
        if (!WaitReadable(client, POLL_MS))
            continue;
        ssize_t n = recv(client, buffer, sizeof(buffer), 0);
        if (n <= 0)
            return;
        head.append(buffer, static_cast<size_t>(n));
    }
    Answer answer;
    {
        std::lock_guard<std::mutex> lock(mMutex);
        mRequests.push_back(head);
        answer = mAnswer;
    }
    auto until = std::chrono::steady_clock::now() + std::chrono::milliseconds(answer.delayMs);
    while (std::chrono::steady_clock::now() < until && !mIsStopping)
        std::this_thread::sleep_for(std::chrono::milliseconds(POLL_MS));
    std::string reply =
        "HTTP/1.1 " + std::to_string(answer.status) + " Test\r\nContent-Type: application/json\r\n";
    if (answer.isLengthSent)
        reply += "Content-Length: " + std::to_string(answer.body.size()) + "\r\n";
    SendAll(client, reply + "Connection: close\r\n\r\n" + answer.body);
}

}  // namespace SiblingTest

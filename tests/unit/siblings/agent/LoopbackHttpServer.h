#ifndef WEATHER_TESTS_LOOPBACK_HTTP_SERVER_H
#define WEATHER_TESTS_LOOPBACK_HTTP_SERVER_H

#include <atomic>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

namespace SiblingTest
{

// An HTTP server on 127.0.0.1 in a thread of the test: every request gets
// the answer set last, and the request heads are kept for the test.
class LoopbackHttpServer
{
public:
    struct Answer
    {
        int status = 200;
        std::string body;
        int delayMs = 0;
        // Without a length the answer ends when the connection closes.
        bool isLengthSent = true;
    };

    LoopbackHttpServer();
    ~LoopbackHttpServer();
    LoopbackHttpServer(const LoopbackHttpServer&) = delete;
    LoopbackHttpServer& operator=(const LoopbackHttpServer&) = delete;

    void SetAnswer(const Answer& answer);
    // "http://127.0.0.1:<port>/v1/forecast"; empty when no port could be had.
    std::string GetBaseUrl() const;
    std::vector<std::string> GetRequests() const;

private:
    void Run();
    void Serve(int client);

    int mListenFd = -1;
    int mPort = 0;
    std::atomic<bool> mIsStopping{false};
    mutable std::mutex mMutex;
    Answer mAnswer;
    std::vector<std::string> mRequests;
    std::thread mThread;
};

}  // namespace SiblingTest

#endif

#ifndef NSWEATHER_HTTP_CLIENT_H
#define NSWEATHER_HTTP_CLIENT_H

#include <cstddef>
#include <string>

namespace NSWeather
{

// One bounded HTTP(S) GET through libcurl: a total time limit, a cap on
// the answer's size, no redirects, only http and https, certificates
// checked. Nothing is kept between requests.
class HttpClient
{
public:
    enum class Outcome
    {
        ANSWERED,     // a whole answer came, whatever its status
        UNREACHABLE,  // name not resolved or connection refused
        TIMED_OUT,
        TOO_LARGE,
        FAILED,  // anything else (TLS, broken answer, bad URL)
    };

    struct Response
    {
        Outcome outcome = Outcome::FAILED;
        long status = 0;
        std::string body;
        // Why it failed, for the log; empty when answered.
        std::string error;
    };

    HttpClient(std::string userAgent, long timeoutMs, size_t maxBytes);
    virtual ~HttpClient() = default;

    Response Get(const std::string& url) const;
    // %-escapes everything but unreserved characters.
    static std::string Escape(const std::string& text);

private:
    static size_t WriteCb(char* data, size_t size, size_t count, void* userData);

    std::string mUserAgent;
    long mTimeoutMs;
    size_t mMaxBytes;
};

}  // namespace NSWeather

#endif

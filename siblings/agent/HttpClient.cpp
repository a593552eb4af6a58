#include "HttpClient.h"

#include <curl/curl.h>

#include <algorithm>
#include <memory>
#include <mutex>

namespace NSWeather
{

namespace
{
struct EasyDeleter
{
    void operator()(CURL* handle) const { curl_easy_cleanup(handle); }
};
struct ListDeleter
{
    void operator()(curl_slist* list) const { curl_slist_free_all(list); }
};
using EasyPtr = std::unique_ptr<CURL, EasyDeleter>;
using ListPtr = std::unique_ptr<curl_slist, ListDeleter>;

struct Sink
{
    std::string* body;
    size_t maxBytes;
    bool isTooLarge;
};

// curl_global_init is not thread-safe; do it once, before any handle.
bool InitCurl()
{
    static std::once_flag once;
    static CURLcode result = CURLE_FAILED_INIT;
    std::call_once(once, [] { result = curl_global_init(CURL_GLOBAL_DEFAULT); });
    return result == CURLE_OK;
}

HttpClient::Outcome OutcomeOf(CURLcode code, bool isTooLarge)
{
    if (isTooLarge || code == CURLE_FILESIZE_EXCEEDED)
        return HttpClient::Outcome::TOO_LARGE;
    switch (code)
    {
        case CURLE_OK:
            return HttpClient::Outcome::ANSWERED;
        case CURLE_OPERATION_TIMEDOUT:
            return HttpClient::Outcome::TIMED_OUT;
        case CURLE_COULDNT_RESOLVE_HOST:
        case CURLE_COULDNT_RESOLVE_PROXY:
        case CURLE_COULDNT_CONNECT:
            return HttpClient::Outcome::UNREACHABLE;
        default:
            return HttpClient::Outcome::FAILED;
    }
}
}  // namespace

HttpClient::HttpClient(std::string userAgent, long timeoutMs, size_t maxBytes)
    : mUserAgent(std::move(userAgent)), mTimeoutMs(std::max(timeoutMs, 1L)), mMaxBytes(maxBytes)
{
}

size_t HttpClient::WriteCb(char* data, size_t size, size_t count, void* userData)
{
    auto* sink = static_cast<Sink*>(userData);
    if (!sink || !sink->body || !data)
        return 0;
    size_t bytes = size * count;
    if (bytes > sink->maxBytes - std::min(sink->maxBytes, sink->body->size()))
    {
        sink->isTooLarge = true;
        return 0;
    }
    try
    {
        sink->body->append(data, bytes);
    }
    catch (...)
    {
        return 0;
    }
    return bytes;
}

std::string HttpClient::Escape(const std::string& text)
{
    static const char* const HEX = "0123456789ABCDEF";
    std::string escaped;
    for (unsigned char c : text)
    {
        bool isAlnum = (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
        if (isAlnum || c == '-' || c == '.' || c == '_' || c == '~')
        {
            escaped += static_cast<char>(c);
            continue;
        }
        escaped += '%';
        escaped += HEX[c >> 4];
        escaped += HEX[c & 15];
    }
    return escaped;
}

HttpClient::Response HttpClient::Get(const std::string& url) const
{
    Response response;
    EasyPtr easy(InitCurl() ? curl_easy_init() : nullptr);
    ListPtr headers(curl_slist_append(nullptr, "Accept: application/json"));
    if (!easy || !headers)
    {
        response.error = "libcurl could not be set up";
        return response;
    }
    Sink sink{&response.body, mMaxBytes, false};
    char errorText[CURL_ERROR_SIZE] = "";
    CURL* handle = easy.get();
    curl_easy_setopt(handle, CURLOPT_URL, url.c_str());
    curl_easy_setopt(handle, CURLOPT_PROTOCOLS_STR, "http,https");
    curl_easy_setopt(handle, CURLOPT_FOLLOWLOCATION, 0L);
    curl_easy_setopt(handle, CURLOPT_NOSIGNAL, 1L);
    curl_easy_setopt(handle, CURLOPT_TIMEOUT_MS, mTimeoutMs);
    curl_easy_setopt(handle, CURLOPT_CONNECTTIMEOUT_MS, mTimeoutMs);
    curl_easy_setopt(handle, CURLOPT_MAXFILESIZE_LARGE, static_cast<curl_off_t>(mMaxBytes));
    curl_easy_setopt(handle, CURLOPT_USERAGENT, mUserAgent.c_str());
    curl_easy_setopt(handle, CURLOPT_HTTPHEADER, headers.get());
    curl_easy_setopt(handle, CURLOPT_ACCEPT_ENCODING, "");
    curl_easy_setopt(handle, CURLOPT_ERRORBUFFER, errorText);
    curl_easy_setopt(handle, CURLOPT_WRITEFUNCTION, WriteCb);
    curl_easy_setopt(handle, CURLOPT_WRITEDATA, &sink);
    CURLcode code = curl_easy_perform(handle);
    response.outcome = OutcomeOf(code, sink.isTooLarge);
    if (response.outcome == Outcome::ANSWERED)
    {
        curl_easy_getinfo(handle, CURLINFO_RESPONSE_CODE, &response.status);
        return response;
    }
    response.body.clear();
    response.error = sink.isTooLarge ? "the answer is larger than " + std::to_string(mMaxBytes) + " bytes"
                                     : std::string(curl_easy_strerror(code));
    if (!sink.isTooLarge && errorText[0])
        response.error += std::string(": ") + errorText;
    return response;
}

}  // namespace NSWeather

#include "WeatherSourceChoice.h"

#include <vconf.h>

#include <cstdlib>
#include <memory>

#include "OpenMeteoWeatherSource.h"
#include "SampleWeatherSource.h"
#include "SiblingLog.h"

namespace NSWeather
{

namespace
{
constexpr long MIN_TIMEOUT_MS = 50;
constexpr long MAX_TIMEOUT_MS = 60000;

bool IsHttpUrl(const std::string& url)
{
    return url.rfind("http://", 0) == 0 || url.rfind("https://", 0) == 0;
}
}  // namespace

std::string WeatherSourceChoice::ReadKey()
{
    char* value = vconf_get_str(SOURCE_KEY);
    if (!value)
        return std::string();
    std::string name(value);
    free(value);
    return name;
}

WeatherSourcePtr WeatherSourceChoice::MakeOpenMeteo()
{
    OpenMeteoWeatherSource::Options options = OpenMeteoWeatherSource::GetDefaultOptions();
    const char* url = getenv(BASE_URL_ENV);
    if (url && *url)
    {
        if (IsHttpUrl(url))
            options.baseUrl = url;
        else
            SIBLING_LOG("%s is not an http(s) address; the service's own is used", BASE_URL_ENV);
    }
    const char* timeout = getenv(TIMEOUT_ENV);
    if (timeout && *timeout)
    {
        char* end = nullptr;
        long ms = strtol(timeout, &end, 10);
        if (*end == '\0' && ms >= MIN_TIMEOUT_MS && ms <= MAX_TIMEOUT_MS)
            options.timeoutMs = ms;
        else
            SIBLING_LOG("%s='%s' is not %ld-%ld ms; %ld ms is used", TIMEOUT_ENV, timeout, MIN_TIMEOUT_MS,
                        MAX_TIMEOUT_MS, options.timeoutMs);
    }
    return std::make_shared<OpenMeteoWeatherSource>(options);
}

WeatherSourcePtr WeatherSourceChoice::Make(const std::string& name)
{
    std::string chosen = name.empty() ? ReadKey() : name;
    if (chosen == OPEN_METEO)
        return MakeOpenMeteo();
    if (chosen.empty() || chosen == SAMPLE)
        return std::make_shared<SampleWeatherSource>();
    if (!name.empty())
        return nullptr;
    SIBLING_LOG("%s holds an unknown source '%s'; sample weather is used", SOURCE_KEY, chosen.c_str());
    return std::make_shared<SampleWeatherSource>();
}

}  // namespace NSWeather

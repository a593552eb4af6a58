// One answer of the forecast service, as the agent receives it over the
// network. An accepted answer holds exactly what the rows need, in order
// and in range; the error reason of any answer is short and printable.
#include <cstdint>
#include <string>

#include "FuzzRoot.h"
#include "OpenMeteoForecast.h"
#include "WmoWeatherCode.h"

namespace
{
// The recorded seed's moment, so that its hours lie ahead.
constexpr time_t kNow = 1796617200;

void CheckAccepted(const NSWeather::OpenMeteoForecast& forecast)
{
    using Forecast = NSWeather::OpenMeteoForecast;
    FUZZ_CHECK(forecast.GetHours().size() == static_cast<size_t>(Forecast::HOUR_COUNT));
    FUZZ_CHECK(forecast.GetDays().size() == static_cast<size_t>(Forecast::DAY_COUNT));
    FUZZ_CHECK(NSWeather::WmoWeatherCode::IsKnown(forecast.GetCurrent().code));
    FUZZ_CHECK(forecast.GetCurrent().humidity >= 0 && forecast.GetCurrent().humidity <= 100);
    time_t last = 0;
    for (const auto& hour : forecast.GetHours())
    {
        FUZZ_CHECK(NSWeather::WmoWeatherCode::IsKnown(hour.code));
        FUZZ_CHECK(hour.time > last);
        last = hour.time;
    }
    last = 0;
    for (const auto& day : forecast.GetDays())
    {
        FUZZ_CHECK(NSWeather::WmoWeatherCode::IsKnown(day.code));
        FUZZ_CHECK(day.time > last);
        last = day.time;
    }
}
}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    WeatherTest::FuzzRoot::Get();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    std::string text(reinterpret_cast<const char*>(data), size);
    NSWeather::OpenMeteoForecast forecast;
    std::string reason;
    if (NSWeather::OpenMeteoForecast::Parse(text, kNow, forecast, reason))
        CheckAccepted(forecast);
    else
        FUZZ_CHECK(!reason.empty());
    std::string error = NSWeather::OpenMeteoForecast::GetErrorReason(text);
    FUZZ_CHECK(error.size() <= 200);
    for (char c : error) FUZZ_CHECK(static_cast<unsigned char>(c) >= 0x20 && c != 0x7f);
    return 0;
}

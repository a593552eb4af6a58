#ifndef NSWEATHER_OPEN_METEO_FORECAST_H
#define NSWEATHER_OPEN_METEO_FORECAST_H

#include <ctime>
#include <optional>
#include <string>
#include <vector>

namespace NSWeather
{

// One Open-Meteo forecast answer (JSON, unix times, metric units), read
// and checked whole before anything of it is used: an answer that lacks a
// value the rows need, or holds one out of range, is refused as a whole.
class OpenMeteoForecast
{
public:
    static constexpr int HOUR_COUNT = 24;
    static constexpr int DAY_COUNT = 10;

    struct Current
    {
        time_t time = 0;
        double temperature = 0.0;
        double feltTemperature = 0.0;
        int humidity = 0;
        bool isDay = true;
        int code = 0;
        std::optional<double> windSpeed;  // km/h
        std::optional<double> windDirection;
        std::optional<double> uvIndex;  // of the hour it falls in
    };

    struct Hour
    {
        time_t time = 0;
        double temperature = 0.0;
        int code = 0;
        bool isDay = true;
    };

    struct Day
    {
        time_t time = 0;  // local midnight
        int code = 0;
        double high = 0.0;
        double low = 0.0;
        std::optional<time_t> sunrise;
        std::optional<time_t> sunset;
        std::optional<double> precipitationSum;
        std::optional<double> precipitationProbability;
    };

    // From the first day's sunset to the next sunrise.
    struct Night
    {
        std::optional<double> precipitationSum;
        std::optional<double> precipitationProbability;
    };

    virtual ~OpenMeteoForecast() = default;

    // False, with the reason, for a refused answer. The hours are the 24
    // that follow `now`, the days the first ten of the answer.
    static bool Parse(const std::string& text, time_t now, OpenMeteoForecast& forecast, std::string& reason);
    // The "reason" of an error answer, shortened and printable; empty when
    // there is none.
    static std::string GetErrorReason(const std::string& text);

    const Current& GetCurrent() const { return mCurrent; }
    const std::vector<Hour>& GetHours() const { return mHours; }
    const std::vector<Day>& GetDays() const { return mDays; }
    const Night& GetTonight() const { return mTonight; }

private:
    Current mCurrent;
    std::vector<Hour> mHours;
    std::vector<Day> mDays;
    Night mTonight;
};

}  // namespace NSWeather

#endif

#include "OpenMeteoForecast.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>

#include "WmoWeatherCode.h"

namespace NSWeather
{

namespace
{
using Json = nlohmann::json;
using Series = std::vector<std::optional<double>>;

// The answer nests four levels (object, block, series, value); anything
// deeper is dropped while it is read, so no input nests without bound.
constexpr int MAX_DEPTH = 4;
constexpr size_t MAX_REASON = 200;
constexpr time_t HOUR = 3600;
constexpr time_t CURRENT_AGE_LIMIT = 3 * HOUR;

struct Range
{
    double low;
    double high;
    bool isWhole;
};

constexpr Range TIME{1.0, 1e11, true};
constexpr Range TEMPERATURE{-90.0, 60.0, false};
constexpr Range FELT_TEMPERATURE{-110.0, 80.0, false};
constexpr Range PERCENT{0.0, 100.0, false};
constexpr Range AMOUNT{0.0, 1e4, false};
constexpr Range DEGREES{0.0, 360.0, false};
constexpr Range FLAG{0.0, 1.0, true};
constexpr Range CODE{0.0, 99.0, true};

struct HourlySeries
{
    Series time;
    Series temperature;
    Series code;
    Series isDay;
    Series precipitation;
    Series probability;
    Series uvIndex;
};

struct DailySeries
{
    Series time;
    Series code;
    Series high;
    Series low;
    Series sunrise;
    Series sunset;
    Series precipitation;
    Series probability;
};

Json ParseBounded(const std::string& text)
{
    return Json::parse(
        text, [](int depth, Json::parse_event_t, Json&) { return depth <= MAX_DEPTH; }, false);
}

std::string Where(const char* block, const char* key)
{
    return std::string(block) + "." + key;
}

std::string Where(const char* block, const char* key, size_t index)
{
    return Where(block, key) + "[" + std::to_string(index) + "]";
}

bool ReadValue(const Json& value, const Range& range, double& number)
{
    if (!value.is_number())
        return false;
    number = value.get<double>();
    return std::isfinite(number) && number >= range.low && number <= range.high &&
           (!range.isWhole || std::floor(number) == number);
}

// An absent or null value leaves `value` empty; anything else must be a
// number in range.
bool ReadOptional(const Json& block, const char* blockName, const char* key, const Range& range,
                  std::optional<double>& value, std::string& reason)
{
    auto it = block.find(key);
    if (it == block.end() || it->is_null())
        return true;
    double number = 0.0;
    if (!ReadValue(*it, range, number))
    {
        reason = Where(blockName, key) + " is not a valid value";
        return false;
    }
    value = number;
    return true;
}

bool ReadRequired(const Json& block, const char* blockName, const char* key, const Range& range,
                  double& value, std::string& reason)
{
    std::optional<double> read;
    if (!ReadOptional(block, blockName, key, range, read, reason))
        return false;
    if (!read)
    {
        reason = Where(blockName, key) + " is missing";
        return false;
    }
    value = *read;
    return true;
}

// Numbers in range or nulls, as many as the block's times.
bool ReadSeries(const Json& block, const char* blockName, const char* key, size_t count, const Range& range,
                Series& series, std::string& reason)
{
    auto it = block.find(key);
    if (it == block.end() || !it->is_array() || it->size() != count)
    {
        reason = Where(blockName, key) + " is missing or not as long as the times";
        return false;
    }
    series.assign(count, std::nullopt);
    for (size_t i = 0; i < count; ++i)
    {
        double number = 0.0;
        if ((*it)[i].is_null())
            continue;
        if (!ReadValue((*it)[i], range, number))
        {
            reason = Where(blockName, key, i) + " is not a valid value";
            return false;
        }
        series[i] = number;
    }
    return true;
}

bool HasValues(const char* blockName, const char* key, const Series& series, size_t first, size_t count,
               std::string& reason)
{
    for (size_t i = first; i < first + count; ++i)
    {
        if (!series[i])
        {
            reason = Where(blockName, key, i) + " is empty";
            return false;
        }
    }
    return true;
}

bool IsKnownCode(const char* blockName, const char* key, int code, std::string& reason)
{
    if (WmoWeatherCode::IsKnown(code))
        return true;
    reason = Where(blockName, key) + " " + std::to_string(code) + " is no known weather code";
    return false;
}

// The block's times: all there and rising.
bool ReadTimes(const Json& root, const char* blockName, const Json*& block, Series& time, std::string& reason)
{
    auto it = root.find(blockName);
    if (it == root.end() || !it->is_object() || it->find("time") == it->end() ||
        !it->find("time")->is_array())
    {
        reason = std::string("the answer has no ") + blockName + " times";
        return false;
    }
    block = &*it;
    size_t count = block->find("time")->size();
    if (!ReadSeries(*block, blockName, "time", count, TIME, time, reason) ||
        !HasValues(blockName, "time", time, 0, count, reason))
        return false;
    for (size_t i = 1; i < count; ++i)
    {
        if (*time[i] <= *time[i - 1])
        {
            reason = Where(blockName, "time", i) + " does not follow the one before";
            return false;
        }
    }
    return true;
}

bool ReadCurrent(const Json& root, time_t now, OpenMeteoForecast::Current& current, std::string& reason)
{
    auto it = root.find("current");
    if (it == root.end() || !it->is_object())
    {
        reason = "the answer has no current conditions";
        return false;
    }
    const Json& block = *it;
    const char* name = "current";
    double time = 0.0;
    double humidity = 0.0;
    double isDay = 0.0;
    double code = 0.0;
    bool isRead = ReadRequired(block, name, "time", TIME, time, reason) &&
                  ReadRequired(block, name, "temperature_2m", TEMPERATURE, current.temperature, reason) &&
                  ReadRequired(block, name, "apparent_temperature", FELT_TEMPERATURE, current.feltTemperature,
                               reason) &&
                  ReadRequired(block, name, "relative_humidity_2m", PERCENT, humidity, reason) &&
                  ReadRequired(block, name, "is_day", FLAG, isDay, reason) &&
                  ReadRequired(block, name, "weather_code", CODE, code, reason) &&
                  ReadOptional(block, name, "wind_speed_10m", AMOUNT, current.windSpeed, reason) &&
                  ReadOptional(block, name, "wind_direction_10m", DEGREES, current.windDirection, reason);
    if (!isRead)
        return false;
    current.time = static_cast<time_t>(time);
    current.humidity = static_cast<int>(std::lround(humidity));
    current.isDay = isDay != 0.0;
    current.code = static_cast<int>(code);
    if (!IsKnownCode("current", "weather_code", current.code, reason))
        return false;
    if (current.time > now + HOUR || current.time < now - CURRENT_AGE_LIMIT)
    {
        reason = "the current conditions are of " + std::to_string(current.time) + ", not of now (" +
                 std::to_string(now) + ")";
        return false;
    }
    return true;
}

bool ReadHourly(const Json& root, HourlySeries& series, std::string& reason)
{
    const Json* block = nullptr;
    const char* name = "hourly";
    if (!ReadTimes(root, name, block, series.time, reason))
        return false;
    size_t count = series.time.size();
    return ReadSeries(*block, name, "temperature_2m", count, TEMPERATURE, series.temperature, reason) &&
           ReadSeries(*block, name, "weather_code", count, CODE, series.code, reason) &&
           ReadSeries(*block, name, "is_day", count, FLAG, series.isDay, reason) &&
           ReadSeries(*block, name, "precipitation", count, AMOUNT, series.precipitation, reason) &&
           ReadSeries(*block, name, "precipitation_probability", count, PERCENT, series.probability,
                      reason) &&
           ReadSeries(*block, name, "uv_index", count, AMOUNT, series.uvIndex, reason);
}

bool SelectHours(const HourlySeries& series, time_t now, std::vector<OpenMeteoForecast::Hour>& hours,
                 std::string& reason)
{
    size_t count = series.time.size();
    size_t first = 0;
    while (first < count && *series.time[first] <= now) ++first;
    if (count - first < static_cast<size_t>(OpenMeteoForecast::HOUR_COUNT))
    {
        reason = "the answer has " + std::to_string(count - first) + " hours after now, not " +
                 std::to_string(OpenMeteoForecast::HOUR_COUNT);
        return false;
    }
    const char* name = "hourly";
    size_t needed = OpenMeteoForecast::HOUR_COUNT;
    if (!HasValues(name, "temperature_2m", series.temperature, first, needed, reason) ||
        !HasValues(name, "weather_code", series.code, first, needed, reason) ||
        !HasValues(name, "is_day", series.isDay, first, needed, reason))
        return false;
    for (size_t i = first; i < first + needed; ++i)
    {
        OpenMeteoForecast::Hour hour;
        hour.time = static_cast<time_t>(*series.time[i]);
        hour.temperature = *series.temperature[i];
        hour.code = static_cast<int>(*series.code[i]);
        if (!IsKnownCode(name, "weather_code", hour.code, reason))
            return false;
        hour.isDay = *series.isDay[i] != 0.0;
        hours.push_back(hour);
    }
    return true;
}

bool ReadDaily(const Json& root, std::vector<OpenMeteoForecast::Day>& days, std::string& reason)
{
    const Json* block = nullptr;
    const char* name = "daily";
    DailySeries s;
    if (!ReadTimes(root, name, block, s.time, reason))
        return false;
    size_t count = s.time.size();
    size_t needed = OpenMeteoForecast::DAY_COUNT;
    bool isRead =
        ReadSeries(*block, name, "weather_code", count, CODE, s.code, reason) &&
        ReadSeries(*block, name, "temperature_2m_max", count, TEMPERATURE, s.high, reason) &&
        ReadSeries(*block, name, "temperature_2m_min", count, TEMPERATURE, s.low, reason) &&
        ReadSeries(*block, name, "sunrise", count, TIME, s.sunrise, reason) &&
        ReadSeries(*block, name, "sunset", count, TIME, s.sunset, reason) &&
        ReadSeries(*block, name, "precipitation_sum", count, AMOUNT, s.precipitation, reason) &&
        ReadSeries(*block, name, "precipitation_probability_max", count, PERCENT, s.probability, reason);
    if (!isRead)
        return false;
    if (count < needed)
    {
        reason = "the answer has " + std::to_string(count) + " days, not " + std::to_string(needed);
        return false;
    }
    if (!HasValues(name, "weather_code", s.code, 0, needed, reason) ||
        !HasValues(name, "temperature_2m_max", s.high, 0, needed, reason) ||
        !HasValues(name, "temperature_2m_min", s.low, 0, needed, reason))
        return false;
    for (size_t i = 0; i < needed; ++i)
    {
        OpenMeteoForecast::Day day;
        day.time = static_cast<time_t>(*s.time[i]);
        day.code = static_cast<int>(*s.code[i]);
        if (!IsKnownCode(name, "weather_code", day.code, reason))
            return false;
        day.high = *s.high[i];
        day.low = *s.low[i];
        if (day.low > day.high)
        {
            reason = Where(name, "temperature_2m_min", i) + " is above the day's maximum";
            return false;
        }
        if (s.sunrise[i] && s.sunset[i])
        {
            day.sunrise = static_cast<time_t>(*s.sunrise[i]);
            day.sunset = static_cast<time_t>(*s.sunset[i]);
        }
        day.precipitationSum = s.precipitation[i];
        day.precipitationProbability = s.probability[i];
        days.push_back(day);
    }
    return true;
}

// The UV index of the hour the current conditions fall in.
std::optional<double> UvIndexAt(const HourlySeries& series, time_t time)
{
    for (size_t i = 0; i < series.time.size(); ++i)
        if (*series.time[i] <= time && time < *series.time[i] + HOUR)
            return series.uvIndex[i];
    return std::nullopt;
}

// Tonight's precipitation from the hours between the first sunset and the
// next sunrise; empty when the answer does not say.
OpenMeteoForecast::Night NightOf(const HourlySeries& series, const std::vector<OpenMeteoForecast::Day>& days)
{
    OpenMeteoForecast::Night night;
    if (days.size() < 2 || !days[0].sunset || !days[1].sunrise)
        return night;
    for (size_t i = 0; i < series.time.size(); ++i)
    {
        double time = *series.time[i];
        if (time < *days[0].sunset || time >= *days[1].sunrise)
            continue;
        if (series.precipitation[i])
            night.precipitationSum = night.precipitationSum.value_or(0.0) + *series.precipitation[i];
        if (series.probability[i])
            night.precipitationProbability =
                std::max(night.precipitationProbability.value_or(0.0), *series.probability[i]);
    }
    return night;
}
}  // namespace

bool OpenMeteoForecast::Parse(const std::string& text, time_t now, OpenMeteoForecast& forecast,
                              std::string& reason)
{
    Json root = ParseBounded(text);
    if (root.is_discarded() || !root.is_object())
    {
        reason = "the answer is not a JSON object";
        return false;
    }
    OpenMeteoForecast parsed;
    HourlySeries hourly;
    if (!ReadCurrent(root, now, parsed.mCurrent, reason) || !ReadHourly(root, hourly, reason) ||
        !SelectHours(hourly, now, parsed.mHours, reason) || !ReadDaily(root, parsed.mDays, reason))
        return false;
    parsed.mTonight = NightOf(hourly, parsed.mDays);
    parsed.mCurrent.uvIndex = UvIndexAt(hourly, parsed.mCurrent.time);
    forecast = std::move(parsed);
    return true;
}

std::string OpenMeteoForecast::GetErrorReason(const std::string& text)
{
    Json root = ParseBounded(text);
    if (root.is_discarded() || !root.is_object())
        return std::string();
    auto it = root.find("reason");
    if (it == root.end() || !it->is_string())
        return std::string();
    std::string reason = it->get<std::string>().substr(0, MAX_REASON);
    for (char& c : reason)
        if (static_cast<unsigned char>(c) < 0x20 || c == 0x7f)
            c = ' ';
    return reason;
}

}  // namespace NSWeather

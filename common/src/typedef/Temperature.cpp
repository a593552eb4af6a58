#include "Temperature.h"

#include <cmath>

namespace NSWeather
{

namespace
{
constexpr double NO_TEMPERATURE = 999.0;

double RoundToOneDecimal(double value)
{
    return std::floor(value * 10 + 0.5) / 10;
}
}  // namespace

Temperature::Temperature() : mCelsius(NO_TEMPERATURE), mFahrenheit(NO_TEMPERATURE) {}

Temperature::~Temperature() = default;

void Temperature::SetCelsiusValue(double celsius)
{
    // The sentinel must survive, not become 1830.2 degrees Fahrenheit.
    if (celsius == NO_TEMPERATURE)
    {
        mCelsius = NO_TEMPERATURE;
        mFahrenheit = NO_TEMPERATURE;
        return;
    }
    mCelsius = RoundToOneDecimal(celsius);
    mFahrenheit = RoundToOneDecimal(32 + celsius * 1.8);
}

double Temperature::GetCelsius() const
{
    return mCelsius;
}

double Temperature::GetFahrenheit() const
{
    return mFahrenheit;
}

}  // namespace NSWeather

#ifndef NSWEATHER_TEMPERATURE_H
#define NSWEATHER_TEMPERATURE_H

#include <memory>
#include <vector>

namespace NSWeather
{
// One temperature in both scales; the stores hold Celsius only.
class Temperature
{
public:
    Temperature();
    virtual ~Temperature();

    // 999.0 stays the "no value" sentinel in both scales; anything else is
    // kept to one decimal, rounded half up.
    void SetCelsiusValue(double celsius);
    double GetCelsius() const;
    double GetFahrenheit() const;

private:
    double mCelsius;
    double mFahrenheit;
};

using TemperaturePtr = std::shared_ptr<Temperature>;
using TemperaturePtrVector = std::vector<TemperaturePtr>;
using TemperaturePtrVectorPtr = std::shared_ptr<TemperaturePtrVector>;
}  // namespace NSWeather

#endif

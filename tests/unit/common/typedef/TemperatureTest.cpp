#include "Temperature.h"

#include <gtest/gtest.h>

namespace
{
using NSWeather::Temperature;

struct Conversion
{
    double input;
    double celsius;
    double fahrenheit;
};

class TemperatureConversionTest : public ::testing::TestWithParam<Conversion>
{
};

TEST_P(TemperatureConversionTest, KeepsOneDecimalRoundedHalfUp)
{
    const Conversion& c = GetParam();
    Temperature temperature;
    temperature.SetCelsiusValue(c.input);
    EXPECT_DOUBLE_EQ(temperature.GetCelsius(), c.celsius);
    EXPECT_DOUBLE_EQ(temperature.GetFahrenheit(), c.fahrenheit);
}

INSTANTIATE_TEST_SUITE_P(Values, TemperatureConversionTest,
                         ::testing::Values(Conversion{21.04, 21.0, 69.9}, Conversion{-2.25, -2.2, 28.0},
                                           Conversion{-40.0, -40.0, -40.0}, Conversion{0.05, 0.1, 32.1},
                                           Conversion{36.6, 36.6, 97.9},
                                           // Close to the sentinel but not it: converted.
                                           Conversion{999.04, 999.0, 1830.3}));

// Fresh temperatures are checked with the records that hold them.
TEST(TemperatureTest, SentinelSurvivesInBothScales)
{
    Temperature temperature;
    temperature.SetCelsiusValue(12.3);
    temperature.SetCelsiusValue(999.0);
    EXPECT_DOUBLE_EQ(temperature.GetCelsius(), 999.0);
    EXPECT_DOUBLE_EQ(temperature.GetFahrenheit(), 999.0);
}

}  // namespace

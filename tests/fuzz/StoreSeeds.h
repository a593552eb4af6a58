#ifndef WEATHER_TESTS_FUZZ_STORE_SEEDS_H
#define WEATHER_TESTS_FUZZ_STORE_SEEDS_H

namespace WeatherTest
{

// Makes the shared store in the current platform root through the store's
// own code: every table, the settings row, the latest version and two cities
// (one of them the current location) with a little of every forecast.
void WriteSoundStore();

}  // namespace WeatherTest

#endif

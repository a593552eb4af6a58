#ifndef NSWEATHER_MOON_PHASE_H
#define NSWEATHER_MOON_PHASE_H

#include <ctime>
#include <memory>
#include <string>
#include <vector>

namespace NSWeather
{
// Moon phase of one day at one city.
class MoonPhase
{
public:
    MoonPhase();
    virtual ~MoonPhase();

    std::string GetLocationID() const;
    void SetLocationID(const std::string& locationID);
    time_t GetDate() const;
    void SetDate(time_t date);
    time_t GetMoonRiseTime() const;
    void SetMoonRiseTime(time_t moonRiseTime);
    time_t GetMoonSetTime() const;
    void SetMoonSetTime(time_t moonSetTime);
    std::string GetPhaseText() const;
    void SetPhaseText(const std::string& phaseText);
    int GetAge() const;
    void SetAge(int age);

private:
    std::string mLocationID;
    time_t mDate;
    time_t mMoonRiseTime;
    time_t mMoonSetTime;
    std::string mPhaseText;
    int mAge;
};

using MoonPhasePtr = std::shared_ptr<MoonPhase>;
using MoonPhasePtrVector = std::vector<MoonPhasePtr>;
using MoonPhasePtrVectorPtr = std::shared_ptr<MoonPhasePtrVector>;
}  // namespace NSWeather

#endif

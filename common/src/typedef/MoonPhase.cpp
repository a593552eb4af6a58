#include "MoonPhase.h"

namespace NSWeather
{

MoonPhase::MoonPhase()
    : mLocationID(), mDate(999), mMoonRiseTime(999), mMoonSetTime(999), mPhaseText(), mAge(999)
{
}

MoonPhase::~MoonPhase() = default;

std::string MoonPhase::GetLocationID() const
{
    return mLocationID;
}

void MoonPhase::SetLocationID(const std::string& locationID)
{
    mLocationID = locationID;
}

time_t MoonPhase::GetDate() const
{
    return mDate;
}

void MoonPhase::SetDate(time_t date)
{
    mDate = date;
}

time_t MoonPhase::GetMoonRiseTime() const
{
    return mMoonRiseTime;
}

void MoonPhase::SetMoonRiseTime(time_t moonRiseTime)
{
    mMoonRiseTime = moonRiseTime;
}

time_t MoonPhase::GetMoonSetTime() const
{
    return mMoonSetTime;
}

void MoonPhase::SetMoonSetTime(time_t moonSetTime)
{
    mMoonSetTime = moonSetTime;
}

std::string MoonPhase::GetPhaseText() const
{
    return mPhaseText;
}

void MoonPhase::SetPhaseText(const std::string& phaseText)
{
    mPhaseText = phaseText;
}

int MoonPhase::GetAge() const
{
    return mAge;
}

void MoonPhase::SetAge(int age)
{
    mAge = age;
}

}  // namespace NSWeather

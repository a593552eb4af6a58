#include "Precipitation.h"

namespace NSWeather
{

Precipitation::Precipitation()
    : mPrecType(999),
      mPrecProbability(999.0),
      mPrecAmount(999.0),
      mPrecProbabilityNight(999.0),
      mPrecAmountNight(999.0)
{
}

Precipitation::~Precipitation() = default;

int Precipitation::GetPrecType() const
{
    return mPrecType;
}

void Precipitation::SetPrecType(int precType)
{
    mPrecType = precType;
}

double Precipitation::GetPrecProbability() const
{
    return mPrecProbability;
}

void Precipitation::SetPrecProbability(double precProbability)
{
    mPrecProbability = precProbability;
}

double Precipitation::GetPrecAmount() const
{
    return mPrecAmount;
}

void Precipitation::SetPrecAmount(double precAmount)
{
    mPrecAmount = precAmount;
}

double Precipitation::GetPrecProbabilityNight() const
{
    return mPrecProbabilityNight;
}

void Precipitation::SetPrecProbabilityNight(double precProbabilityNight)
{
    mPrecProbabilityNight = precProbabilityNight;
}

double Precipitation::GetPrecAmountNight() const
{
    return mPrecAmountNight;
}

void Precipitation::SetPrecAmountNight(double precAmountNight)
{
    mPrecAmountNight = precAmountNight;
}

}  // namespace NSWeather

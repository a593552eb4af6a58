#include "Extra.h"

#include <memory>

namespace NSWeather
{

Extra::Extra()
    : mHumidity(999),
      mSunsetTime(999),
      mSunriseTime(999),
      mPm25(999),
      mPm10(999),
      mAqi(999),
      mUvIndex(999),
      mPrecipitationPtr(std::make_shared<Precipitation>()),
      mRealfeel(std::make_shared<Temperature>()),
      mOutdoorExcercise(999),
      mComfort(999),
      mClothing(999),
      mSkincare(999),
      mCarwash(999),
      mFoodPoison(999),
      mSpoiledFood(999),
      mFrozenPipes(999),
      mFrostbite(999),
      mCold(999),
      mAirDust(9999),
      mDrySkin(999),
      mHeat(999),
      mDiscomfort(999),
      mPollen(999)
{
}

Extra::~Extra() = default;

int Extra::GetHumidity() const
{
    return mHumidity;
}

void Extra::SetHumidity(int humidity)
{
    mHumidity = humidity;
}

time_t Extra::GetSunsetTime() const
{
    return mSunsetTime;
}

void Extra::SetSunsetTime(time_t sunsetTime)
{
    mSunsetTime = sunsetTime;
}

time_t Extra::GetSunriseTime() const
{
    return mSunriseTime;
}

void Extra::SetSunriseTime(time_t sunriseTime)
{
    mSunriseTime = sunriseTime;
}

int Extra::GetPm25() const
{
    return mPm25;
}

void Extra::SetPm25(int pm25)
{
    mPm25 = pm25;
}

int Extra::GetPm10() const
{
    return mPm10;
}

void Extra::SetPm10(int pm10)
{
    mPm10 = pm10;
}

int Extra::GetAqi() const
{
    return mAqi;
}

void Extra::SetAqi(int aqi)
{
    mAqi = aqi;
}

int Extra::GetUvIndex() const
{
    return mUvIndex;
}

void Extra::SetUvIndex(int uvIndex)
{
    mUvIndex = uvIndex;
}

PrecipitationPtr Extra::GetPrecipitationPtr() const
{
    return mPrecipitationPtr;
}

void Extra::SetPrecipitationPtr(PrecipitationPtr precipitationPtr)
{
    mPrecipitationPtr = precipitationPtr;
}

TemperaturePtr Extra::GetRealfeel() const
{
    return mRealfeel;
}

void Extra::SetRealfeel(TemperaturePtr realfeel)
{
    mRealfeel = realfeel;
}

int Extra::GetOutdoorExcercise() const
{
    return mOutdoorExcercise;
}

void Extra::SetOutdoorExcercise(int outdoorExcercise)
{
    mOutdoorExcercise = outdoorExcercise;
}

int Extra::GetComfort() const
{
    return mComfort;
}

void Extra::SetComfort(int comfort)
{
    mComfort = comfort;
}

int Extra::GetClothing() const
{
    return mClothing;
}

void Extra::SetClothing(int clothing)
{
    mClothing = clothing;
}

int Extra::GetSkincare() const
{
    return mSkincare;
}

void Extra::SetSkincare(int skincare)
{
    mSkincare = skincare;
}

int Extra::GetCarwash() const
{
    return mCarwash;
}

void Extra::SetCarwash(int carwash)
{
    mCarwash = carwash;
}

int Extra::GetFoodPoison() const
{
    return mFoodPoison;
}

void Extra::SetFoodPoison(int foodPoison)
{
    mFoodPoison = foodPoison;
}

int Extra::GetSpoiledFood() const
{
    return mSpoiledFood;
}

void Extra::SetSpoiledFood(int spoiledFood)
{
    mSpoiledFood = spoiledFood;
}

int Extra::GetFrozenPipes() const
{
    return mFrozenPipes;
}

void Extra::SetFrozenPipes(int frozenPipes)
{
    mFrozenPipes = frozenPipes;
}

int Extra::GetFrostbite() const
{
    return mFrostbite;
}

void Extra::SetFrostbite(int frostbite)
{
    mFrostbite = frostbite;
}

int Extra::GetCold() const
{
    return mCold;
}

void Extra::SetCold(int cold)
{
    mCold = cold;
}

int Extra::GetAirDust() const
{
    return mAirDust;
}

void Extra::SetAirDust(int airDust)
{
    mAirDust = airDust;
}

int Extra::GetDrySkin() const
{
    return mDrySkin;
}

void Extra::SetDrySkin(int drySkin)
{
    mDrySkin = drySkin;
}

int Extra::GetHeat() const
{
    return mHeat;
}

void Extra::SetHeat(int heat)
{
    mHeat = heat;
}

int Extra::GetDiscomfort() const
{
    return mDiscomfort;
}

void Extra::SetDiscomfort(int discomfort)
{
    mDiscomfort = discomfort;
}

int Extra::GetPollen() const
{
    return mPollen;
}

void Extra::SetPollen(int pollen)
{
    mPollen = pollen;
}

}  // namespace NSWeather

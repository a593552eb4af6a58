#ifndef NSWEATHER_EXTRA_H
#define NSWEATHER_EXTRA_H

#include <ctime>
#include <memory>
#include <vector>

#include "Precipitation.h"
#include "Temperature.h"

namespace NSWeather
{
// Extra conditions of one city: air, sun, precipitation and life-style indexes.
class Extra
{
public:
    Extra();
    virtual ~Extra();

    int GetHumidity() const;
    void SetHumidity(int humidity);
    time_t GetSunsetTime() const;
    void SetSunsetTime(time_t sunsetTime);
    time_t GetSunriseTime() const;
    void SetSunriseTime(time_t sunriseTime);
    int GetPm25() const;
    void SetPm25(int pm25);
    int GetPm10() const;
    void SetPm10(int pm10);
    int GetAqi() const;
    void SetAqi(int aqi);
    int GetUvIndex() const;
    void SetUvIndex(int uvIndex);
    PrecipitationPtr GetPrecipitationPtr() const;
    void SetPrecipitationPtr(PrecipitationPtr precipitationPtr);
    // Felt temperature.
    TemperaturePtr GetRealfeel() const;
    void SetRealfeel(TemperaturePtr realfeel);
    // Life-style indexes, in the order of the record.
    int GetOutdoorExcercise() const;
    void SetOutdoorExcercise(int outdoorExcercise);
    int GetComfort() const;
    void SetComfort(int comfort);
    int GetClothing() const;
    void SetClothing(int clothing);
    int GetSkincare() const;
    void SetSkincare(int skincare);
    int GetCarwash() const;
    void SetCarwash(int carwash);
    int GetFoodPoison() const;
    void SetFoodPoison(int foodPoison);
    int GetSpoiledFood() const;
    void SetSpoiledFood(int spoiledFood);
    int GetFrozenPipes() const;
    void SetFrozenPipes(int frozenPipes);
    int GetFrostbite() const;
    void SetFrostbite(int frostbite);
    int GetCold() const;
    void SetCold(int cold);
    int GetAirDust() const;
    void SetAirDust(int airDust);
    int GetDrySkin() const;
    void SetDrySkin(int drySkin);
    int GetHeat() const;
    void SetHeat(int heat);
    int GetDiscomfort() const;
    void SetDiscomfort(int discomfort);
    int GetPollen() const;
    void SetPollen(int pollen);

private:
    int mHumidity;
    time_t mSunsetTime;
    time_t mSunriseTime;
    int mPm25;
    int mPm10;
    int mAqi;
    int mUvIndex;
    PrecipitationPtr mPrecipitationPtr;
    TemperaturePtr mRealfeel;
    int mOutdoorExcercise;
    int mComfort;
    int mClothing;
    int mSkincare;
    int mCarwash;
    int mFoodPoison;
    int mSpoiledFood;
    int mFrozenPipes;
    int mFrostbite;
    int mCold;
    int mAirDust;
    int mDrySkin;
    int mHeat;
    int mDiscomfort;
    int mPollen;
};

using ExtraPtr = std::shared_ptr<Extra>;
using ExtraPtrVector = std::vector<ExtraPtr>;
using ExtraPtrVectorPtr = std::shared_ptr<ExtraPtrVector>;
}  // namespace NSWeather

#endif

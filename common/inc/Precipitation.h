#ifndef NSWEATHER_PRECIPITATION_H
#define NSWEATHER_PRECIPITATION_H

#include <memory>
#include <vector>

namespace NSWeather
{
// Precipitation for the day and the night.
class Precipitation
{
public:
    Precipitation();
    virtual ~Precipitation();

    int GetPrecType() const;
    void SetPrecType(int precType);
    double GetPrecProbability() const;
    void SetPrecProbability(double precProbability);
    double GetPrecAmount() const;
    void SetPrecAmount(double precAmount);
    double GetPrecProbabilityNight() const;
    void SetPrecProbabilityNight(double precProbabilityNight);
    double GetPrecAmountNight() const;
    void SetPrecAmountNight(double precAmountNight);

private:
    int mPrecType;
    double mPrecProbability;
    double mPrecAmount;
    double mPrecProbabilityNight;
    double mPrecAmountNight;
};

using PrecipitationPtr = std::shared_ptr<Precipitation>;
using PrecipitationPtrVector = std::vector<PrecipitationPtr>;
using PrecipitationPtrVectorPtr = std::shared_ptr<PrecipitationPtrVector>;
}  // namespace NSWeather

#endif

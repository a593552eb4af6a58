// One database file of the shared store as another process or an old
// installation left it. The first byte picks the weather, settings or version
// file, the rest is its content; the other two are sound files made by the
// store itself. Every reader, and the start-up upgrade, must log and give a
// safe result, and so must the clock of each city read.
#include <cstdint>
#include <string>
#include <unistd.h>
#include <vector>

#include "ContentProvider.h"
#include "DBController.h"
#include "FileUtil.h"
#include "FuzzRoot.h"
#include "SettingDBController.h"
#include "TimeUtil.h"
#include "StoreSeeds.h"
#include "UpgradeDBController.h"

using namespace NSWeather;

namespace
{

struct StoreFile
{
    std::string path;
    std::string soundContent;
};

std::vector<StoreFile> gFiles;

void ReadEverything()
{
    DBController dbController;
    CityPtrVectorPtr cities = dbController.SelectAllCityData();
    if (cities)
        for (const CityPtr& city : *cities)
        {
            FUZZ_CHECK(city != nullptr);
            // What the widget first computes from a city it shows: its clock.
            TimeUtil::GetIsDay(city, 1700000000);
            TimeUtil::GetLocalTimeStringLong(city, CP_ACCUWEATHER);
        }
    dbController.GetIsWeatherInfoExpired();
    SettingDBController().Select();
    UpgradeDBController().UpgradeIfNeeded();
}

}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    WeatherTest::FuzzRoot::Get();
    WeatherTest::WriteSoundStore();
    for (const std::string& path : {FileUtil::GetWeatherDBFilePath(), FileUtil::GetSettingDBFilePath(),
                                    FileUtil::GetVersionDBFilePath()})
        gFiles.push_back({path, WeatherTest::ReadBytes(path)});
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    if (size == 0)
        return 0;
    size_t chosen = data[0] % gFiles.size();
    for (size_t i = 0; i < gFiles.size(); ++i)
    {
        unlink((gFiles[i].path + "-journal").c_str());
        std::string content = i == chosen ? std::string(reinterpret_cast<const char*>(data) + 1, size - 1)
                                          : gFiles[i].soundContent;
        FUZZ_CHECK(WeatherTest::WriteBytes(gFiles[i].path, content));
    }
    ReadEverything();
    return 0;
}

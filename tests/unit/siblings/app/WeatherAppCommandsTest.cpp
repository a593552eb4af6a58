#include <sstream>

#include "AppLauncher.h"
#include "DBController.h"
#include "MainLoop.h"
#include "SampleWeatherSource.h"
#include "SettingDBController.h"
#include "SiblingTestSupport.h"
#include "TestFiles.h"
#include "WeatherAppCommands.h"
#include "WeatherDefine.h"

using namespace NSWeather;

namespace
{

class WeatherAppCommandsTest : public SiblingTest::SiblingFixture
{
protected:
    // Location ids in page order, checking that pages run 0, 1, ... .
    static std::string PageOrder()
    {
        std::string order;
        CityPtrVectorPtr cityPtrVector = DBController().SelectAllCityData();
        for (size_t i = 0; cityPtrVector && i < cityPtrVector->size(); ++i)
        {
            EXPECT_EQ(static_cast<int>(i), (*cityPtrVector)[i]->GetPageIndex());
            order += (order.empty() ? "" : ",") + (*cityPtrVector)[i]->GetLocationId();
        }
        return order;
    }

    static std::string SettingsText()
    {
        SettingPtr s = SettingDBController().Select();
        std::ostringstream out;
        out << s->GetCurrentCityLocationId() << "@" << s->GetCurrentCityIndex() << " unit"
            << s->GetTemperatureUnit() << " every" << s->GetAutoRefreshInterval()
            << (s->GetAutoRefreshOn() ? "on" : "off") << " " << s->GetCpType() << " location"
            << s->GetUseCurrentLocationOn() << s->GetShowCurrentCityAgreement();
        return out.str();
    }
};

struct CommandCase
{
    const char* command;
    int result;
    const char* order;     // cities in page order afterwards
    const char* settings;  // SettingsText() afterwards
};

// One user session: each command's effect on the cities and the settings.
const CommandCase SESSION[] = {
    {"list", ERR_OK, "", "@0 unit1 every6on Accuweather location00"},
    {"add seoul", ERR_OK, "kr-seoul", "kr-seoul@0 unit1 every6on Accuweather location00"},
    {"add TOKYO", ERR_OK, "kr-seoul,jp-tokyo", "kr-seoul@0 unit1 every6on Accuweather location00"},
    {"add fr-paris", ERR_OK, "kr-seoul,jp-tokyo,fr-paris",
     "kr-seoul@0 unit1 every6on Accuweather location00"},
    {"add tokyo", ERR_OK, "kr-seoul,jp-tokyo,fr-paris", "kr-seoul@0 unit1 every6on Accuweather location00"},
    {"add qqqzz", ERR_FAIL, "kr-seoul,jp-tokyo,fr-paris", "kr-seoul@0 unit1 every6on Accuweather location00"},
    {"move 0 2", ERR_OK, "jp-tokyo,fr-paris,kr-seoul", "kr-seoul@2 unit1 every6on Accuweather location00"},
    {"move 0 3", ERR_FAIL, "jp-tokyo,fr-paris,kr-seoul", "kr-seoul@2 unit1 every6on Accuweather location00"},
    {"current 1", ERR_OK, "jp-tokyo,fr-paris,kr-seoul", "fr-paris@1 unit1 every6on Accuweather location00"},
    {"current nowhere", ERR_FAIL, "jp-tokyo,fr-paris,kr-seoul",
     "fr-paris@1 unit1 every6on Accuweather location00"},
    {"remove fr-paris", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit1 every6on Accuweather location00"},
    {"remove 7", ERR_FAIL, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit1 every6on Accuweather location00"},
    {"unit f", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every6on Accuweather location00"},
    {"unit k", ERR_FAIL, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every6on Accuweather location00"},
    {"interval 0", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every0off Accuweather location00"},
    {"interval 5", ERR_FAIL, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every0off Accuweather location00"},
    {"interval 12", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every12on Accuweather location00"},
    {"provider 4", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every12on WeatherNews location00"},
    {"provider cmaweather", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every12on cmaweather location00"},
    {"provider 9", ERR_FAIL, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every12on cmaweather location00"},
    {"location on", ERR_OK, "jp-tokyo,kr-seoul", "jp-tokyo@0 unit0 every12on cmaweather location11"},
    {"remove 0", ERR_OK, "kr-seoul", "kr-seoul@0 unit0 every12on cmaweather location11"},
    {"remove kr-seoul", ERR_OK, "", "@0 unit0 every12on cmaweather location11"},
    {"move", ERR_FAIL, "", "@0 unit0 every12on cmaweather location11"},
};

std::vector<std::string> Words(const std::string& text)
{
    std::istringstream in(text);
    std::vector<std::string> words;
    for (std::string word; in >> word;) words.push_back(word);
    return words;
}

TEST_F(WeatherAppCommandsTest, SessionOfCommandsKeepsPagesAndCurrentCity)
{
    WeatherAppCommands commands(mCataloguePtr, std::make_shared<SampleWeatherSource>());
    for (const CommandCase& c : SESSION)
    {
        std::string out;
        EXPECT_EQ(c.result, commands.Run(Words(c.command), out)) << c.command << ": " << out;
        EXPECT_EQ(c.order, PageOrder()) << c.command;
        EXPECT_EQ(c.settings, SettingsText()) << c.command;
    }
}

TEST_F(WeatherAppCommandsTest, LocationOffRemovesTheCurrentLocationCity)
{
    WeatherAppCommands commands(mCataloguePtr, std::make_shared<SampleWeatherSource>());
    std::string out;
    ASSERT_EQ(ERR_OK, commands.Run({"add", "oslo"}, out));
    CityPtr herePtr = WeatherAgent(mCataloguePtr, std::make_shared<SampleWeatherSource>())
                          .MakeCity(*mCataloguePtr->FindById("kr-seoul"), true, 0);
    ASSERT_TRUE(herePtr);
    ASSERT_EQ(ERR_OK, DBController().InsertCityData(herePtr));
    ASSERT_EQ(ERR_OK, commands.Run({"current", "kr-seoul:C"}, out));
    ASSERT_EQ(ERR_OK, commands.Run({"location", "off"}, out)) << out;
    EXPECT_EQ("no-oslo", PageOrder());
    EXPECT_EQ("no-oslo@0 unit1 every6on Accuweather location00", SettingsText());
}

// Launched by the widget's taps: the request is recorded; without a display
// no window is opened and the process ends.
TEST_F(WeatherAppCommandsTest, LaunchRequestsAreRecorded)
{
    RegisterPrograms();
    ecore_init();
    ASSERT_EQ(0, AppLauncher().RequestLaunchApplicationWithLocationId("kr-seoul"));
    ASSERT_EQ(0, AppLauncher().RequestLaunchApplicationForAddCity());
    std::string log;
    WeatherTest::RunLoopUntil(
        [&]
        {
            log = WeatherTest::ReadText(mRoot.Path("log/dlog.log"));
            return log.find("MODE=ADD_CITY") != std::string::npos &&
                   log.find("LOCATION_ID=kr-seoul") != std::string::npos;
        },
        30.0);
    EXPECT_NE(std::string::npos, log.find("launched: LOCATION_ID=kr-seoul MODE=(none)")) << log;
    EXPECT_NE(std::string::npos, log.find("launched: LOCATION_ID=(none) MODE=ADD_CITY")) << log;
    ecore_shutdown();
}

}  // namespace

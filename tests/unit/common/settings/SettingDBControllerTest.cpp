#include <sys/wait.h>
#include <unistd.h>

#include "SettingDBController.h"
#include "SettingsTestSupport.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using SettingsTest::RawDB;

namespace
{

class SettingDBControllerTest : public SettingsTest::SettingsFixture
{
};

// Every field away from its default, so a swapped or dropped column shows.
SettingPtr MakeDistinctSetting()
{
    auto s = std::make_shared<Setting>();
    s->SetCurrentCityIndex(3);
    s->SetCurrentCityLocationId("loc-1'; DROP TABLE SETTING_TABLE;--");
    s->SetTemperatureUnit(0);
    s->SetLastRefreshedTime(static_cast<time_t>(2000000001));
    s->SetCurrentLocationAreaRefreshedTime(static_cast<time_t>(2000000002));
    s->SetIsFirstLaunch(false);
    s->SetAutoRefreshOn(false);
    s->SetAutoRefreshInterval(12);
    s->SetUseCurrentLocationOn(true);
    s->SetShowCurrentCityAgreement(true);
    s->SetRefreshOnOpeningOn(true);
    s->SetRefreshOnOpeningOnAgreement(true);
    s->SetNotificationOn(true);
    s->SetNotificationTime(static_cast<time_t>(2000000003));
    s->SetNetworkPositionPopupAgreement(true);
    s->SetShowNetworkPopup(true);
    s->SetChinaDataGPSPerformPopupOn(true);
    s->SetAutoScrollOn(true);
    s->SetAutoScrollInterval(7);
    s->SetLastUpdateLanguageCode("ko");
    s->SetCpType("Kweather");
    s->SetDaemonType("OTHER_DAEMON");
    s->SetIsNowRefreshing(true);
    s->SetIsSupportManualRefresh(true);
    s->SetRefreshingStartTime(static_cast<time_t>(2000000004));
    return s;
}

void ExpectSameSetting(const Setting& expected, const Setting& actual)
{
    EXPECT_EQ(expected.GetCurrentCityIndex(), actual.GetCurrentCityIndex());
    EXPECT_EQ(expected.GetCurrentCityLocationId(), actual.GetCurrentCityLocationId());
    EXPECT_EQ(expected.GetTemperatureUnit(), actual.GetTemperatureUnit());
    EXPECT_EQ(expected.GetLastRefreshedTime(), actual.GetLastRefreshedTime());
    EXPECT_EQ(expected.GetCurrentLocationAreaRefreshedTime(), actual.GetCurrentLocationAreaRefreshedTime());
    EXPECT_EQ(expected.GetIsFirstLaunch(), actual.GetIsFirstLaunch());
    EXPECT_EQ(expected.GetAutoRefreshOn(), actual.GetAutoRefreshOn());
    EXPECT_EQ(expected.GetAutoRefreshInterval(), actual.GetAutoRefreshInterval());
    EXPECT_EQ(expected.GetUseCurrentLocationOn(), actual.GetUseCurrentLocationOn());
    EXPECT_EQ(expected.GetShowCurrentCityAgreement(), actual.GetShowCurrentCityAgreement());
    EXPECT_EQ(expected.GetRefreshOnOpeningOn(), actual.GetRefreshOnOpeningOn());
    EXPECT_EQ(expected.GetRefreshOnOpeningOnAgreement(), actual.GetRefreshOnOpeningOnAgreement());
    EXPECT_EQ(expected.GetNotificationOn(), actual.GetNotificationOn());
    EXPECT_EQ(expected.GetNotificationTime(), actual.GetNotificationTime());
    EXPECT_EQ(expected.GetNetworkPositionPopupAgreement(), actual.GetNetworkPositionPopupAgreement());
    EXPECT_EQ(expected.GetShowNetworkPopup(), actual.GetShowNetworkPopup());
    EXPECT_EQ(expected.GetChinaDataGPSPerformPopupOn(), actual.GetChinaDataGPSPerformPopupOn());
    EXPECT_EQ(expected.GetAutoScrollOn(), actual.GetAutoScrollOn());
    EXPECT_EQ(expected.GetAutoScrollInterval(), actual.GetAutoScrollInterval());
    EXPECT_EQ(expected.GetLastUpdateLanguageCode(), actual.GetLastUpdateLanguageCode());
    EXPECT_EQ(expected.GetCpType(), actual.GetCpType());
    EXPECT_EQ(expected.GetDaemonType(), actual.GetDaemonType());
    EXPECT_EQ(expected.GetIsNowRefreshing(), actual.GetIsNowRefreshing());
    EXPECT_EQ(expected.GetIsSupportManualRefresh(), actual.GetIsSupportManualRefresh());
    EXPECT_EQ(expected.GetRefreshingStartTime(), actual.GetRefreshingStartTime());
}

TEST_F(SettingDBControllerTest, NewDatabaseHoldsOneDefaultRow)
{
    InitializeSettings();
    RawDB db(SettingDBPath());
    EXPECT_EQ(1, db.QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
    EXPECT_EQ("Accuweather", db.QueryText("SELECT CpType FROM SETTING_TABLE"));
    EXPECT_EQ("RI_DAEMON", db.QueryText("SELECT DaemonType FROM SETTING_TABLE"));
    EXPECT_EQ(6, db.QueryInt("SELECT AutoRefreshInterval FROM SETTING_TABLE"));
    EXPECT_EQ(1, db.QueryInt("SELECT TemperatureUnit FROM SETTING_TABLE"));
    EXPECT_EQ(1, db.QueryInt("SELECT IsFirstLaunch FROM SETTING_TABLE"));

    SettingPtr selected = SettingDBController().Select();
    ASSERT_TRUE(selected);
    ExpectSameSetting(Setting(), *selected);
}

TEST_F(SettingDBControllerTest, InitializeKeepsAnExistingRowAndRefillsAnEmptyTable)
{
    InitializeSettings();
    SetSettingColumn("CpType", "'cmaweather'");
    InitializeSettings();
    RawDB db(SettingDBPath());
    EXPECT_EQ(1, db.QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
    EXPECT_EQ("cmaweather", db.QueryText("SELECT CpType FROM SETTING_TABLE"));

    db.Exec("DELETE FROM SETTING_TABLE");
    InitializeSettings();
    EXPECT_EQ(1, db.QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
    EXPECT_EQ("Accuweather", db.QueryText("SELECT CpType FROM SETTING_TABLE"));
}

TEST_F(SettingDBControllerTest, EveryColumnRoundTrips)
{
    InitializeSettings();
    SettingPtr written = MakeDistinctSetting();
    SettingDBController().Update(written);

    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    ExpectSameSetting(*written, *read);
    // Times beyond 32 bits must survive in the INT64 columns.
    RawDB db(SettingDBPath());
    EXPECT_EQ(2000000004LL, db.QueryInt("SELECT RefreshingStartTime FROM SETTING_TABLE"));
    EXPECT_EQ(1, db.QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
}

TEST_F(SettingDBControllerTest, NonZeroIntegerInABooleanColumnReadsTrue)
{
    InitializeSettings();
    SetSettingColumn("AutoScrollOn", "2");
    SetSettingColumn("IsNowRefreshing", "-1");
    SetSettingColumn("AutoRefreshOn", "0");
    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_TRUE(read->GetAutoScrollOn());
    EXPECT_TRUE(read->GetIsNowRefreshing());
    EXPECT_FALSE(read->GetAutoRefreshOn());
}

TEST_F(SettingDBControllerTest, NullRecordWritesNothing)
{
    InitializeSettings();
    SetSettingColumn("CpType", "'Kweather'");
    std::string before = SettingsTest::ReadFileBytes(SettingDBPath());
    SettingDBController().Update(nullptr);
    EXPECT_EQ(before, SettingsTest::ReadFileBytes(SettingDBPath()));
    EXPECT_TRUE(mLog.Contains("(!settingPtr) [return]")) << mLog.Dump();
    EXPECT_EQ("Kweather", SettingDBController().Select()->GetCpType());
}

TEST_F(SettingDBControllerTest, DisplayCityIdChangesOnlyThatColumn)
{
    InitializeSettings();
    SetSettingColumn("CpType", "'WeatherNews'");
    SettingDBController().UpdateLocationIdOfDisplayCity("2-226396_1_AL");
    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_EQ("2-226396_1_AL", read->GetCurrentCityLocationId());
    EXPECT_EQ("WeatherNews", read->GetCpType());
}

TEST_F(SettingDBControllerTest, ReadingWithoutDatabaseGivesNullAndCreatesNothing)
{
    MakeDBDir();
    EXPECT_FALSE(SettingDBController().Select());
    EXPECT_TRUE(mLog.Contains("dbConnector->DBInitialize(GetSettingDBFilePath(), true) == false")) << mLog.Dump();
    EXPECT_FALSE(SettingsTest::FileExists(SettingDBPath()));
}

TEST_F(SettingDBControllerTest, InitializeFailsWithoutDatabaseFolder)
{
    EXPECT_EQ(ERR_FAIL, SettingDBController().Initialize());
    EXPECT_TRUE(mLog.Contains("dbConnector->DBInitialize(GetSettingDBFilePath(), false) == false"))
        << mLog.Dump();
}

// Each child reads the row, waits for its turn, changes one field and
// writes the whole row back.
void RunWriter(int readyFd, int goFd, void (*change)(Setting&))
{
    SettingPtr settingPtr = SettingDBController().Select();
    char byte = settingPtr ? 'r' : 'x';
    if (write(readyFd, &byte, 1) != 1 || read(goFd, &byte, 1) != 1 || !settingPtr)
        _exit(2);
    change(*settingPtr);
    SettingDBController().Update(settingPtr);
    _exit(0);
}

struct Writer
{
    pid_t pid = -1;
    int ready[2] = {-1, -1};
    int go[2] = {-1, -1};
};

void StartWriter(Writer& writer, void (*change)(Setting&))
{
    ASSERT_EQ(0, pipe(writer.ready));
    ASSERT_EQ(0, pipe(writer.go));
    writer.pid = fork();
    ASSERT_GE(writer.pid, 0);
    if (writer.pid == 0)
        RunWriter(writer.ready[1], writer.go[0], change);
    char byte = 0;
    ASSERT_EQ(1, read(writer.ready[0], &byte, 1));
    ASSERT_EQ('r', byte);
}

int LetWriterFinish(Writer& writer)
{
    char byte = 'g';
    int status = -1;
    if (write(writer.go[1], &byte, 1) != 1 || waitpid(writer.pid, &status, 0) != writer.pid)
        return -1;
    for (int fd : {writer.ready[0], writer.ready[1], writer.go[0], writer.go[1]})
        close(fd);
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
}

TEST_F(SettingDBControllerTest, LaterWriterOfTwoProcessesWinsEveryColumn)
{
    InitializeSettings();
    Writer first;
    Writer second;
    StartWriter(first, [](Setting& s) {
        s.SetTemperatureUnit(0);
        s.SetCpType("Kweather");
    });
    StartWriter(second, [](Setting& s) { s.SetCpType("cmaweather"); });
    EXPECT_EQ(0, LetWriterFinish(first));
    EXPECT_EQ("Kweather", SettingDBController().Select()->GetCpType());
    EXPECT_EQ(0, LetWriterFinish(second));

    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_EQ("cmaweather", read->GetCpType());
    // The second process read the row before the first wrote, so the
    // first one's unit change is gone.
    EXPECT_EQ(1, read->GetTemperatureUnit());
    EXPECT_EQ(1, RawDB(SettingDBPath()).QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
}

}  // namespace

#include <sstream>

#include <sqlite3.h>
#include <sys/wait.h>
#include <unistd.h>

#include "SettingDBController.h"
#include "DBTestSupport.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{

class SettingDBControllerTest : public WeatherTest::StoreTest
{
};

// All 25 fields in column order, so that a swapped or dropped column shows.
std::string Describe(const Setting& s)
{
    std::ostringstream out;
    out << s.GetCurrentCityIndex() << '|' << s.GetCurrentCityLocationId() << '|' << s.GetTemperatureUnit()
        << '|' << s.GetLastRefreshedTime() << '|' << s.GetCurrentLocationAreaRefreshedTime() << '|'
        << s.GetIsFirstLaunch() << s.GetAutoRefreshOn() << '|' << s.GetAutoRefreshInterval() << '|'
        << s.GetUseCurrentLocationOn() << s.GetShowCurrentCityAgreement() << s.GetRefreshOnOpeningOn()
        << s.GetRefreshOnOpeningOnAgreement() << s.GetNotificationOn() << '|' << s.GetNotificationTime()
        << '|' << s.GetNetworkPositionPopupAgreement() << s.GetShowNetworkPopup()
        << s.GetChinaDataGPSPerformPopupOn() << s.GetAutoScrollOn() << '|' << s.GetAutoScrollInterval() << '|'
        << s.GetLastUpdateLanguageCode() << '|' << s.GetCpType() << '|' << s.GetDaemonType() << '|'
        << s.GetIsNowRefreshing() << s.GetIsSupportManualRefresh() << '|' << s.GetRefreshingStartTime();
    return out.str();
}

TEST_F(SettingDBControllerTest, NewOrEmptyTableGetsTheDefaultRowAndAStoredRowIsKept)
{
    InitializeSettings();
    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_EQ("0||1|0|0|11|6|00000|0|0000|0|en|Accuweather|RI_DAEMON|00|0", Describe(*read));

    SetSettingColumn("CpType", "'cmaweather'");
    InitializeSettings();
    RawDB db(SettingDBPath());
    EXPECT_EQ("1|cmaweather", db.QueryText("SELECT COUNT(*) || '|' || max(CpType) FROM SETTING_TABLE"));

    db.Exec("DELETE FROM SETTING_TABLE");
    InitializeSettings();
    EXPECT_EQ("1|Accuweather", db.QueryText("SELECT COUNT(*) || '|' || max(CpType) FROM SETTING_TABLE"));
}

TEST_F(SettingDBControllerTest, EveryColumnRoundTrips)
{
    InitializeSettings();
    auto s = std::make_shared<Setting>();
    s->SetCurrentCityIndex(3);
    s->SetCurrentCityLocationId("loc'; DROP TABLE SETTING_TABLE;--");
    s->SetTemperatureUnit(0);
    s->SetLastRefreshedTime(2000000001);
    s->SetCurrentLocationAreaRefreshedTime(2000000002);
    s->SetIsFirstLaunch(false);
    s->SetAutoRefreshInterval(12);
    s->SetUseCurrentLocationOn(true);
    s->SetRefreshOnOpeningOn(true);
    s->SetNotificationTime(2000000003);
    s->SetShowNetworkPopup(true);
    s->SetAutoScrollOn(true);
    s->SetAutoScrollInterval(7);
    s->SetLastUpdateLanguageCode("ko");
    s->SetCpType("Kweather");
    s->SetDaemonType("OTHER_DAEMON");
    s->SetIsSupportManualRefresh(true);
    s->SetRefreshingStartTime(2000000004);
    ASSERT_EQ(ERR_OK, SettingDBController().Update(s));
    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_EQ(Describe(*s), Describe(*read));

    // The flags left out above flipped the other way round.
    for (auto flip : {&Setting::SetAutoRefreshOn, &Setting::SetShowCurrentCityAgreement,
                      &Setting::SetRefreshOnOpeningOnAgreement, &Setting::SetNotificationOn,
                      &Setting::SetNetworkPositionPopupAgreement, &Setting::SetChinaDataGPSPerformPopupOn,
                      &Setting::SetIsNowRefreshing})
        ((*s).*flip)(flip != &Setting::SetAutoRefreshOn);
    ASSERT_EQ(ERR_OK, SettingDBController().Update(s));
    EXPECT_EQ(Describe(*s), Describe(*SettingDBController().Select()));
    EXPECT_EQ(1, RawDB(SettingDBPath()).QueryInt("SELECT COUNT(*) FROM SETTING_TABLE"));
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

TEST_F(SettingDBControllerTest, NullRecordWritesNothingAndDisplayCityWritesOneColumn)
{
    InitializeSettings();
    SetSettingColumn("CpType", "'Kweather'");
    std::string before = WeatherTest::ReadText(SettingDBPath());
    EXPECT_EQ(ERR_FAIL, SettingDBController().Update(nullptr));
    EXPECT_EQ(before, WeatherTest::ReadText(SettingDBPath()));
    EXPECT_TRUE(mLog.Contains("(!settingPtr) [return]")) << mLog.Dump();

    EXPECT_EQ(ERR_OK, SettingDBController().UpdateLocationIdOfDisplayCity("2-226396_1_AL"));
    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_EQ("2-226396_1_AL", read->GetCurrentCityLocationId());
    EXPECT_EQ("Kweather", read->GetCpType());
}

TEST_F(SettingDBControllerTest, MissingDatabaseIsNeitherReadNorCreated)
{
    EXPECT_EQ(ERR_FAIL, SettingDBController().Initialize());
    EXPECT_TRUE(mLog.Contains("/.setting.db for writing")) << mLog.Dump();
    MakeDBDir();
    EXPECT_FALSE(SettingDBController().Select());
    EXPECT_TRUE(mLog.Contains("/.setting.db for reading")) << mLog.Dump();
    EXPECT_FALSE(WeatherTest::FileExists(SettingDBPath()));
}

// Another process writes one column while the read-change-write is between
// its read and its write: that write waits for the lock and survives.
TEST_F(SettingDBControllerTest, ReadChangeWriteDoesNotUndoAWriteOfAnotherProcess)
{
    InitializeSettings();
    int go[2];
    int blocked[2];
    ASSERT_EQ(0, pipe(go));
    ASSERT_EQ(0, pipe(blocked));
    pid_t pid = fork();
    ASSERT_GE(pid, 0);
    if (pid == 0)
    {
        char byte = 0;
        sqlite3* db = nullptr;
        if (read(go[0], &byte, 1) != 1 || sqlite3_open(SettingDBPath().c_str(), &db) != SQLITE_OK)
            _exit(2);
        // Says once that the write is held back, then keeps retrying.
        auto onBusy = [](void* fd, int count) -> int
        {
            char b = 'b';
            if (count == 0 && write(*static_cast<int*>(fd), &b, 1) != 1)
                return 0;
            usleep(20000);
            return count < 500;
        };
        sqlite3_busy_handler(db, onBusy, &blocked[1]);
        int rc =
            sqlite3_exec(db, "UPDATE SETTING_TABLE SET CpType = 'cmaweather';", nullptr, nullptr, nullptr);
        sqlite3_close(db);
        _exit(rc == SQLITE_OK ? 0 : 3);
    }
    SettingPtr written = SettingDBController().SelectAndUpdate(
        [&](const SettingPtr& s)
        {
            s->SetTemperatureUnit(0);
            char byte = 'g';
            ASSERT_EQ(1, write(go[1], &byte, 1));
            ASSERT_EQ(1, read(blocked[0], &byte, 1));
        });
    int status = -1;
    ASSERT_EQ(pid, waitpid(pid, &status, 0));
    for (int fd : {go[0], go[1], blocked[0], blocked[1]}) close(fd);
    EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0) << status;
    ASSERT_TRUE(written);
    EXPECT_EQ(0, written->GetTemperatureUnit());
    SettingPtr read = SettingDBController().Select();
    ASSERT_TRUE(read);
    EXPECT_EQ(0, read->GetTemperatureUnit());
    EXPECT_EQ("cmaweather", read->GetCpType());
}

TEST_F(SettingDBControllerTest, ReadChangeWriteWithoutARowWritesNothing)
{
    MakeDBDir();
    bool isCalled = false;
    EXPECT_FALSE(SettingDBController().SelectAndUpdate([&](const SettingPtr&) { isCalled = true; }));
    EXPECT_FALSE(isCalled);
    EXPECT_FALSE(SettingDBController().SelectAndUpdate(nullptr));
}

}  // namespace

// The suite's programs when something goes wrong under them: an agent
// killed while it writes, a disk that fills up during a refresh, the
// settings file removed or the weather file unreadable while the widget runs.
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <dirent.h>
#include <fcntl.h>
#include <signal.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <random>
#include <thread>

#include "DBController.h"
#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SiblingTestSupport.h"
#include "TestDB.h"
#include "TestFiles.h"
#include "WeatherDefine.h"
#include "WidgetHostPages.h"

namespace WeatherTest
{

using ::testing::HasSubstr;
using ::testing::Not;

namespace
{
const std::vector<std::string> kCities = {"seoul",  "oslo",   "paris",  "tokyo", "mumbai",
                                          "london", "berlin", "madrid", "rome",  "cairo"};
// The sanitizers make each agent start several times slower.
#ifdef __SANITIZE_ADDRESS__
const int kKills = 25;
#else
const int kKills = 200;
#endif

std::string WeatherDB()
{
    return NSWeather::FileUtil::GetWeatherDBFilePath();
}

// Whether the process has the weather database's journal open: it is inside
// a write transaction.
bool IsWriting(pid_t pid)
{
    std::string fdDir = "/proc/" + std::to_string(pid) + "/fd";
    DIR* dir = opendir(fdDir.c_str());
    if (!dir)
        return false;
    bool isWriting = false;
    std::string journal = WeatherDB() + "-journal";
    char target[4096];
    while (dirent* entry = readdir(dir))
    {
        ssize_t length = readlink((fdDir + "/" + entry->d_name).c_str(), target, sizeof(target) - 1);
        if (length > 0 && journal.compare(0, std::string::npos, target, static_cast<size_t>(length)) == 0)
            isWriting = true;
    }
    closedir(dir);
    return isWriting;
}

// The text of `part` in a page slot's dump, "" if none.
std::string TextIn(const std::string& slot, const std::string& part)
{
    std::string key = "\"" + part + "\":\"";
    size_t at = slot.find(key);
    if (at == std::string::npos)
        return std::string();
    at += key.size();
    return slot.substr(at, slot.find('"', at) - at);
}

// Every row of the weather tables, to compare before and after.
std::string WeatherRows()
{
    RawDB db(WeatherDB(), true);
    std::string rows;
    for (const char* table : {"CITY_TABLE", "CURRENT_WEATHER_TABLE", "WEEKLY_WEATHER_TABLE",
                              "HOURLY_WEATHER_TABLE", "EXTRA_WEATHER_TABLE", "MOON_PHASE_TABLE"})
    {
        std::string columns;
        for (const std::string& column : db.ColumnNames(table))
            columns += (columns.empty() ? "quote(" : "||','||quote(") + column + ")";
        rows += db.QueryText("SELECT group_concat(" + columns + ", ';') FROM " + table) + "\n";
    }
    return rows;
}

// Starts the agent's refresh with files limited to `maxFileSize` bytes (0:
// no limit); what it writes fails with EFBIG instead of killing it. Its
// log goes to `output` too, which stays small.
pid_t StartAgent(const std::string& output, rlim_t maxFileSize)
{
    pid_t pid = fork();
    if (pid == 0)
    {
        if (maxFileSize > 0)
        {
            rlimit limit = {maxFileSize, maxFileSize};
            setrlimit(RLIMIT_FSIZE, &limit);
            signal(SIGXFSZ, SIG_IGN);
        }
        setenv("DLOG_STDERR", "1", 1);
        int fd = open(output.c_str(), O_WRONLY | O_CREAT | O_TRUNC, 0600);
        dup2(fd, STDOUT_FILENO);
        dup2(fd, STDERR_FILENO);
        std::string program = SiblingTest::AgentProgram();
        execl(program.c_str(), program.c_str(), "refresh", static_cast<char*>(nullptr));
        _exit(127);
    }
    return pid;
}

bool HasExited(pid_t pid)
{
    return waitpid(pid, nullptr, WNOHANG) == pid;
}
}  // namespace

class FaultTest : public WidgetHostPagesTest
{
public:
    void SetUp() override
    {
        WidgetHostPagesTest::SetUp();
        SiblingTest::RegisterPrograms(mRoot);
    }

    void App(const std::vector<std::string>& args)
    {
        std::vector<std::string> command = {SiblingTest::AppProgram()};
        command.insert(command.end(), args.begin(), args.end());
        std::string output = mRoot.Path("app.out");
        ASSERT_EQ(SiblingTest::Run(command, output), 0) << ReadText(output);
    }

    void AddCities(size_t count = kCities.size())
    {
        for (size_t i = 0; i < count; ++i) App({"add", kCities[i]});
    }

    // A new LastRefreshedTime and an update of both instances: the widget
    // reads every city again, as after a refresh.
    void Reload()
    {
        ChangeSetting([](const NSWeather::SettingPtr& s)
                      { s->SetLastRefreshedTime(s->GetLastRefreshedTime() + 1); });
        for (int n : {1, 2}) EXPECT_EQ(Send("update " + Id(n)), "OK");
    }

    // Each instance draws a city with its weather, the 4x4 with four days.
    void ExpectWholeCitiesDrawn()
    {
        for (int n : {1, 2})
        {
            std::string centre = Slot(Id(n), "centerLayout");
            std::vector<std::string> parts = {"name", "current"};
            for (int day = 1; n == 2 && day <= 4; ++day)
                parts.push_back("weatherForecastHighTemp" + std::to_string(day));
            for (const std::string& part : parts)
                EXPECT_FALSE(TextIn(centre, part).empty()) << n << " " << part << ": " << centre;
        }
    }

    // Read through the store as the widget reads: every city, each whole.
    void ExpectWholeCitiesStored()
    {
        NSWeather::CityPtrVectorPtr cities = NSWeather::DBController().SelectAllCityData();
        ASSERT_TRUE(cities) << mLog.Dump();
        EXPECT_EQ(cities->size(), kCities.size());
        for (const NSWeather::CityPtr& city : *cities)
        {
            ASSERT_TRUE(city);
            EXPECT_TRUE(city->GetCurrentPtr()) << city->GetLocationId();
            EXPECT_TRUE(city->GetExtraPtr()) << city->GetLocationId();
            EXPECT_GE(city->GetWeeklyPtrVector()->size(), 4u) << city->GetLocationId();
            EXPECT_FALSE(city->GetHourlyPtrVector()->empty()) << city->GetLocationId();
        }
    }

    static std::string IntegrityCheck() { return RawDB(WeatherDB()).QueryText("PRAGMA integrity_check"); }

    std::string Log() const { return ReadText(mRoot.Path("log/dlog.log")); }

    void TearDown() override
    {
        WidgetHostPagesTest::TearDown();
        if (!mMount.empty())
            umount2(mMount.c_str(), MNT_DETACH);
    }

    // Moves the weather database onto a filesystem of its own that has no
    // room left; false when this process may not mount one.
    bool FillWeatherDisk()
    {
        std::string tiny = mRoot.Path("tiny");
        if (geteuid() != 0 || mkdir(tiny.c_str(), 0700) != 0 ||
            mount("tmpfs", tiny.c_str(), "tmpfs", 0, "size=256k") != 0)
            return false;
        mMount = tiny;
        std::string moved = tiny + "/.weather.db";
        WriteText(moved, ReadText(WeatherDB()));
        EXPECT_EQ(unlink(WeatherDB().c_str()), 0);
        EXPECT_EQ(symlink(moved.c_str(), WeatherDB().c_str()), 0);
        int fd = open((tiny + "/filler").c_str(), O_WRONLY | O_CREAT, 0600);
        char block[4096] = {};
        while (write(fd, block, sizeof(block)) > 0)
        {
        }
        close(fd);
        return true;
    }

    std::string mMount;
};

// Each agent is killed at a random moment of its writes, up to 15 ms after
// it first opened the journal: inside the write of one of its ten cities or
// between two (or it ends first). A writer killed inside its transaction
// leaves a journal that the next reader or writer must roll back.
TEST_F(FaultTest, AnAgentKilledWhileWritingLeavesNoHalfWrittenCity)
{
    AddCities();
    StartHost({"4x2", "4x4"});
    unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    std::uniform_int_distribution<int> delayMs(0, 15);
    int kills = 0;
    int killedWriting = 0;
    for (int run = 0; kills < kKills && run < 2 * kKills && !HasFailure(); ++run)
    {
        pid_t pid = SiblingTest::Start({SiblingTest::AgentProgram(), "refresh"});
        ASSERT_GT(pid, 0);
        bool hasExited = false;
        auto giveUp = std::chrono::steady_clock::now() + std::chrono::seconds(30);
        while (!IsWriting(pid) && !(hasExited = HasExited(pid)))
        {
            ASSERT_LT(std::chrono::steady_clock::now(), giveUp) << "the agent neither writes nor ends";
            std::this_thread::sleep_for(std::chrono::microseconds(200));
        }
        if (!hasExited)
        {
            std::this_thread::sleep_for(std::chrono::milliseconds(delayMs(random)));
            killedWriting += IsWriting(pid) ? 1 : 0;
            ::kill(pid, SIGKILL);
            int status = 0;
            waitpid(pid, &status, 0);
            kills += WIFSIGNALED(status) ? 1 : 0;
        }
        Reload();
        ExpectWholeCitiesDrawn();
        ExpectWholeCitiesStored();
        if (run % 50 == 49)
        {
            EXPECT_EQ(IntegrityCheck(), "ok");
        }
    }
    std::printf("%d kills, %d inside a write transaction\n", kills, killedWriting);
    EXPECT_EQ(kills, kKills);
    EXPECT_GE(killedWriting, kKills / 10);
    EXPECT_EQ(IntegrityCheck(), "ok");
}

// The agent's writes fail for want of room: on a full filesystem when this
// process may mount one, and past a file size limit everywhere.
TEST_F(FaultTest, AFullDiskDuringARefreshKeepsTheOldWeatherAndEndsTheRefresh)
{
    struct Case
    {
        const char* name;
        bool isFullDisk;
        rlim_t maxFileSize;
    };
    const Case cases[] = {{"FullDisk", true, 0}, {"FileSizeLimit", false, 16384}};
    for (const Case& c : cases)
    {
        SCOPED_TRACE(c.name);
        AddCities(3);
        RawDB(WeatherDB()).Exec("UPDATE CURRENT_WEATHER_TABLE SET curTemperature = 99");
        if (c.isFullDisk && !FillWeatherDisk())
        {
            std::printf("no filesystem of our own here: the full disk case is left out\n");
            continue;
        }
        std::string before = WeatherRows();
        StartHost({"4x2", "4x4"});
        // As the widget marks a refresh it asked for.
        ChangeSetting(
            [](const NSWeather::SettingPtr& s)
            {
                s->SetIsNowRefreshing(true);
                s->SetRefreshingStartTime(time(nullptr));
            });

        std::string output = mRoot.Path("agent.out");
        EXPECT_EQ(SiblingTest::Finish(StartAgent(output, c.maxFileSize)), 1);
        EXPECT_THAT(ReadText(output), HasSubstr("could not be written"));
        EXPECT_THAT(ReadText(output), HasSubstr("posted 'FAIL'"));
        EXPECT_TRUE(WaitUntil([this] { return CountLog("SetIsNowRefreshing as:0") > 0; })) << Log();
        WaitIdle();
        EXPECT_FALSE(ReadSetting()->GetIsNowRefreshing());
        EXPECT_EQ(WeatherRows(), before);
        EXPECT_EQ(IntegrityCheck(), "ok");
        for (int n : {1, 2})
        {
            std::string centre = Slot(Id(n), "centerLayout");
            EXPECT_EQ(TextIn(centre, "current"), "99") << n;
            EXPECT_THAT(centre, HasSubstr("weather_box_ic_refresh.png")) << n;
            EXPECT_THAT(centre, Not(HasSubstr("progressbar"))) << n;
        }
        TearDown();
        mHostPid = -1;
        mMount.clear();
        mClient.Disconnect();
        unlink(WeatherDB().c_str());
        unlink(mRoot.Path("log/dlog.log").c_str());
        ASSERT_EQ(NSWeather::DataStoreInitializer::Run(), NSWeather::ERR_OK);
    }
}

// The settings are the weather app's: the widget does not make them again.
// Without them it keeps drawing its cities, and it follows the settings the
// app writes next.
TEST_F(FaultTest, TheWidgetOutlivesItsSettingsFileAndFollowsTheNextOne)
{
    AddCities(3);
    StartHost({"4x2", "4x4"});
    std::string celsius = CentreText(Id(1), "current");
    ASSERT_FALSE(celsius.empty());
    ASSERT_EQ(unlink(NSWeather::FileUtil::GetSettingDBFilePath().c_str()), 0);

    for (const std::string& command :
         {"update " + Id(1), "update " + Id(2), "pause " + Id(1), "resume " + Id(1),
          "swipe " + Id(1) + " 300 300 300 150 200", "pause " + Id(2), "resume " + Id(2)})
    {
        EXPECT_EQ(Send(command).compare(0, 2, "OK"), 0) << command;
        WaitIdle();
        ExpectWholeCitiesDrawn();
    }
    EXPECT_GT(CountLog("!settingPtr"), 0);

    App({"unit", "f"});
    EXPECT_EQ(ReadSetting()->GetTemperatureUnit(), 0);
    ASSERT_EQ(Send("swipe " + Id(1) + " 300 150 300 300 200").compare(0, 2, "OK"), 0);
    for (int n : {1, 2})
    {
        ASSERT_EQ(Send("pause " + Id(n)), "OK");
        ASSERT_EQ(Send("resume " + Id(n)), "OK");
    }
    WaitIdle();
    ExpectWholeCitiesDrawn();
    EXPECT_NE(CentreText(Id(1), "current"), celsius);
    EXPECT_EQ(CentreText(Id(1), "name"), CentreText(Id(2), "name"));
}

// A weather file that cannot be read for a while (here: not a database)
// leaves the cities drawn, rather than the page of a widget without any.
TEST_F(FaultTest, AnUnreadableWeatherFileLeavesTheCitiesDrawn)
{
    AddCities(3);
    StartHost({"4x2", "4x4"});
    std::string name = CentreText(Id(1), "name");
    std::string saved = mRoot.Path("weather.saved");
    ASSERT_EQ(rename(WeatherDB().c_str(), saved.c_str()), 0);
    WriteText(WeatherDB(), std::string(8192, 'x'));
    Reload();
    WaitIdle();
    ExpectWholeCitiesDrawn();
    EXPECT_EQ(CentreText(Id(1), "name"), name);
    EXPECT_GT(CountLog("Cannot open " + WeatherDB() + " for reading"), 0);

    ASSERT_EQ(rename(saved.c_str(), WeatherDB().c_str()), 0);
    App({"unit", "f"});
    Reload();
    WaitIdle();
    ExpectWholeCitiesDrawn();
    EXPECT_EQ(CentreText(Id(1), "name"), name);
}

}  // namespace WeatherTest

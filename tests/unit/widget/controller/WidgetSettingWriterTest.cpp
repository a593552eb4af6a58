#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include "DataStoreInitializer.h"
#include "FileUtil.h"
#include "SettingDBController.h"
#include "TestDB.h"
#include "TestPlatform.h"
#include "WidgetPageData.h"
#include "WidgetSettingWriter.h"

namespace
{

using NSWeather::SettingPtr;

class WidgetSettingWriterTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        NSWeather::FileUtil::ClearCache();
        ASSERT_EQ(NSWeather::DataStoreInitializer::Run(), 0);
    }

    // Another process takes the write lock, changes the unit and holds
    // the lock a while before it commits; returns once it holds the lock.
    pid_t StartOtherWriter()
    {
        int fds[2];
        EXPECT_EQ(pipe(fds), 0);
        pid_t pid = fork();
        if (pid == 0)
        {
            close(fds[0]);
            WeatherTest::RawDB db(NSWeather::FileUtil::GetSettingDBFilePath());
            bool ok = db.Exec("BEGIN IMMEDIATE") && db.Exec("UPDATE SETTING_TABLE SET TemperatureUnit = 0");
            (void)!write(fds[1], ok ? "1" : "0", 1);
            usleep(300 * 1000);
            _exit(db.Exec("COMMIT") ? 0 : 1);
        }
        close(fds[1]);
        char c = 0;
        EXPECT_EQ(read(fds[0], &c, 1), 1);
        EXPECT_EQ(c, '1');
        close(fds[0]);
        return pid;
    }
};

// Each of the widget's writes of the shared row, made while another
// process is changing another field of it.
TEST_F(WidgetSettingWriterTest, WidgetWritesKeepAnotherProcessesChange)
{
    struct Case
    {
        const char* name;
        std::function<void()> write;
        std::function<bool(const SettingPtr&)> written;
    };
    const Case cases[] = {
        {"DisplayedCity",
         []
         {
             NSWeatherWidget::WidgetSettingWriter::Change([](const SettingPtr& s)
                                                          { s->SetCurrentCityLocationId("flicked"); });
         },
         [](const SettingPtr& s) { return s->GetCurrentCityLocationId() == "flicked"; }},
        {"RefreshMark",
         []
         {
             NSWeatherWidget::WidgetPageData data;
             data.SetSettingPtr(NSWeather::SettingDBController().Select());
             EXPECT_TRUE(data.SetIsNowRefreshing(true));
             EXPECT_TRUE(data.GetIsNowRefreshing());
         },
         [](const SettingPtr& s) { return s->GetIsNowRefreshing() && s->GetRefreshingStartTime() > 0; }},
    };
    for (const Case& c : cases)
    {
        NSWeather::SettingDBController controller;
        SettingPtr initial = controller.Select();
        ASSERT_TRUE(initial);
        initial->SetTemperatureUnit(1);
        controller.Update(initial);
        pid_t other = StartOtherWriter();
        c.write();
        int status = -1;
        waitpid(other, &status, 0);
        EXPECT_EQ(status, 0) << c.name;
        SettingPtr stored = controller.Select();
        ASSERT_TRUE(stored) << c.name;
        EXPECT_EQ(stored->GetTemperatureUnit(), 0) << c.name << ": the other process's change was undone";
        EXPECT_TRUE(c.written(stored)) << c.name;
    }
}

TEST_F(WidgetSettingWriterTest, NoRowMeansNothingWritten)
{
    WeatherTest::RawDB(NSWeather::FileUtil::GetSettingDBFilePath()).Exec("DELETE FROM SETTING_TABLE");
    EXPECT_FALSE(
        NSWeatherWidget::WidgetSettingWriter::Change([](const SettingPtr& s) { s->SetTemperatureUnit(0); }));
}

}  // namespace

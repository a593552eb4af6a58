#include "SettingsTestSupport.h"
#include "ShareTargetDBController.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using SettingsTest::RawDB;

namespace
{

class ShareTargetDBControllerTest : public SettingsTest::SettingsFixture
{
protected:
    void SetUp() override
    {
        MakeDBDir();
        ASSERT_EQ(ERR_OK, ShareTargetDBController().Initialize());
    }

    static ShareTargetPtr Target(const std::string& appId, const std::string& portId)
    {
        auto target = std::make_shared<ShareTarget>();
        target->SetAppID(appId);
        target->SetPortID(portId);
        return target;
    }
};

TEST_F(ShareTargetDBControllerTest, TargetsComeBackInInsertOrder)
{
    ShareTargetDBController controller;
    controller.Insert(Target("com.example.a", "port.a"));
    controller.Insert(Target("com.example.b", "port.b"));
    ShareTargetPtrVectorPtr targets = controller.Select();
    ASSERT_TRUE(targets);
    ASSERT_EQ(2u, targets->size());
    EXPECT_EQ("com.example.a", targets->at(0)->GetAppID());
    EXPECT_EQ("port.a", targets->at(0)->GetPortID());
    EXPECT_EQ("com.example.b", targets->at(1)->GetAppID());
    EXPECT_EQ("port.b", targets->at(1)->GetPortID());
}

TEST_F(ShareTargetDBControllerTest, SecondInsertOfAnAppIdKeepsTheFirstPort)
{
    ShareTargetDBController controller;
    controller.Insert(Target("com.example.a", "port.first"));
    controller.Insert(Target("com.example.b", "port.b"));
    controller.Insert(Target("com.example.a", "port.second"));
    EXPECT_TRUE(mLog.Contains("There is a same appId. so we didn't insert this app")) << mLog.Dump();

    RawDB db(ShareTargetDBPath());
    EXPECT_EQ(1, db.QueryInt("SELECT COUNT(*) FROM SHARE_TARGET_TABLE WHERE AppID = 'com.example.a'"));
    EXPECT_EQ("port.first", db.QueryText("SELECT PortID FROM SHARE_TARGET_TABLE WHERE AppID = 'com.example.a'"));
    // Only a whole, exact id counts as the same.
    controller.Insert(Target("com.example", "port.c"));
    controller.Insert(Target("COM.EXAMPLE.A", "port.d"));
    EXPECT_EQ(4, db.QueryInt("SELECT COUNT(*) FROM SHARE_TARGET_TABLE"));
}

TEST_F(ShareTargetDBControllerTest, EmptyTableGivesEmptyListAndInitializeAgainIsHarmless)
{
    ShareTargetPtrVectorPtr targets = ShareTargetDBController().Select();
    ASSERT_TRUE(targets);
    EXPECT_TRUE(targets->empty());
    EXPECT_EQ(ERR_OK, ShareTargetDBController().Initialize());
    EXPECT_EQ(
        "CREATE TABLE SHARE_TARGET_TABLE (PK_ID\tINTEGER NOT NULL PRIMARY KEY AUTOINCREMENT,AppID\tTEXT, PortID\tTEXT)",
        RawDB(ShareTargetDBPath()).TableSql("SHARE_TARGET_TABLE"));
}

TEST_F(ShareTargetDBControllerTest, InsertWithoutTableStoresNothingAndDoesNotCrash)
{
    RawDB(ShareTargetDBPath()).Exec("DROP TABLE SHARE_TARGET_TABLE");
    ShareTargetDBController().Insert(Target("com.example.a", "port.a"));
    ShareTargetDBController().Insert(nullptr);
    EXPECT_EQ("", RawDB(ShareTargetDBPath()).TableSql("SHARE_TARGET_TABLE"));
    ShareTargetPtrVectorPtr targets = ShareTargetDBController().Select();
    ASSERT_TRUE(targets);
    EXPECT_TRUE(targets->empty());
}

}  // namespace

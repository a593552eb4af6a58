#include "DBTestSupport.h"
#include "ShareTargetDBController.h"
#include "WeatherDefine.h"

using namespace NSWeather;
using WeatherTest::RawDB;

namespace
{

class ShareTargetDBControllerTest : public WeatherTest::StoreTest
{
protected:
    void SetUp() override
    {
        MakeDBDir();
        ASSERT_EQ(ERR_OK, ShareTargetDBController().Initialize());
    }

    static void Insert(const std::string& appId, const std::string& portId)
    {
        auto target = std::make_shared<ShareTarget>();
        target->SetAppID(appId);
        target->SetPortID(portId);
        ShareTargetDBController().Insert(target);
    }

    static std::string Listed()
    {
        ShareTargetPtrVectorPtr targets = ShareTargetDBController().Select();
        std::string listed;
        for (const ShareTargetPtr& target : *targets)
            listed += target->GetAppID() + "=" + target->GetPortID() + ";";
        return listed;
    }
};

TEST_F(ShareTargetDBControllerTest, OneRowPerExactAppIdInInsertOrder)
{
    EXPECT_EQ("", Listed());
    Insert("com.example.a", "port.first");
    Insert("com.example.b", "port.b");
    Insert("com.example.a", "port.second");
    EXPECT_TRUE(mLog.Contains("There is a same appId. so we didn't insert this app")) << mLog.Dump();
    Insert("com.example", "port.c");
    Insert("COM.EXAMPLE.A", "port.d");
    EXPECT_EQ("com.example.a=port.first;com.example.b=port.b;com.example=port.c;COM.EXAMPLE.A=port.d;",
              Listed());
}

TEST_F(ShareTargetDBControllerTest, InitializeAgainKeepsRowsAndMissingTableTakesNothing)
{
    Insert("com.example.a", "port.a");
    EXPECT_EQ(ERR_OK, ShareTargetDBController().Initialize());
    EXPECT_EQ(
        "CREATE TABLE SHARE_TARGET_TABLE (PK_ID\tINTEGER NOT NULL PRIMARY KEY AUTOINCREMENT,AppID\tTEXT, "
        "PortID\tTEXT)",
        RawDB(ShareTargetDBPath()).TableSql("SHARE_TARGET_TABLE"));
    EXPECT_EQ("com.example.a=port.a;", Listed());

    RawDB(ShareTargetDBPath()).Exec("DROP TABLE SHARE_TARGET_TABLE");
    Insert("com.example.b", "port.b");
    ShareTargetDBController().Insert(nullptr);
    EXPECT_EQ("", RawDB(ShareTargetDBPath()).TableSql("SHARE_TARGET_TABLE"));
    EXPECT_EQ("", Listed());
}

}  // namespace

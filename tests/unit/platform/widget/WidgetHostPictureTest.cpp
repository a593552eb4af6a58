#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>

#include "TestPicture.h"
#include "WidgetHostFixture.h"

using ::testing::HasSubstr;

namespace WeatherTest
{

namespace
{
std::set<uint32_t> ColoursOf(const TestPicture& picture)
{
    return std::set<uint32_t>(picture.pixels.begin(), picture.pixels.end());
}
}  // namespace

TEST_F(WidgetHostTest, SnapshotWritesAPictureOfTheInstanceSize)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    std::string file = mRoot.Path("wide.png");
    EXPECT_EQ(Send("snapshot " + id + " " + file), "OK " + file + " 712x354");
    TestPicture wide = TestPicture::Load(file);
    EXPECT_EQ(wide.width, 712);
    EXPECT_EQ(wide.height, 354);
    EXPECT_GE(ColoursOf(wide).size(), 3u) << "background, block and text should all show";
    // The background colour of the test widget is there.
    EXPECT_EQ(ColoursOf(wide).count(0xff143ca0u), 1u);

    ASSERT_EQ(Send("resize " + id + " 4x4"), "OK");
    std::string square = mRoot.Path("square.png");
    EXPECT_EQ(Send("snapshot " + id + " " + square), "OK " + square + " 712x712");
    EXPECT_EQ(TestPicture::Load(square).height, 712);
}

TEST_F(WidgetHostTest, OnADisplayWindowsAreDrawnAndPicturedToo)
{
    std::string display = StartXServer();
    if (display.empty())
        GTEST_SKIP() << "no X server (Xvfb) on this machine";
    StartHost({"--instance", "4x2", "--instance", "4x4"}, display);
    std::string list = Send("list");
    auto words = Words(list);
    ASSERT_GE(words.size(), 12u) << list;
    const std::string& square = words[7];
    WaitIdle();
    std::string file = mRoot.Path("display.png");
    EXPECT_EQ(Send("snapshot " + square + " " + file), "OK " + file + " 712x712");
    TestPicture picture = TestPicture::Load(file);
    EXPECT_EQ(picture.width, 712);
    EXPECT_EQ(picture.height, 712);
    EXPECT_EQ(ColoursOf(picture).count(0xff143ca0u), 1u);
    EXPECT_GE(ColoursOf(picture).size(), 3u);
}

TEST_F(WidgetHostTest, SnapshotToAnUnwritablePlaceIsAnError)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    EXPECT_THAT(Send("snapshot " + id + " " + mRoot.Path("missing/dir/x.png")),
                HasSubstr("ERR could not write"));
    EXPECT_THAT(Send("snapshot " + id), HasSubstr("ERR usage"));
}

TEST_F(WidgetHostTest, DumpDescribesTheTextsOfTheWindow)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    std::string reply = Send("dump " + id);
    ASSERT_EQ(reply.compare(0, 4, "OK {"), 0) << reply;
    EXPECT_EQ(reply.find('\n'), std::string::npos);
    EXPECT_THAT(reply, HasSubstr("\"text\":\"" + id + "\""));
    EXPECT_THAT(reply, HasSubstr("\"type\":\"text\""));
    // The layout: its group, both text parts, the image in one swallow and the empty one.
    EXPECT_THAT(reply, HasSubstr("\"group\":\"test/page\",\"texts\":{\"title\":\"" + id +
                                 "\",\"note\":\"second line\"},\"swallows\":{\"icon\":{"));
    EXPECT_THAT(reply, HasSubstr("TestWidgetLayout.edj\",\"group\":\"test/icon\""));
    EXPECT_THAT(reply, HasSubstr("\"empty\":null"));
    EXPECT_THAT(Send("dump"), HasSubstr("ERR usage"));
}

// The count takes in what the dump leaves out (rectangles, clippers), so
// it is larger than the dump's objects, and a second instance has its own.
TEST_F(WidgetHostTest, CountTakesEveryObjectOfTheInstanceCanvas)
{
    StartHost();
    std::string id = CreateInstance("4x2");
    std::string reply = Send("count " + id);
    ASSERT_EQ(reply.compare(0, 3, "OK "), 0) << reply;
    std::string dump = Send("dump " + id);
    size_t described = 0;
    for (size_t at = dump.find("\"type\":"); at != std::string::npos; at = dump.find("\"type\":", at + 1))
        ++described;
    EXPECT_GT(std::stol(reply.substr(3)), static_cast<long>(described));
    EXPECT_EQ(Send("count " + CreateInstance("4x2")), reply);
    EXPECT_THAT(Send("count"), HasSubstr("ERR usage"));
    EXPECT_THAT(Send("count nobody"), HasSubstr("ERR"));
}

}  // namespace WeatherTest

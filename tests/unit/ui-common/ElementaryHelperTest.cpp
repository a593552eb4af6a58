#include "ElementaryHelper.h"

#include <Elementary.h>
#include <gtest/gtest.h>

#include <app_common.h>

#include <string>

#include "TestPlatform.h"

namespace
{
using NSWeather::ElementaryHelper;

const char* const WIDGET_APP_ID = "com.quorvex.weather-m-widget";

int CountTopLevelObjects(Evas* evas)
{
    int count = 0;
    for (Evas_Object* obj = evas_object_bottom_get(evas); obj; obj = evas_object_above_get(obj)) ++count;
    return count;
}

class ElementaryHelperTest : public WeatherTest::PlatformTest
{
protected:
    void SetUp() override
    {
        ASSERT_EQ(app_set_own_id(WIDGET_APP_ID), APP_ERROR_NONE);
        mResDir = mRoot.Path(std::string("apps/") + WIDGET_APP_ID + "/res/");
        ASSERT_EQ(system(("mkdir -p '" + mResDir + "widget' && cp '" TEST_LAYOUT_EDJ "' '" + mResDir +
                          "widget/TestLayouts.edj'")
                             .c_str()),
                  0);
        mWin = elm_win_add(nullptr, "elements-test", ELM_WIN_BASIC);
        ASSERT_NE(mWin, nullptr);
    }

    void TearDown() override { evas_object_del(mWin); }

    ElementaryHelper mHelper;
    std::string mResDir;
    Evas_Object* mWin = nullptr;
};

TEST_F(ElementaryHelperTest, ResourceNamesResolveInsideTheResourceFolderOnly)
{
    EXPECT_EQ(mHelper.CreateMultiResPath("widget/TestLayouts.edj"), mResDir + "widget/TestLayouts.edj");
    EXPECT_EQ(mHelper.CreateMultiResPath("widget/Missing.edj"), "");
    EXPECT_EQ(mHelper.CreateMultiLayout(mWin, "widget/Missing.edj", "test/layout"), nullptr);
    EXPECT_EQ(mHelper.CreateMultiImage(mWin, "widget/Missing.edj", "test/image.png"), nullptr);
    // An id that climbs out of the resource folder is no resource either.
    EXPECT_EQ(mHelper.CreateMultiResPath("../../com.quorvex.weather-m/shared/data/x"), "");
}

TEST_F(ElementaryHelperTest, LayoutsLoadTheirGroupOrAreDeleted)
{
    Evas_Object* layout = mHelper.CreateMultiLayout(mWin, "widget/TestLayouts.edj", "test/layout");
    ASSERT_NE(layout, nullptr) << mLog.Dump();
    EXPECT_NE(elm_layout_content_set(layout, "content", elm_box_add(mWin)), EINA_FALSE)
        << "not the test group";

    Evas* evas = evas_object_evas_get(mWin);
    int before = CountTopLevelObjects(evas);
    EXPECT_EQ(mHelper.CreateMultiLayout(mWin, "widget/TestLayouts.edj", "no/such/group"), nullptr);
    EXPECT_EQ(CountTopLevelObjects(evas), before) << "the half-made layout was left behind";
    EXPECT_TRUE(mLog.Contains("elm_layout_file_set is failed. file: " + mResDir +
                              "widget/TestLayouts.edj, group: no/such/group"));

    // Without file or group the layout stays bare.
    EXPECT_NE(mHelper.CreateLayout(mWin, "", ""), nullptr);
    EXPECT_EQ(mHelper.CreateLayout(nullptr, mResDir + "widget/TestLayouts.edj", "test/layout"), nullptr);
}

TEST_F(ElementaryHelperTest, ImagesShowAGroupOfTheResourceFile)
{
    Evas_Object* image = mHelper.CreateMultiImage(mWin, "widget/TestLayouts.edj", "test/image.png");
    ASSERT_NE(image, nullptr);
    const char* file = nullptr;
    const char* group = nullptr;
    elm_image_file_get(image, &file, &group);
    EXPECT_EQ(std::string(file ? file : ""), mResDir + "widget/TestLayouts.edj");
    EXPECT_STREQ(group, "test/image.png");

    EXPECT_EQ(mHelper.CreateImage(nullptr, mResDir + "widget/TestLayouts.edj", "test/image.png"), nullptr);
}

TEST_F(ElementaryHelperTest, ActivityIndicatorPulsesShownInItsStyle)
{
    Evas_Object* indicator = mHelper.CreateActivityIndicator(mWin, "wheel");
    ASSERT_NE(indicator, nullptr);
    EXPECT_TRUE(evas_object_visible_get(indicator));
    EXPECT_TRUE(elm_progressbar_pulse_get(indicator));
    EXPECT_STREQ(elm_object_style_get(indicator), "wheel");
    EXPECT_EQ(mHelper.CreateActivityIndicator(nullptr, "wheel"), nullptr);
    EXPECT_EQ(mHelper.CreateActivityIndicator(mWin, ""), nullptr);
}

}  // namespace

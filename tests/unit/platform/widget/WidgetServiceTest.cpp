#include <gtest/gtest.h>

#include "TestPlatform.h"
#include "widget.h"
#include "widget_app.h"
#include "widget_service.h"

namespace WeatherTest
{

TEST(WidgetService, SizeTableMatchesThePhoneBothWays)
{
    const struct
    {
        widget_size_type_e type;
        int width;
        int height;
    } table[] = {
        {WIDGET_SIZE_TYPE_1x1, 175, 175},      {WIDGET_SIZE_TYPE_2x1, 354, 175},
        {WIDGET_SIZE_TYPE_2x2, 354, 354},      {WIDGET_SIZE_TYPE_4x1, 712, 175},
        {WIDGET_SIZE_TYPE_4x2, 712, 354},      {WIDGET_SIZE_TYPE_4x3, 712, 533},
        {WIDGET_SIZE_TYPE_4x4, 712, 712},      {WIDGET_SIZE_TYPE_4x5, 712, 891},
        {WIDGET_SIZE_TYPE_4x6, 712, 1070},     {WIDGET_SIZE_TYPE_FULL, 720, 1280},
        {WIDGET_SIZE_TYPE_EASY_1x1, 224, 215}, {WIDGET_SIZE_TYPE_EASY_3x1, 680, 215},
        {WIDGET_SIZE_TYPE_EASY_3x3, 680, 653},
    };
    for (const auto& entry : table)
    {
        int width = 0;
        int height = 0;
        ASSERT_EQ(widget_service_get_size(entry.type, &width, &height), WIDGET_ERROR_NONE);
        EXPECT_EQ(width, entry.width);
        EXPECT_EQ(height, entry.height);
        widget_size_type_e type = WIDGET_SIZE_TYPE_UNKNOWN;
        ASSERT_EQ(widget_service_get_size_type(entry.width, entry.height, &type), WIDGET_ERROR_NONE);
        EXPECT_EQ(type, entry.type);
    }
}

TEST(WidgetService, OnlyExactPixelSizesResolve)
{
    widget_size_type_e type = WIDGET_SIZE_TYPE_4x2;
    EXPECT_EQ(widget_service_get_size_type(712, 355, &type), WIDGET_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(type, WIDGET_SIZE_TYPE_UNKNOWN);
    type = WIDGET_SIZE_TYPE_4x2;
    EXPECT_EQ(widget_service_get_size_type(354, 712, &type), WIDGET_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(type, WIDGET_SIZE_TYPE_UNKNOWN);
    int width = 0;
    EXPECT_EQ(widget_service_get_size(WIDGET_SIZE_TYPE_UNKNOWN, &width, &width),
              WIDGET_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(widget_service_get_size(static_cast<widget_size_type_e>(0x0030), &width, &width),
              WIDGET_ERROR_INVALID_PARAMETER);
}

TEST(WidgetService, CallsWithoutARunningHostFailCleanly)
{
    EXPECT_EQ(widget_service_trigger_update("com.quorvex.weather-m-widget", nullptr, nullptr, 1),
              WIDGET_ERROR_NOT_EXIST);
    EXPECT_EQ(widget_app_exit(), WIDGET_ERROR_FAULT);
    EXPECT_EQ(widget_get_evas_object("com.quorvex.weather-m-widget:1", 0), nullptr);
    widget_app_lifecycle_callback_s noCreate = {nullptr, nullptr};
    char name[] = "widget";
    char* argv[] = {name, nullptr};
    EXPECT_EQ(widget_app_main(1, argv, &noCreate, nullptr), WIDGET_ERROR_INVALID_PARAMETER);
}

}  // namespace WeatherTest

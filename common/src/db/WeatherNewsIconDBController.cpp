#include "WeatherNewsIconDBController.h"

#include <cstdio>
#include <string>

#include "CommonLog.h"
#include "DBCycleCloser.h"
#include "DBStatement.h"
#include "FileUtil.h"

namespace NSWeather
{

namespace
{
constexpr size_t ICON_QUERY_BUFFER_SIZE = 512;
}  // namespace

WeatherNewsIconDBController::WeatherNewsIconDBController() = default;

WeatherNewsIconDBController::~WeatherNewsIconDBController() = default;

int WeatherNewsIconDBController::Select(int iconId, bool isDayTime)
{
    std::string iconDBPath = FileUtil::GetWeatherNewsIconDBFilePath();
    COMMON_RETV_IF(iconDBPath.length() < 1, 0);
    // Read-only, so a missing file is reported instead of an empty database
    // being created in the resource folder.
    DBCycleCloser cycle(iconDBPath, DBCycleCloser::Mode::READ);
    COMMON_RETV_IF(cycle.GetIsOpened() == false, 0);
    // The one statement text kept with its value inline, as the suite's
    // other programs write it; the value is a formatted integer.
    char query[ICON_QUERY_BUFFER_SIZE] = {};
    snprintf(query, sizeof(query),
             isDayTime ? "SELECT day_mapping_id FROM icon_table WHERE icon_id = %d;"
                       : "SELECT night_mapping_id FROM icon_table WHERE icon_id = %d;",
             iconId);
    DBStatement statement(query);
    int rc = statement.Step();
    if (rc != SQLITE_ROW)
    {
        COMMON_LOG("No result : %d", rc);
        return 0;
    }
    return statement.ColumnInt(0);
}

}  // namespace NSWeather

#include "DataStoreInitializer.h"

#include "CommonLog.h"
#include "DBController.h"
#include "SettingDBController.h"
#include "ShareTargetDBController.h"
#include "UpgradeDBController.h"
#include "VersionDBController.h"
#include "WeatherDefine.h"

namespace NSWeather
{

int DataStoreInitializer::Run()
{
    int result = ERR_OK;
    UpgradeDBController upgradeDBController;
    upgradeDBController.MakeDBFileDirectory();
    if (DBController().Initialize() == ERR_FAIL)
    {
        COMMON_LOG("Fail to initialize the weather database");
        result = ERR_FAIL;
    }
    if (SettingDBController().Initialize() == ERR_FAIL)
    {
        COMMON_LOG("Fail to initialize the setting database");
        result = ERR_FAIL;
    }
    if (ShareTargetDBController().Initialize() == ERR_FAIL)
    {
        COMMON_LOG("Fail to initialize the share target database");
        result = ERR_FAIL;
    }
    if (VersionDBController().Initialize() == ERR_FAIL)
    {
        COMMON_LOG("Fail to initialize the version database");
        result = ERR_FAIL;
    }
    upgradeDBController.UpgradeIfNeeded();
    return result;
}

}  // namespace NSWeather

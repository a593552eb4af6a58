#include "UpgradeDBController.h"

#include <string>

#include "CommonLog.h"
#include "DBController.h"
#include "FileUtil.h"
#include "SettingDBController.h"
#include "ShareTargetDBController.h"
#include "VersionDBController.h"
#include "WeatherDefine.h"

namespace NSWeather
{

UpgradeDBController::UpgradeDBController() : mCurrentVersion(0.0), mLatestVersion(0.0) {}

UpgradeDBController::~UpgradeDBController() = default;

void UpgradeDBController::MakeDBFileDirectory()
{
    std::string directoryPath = FileUtil::GetSharedDataDirectoryPath();
    COMMON_RET_IF(directoryPath.length() < 1);
    FileUtil::MakeDirectory(directoryPath + "db");
}

bool UpgradeDBController::IsNeedToUpgrade()
{
    VersionDBController versionDBController;
    mCurrentVersion = versionDBController.GetCurrentDBVersion();
    mLatestVersion = versionDBController.GetLatestDBVersion();
    if (mLatestVersion > mCurrentVersion)
    {
        COMMON_LOG("Need to upgrade DB : CurrentVersion[%.1f], LastestVersion[%.1f]", mCurrentVersion,
                   mLatestVersion);
        return true;
    }
    return false;
}

int UpgradeDBController::UpgradeDB()
{
    int result = DBController().UpgradeDB(mCurrentVersion);
    SettingDBController().UpgradeDB(mCurrentVersion);
    ShareTargetDBController().UpgradeDB(mCurrentVersion);
    // An old schema must not be marked as new: the steps that could not run
    // are retried at the next start.
    COMMON_RETV_IF(result != ERR_OK, ERR_FAIL);
    COMMON_RETV_IF(VersionDBController().UpgradeDB(mLatestVersion) == false, ERR_FAIL);
    return ERR_OK;
}

void UpgradeDBController::UpgradeIfNeeded()
{
    if (IsNeedToUpgrade())
        UpgradeDB();
}

}  // namespace NSWeather

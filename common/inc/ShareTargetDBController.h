#ifndef NSWEATHER_SHARE_TARGET_DB_CONTROLLER_H
#define NSWEATHER_SHARE_TARGET_DB_CONTROLLER_H

#include <string>

#include "ShareTarget.h"

namespace NSWeather
{

// The applications that want the agent's messages ("db/.share_target.db"),
// at most one row per application id.
class ShareTargetDBController
{
public:
    ShareTargetDBController();
    virtual ~ShareTargetDBController();

    // ERR_OK, or ERR_FAIL when the database cannot be opened.
    int Initialize();
    // Runs on the caller's cycle.
    bool IsShareTargetTableExist();
    bool CreateTable();
    // Own cycle; a target whose application id is already stored is skipped
    // (ERR_OK). ERR_FAIL when the table could not be read or written.
    int Insert(const ShareTargetPtr& shareTargetPtr);
    // Own cycle; an empty vector when there is no row, null when the
    // database cannot be opened.
    ShareTargetPtrVectorPtr Select();
    // The table has had the same columns in every version.
    void UpgradeDB(double currentVersion);

private:
    // stepResult: the last step, SQLITE_DONE when every row was seen.
    bool IsAppIdStored(const std::string& appId, int& stepResult);
    ShareTargetPtrVectorPtr SelectRows();
};

}  // namespace NSWeather

#endif

#ifndef NSWEATHER_UPGRADE_DB_CONTROLLER_H
#define NSWEATHER_UPGRADE_DB_CONTROLLER_H

namespace NSWeather
{

// Brings a weather database that an older installation left behind up to
// the current schema, once, at start-up.
class UpgradeDBController
{
public:
    UpgradeDBController();
    virtual ~UpgradeDBController();

    // Creates the shared "db" folder that every database file lives in.
    void MakeDBFileDirectory();
    bool IsNeedToUpgrade();
    // The version is written as the latest only when every step could
    // reach the weather database; otherwise the upgrade runs again at the
    // next start. ERR_OK or ERR_FAIL.
    int UpgradeDB();
    void UpgradeIfNeeded();

    double GetCurrentVersion() const { return mCurrentVersion; }
    double GetLatestVersion() const { return mLatestVersion; }

private:
    double mCurrentVersion;
    double mLatestVersion;
};

}  // namespace NSWeather

#endif

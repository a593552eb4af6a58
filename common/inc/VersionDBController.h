#ifndef NSWEATHER_VERSION_DB_CONTROLLER_H
#define NSWEATHER_VERSION_DB_CONTROLLER_H

namespace NSWeather
{

// The schema version of the weather database, kept in "db/.version.db".
class VersionDBController
{
public:
    VersionDBController();
    virtual ~VersionDBController();

    // Creates the table and, for a new file, the row 0.0. ERR_OK, or
    // ERR_FAIL when the database cannot be opened.
    int Initialize();
    // Own cycle; 0.0 when the database cannot be read, so that an upgrade
    // runs (its steps are harmless on an up-to-date weather database).
    double GetCurrentDBVersion();
    // On the caller's cycle; -1.0 when there is no row.
    double GetCurrentVersion();
    double GetLatestDBVersion() const;
    // Insert, Update and CreateTable run on the caller's cycle; false when
    // the statement failed.
    bool Insert(double version);
    bool Update(double version);
    // Own cycle: stores the version. false when it could not be written.
    bool UpgradeDB(double version);
    bool CreateTable();
};

}  // namespace NSWeather

#endif

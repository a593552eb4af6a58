#ifndef NSWEATHER_DB_CYCLE_CLOSER_H
#define NSWEATHER_DB_CYCLE_CLOSER_H

#include <string>

namespace NSWeather
{

class DBConnector;

// The one way to run a DBConnector cycle: opens it, and ends it (commit and
// close, or roll back when a step failed) when the operation that opened it
// leaves, on every path. Declared before the cycle's statements, so they
// are finalised first.
class DBCycleCloser
{
public:
    enum class Mode
    {
        READ,
        // Takes the write lock before the first read (see DBConnector).
        WRITE,
    };

    DBCycleCloser(const std::string& dbFilePath, Mode mode);
    virtual ~DBCycleCloser();
    DBCycleCloser(const DBCycleCloser&) = delete;
    DBCycleCloser& operator=(const DBCycleCloser&) = delete;

    // False (and logged) when the file could not be opened.
    bool GetIsOpened() const { return mDBConnector != nullptr; }
    // Another database file read in this cycle's transaction (see
    // DBConnector::DBAttach); false, and the cycle failed, when it cannot be.
    bool Attach(const std::string& dbFilePath);
    // The cycle is rolled back however the rest of it goes.
    void MarkFailed();
    // Ends the cycle now, once its statements are finalised; a cycle whose
    // work is not done is rolled back. True only when it was committed
    // without a failed step. Later calls return false.
    bool Close(bool isDone = true);

private:
    DBConnector* mDBConnector;
};

}  // namespace NSWeather

#endif

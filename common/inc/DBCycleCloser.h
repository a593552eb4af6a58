#ifndef NSWEATHER_DB_CYCLE_CLOSER_H
#define NSWEATHER_DB_CYCLE_CLOSER_H

namespace NSWeather
{

class DBConnector;

// Ends an open DBConnector cycle (commit and close, or roll back when a
// step failed) when the operation that opened it leaves, on every path.
// Declared right after a successful DBInitialize and before the cycle's
// statements, so they are finalised first. The connector is not owned.
class DBCycleCloser
{
public:
    explicit DBCycleCloser(DBConnector* dbConnector);
    virtual ~DBCycleCloser();
    DBCycleCloser(const DBCycleCloser&) = delete;
    DBCycleCloser& operator=(const DBCycleCloser&) = delete;

    // The cycle is rolled back however the rest of it goes.
    void MarkFailed();
    // Ends the cycle now, once its statements are finalised; true only when
    // it was committed without a failed step. Later calls return false.
    bool Close();

private:
    DBConnector* mDBConnector;
};

}  // namespace NSWeather

#endif

#ifndef NSWEATHER_DB_CYCLE_CLOSER_H
#define NSWEATHER_DB_CYCLE_CLOSER_H

namespace NSWeather
{

class DBConnector;

// Ends an open DBConnector cycle (commit and close) when the operation that
// opened it leaves, on every path. Declared right after a successful
// DBInitialize and before the cycle's statements, so they are finalised
// first. The connector is not owned.
class DBCycleCloser
{
public:
    explicit DBCycleCloser(DBConnector* dbConnector);
    virtual ~DBCycleCloser();
    DBCycleCloser(const DBCycleCloser&) = delete;
    DBCycleCloser& operator=(const DBCycleCloser&) = delete;

private:
    DBConnector* mDBConnector;
};

}  // namespace NSWeather

#endif

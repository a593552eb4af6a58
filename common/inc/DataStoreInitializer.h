#ifndef NSWEATHER_DATA_STORE_INITIALIZER_H
#define NSWEATHER_DATA_STORE_INITIALIZER_H

namespace NSWeather
{

// The start-up of the shared data store, the same in every process of the
// suite: the "db" folder, the weather tables, the settings row, the share
// targets, the version and then the upgrade of an old weather database.
class DataStoreInitializer
{
public:
    virtual ~DataStoreInitializer() = default;

    // ERR_OK when every database could be opened, ERR_FAIL otherwise; the
    // later steps run even when an earlier one fails.
    static int Run();
};

}  // namespace NSWeather

#endif

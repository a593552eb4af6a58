// fuzz-seeds <corpus folder>: writes the seed inputs of every fuzz target,
// each made by the code that makes such input for real, into
// <corpus folder>/<target>/. Files of the same name are replaced; others
// (inputs the fuzzers found) are kept.
#include <sqlite3.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <sys/stat.h>
#include <utility>
#include <vector>

#include "FileUtil.h"
#include "FuzzRoot.h"
#include "StoreSeeds.h"
#include "VersionDBController.h"
#include "app_control.h"
#include "app_control/AppControlInternal.h"
#include "bundle.h"
#include "bundle/BundleInternal.h"
#include "message_port/MessageEnvelope.h"
#include "vconf.h"
#include "vconf/VconfStore.h"

namespace
{

using Extras = std::vector<std::pair<const char*, const char*>>;

std::string gCorpus;

void Put(const std::string& target, const std::string& name, const std::string& bytes)
{
    std::string dir = gCorpus + "/" + target;
    mkdir(dir.c_str(), 0755);
    FUZZ_CHECK(WeatherTest::WriteBytes(dir + "/" + name, bytes));
}

std::string Encoded(bundle* b)
{
    bundle_raw* raw = nullptr;
    int length = 0;
    FUZZ_CHECK(bundle_encode(b, &raw, &length) == BUNDLE_ERROR_NONE);
    std::string text(reinterpret_cast<const char*>(raw), static_cast<size_t>(length));
    free(raw);
    return text;
}

// The launch request as the launcher hands it to the started process.
std::string LaunchRequest(const char* appId, const char* operation, const char* uri, const Extras& extras)
{
    app_control_h request = nullptr;
    FUZZ_CHECK(app_control_create(&request) == APP_CONTROL_ERROR_NONE);
    if (appId)
        app_control_set_app_id(request, appId);
    if (operation)
        app_control_set_operation(request, operation);
    if (uri)
        app_control_set_uri(request, uri);
    for (const auto& extra : extras) app_control_add_extra_data(request, extra.first, extra.second);
    bundle* b = platform::AppControlToBundle(*request, "com.quorvex.weather-m-widget");
    std::string text = Encoded(b);
    bundle_free(b);
    app_control_destroy(request);
    return text;
}

bundle* AgentMessage()
{
    bundle* message = bundle_create();
    bundle_add_str(message, "MESSAGE", "REQUEST_WEATHER_INFO_FOR_REFRESH");
    bundle_add_str(message, "RESULT", "OK");
    return message;
}

void WriteBundleSeeds()
{
    const char* target = "bundle-decode";
    Put(target, "agent-refresh.txt",
        LaunchRequest("com.quorvex.weather-m-agent", nullptr, nullptr,
                      {{"PORT_ID", "weather-widget-port"}, {"MESSAGE", "REQUEST_WEATHER_INFO_FOR_REFRESH"}}));
    Put(target, "app-add-city.txt",
        LaunchRequest("com.quorvex.weather-m", nullptr, nullptr, {{"MODE", "ADD_CITY"}}));
    Put(target, "browser-view.txt",
        LaunchRequest(nullptr, APP_CONTROL_OPERATION_VIEW, "https://www.accuweather.com/", {}));
    bundle* message = AgentMessage();
    Put(target, "agent-message.bin", platform::BundleToBinary(message));
    bundle_free(message);
}

void WriteDatagramSeeds()
{
    const char* target = "message-datagram";
    bundle* message = AgentMessage();
    Put(target, "agent-done", platform::EncodeEnvelope("com.quorvex.weather-m-agent", nullptr, message));
    Put(target, "with-reply-port", platform::EncodeEnvelope("com.quorvex.weather-m", "reply-port", message));
    bundle_free(message);
    bundle* empty = bundle_create();
    Put(target, "empty-message", platform::EncodeEnvelope("com.quorvex.weather-m-agent", nullptr, empty));
    bundle_free(empty);
}

void WriteControlSeeds()
{
    const char* target = "control-command";
    const std::pair<const char*, const char*> lines[] = {
        {"create", "create 4x2\n"},
        {"resize", "resize com.quorvex.weather-m-widget:1 4x4\n"},
        {"tap", "tap com.quorvex.weather-m-widget:1 356 177 80\n"},
        {"swipe", "swipe com.quorvex.weather-m-widget:1 356 300 356 40 300\n"},
        {"update", "update com.quorvex.weather-m-widget:1 0\n"},
        {"idle", "idle 0.5\n"},
        {"event", "event region\n"},
        {"snapshot", "snapshot com.quorvex.weather-m-widget:1 /tmp/widget.png\r\n"},
        {"list", "list\n"},
    };
    for (const auto& line : lines) Put(target, line.first, line.second);
}

void WriteVconfSeeds()
{
    const char* target = "vconf-key-file";
    platform::vconf::Value value;
    value.type = VCONF_TYPE_INT;
    value.intValue = 2;
    Put(target, "int", platform::vconf::Encode(value));
    value.type = VCONF_TYPE_BOOL;
    value.intValue = 1;
    Put(target, "bool", platform::vconf::Encode(value));
    value.type = VCONF_TYPE_DOUBLE;
    value.dblValue = 48.8566;
    Put(target, "double", platform::vconf::Encode(value));
    value.type = VCONF_TYPE_STRING;
    value.strValue = "ko_KR.UTF-8";
    Put(target, "string", platform::vconf::Encode(value));
}

// The file with the smallest pages SQLite allows, so the seeds stay small.
std::string Compacted(const std::string& path)
{
    sqlite3* db = nullptr;
    FUZZ_CHECK(sqlite3_open(path.c_str(), &db) == SQLITE_OK);
    FUZZ_CHECK(sqlite3_exec(db, "PRAGMA page_size=512; VACUUM;", nullptr, nullptr, nullptr) == SQLITE_OK);
    sqlite3_close(db);
    return WeatherTest::ReadBytes(path);
}

void WriteStoreSeeds()
{
    using NSWeather::FileUtil;
    const char* target = "store-file";
    WeatherTest::WriteSoundStore();
    // The first byte picks the file: weather, settings, version.
    Put(target, "weather", '\0' + Compacted(FileUtil::GetWeatherDBFilePath()));
    Put(target, "setting", '\1' + Compacted(FileUtil::GetSettingDBFilePath()));
    Put(target, "version", '\2' + Compacted(FileUtil::GetVersionDBFilePath()));
}

}  // namespace

int main(int argc, char** argv)
{
    if (argc != 2)
    {
        fprintf(stderr, "usage: fuzz-seeds <corpus folder>\n");
        return 2;
    }
    gCorpus = argv[1];
    WeatherTest::FuzzRoot::Get();
    WriteBundleSeeds();
    WriteDatagramSeeds();
    WriteControlSeeds();
    WriteVconfSeeds();
    WriteStoreSeeds();
    return 0;
}

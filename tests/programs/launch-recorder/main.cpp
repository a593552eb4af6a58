// Launch target for tests: writes what it was launched with to
// <root>/apps/<own id>/shared/data/launch-record.txt, extra data in order.
#include <app_control.h>
#include <app_control_launch.h>

#include <cstdio>
#include <cstdlib>
#include <string>

namespace
{

std::string Take(char* text)
{
    std::string copy = text ? text : "(unset)";
    free(text);
    return copy;
}

bool AddExtraCb(app_control_h request, const char* key, void* data)
{
    char* value = nullptr;
    app_control_get_extra_data(request, key, &value);
    *static_cast<std::string*>(data) += std::string("extra:") + key + "=" + Take(value) + "\n";
    return true;
}

std::string Describe()
{
    const char* root = getenv("PLATFORM_ROOT");
    const char* appId = getenv("PLATFORM_APP_ID");
    std::string record =
        std::string("app_id=") + (appId ? appId : "") + "\nroot=" + (root ? root : "") + "\n";
    app_control_h request = nullptr;
    int result = app_control_get_launch_request(&request);
    if (result != APP_CONTROL_ERROR_NONE)
        return record + "error=" + std::to_string(result) + "\n";
    char* text = nullptr;
    app_control_get_operation(request, &text);
    record += "operation=" + Take(text) + "\n";
    app_control_get_uri(request, &text);
    record += "uri=" + Take(text) + "\n";
    app_control_foreach_extra_data(request, AddExtraCb, &record);
    app_control_destroy(request);
    return record;
}

}  // namespace

int main()
{
    const char* root = getenv("PLATFORM_ROOT");
    const char* appId = getenv("PLATFORM_APP_ID");
    if (!root || !appId)
        return 1;
    std::string path = std::string(root) + "/apps/" + appId + "/shared/data/launch-record.txt";
    std::string temp = path + ".tmp";
    FILE* file = fopen(temp.c_str(), "w");
    if (!file)
        return 1;
    std::string record = Describe();
    fwrite(record.data(), 1, record.size(), file);
    fclose(file);
    return rename(temp.c_str(), path.c_str()) == 0 ? 0 : 1;
}

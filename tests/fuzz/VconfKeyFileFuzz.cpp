// The bytes of one system key file, as another process or a person left
// them. The reader takes a well-formed typed value or refuses the file; a
// value it takes is written back the same, and every getter agrees.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "FuzzRoot.h"
#include "core/PlatformRoot.h"
#include "vconf.h"
#include "vconf/VconfStore.h"

namespace
{
const char* const kKey = "db/fuzz/key";

bool SameValue(const platform::vconf::Value& a, const platform::vconf::Value& b)
{
    return a.type == b.type && a.intValue == b.intValue && a.dblValue == b.dblValue &&
           a.strValue == b.strValue;
}

// Each getter succeeds exactly for its own type, with the decoded value.
void CheckGetters(bool isDecoded, const platform::vconf::Value& value)
{
    int number = 0;
    bool isInt = vconf_get_int(kKey, &number) == VCONF_OK;
    FUZZ_CHECK(isInt == (isDecoded && value.type == VCONF_TYPE_INT));
    FUZZ_CHECK(!isInt || number == value.intValue);
    bool isBool = vconf_get_bool(kKey, &number) == VCONF_OK;
    FUZZ_CHECK(isBool == (isDecoded && value.type == VCONF_TYPE_BOOL));
    FUZZ_CHECK(!isBool || number == value.intValue);
    double real = 0.0;
    bool isDouble = vconf_get_dbl(kKey, &real) == VCONF_OK;
    FUZZ_CHECK(isDouble == (isDecoded && value.type == VCONF_TYPE_DOUBLE));
    FUZZ_CHECK(!isDouble || real == value.dblValue);
    char* text = vconf_get_str(kKey);
    FUZZ_CHECK((text != nullptr) == (isDecoded && value.type == VCONF_TYPE_STRING));
    FUZZ_CHECK(!text || value.strValue == text);
    free(text);
}
}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***)
{
    WeatherTest::FuzzRoot::Get();
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static const std::string path = platform::vconf::KeyPath(kKey);
    std::string content(reinterpret_cast<const char*>(data), size);
    platform::vconf::Value value;
    bool isDecoded = platform::vconf::Decode(content, value);
    if (isDecoded)
    {
        platform::vconf::Value reread;
        FUZZ_CHECK(platform::vconf::Decode(platform::vconf::Encode(value), reread));
        FUZZ_CHECK(SameValue(value, reread));
    }
    platform::MakeDirs(path.substr(0, path.rfind('/')));
    FUZZ_CHECK(WeatherTest::WriteBytes(path, content));
    CheckGetters(isDecoded, value);
    return 0;
}

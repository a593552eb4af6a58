#include "vconf.h"

#include <cstring>

#include "core/ApiGuard.h"
#include "core/PlatformRoot.h"
#include "dlog.h"
#include "vconf/VconfStore.h"
#include "vconf/VconfWatch.h"

using platform::GuardedCall;
using platform::vconf::kLogTag;
using platform::vconf::Value;

namespace
{

bool ReadTyped(const char* key, int type, Value& value)
{
    if (!platform::vconf::Read(key, value))
        return false;
    if (value.type != type)
    {
        dlog_print(DLOG_ERROR, kLogTag, "key %s has type %d, not %d", key, value.type, type);
        return false;
    }
    return true;
}

int WriteTyped(const char* key, const Value& value)
{
    return platform::vconf::Write(key, value) ? VCONF_OK : VCONF_ERROR;
}

bool NodeHasType(const keynode_t* node, int type)
{
    if (!node)
        return false;
    if (node->value.type != type)
    {
        dlog_print(DLOG_ERROR, kLogTag, "key node %s has type %d, not %d", node->name.c_str(),
                   node->value.type, type);
        return false;
    }
    return true;
}

int GetInt(const char* key, int* intval)
{
    Value value;
    if (!intval || !ReadTyped(key, VCONF_TYPE_INT, value))
        return VCONF_ERROR;
    *intval = value.intValue;
    return VCONF_OK;
}

int GetBool(const char* key, int* boolval)
{
    Value value;
    if (!boolval || !ReadTyped(key, VCONF_TYPE_BOOL, value))
        return VCONF_ERROR;
    *boolval = value.intValue;
    return VCONF_OK;
}

int GetDbl(const char* key, double* dblval)
{
    Value value;
    if (!dblval || !ReadTyped(key, VCONF_TYPE_DOUBLE, value))
        return VCONF_ERROR;
    *dblval = value.dblValue;
    return VCONF_OK;
}

char* GetStr(const char* key)
{
    Value value;
    if (!ReadTyped(key, VCONF_TYPE_STRING, value))
        return nullptr;
    return platform::CopyString(value.strValue);
}

int SetInt(const char* key, const int intval)
{
    Value value;
    value.type = VCONF_TYPE_INT;
    value.intValue = intval;
    return WriteTyped(key, value);
}

int SetBool(const char* key, const int boolval)
{
    Value value;
    value.type = VCONF_TYPE_BOOL;
    value.intValue = boolval ? 1 : 0;
    return WriteTyped(key, value);
}

int SetDbl(const char* key, const double dblval)
{
    Value value;
    value.type = VCONF_TYPE_DOUBLE;
    value.dblValue = dblval;
    return WriteTyped(key, value);
}

int SetStr(const char* key, const char* strval)
{
    if (!strval)
    {
        dlog_print(DLOG_ERROR, kLogTag, "no value for key %s", key ? key : "(null)");
        return VCONF_ERROR;
    }
    Value value;
    value.type = VCONF_TYPE_STRING;
    value.strValue = strval;
    return WriteTyped(key, value);
}

}  // namespace

// Every entry point below is guarded: no exception may reach a C caller.

extern "C" int vconf_get_int(const char* key, int* intval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return GetInt(key, intval); });
}

extern "C" int vconf_get_bool(const char* key, int* boolval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return GetBool(key, boolval); });
}

extern "C" int vconf_get_dbl(const char* key, double* dblval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return GetDbl(key, dblval); });
}

extern "C" char* vconf_get_str(const char* key)
{
    return GuardedCall(kLogTag, nullptr, [&] { return GetStr(key); });
}

extern "C" int vconf_set_int(const char* key, const int intval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return SetInt(key, intval); });
}

extern "C" int vconf_set_bool(const char* key, const int boolval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return SetBool(key, boolval); });
}

extern "C" int vconf_set_dbl(const char* key, const double dblval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return SetDbl(key, dblval); });
}

extern "C" int vconf_set_str(const char* key, const char* strval)
{
    return GuardedCall(kLogTag, VCONF_ERROR, [&] { return SetStr(key, strval); });
}

extern "C" int vconf_notify_key_changed(const char* key, vconf_callback_fn cb, void* user_data)
{
    return GuardedCall(kLogTag, VCONF_ERROR,
                       [&] { return platform::vconf::WatchRegistry::GetInstance().Add(key, cb, user_data); });
}

extern "C" int vconf_ignore_key_changed(const char* key, vconf_callback_fn cb)
{
    return GuardedCall(kLogTag, VCONF_ERROR,
                       [&] { return platform::vconf::WatchRegistry::GetInstance().Remove(key, cb); });
}

extern "C" char* vconf_keynode_get_name(keynode_t* keynode)
{
    return keynode ? &keynode->name[0] : nullptr;
}

extern "C" int vconf_keynode_get_type(keynode_t* keynode)
{
    return keynode ? keynode->value.type : -1;
}

extern "C" int vconf_keynode_get_int(keynode_t* keynode)
{
    return NodeHasType(keynode, VCONF_TYPE_INT) ? keynode->value.intValue : -1;
}

extern "C" int vconf_keynode_get_bool(keynode_t* keynode)
{
    return NodeHasType(keynode, VCONF_TYPE_BOOL) ? keynode->value.intValue : -1;
}

extern "C" double vconf_keynode_get_dbl(keynode_t* keynode)
{
    return NodeHasType(keynode, VCONF_TYPE_DOUBLE) ? keynode->value.dblValue : -1.0;
}

extern "C" char* vconf_keynode_get_str(keynode_t* keynode)
{
    return NodeHasType(keynode, VCONF_TYPE_STRING) ? &keynode->value.strValue[0] : nullptr;
}

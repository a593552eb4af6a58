// Ordered string maps and their base64 encoding.
#include "bundle.h"

#include <cstdlib>
#include <cstring>

#include "bundle/BundleInternal.h"
#include "core/ApiGuard.h"
#include "dlog.h"

namespace
{

int Fail(int error)
{
    set_last_result(error);
    return error;
}

keyval_t* FindMutable(bundle* b, const char* key)
{
    return const_cast<keyval_t*>(platform::BundleFind(b, key));
}

}  // namespace

extern "C" bundle* bundle_create(void)
{
    bundle* b = new (std::nothrow) _bundle_t();
    set_last_result(b ? BUNDLE_ERROR_NONE : BUNDLE_ERROR_OUT_OF_MEMORY);
    return b;
}

extern "C" int bundle_free(bundle* b)
{
    if (!b)
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    delete b;
    return Fail(BUNDLE_ERROR_NONE);
}

extern "C" int bundle_add_str(bundle* b, const char* key, const char* str)
{
    if (!b || !key || !*key || !str)
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    if (platform::BundleFind(b, key))
        return Fail(BUNDLE_ERROR_KEY_EXISTS);
    return platform::GuardedCall(
        "BUNDLE", BUNDLE_ERROR_OUT_OF_MEMORY,
        [&]
        {
            b->items.push_back(std::make_unique<keyval_t>(keyval_t{key, BUNDLE_TYPE_STR, str}));
            return Fail(BUNDLE_ERROR_NONE);
        });
}

extern "C" int bundle_get_str(bundle* b, const char* key, char** str)
{
    if (!b || !key || !str)
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    keyval_t* item = FindMutable(b, key);
    if (!item)
        return Fail(BUNDLE_ERROR_KEY_NOT_AVAILABLE);
    *str = &item->value[0];
    return Fail(BUNDLE_ERROR_NONE);
}

extern "C" int bundle_del(bundle* b, const char* key)
{
    if (!b || !key)
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    for (auto it = b->items.begin(); it != b->items.end(); ++it)
    {
        if ((*it)->key == key)
        {
            b->items.erase(it);
            return Fail(BUNDLE_ERROR_NONE);
        }
    }
    return Fail(BUNDLE_ERROR_KEY_NOT_AVAILABLE);
}

extern "C" int bundle_get_count(bundle* b)
{
    if (!b)
    {
        Fail(BUNDLE_ERROR_INVALID_PARAMETER);
        return 0;
    }
    Fail(BUNDLE_ERROR_NONE);
    return static_cast<int>(b->items.size());
}

extern "C" bundle* bundle_dup(bundle* b)
{
    if (!b)
    {
        Fail(BUNDLE_ERROR_INVALID_PARAMETER);
        return nullptr;
    }
    return platform::GuardedCall("BUNDLE", nullptr,
                                 [&]
                                 {
                                     auto copy = std::make_unique<_bundle_t>();
                                     for (const auto& item : b->items)
                                         copy->items.push_back(std::make_unique<keyval_t>(*item));
                                     Fail(BUNDLE_ERROR_NONE);
                                     return copy.release();
                                 });
}

extern "C" int bundle_encode(bundle* b, bundle_raw** raw, int* len)
{
    if (!b || !raw || !len)
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    if (b->items.size() > platform::kMaxBundleEntries)
    {
        dlog_print(DLOG_ERROR, "BUNDLE", "cannot encode %zu entries (at most %zu)", b->items.size(),
                   platform::kMaxBundleEntries);
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    }
    std::string text = platform::Base64Encode(platform::BundleToBinary(b));
    char* copy = static_cast<char*>(malloc(text.size() + 1));
    if (!copy)
        return Fail(BUNDLE_ERROR_OUT_OF_MEMORY);
    memcpy(copy, text.c_str(), text.size() + 1);
    *raw = reinterpret_cast<bundle_raw*>(copy);
    *len = static_cast<int>(text.size());
    return Fail(BUNDLE_ERROR_NONE);
}

extern "C" bundle* bundle_decode(const bundle_raw* raw, const int len)
{
    std::string binary;
    bundle* b = nullptr;
    if (raw && len > 0 &&
        platform::Base64Decode(reinterpret_cast<const char*>(raw), static_cast<size_t>(len), binary))
        b = platform::BundleFromBinary(binary);
    if (!b)
    {
        dlog_print(DLOG_ERROR, "BUNDLE", "rejected a malformed encoding of %d bytes", len);
        Fail(BUNDLE_ERROR_INVALID_PARAMETER);
        return nullptr;
    }
    Fail(BUNDLE_ERROR_NONE);
    return b;
}

extern "C" void bundle_foreach(bundle* b, bundle_iterator_t iter, void* userData)
{
    if (!b || !iter)
    {
        Fail(BUNDLE_ERROR_INVALID_PARAMETER);
        return;
    }
    // A snapshot, so that a callback that edits the bundle cannot pull an
    // entry out from under the loop.
    _bundle_t snapshot;
    for (const auto& item : b->items) snapshot.items.push_back(std::make_unique<keyval_t>(*item));
    for (const auto& item : snapshot.items) iter(item->key.c_str(), item->type, item.get(), userData);
    Fail(BUNDLE_ERROR_NONE);
}

extern "C" int bundle_keyval_get_type(bundle_keyval_t* kv)
{
    if (!kv)
    {
        Fail(BUNDLE_ERROR_INVALID_PARAMETER);
        return BUNDLE_TYPE_NONE;
    }
    return kv->type;
}

extern "C" int bundle_keyval_get_basic_val(bundle_keyval_t* kv, void** val, size_t* size)
{
    if (!kv || !val)
        return Fail(BUNDLE_ERROR_INVALID_PARAMETER);
    *val = &kv->value[0];
    if (size)
        *size = kv->value.size() + 1;
    return Fail(BUNDLE_ERROR_NONE);
}

extern "C" void bundle_iterate(bundle* b, bundle_iterate_cb_t callback, void* cbData)
{
    if (!b || !callback)
    {
        Fail(BUNDLE_ERROR_INVALID_PARAMETER);
        return;
    }
    std::vector<keyval_t> snapshot;
    for (const auto& item : b->items) snapshot.push_back(*item);
    for (const keyval_t& item : snapshot)
        if (item.type == BUNDLE_TYPE_STR)
            callback(item.key.c_str(), item.value.c_str(), cbData);
    Fail(BUNDLE_ERROR_NONE);
}

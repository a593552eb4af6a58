#ifndef PLATFORM_BUNDLE_H
#define PLATFORM_BUNDLE_H

#include <stddef.h>
#include "tizen_error.h"

#ifdef __cplusplus
extern "C"
{
#endif

    typedef struct _bundle_t bundle;
    typedef unsigned char bundle_raw;
    typedef struct keyval_t bundle_keyval_t;

    typedef enum
    {
        BUNDLE_ERROR_NONE = TIZEN_ERROR_NONE,
        BUNDLE_ERROR_OUT_OF_MEMORY = TIZEN_ERROR_OUT_OF_MEMORY,
        BUNDLE_ERROR_INVALID_PARAMETER = TIZEN_ERROR_INVALID_PARAMETER,
        BUNDLE_ERROR_KEY_NOT_AVAILABLE = TIZEN_ERROR_KEY_NOT_AVAILABLE,
        BUNDLE_ERROR_KEY_EXISTS = TIZEN_ERROR_BUNDLE | 0x01,
    } bundle_error_e;

    typedef enum
    {
        BUNDLE_TYPE_NONE = -1,
        BUNDLE_TYPE_ANY = 0,
        BUNDLE_TYPE_STR = 0x0401,
        BUNDLE_TYPE_STR_ARRAY = 0x0501,
        BUNDLE_TYPE_BYTE = 2,
        BUNDLE_TYPE_BYTE_ARRAY = 0x0102,
    } bundle_type_e;

    /* An ordered map of string keys. Its encoding is versioned and
     * length-prefixed; bundle_decode rejects malformed or truncated input. */
    bundle* bundle_create(void);
    int bundle_free(bundle* b);
    int bundle_add_str(bundle* b, const char* key, const char* str);
    int bundle_get_str(bundle* b, const char* key, char** str); /* owned by the bundle */
    int bundle_del(bundle* b, const char* key);
    int bundle_get_count(bundle* b);
    bundle* bundle_dup(bundle* b);
    int bundle_encode(bundle* b, bundle_raw** raw, int* len); /* free(*raw) */
    bundle* bundle_decode(const bundle_raw* raw, const int len);

    typedef void (*bundle_iterator_t)(const char* key, const int type, const bundle_keyval_t* kv,
                                      void* user_data);
    void bundle_foreach(bundle* b, bundle_iterator_t iter, void* user_data);
    int bundle_keyval_get_type(bundle_keyval_t* kv);
    int bundle_keyval_get_basic_val(bundle_keyval_t* kv, void** val, size_t* size);
    typedef void (*bundle_iterate_cb_t)(const char* key, const char* val, void* data);
    void bundle_iterate(bundle* b, bundle_iterate_cb_t callback, void* cb_data);

#ifdef __cplusplus
}
#endif

#endif

#ifndef PLATFORM_VCONF_H
#define PLATFORM_VCONF_H

#include "vconf-keys.h"

#ifdef __cplusplus
extern "C"
{
#endif

#define VCONF_OK 0
#define VCONF_ERROR -1

    enum
    {
        VCONF_TYPE_NONE = 0,
        VCONF_TYPE_STRING = 40,
        VCONF_TYPE_INT = 41,
        VCONF_TYPE_DOUBLE = 42,
        VCONF_TYPE_BOOL = 43,
        VCONF_TYPE_DIR = 44,
    };

    typedef struct _keynode_t keynode_t;
    typedef void (*vconf_callback_fn)(keynode_t* node, void* user_data);

    /* System keys are files under <root>/vconf/<key>; writes are atomic and
     * change callbacks run on the Ecore main loop of the watching process. */
    int vconf_get_int(const char* key, int* intval);
    int vconf_get_bool(const char* key, int* boolval);
    int vconf_get_dbl(const char* key, double* dblval);
    char* vconf_get_str(const char* key); /* malloc'd, free(); NULL on error */
    int vconf_set_int(const char* key, const int intval);
    int vconf_set_bool(const char* key, const int boolval);
    int vconf_set_dbl(const char* key, const double dblval);
    int vconf_set_str(const char* key, const char* strval);
    int vconf_notify_key_changed(const char* key, vconf_callback_fn cb, void* user_data);
    int vconf_ignore_key_changed(const char* key, vconf_callback_fn cb);

    char* vconf_keynode_get_name(keynode_t* keynode);
    int vconf_keynode_get_type(keynode_t* keynode);
    int vconf_keynode_get_int(keynode_t* keynode);
    int vconf_keynode_get_bool(keynode_t* keynode);
    double vconf_keynode_get_dbl(keynode_t* keynode);
    char* vconf_keynode_get_str(keynode_t* keynode); /* don't free */

#ifdef __cplusplus
}
#endif

#endif

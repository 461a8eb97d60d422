#pragma once
// The platform's key-value settings store. Keys are paths such as "db/zel/salescode"; a key below
// "memory/" is lost when the phone restarts. Every function returns 0 on success and a negative number on
// failure; a key of another type than asked for is a failure.

#ifdef __cplusplus
extern "C" {
#endif

int vconf_get_int(const char *key, int *value);
int vconf_get_bool(const char *key, int *value);
// The value as a new string that the caller releases with free(3); null on failure.
char *vconf_get_str(const char *key);

int vconf_set_int(const char *key, int value);
int vconf_set_bool(const char *key, int value);
int vconf_set_str(const char *key, const char *value);

#ifdef __cplusplus
}
#endif

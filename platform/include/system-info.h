#pragma once
// What the platform tells about itself.

#ifdef __cplusplus
extern "C" {
#endif

enum {
    SYSTEM_INFO_MODEL = 0,
    SYSTEM_INFO_PLATFORM_VERSION = 1,
    SYSTEM_INFO_BUILD_VERSION = 7,
};

// Gives the text of a key as a new string that the caller releases with free(3). Returns 0 on success; on
// failure a negative number, and *value is left as it was.
int system_info_get_value_string(int key, char **value);

#ifdef __cplusplus
}
#endif

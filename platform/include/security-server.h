#pragma once
// The security server's file labels.

#ifdef __cplusplus
extern "C" {
#endif

// Gives the file or folder at a phone path an access label, such as "*" or "zel-manager".
// Returns 0 on success and a negative number on failure.
int security_server_label_access(const char *path, const char *label);

#ifdef __cplusplus
}
#endif

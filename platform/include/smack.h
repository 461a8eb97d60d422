#pragma once
// Reading the security label of a file.

#ifdef __cplusplus
extern "C" {
#endif

// Gives the access label of the file or folder at a phone path as a new string that the caller releases
// with free(3). Returns 0 on success; on failure, also when the file has no label, a negative number and
// *label is left as it was. A symbolic link is not followed.
int smack_lgetlabel(const char *path, char **label);

#ifdef __cplusplus
}
#endif

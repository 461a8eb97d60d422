#pragma once
// The platform's opener for its SQLite databases.

#include <sqlite3.h>

#ifdef __cplusplus
extern "C" {
#endif

// Opens the existing database at a phone path for reading and writing; never creates one. `option` is 0.
// Returns SQLITE_OK and a handle that db_util_close() releases, or another SQLite result and a null handle.
int db_util_open(const char *path, sqlite3 **database, int option);
int db_util_close(sqlite3 *database);

#ifdef __cplusplus
}
#endif

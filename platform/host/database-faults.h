#pragma once
// Faults and journal entries for statements on a database that the phone opened. The library calls SQLite
// itself, so they are brought about through the connection:
//
//     sqlite3_prepare_v2   every statement of one opened connection; the text is the database's path
//     sqlite3_bind_text    every text of two bytes and more, likewise
//     sqlite3_step         one run of one statement; the text is a part of its SQL, as it was prepared
//     disk_full            the database cannot take another page; the text is its path
//
// Only faults that are set when the connection is opened are met.

#include "phone.h"

#include <sqlite3.h>

namespace zel_host {

void watch_database(Phone &phone, sqlite3 *database, const char *path);

} // namespace zel_host

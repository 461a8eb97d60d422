#include "call.h"
#include "database-faults.h"

#include <db-util.h>
#include <sys/stat.h>

namespace zel_host {
namespace {

int open_database(Phone &phone, const char *path, sqlite3 **database) {
    if (path == nullptr || database == nullptr) return SQLITE_MISUSE;
    *database = nullptr;
    const Place place = resolve(phone.folder(), path, Follow::Last);
    struct stat status {};
    if (!place.file || ::fstat(place.file.get(), &status) != 0 || !S_ISREG(status.st_mode)) return SQLITE_CANTOPEN;
    // SQLite names its journals after the database, so it needs the real path; it follows no link from there.
    const std::string file = real_path(place.file.get());
    const int result = sqlite3_open_v2(file.c_str(), database, SQLITE_OPEN_READWRITE | SQLITE_OPEN_NOFOLLOW, nullptr);
    if (result == SQLITE_OK) {
        // Large statements must not make files in the workstation's temporary folder, and a bench phone need
        // not survive the workstation's power: without flushes a run takes the library's time, not the disk's.
        sqlite3_exec(*database, "PRAGMA temp_store=MEMORY; PRAGMA synchronous=OFF", nullptr, nullptr, nullptr);
        watch_database(phone, *database, path);
        return SQLITE_OK;
    }
    sqlite3_close(*database);
    *database = nullptr;
    return result;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int db_util_open(const char *path, sqlite3 **database, int option) {
    if (database != nullptr) *database = nullptr;
    return answer<function("db_util_open")>([&](Phone &phone) { return open_database(phone, path, database); }, path,
                                            option);
}

ZEL_HOST_EXPORT int db_util_close(sqlite3 *database) {
    // Closed also when the call is told to fail: its caller has no second way to give the connection back.
    const int result = sqlite3_close(database);
    return answer<function("db_util_close")>([&](Phone &) { return result; });
}

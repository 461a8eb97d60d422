#include "database-faults.h"

#include "fault.h"
#include "journal.h"

#include <exception>

namespace zel_host {
namespace {

constexpr std::size_t kStep = function("sqlite3_step");

bool strikes(Phone &phone, std::size_t row, const char *text) {
    return any_faults(phone) && matching_fault(phone, kFunctions[row], text) != nullptr;
}

bool journals(Phone &phone) { return phone.page().journal_on.load(std::memory_order_relaxed) != 0; }

void meet_statement(Phone &phone, sqlite3_stmt *statement) {
    const char *sql = sqlite3_sql(statement);
    if (sql == nullptr) return;
    if (journals(phone)) journal(phone, kFunctions[kStep], {Value(sql)});
    if (strikes(phone, kStep, sql)) sqlite3_interrupt(sqlite3_db_handle(statement));
}

// SQLite reports each statement as it starts to run; an interrupt then stops it before its first row.
int on_statement(unsigned /*event*/, void *phone, void *statement, void * /*sql*/) {
    try {
        meet_statement(*static_cast<Phone *>(phone), static_cast<sqlite3_stmt *>(statement));
    } catch (const std::exception &) {
        return 0; // SQLite could not take it, and the bench phone's own trouble is no fault
    }
    return 0;
}

} // namespace

void watch_database(Phone &phone, sqlite3 *database, const char *path) {
    if (!any_faults(phone) && !journals(phone)) return;
    // The limits below would also stop SQLite from reading the tables' definitions later.
    sqlite3_exec(database, "SELECT 1 FROM sqlite_master", nullptr, nullptr, nullptr);
    if (strikes(phone, function("disk_full"), path))
        sqlite3_exec(database, "PRAGMA max_page_count=1", nullptr, nullptr, nullptr);
    if (strikes(phone, function("sqlite3_bind_text"), path)) sqlite3_limit(database, SQLITE_LIMIT_LENGTH, 1);
    if (strikes(phone, function("sqlite3_prepare_v2"), path)) sqlite3_limit(database, SQLITE_LIMIT_SQL_LENGTH, 1);
    sqlite3_trace_v2(database, SQLITE_TRACE_STMT, on_statement, &phone);
}

} // namespace zel_host

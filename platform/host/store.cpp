#include "store.h"

#include <algorithm>
#include <pthread.h>
#include <utility>
#include <vector>

namespace zel_host {
namespace {

constexpr int kBusyWaitMs = 10000;

// Never destroyed: the process's own phone closes its store when the program's statics end, after this list would have.
std::vector<Store *> &stores() {
    static auto *const all = new std::vector<Store *>;
    return *all;
}

void close_before_fork() {
    for (Store *store : stores())
        store->close();
}

void watch_forks() {
    static const bool watched = ::pthread_atfork(close_before_fork, nullptr, nullptr) == 0;
    static_cast<void>(watched);
}

} // namespace

Query::Query(Query &&other) noexcept
    : database_(other.database_), statement_(std::exchange(other.statement_, nullptr)), next_(other.next_) {}

Query::~Query() {
    if (statement_ == nullptr) return;
    sqlite3_reset(statement_);
    sqlite3_clear_bindings(statement_);
}

void Query::fail() const { throw StoreError(std::string("state: ") + sqlite3_errmsg(database_)); }

Query &Query::bind(std::string_view text) {
    // A view without bytes may have no address, which SQLite would take for null.
    const char *bytes = text.empty() ? "" : text.data();
    if (sqlite3_bind_text(statement_, next_++, bytes, static_cast<int>(text.size()), SQLITE_STATIC) != SQLITE_OK)
        fail();
    return *this;
}

Query &Query::bind(std::int64_t number) {
    if (sqlite3_bind_int64(statement_, next_++, number) != SQLITE_OK) fail();
    return *this;
}

Query &Query::bind_null() {
    if (sqlite3_bind_null(statement_, next_++) != SQLITE_OK) fail();
    return *this;
}

bool Query::row() {
    const int result = sqlite3_step(statement_);
    if (result != SQLITE_ROW && result != SQLITE_DONE) fail();
    return result == SQLITE_ROW;
}

void Query::run() {
    while (row()) {
    }
}

std::string_view Query::view(int column) const {
    const auto *bytes = static_cast<const char *>(sqlite3_column_blob(statement_, column));
    const int size = sqlite3_column_bytes(statement_, column);
    return bytes == nullptr ? std::string_view() : std::string_view(bytes, static_cast<std::size_t>(size));
}

Store::Store(std::string file) : file_(std::move(file)) {
    watch_forks();
    stores().push_back(this);
}

Store::~Store() {
    close();
    std::erase(stores(), this);
}

void Store::close() {
    for (const auto &[sql, statement] : statements_)
        sqlite3_finalize(statement);
    statements_.clear();
    sqlite3_close(std::exchange(database_, nullptr));
}

sqlite3 *Store::database() {
    if (database_ != nullptr) return database_;
    const int flags = SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE | SQLITE_OPEN_NOFOLLOW;
    if (sqlite3_open_v2(file_.c_str(), &database_, flags, nullptr) != SQLITE_OK) {
        const std::string reason = sqlite3_errmsg(database_);
        close();
        throw StoreError("cannot open '" + file_ + "': " + reason);
    }
    sqlite3_busy_timeout(database_, kBusyWaitMs);
    execute("PRAGMA synchronous=OFF; PRAGMA journal_mode=WAL; PRAGMA temp_store=MEMORY");
    return database_;
}

void Store::execute(const char *sql) {
    sqlite3 *connection = database();
    if (sqlite3_exec(connection, sql, nullptr, nullptr, nullptr) != SQLITE_OK)
        throw StoreError(std::string("state: ") + sqlite3_errmsg(connection));
}

Query Store::query(const char *sql) {
    sqlite3 *connection = database();
    sqlite3_stmt *&statement = statements_[sql];
    if (statement == nullptr &&
        sqlite3_prepare_v3(connection, sql, -1, SQLITE_PREPARE_PERSISTENT, &statement, nullptr) != SQLITE_OK)
        throw StoreError(std::string("state: ") + sqlite3_errmsg(connection));
    return {connection, statement};
}

Transaction::~Transaction() {
    if (!open_) return;
    try {
        store_.execute("ROLLBACK");
    } catch (const StoreError &) {
        // SQLite has rolled back by itself after some failures.
    }
}

void Transaction::commit() {
    store_.execute("COMMIT");
    open_ = false;
}

} // namespace zel_host

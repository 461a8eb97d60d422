#include "zel-svc-network-database.h"

#include "base/zel-svc-decimal.h"
#include "spec/zel-svc-parse-context.h"

#include <db-util.h>
#include <limits>

namespace {

sqlite3 *open_current() {
    if (ZEL_SVC_NETWORK_DB_PATH[0] == '\0') return nullptr;
    sqlite3 *database = nullptr;
    if (db_util_open(ZEL_SVC_NETWORK_DB_PATH, &database, 0) == SQLITE_OK) return database;
    // SQLite's own opener leaves a handle behind a failure, and so may one built on it.
    if (database) db_util_close(database);
    return nullptr;
}

} // namespace

void NetworkStatement::Finalize::operator()(sqlite3_stmt *statement) const { sqlite3_finalize(statement); }
void NetworkDatabase::Close::operator()(sqlite3 *database) const { db_util_close(database); }

bool NetworkStatement::note(int result) {
    if (result != SQLITE_OK) bound_ = false;
    return result == SQLITE_OK;
}

int NetworkStatement::bind_result(int parameter, std::int32_t value) {
    return sqlite3_bind_int(statement_.get(), parameter, value);
}

int NetworkStatement::bind_result(int parameter, std::string_view text) {
    // An empty view may have no address, which SQLite would take for a null.
    const char *bytes = text.empty() ? "" : text.data();
    return sqlite3_bind_text(statement_.get(), parameter, bytes, static_cast<int>(text.size()), SQLITE_TRANSIENT);
}

int NetworkStatement::bind_result(int parameter, std::nullptr_t /*null*/) {
    return sqlite3_bind_null(statement_.get(), parameter);
}

NetworkStep NetworkStatement::step() {
    if (!statement_ || !bound_) return NetworkStep::Failed;
    switch (sqlite3_step(statement_.get())) {
    case SQLITE_ROW:
        return NetworkStep::Row;
    case SQLITE_DONE:
        return NetworkStep::Done;
    default:
        return NetworkStep::Failed;
    }
}

// Read as a text: the integer reading would cut a number of 64 bits to some other one. A column may hold a
// fraction or a large number with an exponent.
std::int32_t NetworkStatement::integer(int column) const {
    const std::string_view number = text(column);
    if (number == "Inf") return std::numeric_limits<std::int32_t>::max();
    if (number == "-Inf") return std::numeric_limits<std::int32_t>::min();
    return zel_svc_whole_from_text(number);
}

std::string_view NetworkStatement::text(int column) const {
    const unsigned char *bytes = sqlite3_column_text(statement_.get(), column);
    return bytes ? std::string_view{reinterpret_cast<const char *>(bytes)} : std::string_view{};
}

std::optional<std::int32_t> zel_svc_network_id_after(std::int32_t last) {
    if (last == std::numeric_limits<std::int32_t>::max()) return std::nullopt;
    return last + 1;
}

NetworkDatabase::NetworkDatabase() : database_(open_current()) {}

NetworkStatement NetworkDatabase::prepare(const char *sql) {
    sqlite3_stmt *statement = nullptr;
    if (!database_ || sqlite3_prepare_v2(database_.get(), sql, -1, &statement, nullptr) != SQLITE_OK) return {};
    return NetworkStatement{statement};
}

#include "summary-parts.h"

#include <db-util.h>
#include <spec/zel-svc-parse-context.h>

#include <array>

namespace zel_command {
namespace {

struct CloseDatabase {
    void operator()(sqlite3 *database) const { db_util_close(database); }
};
using Database = std::unique_ptr<sqlite3, CloseDatabase>;

struct Finalize {
    void operator()(sqlite3_stmt *statement) const { sqlite3_finalize(statement); }
};
using Statement = std::unique_ptr<sqlite3_stmt, Finalize>;

constexpr std::array kDatabases{ZEL_SVC_NETWORK_DB_PATH_SIM1, ZEL_SVC_NETWORK_DB_PATH_SIM2};

constexpr const char *kNetworks = "select network_info_id, network_name, mccmnc from network_info "
                                  "order by network_info_id";
constexpr const char *kProfiles = "select profile_name, apn, svc_category_id, default_internet_con from pdp_profile "
                                  "where network_info_id=? order by profile_id";

Database open_database(const char *path) {
    sqlite3 *raw = nullptr;
    if (db_util_open(path, &raw, 0) != SQLITE_OK) return nullptr;
    Database database{raw};
    sqlite3_exec(raw, "pragma query_only=1", nullptr, nullptr, nullptr);
    return database;
}

Statement prepare(const Database &database, const char *text) {
    sqlite3_stmt *statement = nullptr;
    sqlite3_prepare_v2(database.get(), text, -1, &statement, nullptr);
    return Statement{statement};
}

std::string column_text(const Statement &statement, int column) {
    const void *bytes = sqlite3_column_blob(statement.get(), column);
    const auto size = static_cast<std::size_t>(sqlite3_column_bytes(statement.get(), column));
    return bytes == nullptr ? std::string{} : std::string{static_cast<const char *>(bytes), size};
}

// The services that the platform's telephony numbers; a profile of no known service is the browser's.
const char *service_name(int category) {
    switch (category) {
    case 0:
        return "IMS";
    case 1:
        return "internet";
    case 2:
        return "MMS";
    case 5:
        return "tethering";
    case 6:
        return "emergency call";
    case 7:
        return "XCAP";
    default:
        return "other";
    }
}

Json profiles_of(const Database &database, int network) {
    Json result = Json::array();
    const Statement statement = prepare(database, kProfiles);
    if (!statement) return result;
    sqlite3_bind_int(statement.get(), 1, network);
    while (sqlite3_step(statement.get()) == SQLITE_ROW) {
        Json &profile = result.emplace_back(Json::object());
        put_text(profile, "name", column_text(statement, 0));
        put_text(profile, "apn", column_text(statement, 1));
        profile["service"] = service_name(sqlite3_column_int(statement.get(), 2));
        profile["default"] = sqlite3_column_int(statement.get(), 3) == 1;
    }
    return result;
}

Json networks_of(const Database &database) {
    Json result = Json::array();
    const Statement statement = prepare(database, kNetworks);
    while (statement && sqlite3_step(statement.get()) == SQLITE_ROW) {
        const int id = sqlite3_column_int(statement.get(), 0);
        Json &network = result.emplace_back(Json::object());
        network["id"] = id;
        put_text(network, "name", column_text(statement, 1));
        put_text(network, "mccmnc", column_text(statement, 2));
        network["profiles"] = profiles_of(database, id);
    }
    return result;
}

} // namespace

Json summary_networks() {
    Json result = Json::array();
    for (std::size_t i = 0; i < kDatabases.size(); ++i) {
        const Database database = open_database(kDatabases[i]);
        if (!database) continue;
        result.push_back({{"sim", i + 1}, {"database", kDatabases[i]}, {"networks", networks_of(database)}});
    }
    return result;
}

} // namespace zel_command

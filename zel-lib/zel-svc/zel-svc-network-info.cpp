#include "zel-svc-network-info.h"

#include "zel-svc-network-database.h"

#include <optional>

namespace {

constexpr const char *kFindByName = "select network_info_id from network_info where network_name=? and mccmnc=?";
constexpr const char *kFindByMccMnc = "select network_info_id from network_info where mccmnc=?";
constexpr const char *kMaximum = "select max(network_info_id) from network_info";
constexpr const char *kInsert = "insert into network_info( network_info_id, network_name, mccmnc ) values( ?, ?, ? )";
constexpr const char *kRename = "update network_info set network_name=? where network_info_id=?";
constexpr const char *kCount = "select count(*) from network_info where mccmnc=?";

// The id in the first row, 0 without a row; nothing when that cannot be told: taken for "no row", a locked
// database would grow a second row for the same network.
std::optional<std::int32_t> first_id(NetworkStatement select) {
    switch (select.step()) {
    case NetworkStep::Row:
        return select.integer(0);
    case NetworkStep::Done:
        return 0;
    case NetworkStep::Failed:
        break;
    }
    return std::nullopt;
}

std::optional<std::int32_t> find_by_name(NetworkDatabase &database, const char *name, const char *mccmnc) {
    NetworkStatement select = database.prepare(kFindByName);
    if (!select || !select.bind(1, name) || !select.bind(2, mccmnc)) return std::nullopt;
    return first_id(std::move(select));
}

std::optional<std::int32_t> find_by_mccmnc(NetworkDatabase &database, const char *mccmnc) {
    NetworkStatement select = database.prepare(kFindByMccMnc);
    if (!select || !select.bind(1, mccmnc)) return std::nullopt;
    return first_id(std::move(select));
}

bool insert(NetworkDatabase &database, std::int32_t id, const char *name, const char *mccmnc) {
    return database.run(kInsert, id, std::string_view{name}, std::string_view{mccmnc});
}

// A new row of the next id. `unused` is the id that the look-up left: it names no network.
std::optional<std::int32_t> create(NetworkDatabase &database, std::int32_t unused, const char *name,
                                   const char *mccmnc) {
    NetworkStatement maximum = database.prepare(kMaximum);
    if (!maximum) {
        // The row is written all the same, under the id at hand, but nobody may use it.
        insert(database, unused, name, mccmnc);
        return std::nullopt;
    }
    const auto last = first_id(std::move(maximum));
    const auto id = last ? zel_svc_network_id_after(*last) : std::nullopt;
    if (!id || !insert(database, *id, name, mccmnc)) return std::nullopt;
    return id;
}

std::optional<std::int32_t> find_or_create(NetworkDatabase &database, const char *name, const char *mccmnc) {
    const auto found = find_by_mccmnc(database, mccmnc);
    if (!found) return std::nullopt;
    if (*found < 1) return create(database, *found, name, mccmnc);
    // The network takes the name of the latest spec that mentions its MCC+MNC.
    if (!database.run(kRename, std::string_view{name}, *found)) return std::nullopt;
    return found;
}

} // namespace

int __zel_svc_network_info_get_id(const char *network_name, const char *mccmnc, int create, std::int32_t *id) {
    if (!network_name || !mccmnc || !id) return 0;
    NetworkDatabase database;
    const auto found =
        create == 1 ? find_or_create(database, network_name, mccmnc) : find_by_name(database, network_name, mccmnc);
    *id = found.value_or(0);
    return found ? 1 : 0;
}

int __zel_svc_network_info_delete_all() {
    NetworkDatabase database;
    return database.run("delete from network_info") ? 1 : 0;
}

int __zel_svc_network_info_count(const char *mccmnc, std::int32_t *count) {
    if (!mccmnc || !count) return 0;
    *count = 0;
    NetworkDatabase database;
    NetworkStatement select = database.prepare(kCount);
    if (!select) return 0;
    if (select.bind(1, std::string_view{mccmnc}) && select.step() == NetworkStep::Row) *count = select.integer(0);
    return 1;
}

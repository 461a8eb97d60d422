#include "keys.h"

namespace zel_host {
namespace {

KeyValue read(const Query &query, int first) {
    const auto type = static_cast<KeyType>(query.integer(first));
    if (type == KeyType::Text) return {.type = type, .text = query.text(first + 1)};
    return {.type = type, .number = query.integer(first + 1)};
}

} // namespace

std::optional<KeyValue> get_key(Phone &phone, std::string_view key) {
    Query query = phone.store().query("SELECT type, value FROM vconf WHERE key = ?");
    if (!query.bind(key).row()) return std::nullopt;
    return read(query, 0);
}

void set_key(Phone &phone, std::string_view key, KeyType type, std::int64_t number) {
    Query query = phone.store().query("INSERT OR REPLACE INTO vconf (key, type, value) VALUES (?, ?, ?)");
    query.bind(key).bind(static_cast<std::int64_t>(type)).bind(number).run();
}

void set_key(Phone &phone, std::string_view key, std::string_view text) {
    Query query = phone.store().query("INSERT OR REPLACE INTO vconf (key, type, value) VALUES (?, ?, ?)");
    query.bind(key).bind(static_cast<std::int64_t>(KeyType::Text)).bind(text).run();
}

bool unset_key(Phone &phone, std::string_view key) {
    Query query = phone.store().query("DELETE FROM vconf WHERE key = ? RETURNING 1");
    const bool existed = query.bind(key).row();
    if (existed) query.run();
    return existed;
}

void unset_keys(Phone &phone, std::string_view prefix) {
    phone.store().query("DELETE FROM vconf WHERE substr(key, 1, length(?1)) = ?1").bind(prefix).run();
}

void each_key(Phone &phone, std::string_view prefix,
              const std::function<void(std::string_view key, const KeyValue &value)> &use) {
    Query query =
        phone.store().query("SELECT key, type, value FROM vconf WHERE substr(key, 1, length(?1)) = ?1 ORDER BY key");
    query.bind(prefix);
    while (query.row())
        use(query.view(0), read(query, 1));
}

} // namespace zel_host

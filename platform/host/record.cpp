#include "record.h"

namespace zel_host {

void record(Phone &phone, std::string_view name, std::int64_t number) {
    Query query = phone.store().query("INSERT OR REPLACE INTO record (name, value) VALUES (?, ?)");
    query.bind(name).bind(number).run();
}

void record(Phone &phone, std::string_view name, std::string_view text) {
    Query query = phone.store().query("INSERT OR REPLACE INTO record (name, value) VALUES (?, ?)");
    query.bind(name).bind(text).run();
}

std::int64_t recorded_number(Phone &phone, std::string_view name, std::int64_t otherwise) {
    Query query = phone.store().query("SELECT value FROM record WHERE name = ?");
    return query.bind(name).row() ? query.integer(0) : otherwise;
}

std::string recorded_text(Phone &phone, std::string_view name) {
    Query query = phone.store().query("SELECT value FROM record WHERE name = ?");
    return query.bind(name).row() ? query.text(0) : std::string();
}

} // namespace zel_host

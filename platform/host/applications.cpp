#include "applications.h"

namespace zel_host {
namespace {

Application read(const Query &query) {
    return {.name = query.text(0), .type = query.text(1), .state = query.text(2), .refusal = query.text(3)};
}

} // namespace

Application application(Phone &phone, std::string_view name) {
    Query query = phone.store().query("SELECT name, type, state, refusal FROM application WHERE name = ?");
    if (query.bind(name).row()) return read(query);
    return {.name = std::string(name), .type = {}, .state = {}, .refusal = {}};
}

void keep_application(Phone &phone, const Application &application) {
    Query query =
        phone.store().query("INSERT OR REPLACE INTO application (name, type, state, refusal) VALUES (?, ?, ?, ?)");
    query.bind(application.name).bind(application.type).bind(application.state).bind(application.refusal).run();
}

void each_application(Phone &phone, const std::function<void(const Application &application)> &use) {
    Query query = phone.store().query("SELECT name, type, state, refusal FROM application ORDER BY name");
    while (query.row())
        use(read(query));
}

} // namespace zel_host

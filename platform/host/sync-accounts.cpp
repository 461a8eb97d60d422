#include "sync-accounts.h"

namespace zel_host {
namespace {

std::optional<std::string> text_or_none(const Query &query, int column) {
    return query.null(column) ? std::nullopt : std::optional<std::string>(query.text(column));
}

void bind(Query &query, const std::optional<std::string> &text) {
    if (text)
        query.bind(*text);
    else
        query.bind_null();
}

std::vector<SyncService> services_of(Phone &phone, std::int64_t account) {
    Query query = phone.store().query("SELECT type, enabled, source, name, database_id, password FROM sync_service "
                                      "WHERE account = ? ORDER BY type");
    query.bind(account);
    std::vector<SyncService> services;
    while (query.row())
        services.push_back({.type = query.integer(0),
                            .enabled = query.integer(1) != 0,
                            .source = query.integer(2),
                            .name = text_or_none(query, 3),
                            .id = text_or_none(query, 4),
                            .password = text_or_none(query, 5)});
    return services;
}

void add_service(Phone &phone, std::int64_t account, const SyncService &service) {
    Query query = phone.store().query("INSERT INTO sync_service (account, type, enabled, source, name, database_id, "
                                      "password) VALUES (?, ?, ?, ?, ?, ?, ?)");
    query.bind(account).bind(service.type).bind(std::int64_t{service.enabled}).bind(service.source);
    bind(query, service.name);
    bind(query, service.id);
    bind(query, service.password);
    query.run();
}

} // namespace

std::vector<SyncAccount> sync_accounts(Phone &phone) {
    Query query = phone.store().query("SELECT id, attribute, name, address, user_id, password, sync_mode, sync_type, "
                                      "sync_interval FROM sync_account ORDER BY id");
    std::vector<SyncAccount> accounts;
    while (query.row())
        accounts.push_back({.id = query.integer(0),
                            .attribute = query.integer(1),
                            .name = query.text(2),
                            .address = query.text(3),
                            .user_id = query.text(4),
                            .password = query.text(5),
                            .sync_mode = query.integer(6),
                            .sync_type = query.integer(7),
                            .sync_interval = query.integer(8),
                            .services = services_of(phone, query.integer(0))});
    return accounts;
}

std::int64_t add_sync_account(Phone &phone, const SyncAccount &account) {
    Transaction transaction(phone.store());
    Query query = phone.store().query("INSERT INTO sync_account (attribute, name, address, user_id, password, "
                                      "sync_mode, sync_type, sync_interval) VALUES (?, ?, ?, ?, ?, ?, ?, ?) "
                                      "RETURNING id");
    query.bind(account.attribute).bind(account.name).bind(account.address).bind(account.user_id);
    query.bind(account.password).bind(account.sync_mode).bind(account.sync_type).bind(account.sync_interval).row();
    const std::int64_t id = query.integer(0);
    query.run();
    for (const SyncService &service : account.services)
        add_service(phone, id, service);
    transaction.commit();
    return id;
}

bool remove_sync_account(Phone &phone, std::int64_t id) {
    Transaction transaction(phone.store());
    phone.store().query("DELETE FROM sync_service WHERE account = ?").bind(id).run();
    Query query = phone.store().query("DELETE FROM sync_account WHERE id = ? RETURNING 1");
    const bool existed = query.bind(id).row();
    if (existed) query.run();
    transaction.commit();
    return existed;
}

void clear_sync_accounts(Phone &phone) { phone.store().execute("DELETE FROM sync_service; DELETE FROM sync_account"); }

} // namespace zel_host

#include "zel-svc-data-sync-account.h"

#include "zel-svc-sync-agent.h"

namespace {

constexpr int kContacts = 0; // types of services
constexpr int kCalendar = 1;
constexpr int kProfileAttribute = 1;

// The texts of one service within an account.
struct Texts {
    FixedText<20> DataSyncAccount::*enabled;
    FixedText<200> DataSyncAccount::*name;
    FixedText<200> DataSyncAccount::*id;
    FixedText<200> DataSyncAccount::*password;
};
constexpr Texts kContactTexts{&DataSyncAccount::contacts_enabled, &DataSyncAccount::contacts_name,
                              &DataSyncAccount::contacts_id, &DataSyncAccount::contacts_password};
constexpr Texts kCalendarTexts{&DataSyncAccount::calendar_enabled, &DataSyncAccount::calendar_name,
                               &DataSyncAccount::calendar_id, &DataSyncAccount::calendar_password};

// An empty text is an absent one for the agent.
const char *text_or_absent(const FixedText<200> &text) { return text.empty() ? nullptr : text.c_str(); }

void set_service(sync_agent_ds_profile *profile, const DataSyncAccount &account, int type, const Texts &texts) {
    // The phone numbers its own databases like the services.
    const sync_agent_ds_service_info service{.type = type,
                                             .enabled = account.*texts.enabled == "on" ? 1 : 0,
                                             .source = type,
                                             .database_name = text_or_absent(account.*texts.name),
                                             .database_id = text_or_absent(account.*texts.id),
                                             .database_password = text_or_absent(account.*texts.password)};
    sync_agent_ds_set_sync_service_info(profile, &service);
}

bool read_server(sync_agent_ds_profile *profile, DataSyncAccount &account) {
    sync_agent_ds_server_info server{};
    if (sync_agent_ds_get_server_info(profile, &server) != 0) return false;
    account.server.assign(zel_svc_text_view(server.address));
    account.user_id.assign(zel_svc_text_view(server.user_id));
    account.password.assign(zel_svc_text_view(server.password));
    return true;
}

void take_service(const sync_agent_ds_service_info &service, DataSyncAccount &account, const Texts &texts) {
    (account.*texts.enabled).assign(service.enabled == 1 ? "on" : "off");
    (account.*texts.name).assign(zel_svc_text_view(service.database_name));
    (account.*texts.id).assign(zel_svc_text_view(service.database_id));
    (account.*texts.password).assign(zel_svc_text_view(service.database_password));
}

bool read_services(sync_agent_ds_profile *profile, DataSyncAccount &account) {
    GList *list = nullptr;
    if (sync_agent_ds_get_sync_service_info(profile, &list) != 0) return false;
    const SyncList services{list};
    for (guint i = 0; i < g_list_length(list); ++i) {
        const auto *service = static_cast<const sync_agent_ds_service_info *>(g_list_nth_data(list, i));
        if (service->type == kContacts) take_service(*service, account, kContactTexts);
        if (service->type == kCalendar) take_service(*service, account, kCalendarTexts);
    }
    return true;
}

bool read_profile(sync_agent_ds_profile *profile, DataSyncAccount &account) {
    const char *name = nullptr;
    if (sync_agent_ds_get_profile_name(profile, &name) != 0) return false;
    account.name.assign(zel_svc_text_view(name));
    return read_server(profile, account) && read_services(profile, account);
}

} // namespace

const char *zel_svc_data_sync_add(const DataSyncAccount &account) {
    sync_agent_ds_profile *created = nullptr;
    if (sync_agent_ds_create_profile_info(&created) != 0) return "create()";
    const SyncProfile profile{created};
    if (sync_agent_ds_set_profile_name(created, account.name.c_str()) != 0) return "set prof name()";
    if (sync_agent_ds_set_profile_attribute(created, kProfileAttribute) != 0) return "set prof attr()";
    // Without one of these the account is there and the user can complete it, so their results do not end it.
    const sync_agent_ds_server_info server{
        .address = account.server.c_str(), .user_id = account.user_id.c_str(), .password = account.password.c_str()};
    sync_agent_ds_set_server_info(created, &server);
    sync_agent_ds_set_sync_info(created, 0, 0, 1);
    set_service(created, account, kContacts, kContactTexts);
    set_service(created, account, kCalendar, kCalendarTexts);
    return sync_agent_ds_add_profile(created) == 0 ? nullptr : "add()";
}

bool zel_svc_data_sync_read(std::size_t index, DataSyncAccount &account) {
    SyncProfiles profiles;
    const bool filled = profiles.read() && index < profiles.size() && read_profile(profiles.at(index), account);
    const bool read = profiles.release() && filled;
    if (!read) account = DataSyncAccount{};
    return read;
}

#include "call.h"
#include "sync-accounts.h"

#include <algorithm>
#include <list>
#include <sync-agent.h>

struct sync_agent_ds_profile {
    zel_host::SyncAccount account;
    std::list<sync_agent_ds_service_info> given; // entries of the lists that were handed out
};

namespace zel_host {
namespace {

using Profile = sync_agent_ds_profile;

constexpr int kRefused = -1;

bool &is_client() {
    static bool initialized = false;
    return initialized;
}

int give_profiles(Phone &phone, GList **profiles) {
    std::vector<std::unique_ptr<Profile>> made;
    for (SyncAccount &account : sync_accounts(phone))
        made.push_back(std::make_unique<Profile>(Profile{.account = std::move(account), .given = {}}));
    GList *list = nullptr;
    for (std::unique_ptr<Profile> &profile : made)
        list = g_list_append(list, profile.release());
    *profiles = list;
    return 0;
}

const char *text_or_null(const std::optional<std::string> &text) { return text ? text->c_str() : nullptr; }

std::optional<std::string> text_or_none(const char *text) {
    return text == nullptr ? std::nullopt : std::optional<std::string>(text);
}

int give_services(Profile &profile, GList **services) {
    std::list<sync_agent_ds_service_info> entries;
    for (const SyncService &service : profile.account.services)
        entries.push_back({.type = static_cast<int>(service.type),
                           .enabled = service.enabled ? 1 : 0,
                           .source = static_cast<int>(service.source),
                           .database_name = text_or_null(service.name),
                           .database_id = text_or_null(service.id),
                           .database_password = text_or_null(service.password)});
    GList *list = nullptr;
    for (sync_agent_ds_service_info &entry : entries)
        list = g_list_append(list, &entry);
    profile.given.splice(profile.given.end(), entries);
    *services = list;
    return 0;
}

int take_service(SyncAccount &account, const sync_agent_ds_service_info &service) {
    std::erase_if(account.services, [&service](const SyncService &held) { return held.type == service.type; });
    account.services.push_back({.type = service.type,
                                .enabled = service.enabled != 0,
                                .source = service.source,
                                .name = text_or_none(service.database_name),
                                .id = text_or_none(service.database_id),
                                .password = text_or_none(service.database_password)});
    return 0;
}

int take_text(std::string &target, const char *text) {
    if (text == nullptr) return kRefused;
    target = text;
    return 0;
}

int take_server(SyncAccount &account, const sync_agent_ds_server_info &info) {
    if (info.address == nullptr || info.user_id == nullptr || info.password == nullptr) return kRefused;
    account.address = info.address;
    account.user_id = info.user_id;
    account.password = info.password;
    return 0;
}

int add(Phone &phone, SyncAccount &account) {
    if (account.id != 0) return kRefused;
    account.id = add_sync_account(phone, account);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int sync_agent_ds_init(void) {
    return answer<function("sync_agent_ds_init")>([](Phone & /*phone*/) {
        is_client() = true;
        return 0;
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_deinit(void) {
    return answer<function("sync_agent_ds_deinit")>([](Phone & /*phone*/) {
        if (!is_client()) return kRefused;
        is_client() = false;
        return 0;
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_get_all_profile(GList **profiles) {
    return answer<function("sync_agent_ds_get_all_profile")>([profiles](Phone &phone) {
        return is_client() && profiles != nullptr ? give_profiles(phone, profiles) : kRefused;
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_free_profile_info(struct sync_agent_ds_profile *profile) {
    // Freed also when the call is told to fail: its caller has no second way to give the information back.
    const std::unique_ptr<Profile> held{profile};
    return answer<function("sync_agent_ds_free_profile_info")>([](Phone & /*phone*/) { return 0; });
}

ZEL_HOST_EXPORT int sync_agent_ds_get_profile_name(struct sync_agent_ds_profile *profile, const char **name) {
    return answer<function("sync_agent_ds_get_profile_name")>([&](Phone & /*phone*/) {
        if (!is_client() || profile == nullptr || name == nullptr) return kRefused;
        *name = profile->account.name.c_str();
        return 0;
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_get_server_info(struct sync_agent_ds_profile *profile,
                                                  struct sync_agent_ds_server_info *info) {
    return answer<function("sync_agent_ds_get_server_info")>([&](Phone & /*phone*/) {
        if (!is_client() || profile == nullptr || info == nullptr) return kRefused;
        *info = {.address = profile->account.address.c_str(),
                 .user_id = profile->account.user_id.c_str(),
                 .password = profile->account.password.c_str()};
        return 0;
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_get_sync_service_info(struct sync_agent_ds_profile *profile, GList **services) {
    return answer<function("sync_agent_ds_get_sync_service_info")>([&](Phone & /*phone*/) {
        if (!is_client() || profile == nullptr || services == nullptr) return kRefused;
        return give_services(*profile, services);
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_create_profile_info(struct sync_agent_ds_profile **profile) {
    return answer<function("sync_agent_ds_create_profile_info")>([profile](Phone & /*phone*/) {
        if (!is_client() || profile == nullptr) return kRefused;
        *profile = std::make_unique<Profile>().release();
        return 0;
    });
}

ZEL_HOST_EXPORT int sync_agent_ds_set_profile_name(struct sync_agent_ds_profile *profile, const char *name) {
    return answer<function("sync_agent_ds_set_profile_name")>(
        [&](Phone & /*phone*/) {
            return is_client() && profile != nullptr ? take_text(profile->account.name, name) : kRefused;
        },
        name);
}

ZEL_HOST_EXPORT int sync_agent_ds_set_profile_attribute(struct sync_agent_ds_profile *profile, int attribute) {
    return answer<function("sync_agent_ds_set_profile_attribute")>(
        [&](Phone & /*phone*/) {
            if (!is_client() || profile == nullptr) return kRefused;
            profile->account.attribute = attribute;
            return 0;
        },
        attribute);
}

// Passwords stay out of the journal.
ZEL_HOST_EXPORT int sync_agent_ds_set_server_info(struct sync_agent_ds_profile *profile,
                                                  const struct sync_agent_ds_server_info *info) {
    const char *address = info == nullptr ? nullptr : info->address;
    const char *user_id = info == nullptr ? nullptr : info->user_id;
    return answer<function("sync_agent_ds_set_server_info")>(
        [&](Phone & /*phone*/) {
            const bool usable = is_client() && profile != nullptr && info != nullptr;
            return usable ? take_server(profile->account, *info) : kRefused;
        },
        address, user_id);
}

ZEL_HOST_EXPORT int sync_agent_ds_set_sync_info(struct sync_agent_ds_profile *profile, int mode, int type,
                                                int interval) {
    return answer<function("sync_agent_ds_set_sync_info")>(
        [&](Phone & /*phone*/) {
            if (!is_client() || profile == nullptr) return kRefused;
            profile->account.sync_mode = mode;
            profile->account.sync_type = type;
            profile->account.sync_interval = interval;
            return 0;
        },
        mode, type, interval);
}

ZEL_HOST_EXPORT int sync_agent_ds_set_sync_service_info(struct sync_agent_ds_profile *profile,
                                                        const struct sync_agent_ds_service_info *service) {
    const int type = service == nullptr ? -1 : service->type;
    const int enabled = service == nullptr ? 0 : service->enabled;
    return answer<function("sync_agent_ds_set_sync_service_info")>(
        [&](Phone & /*phone*/) {
            const bool usable = is_client() && profile != nullptr && service != nullptr;
            return usable ? take_service(profile->account, *service) : kRefused;
        },
        type, enabled);
}

ZEL_HOST_EXPORT int sync_agent_ds_add_profile(struct sync_agent_ds_profile *profile) {
    return answer<function("sync_agent_ds_add_profile")>(
        [&](Phone &phone) { return is_client() && profile != nullptr ? add(phone, profile->account) : kRefused; });
}

ZEL_HOST_EXPORT int sync_agent_ds_delete_profile(struct sync_agent_ds_profile *profile) {
    return answer<function("sync_agent_ds_delete_profile")>([&](Phone &phone) {
        if (!is_client() || profile == nullptr) return kRefused;
        return remove_sync_account(phone, profile->account.id) ? 0 : kRefused;
    });
}

#pragma once
// The sync agent's own data: its accounts, each with its services.

#include "phone.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace zel_host {

inline constexpr std::int64_t kContacts = 0; // types of services
inline constexpr std::int64_t kCalendar = 1;

struct SyncService {
    std::int64_t type = kContacts;
    bool enabled = false;
    std::int64_t source = 0;
    std::optional<std::string> name; // of the server's database
    std::optional<std::string> id;
    std::optional<std::string> password;
};

struct SyncAccount {
    std::int64_t id = 0; // 0: not the agent's yet
    std::int64_t attribute = 0;
    std::string name;
    std::string address;
    std::string user_id;
    std::string password;
    std::int64_t sync_mode = 0;
    std::int64_t sync_type = 0;
    std::int64_t sync_interval = 0;
    std::vector<SyncService> services; // by type
};

std::vector<SyncAccount> sync_accounts(Phone &phone); // oldest first
std::int64_t add_sync_account(Phone &phone, const SyncAccount &account);
bool remove_sync_account(Phone &phone, std::int64_t id);
void clear_sync_accounts(Phone &phone);

} // namespace zel_host

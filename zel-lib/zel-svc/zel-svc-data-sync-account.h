#pragma once
// One data-sync account: its texts as the spec writes them, and the way of these into the sync agent and back.

#include "base/zel-svc-text.h"

#include <cstddef>

struct DataSyncAccount {
    FixedText<40> network_name;
    FixedText<200> name;
    FixedText<200> server;
    FixedText<200> user_id;
    FixedText<200> password;
    FixedText<20> contacts_enabled; // "on", or anything else for off
    FixedText<200> contacts_name;
    FixedText<200> contacts_id;
    FixedText<200> contacts_password;
    FixedText<20> calendar_enabled;
    FixedText<200> calendar_name;
    FixedText<200> calendar_id;
    FixedText<200> calendar_password;
};
static_assert(sizeof(DataSyncAccount) == 2080);

// Adds the account to the agent. Null when the agent took it, else the name of the step that failed.
const char *zel_svc_data_sync_add(const DataSyncAccount &account);

// Reads the profile at a position of the agent's list, from 0. A profile that cannot be read leaves nothing in
// the account.
bool zel_svc_data_sync_read(std::size_t index, DataSyncAccount &account);

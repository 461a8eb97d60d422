#pragma once
// A row of `pdp_profile` on its way into the network database, and its mirror in the section store: what is
// written is written down twice here, column by column.

#include "zel-svc-element-act-connection-profile.h"
#include "zel-svc-network-database.h"

struct ZelSvcProfileRow {
    ZelSvcApnProfile &profile;
    std::int32_t profile_id = 0;
    std::int32_t network_id = 0;
    std::int32_t category = 0;
    std::int32_t is_default = 0;
    FixedText<200> proxy; // address and port in one text
};

// Address and port in one text; empty without an address.
FixedText<200> zel_svc_profile_row_proxy(const ZelSvcApnProfile &profile);

// The statement, a parameter for each column.
const char *zel_svc_profile_row_insert();

struct ZelSvcRefusedColumn {
    int column; // from 1 on
    int result; // SQLite's
};
inline constexpr int ZEL_SVC_PROFILE_ENABLE_COLUMN = 25;
std::int32_t zel_svc_profile_row_enable(const ZelSvcProfileRow &row);

// Binds the columns in order, each with its mirror, the `number`th, behind it. A refused column ends it.
std::optional<ZelSvcRefusedColumn> zel_svc_profile_row_bind(NetworkStatement &insert, const ZelSvcProfileRow &row,
                                                            int number);

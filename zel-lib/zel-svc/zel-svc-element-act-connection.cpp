#include "zel-svc-element-act-connection.h"

#include "base/zel-svc-log.h"
#include "base/zel-svc-number.h"
#include "spec/zel-svc-parse-context.h"
#include "zel-svc-element-act-connection-handle.h"
#include "zel-svc-element-act-connection-profile.h"
#include "zel-svc-element-act-connection-row.h"
#include "zel-svc-network-info.h"

#include <algorithm>
#include <array>

namespace {

using Profile = ZelSvcApnProfile;

constexpr const char *kDeleteOperators = "delete from pdp_profile where user_defined=0 and ( network_info_id in "
                                         "(select network_info_id from network_info where mccmnc=?) )";
constexpr const char *kMaximum = "select max(profile_id) from pdp_profile";
constexpr const char *kDefaults =
    "select count(default_internet_con), max(default_internet_con) from pdp_profile where "
    "svc_category_id=? and network_info_id in (select network_info_id from network_info "
    "where mccmnc=?)";

// The MCC+MNC whose earlier profiles this `Connections` element has dropped.
std::array<FixedText<10>, ZEL_SVC_NETWORK_TABLE_MAX> gCleaned;
std::size_t gCleanedCount = 0;

bool is_cleaned(std::string_view mccmnc) {
    const auto end = gCleaned.begin() + static_cast<std::ptrdiff_t>(gCleanedCount);
    return std::find_if(gCleaned.begin(), end, [&](const auto &known) { return known == mccmnc; }) != end;
}

// Deleting that failed is tried again with the next profile.
void clean(const Profile &profile) {
    if (is_cleaned(profile.mccmnc.view())) return;
    if (!__zel_svc_connection_delete_operator_profiles(profile.mccmnc.c_str())) return;
    if (gCleanedCount < gCleaned.size()) gCleaned[gCleanedCount++] = profile.mccmnc;
}

// Nothing when that cannot be told: taken for an empty table, a locked database would grow a profile 0.
std::optional<std::int32_t> next_profile_id(NetworkDatabase &database) {
    NetworkStatement maximum = database.prepare(kMaximum);
    if (!maximum) return 0;
    switch (maximum.step()) {
    case NetworkStep::Row:
        break;
    case NetworkStep::Done:
        return 0;
    case NetworkStep::Failed:
        return std::nullopt;
    }
    return zel_svc_network_id_after(maximum.integer(0));
}

// Whether no profile of the MCC+MNC is the service's default yet. Asked on a connection of its own; a database
// that gives no answer gets no default.
bool lacks_default(std::int32_t category, const Profile &profile) {
    NetworkDatabase database;
    NetworkStatement select = database.prepare(kDefaults);
    if (!select || !select.bind(1, category) || !select.bind(2, profile.mccmnc.view())) return false;
    if (select.step() != NetworkStep::Row) return false;
    return select.integer(0) < 1 || select.integer(1) < 1;
}

// What the SIM card chose is the default, whatever else is there.
bool becomes_default(std::optional<std::int32_t> category, const Profile &profile) {
    if (!category) return false;
    return gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_PROFILE] == 1 || lacks_default(*category, profile);
}

// What finds the row again, once there is one.
void record_row(int spec_index, std::int32_t profile_id, int number) {
    const std::string key = "profile_id_" + zel_svc_number_text(spec_index);
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", key.c_str(), profile_id);
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "connection", "count", number);
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "count", spec_index);
}

} // namespace

void zel_svc_connection_forget_cleaned() { gCleanedCount = 0; }

bool __zel_svc_connection_delete_operator_profiles(const char *mccmnc) {
    NetworkDatabase database;
    return database.run(kDeleteOperators, std::string_view{mccmnc});
}

void __zel_svc_connection_store_profile(int spec_index, Profile &profile) {
    clean(profile);
    __zel_svc_element_act_connection_set_profile(spec_index, profile);
}

void __zel_svc_element_act_connection_set_profile(int spec_index, Profile &profile) {
    NetworkDatabase database;
    if (!database) return;
    std::int32_t network_id = 0;
    if (__zel_svc_network_info_get_id(profile.network_name.c_str(), profile.mccmnc.c_str(), 1, &network_id) != 1)
        return;
    if (network_id < 1) return;
    const auto profile_id = next_profile_id(database);
    if (!profile_id) return;
    NetworkStatement insert = database.prepare(zel_svc_profile_row_insert());
    if (!insert) return;
    const ZelSvcProfileHandle *handle = zel_svc_connection_find_handle(profile.network_name.view());
    const auto category = zel_svc_connection_category(handle, profile.profile_name.view());
    const ZelSvcProfileRow row{.profile = profile,
                               .profile_id = *profile_id,
                               .network_id = network_id,
                               .category = category.value_or(ZEL_SVC_CATEGORY_INTERNET),
                               .is_default = becomes_default(category, profile) ? 1 : 0,
                               .proxy = zel_svc_profile_row_proxy(profile)};
    const int number = zel_svc_record_next_number(ZEL_SVC_DATA_CONNECTION, "connection");
    if (const auto refused = zel_svc_profile_row_bind(insert, row, number)) {
        if (refused->column == ZEL_SVC_PROFILE_ENABLE_COLUMN)
            ZEL_SVC_LOG("<Warning>[Connection][DB] sqlite3_bind_int(%d(profile_enable),%d)=%d(Not SQLITE_OK) failed.\n",
                        refused->column, zel_svc_profile_row_enable(row), refused->result);
        return;
    }
    if (insert.run()) record_row(spec_index, *profile_id, number);
}

#include "zel-svc-element-act-connection-handle.h"

#include "base/zel-svc-number.h"
#include "handler/zel-svc-applies.h"
#include "handler/zel-svc-record.h"
#include "zel-svc-element-act-connection.h"
#include "zel-svc-network-database.h"
#include "zel-svc-network-info.h"

#include <array>

namespace {

using Handle = ZelSvcProfileHandle;

constexpr FieldRules reported_as(std::string_view label) {
    return {.report = {.label = label, .when = LineWhen::SpecGiven}};
}

// "ProfEmergencyImsCall" is spelled otherwise than its element: readers of the report know it so.
constexpr Field<Handle> kFields[] = {
    field<&Handle::network_name>(ZEL_SVC_ELEMENT_PROFILE_HANDLE_NETWORK_NAME),
    field<&Handle::browser>(ZEL_SVC_ELEMENT_PROF_BROWSER, reported_as("ProfBrowser")),
    field<&Handle::mms>(ZEL_SVC_ELEMENT_PROF_MMS, reported_as("ProfMMS")),
    field<&Handle::internet_sharing>(ZEL_SVC_ELEMENT_PROF_INT_SHARING, reported_as("ProfIntSharing")),
    field<&Handle::ims>(ZEL_SVC_ELEMENT_PROF_IMS, reported_as("ProfIMS")),
    field<&Handle::xcap>(ZEL_SVC_ELEMENT_PROF_XCAP, reported_as("ProfXCAP")),
    field<&Handle::emergency_ims_call>(ZEL_SVC_ELEMENT_PROF_EMERGENCY_IMS_CALL, reported_as("ProfEmergencyImsCall")),
};

struct Service {
    FixedText<200> Handle::*profile_name;
    std::int32_t category;
};

// A profile that serves several services belongs to the first of them.
constexpr Service kServices[] = {
    {&Handle::browser, ZEL_SVC_CATEGORY_INTERNET},
    {&Handle::mms, 2},
    {&Handle::internet_sharing, 5},
    {&Handle::ims, 0},
    {&Handle::xcap, 7},
    {&Handle::emergency_ims_call, 6},
};

constexpr const char *kDefaultOfService = "select profile_name from pdp_profile where network_info_id=? and "
                                          "svc_category_id=? and default_internet_con=1";

std::array<Handle, ZEL_SVC_PROFILE_HANDLE_MAX> gHandles;
std::size_t gHandleCount = 0;
std::size_t gExported = 0; // how many an export has met

OpenRecord<Handle> gHandle;

bool is_handle(const Occurrence &occurrence) { return occurrence.element == ZEL_SVC_ELEMENT_PROFILE_HANDLE; }

// Not quite zel_svc_group_applies(): here the full and the partial mode are alike, whatever the action.
bool applies(const Occurrence &occurrence, std::string_view network_name) {
    const bool from_sim = gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_PROFILE] == 1;
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_OPERATOR) return from_sim && zel_svc_is_current_operators(network_name);
    if (occurrence.mode != ZEL_SVC_PARSE_MODE_FULL && occurrence.mode != ZEL_SVC_PARSE_MODE_PARTIAL) return false;
    return !from_sim;
}

void keep(const Handle &handle) {
    if (gHandleCount < gHandles.size()) gHandles[gHandleCount++] = handle;
}

void fill_for_export(Handle &handle) {
    if (gExported == gHandles.size()) return;
    const Handle &named = gHandles[gExported++];
    __zel_svc_connection_read_profile_handle(named.network_name.c_str(), named.mccmnc.c_str(), handle);
}

// The first default profile of a service; no name without one.
bool read_default(NetworkDatabase &database, std::int32_t network_id, std::int32_t category, FixedText<200> &name) {
    NetworkStatement select = database.prepare(kDefaultOfService);
    if (!select || !select.bind(1, network_id) || !select.bind(2, category)) return false;
    const NetworkStep step = select.step();
    if (step == NetworkStep::Row) name.assign(select.text(0));
    return step != NetworkStep::Failed;
}

} // namespace

void zel_svc_connection_clear_handles() {
    gHandles.fill({});
    gHandleCount = 0;
    gExported = 0;
}

const Handle *zel_svc_connection_find_handle(std::string_view network_name) {
    for (std::size_t i = 0; i < gHandleCount; ++i)
        if (gHandles[i].network_name == network_name) return &gHandles[i];
    return nullptr;
}

// A name that a handle leaves out is no profile's: a nameless profile serves nothing by default.
std::optional<std::int32_t> zel_svc_connection_category(const Handle *handle, std::string_view profile_name) {
    if (!handle || profile_name.empty()) return std::nullopt;
    for (const Service &service : kServices)
        if (handle->*service.profile_name == profile_name) return service.category;
    return std::nullopt;
}

bool __zel_svc_connection_read_profile_handle(const char *network_name, const char *mccmnc, Handle &handle) {
    std::int32_t network_id = 0;
    if (__zel_svc_network_info_get_id(network_name, mccmnc, 0, &network_id) != 1 || network_id < 1) return false;
    NetworkDatabase database;
    Handle found;
    found.network_name.assign(network_name);
    for (const Service &service : kServices)
        if (!read_default(database, network_id, service.category, found.*service.profile_name)) return false;
    handle = found;
    return true;
}

// The spec gives no MCC+MNC, so only a network that is known by its name alone is ever compared. Wanted so.
void __zel_svc_connection_verify_profile_handle(Handle &spec) {
    Handle phone;
    if (!__zel_svc_connection_read_profile_handle(spec.network_name.c_str(), spec.mccmnc.c_str(), phone)) return;
    zel_svc_record_compare<Handle>({}, kFields, spec, phone);
}

void zel_svc_element_act_connection_handle_count(Occurrence &occurrence) {
    if (occurrence.out) occurrence.out->assign(zel_svc_number_text(static_cast<std::int32_t>(gHandleCount)));
}

void zel_svc_element_act_connection_handle_start(Occurrence &occurrence) {
    if (!is_handle(occurrence)) return;
    gHandle.open();
    if (gHandle && occurrence.exports()) fill_for_export(*gHandle);
}

void zel_svc_element_act_connection_handle_value(Occurrence &occurrence) { gHandle.copy(kFields, occurrence); }

void zel_svc_element_act_connection_handle_end(Occurrence &occurrence) {
    if (!is_handle(occurrence)) return;
    const auto handle = gHandle.take();
    if (!handle || occurrence.exports() || !applies(occurrence, handle->network_name.view())) return;
    if (occurrence.verifies()) return __zel_svc_connection_verify_profile_handle(*handle);
    keep(*handle);
}

void zel_svc_element_act_connection_handle_begin_parse() { gHandle.close(); }

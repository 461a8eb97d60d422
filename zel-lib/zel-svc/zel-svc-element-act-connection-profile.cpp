#include "zel-svc-element-act-connection-profile.h"

#include "base/zel-svc-number.h"
#include "handler/zel-svc-applies.h"
#include "spec/zel-svc-element-stack.h"
#include "zel-svc-element-act-connection-handle.h"
#include "zel-svc-element-act-connection.h"

namespace {

using Profile = ZelSvcApnProfile;

OpenRecord<Profile> gProfile;
int gSpecIndex = 1;
// How many name servers of earlier profiles this parse has seen.
std::int32_t gEarlierDnsAddresses = 0;

bool is_profile(const Occurrence &occurrence) { return occurrence.element == ZEL_SVC_ELEMENT_PROFILE; }

// Only the first two name servers of a profile are kept.
void copy_dns_address(Occurrence &occurrence) {
    const auto addresses = zel_svc_connection_profile_fields().last(ZEL_SVC_DNS_ADDRESSES);
    const std::int32_t slot = occurrence.index - gEarlierDnsAddresses;
    if (slot < 0 || static_cast<std::size_t>(slot) >= addresses.size()) return;
    gProfile.copy(addresses.subspan(static_cast<std::size_t>(slot), 1), occurrence);
}

// One row for each network that the profile serves. The row takes the name from the network's entry, so the
// profile's own is put aside: "default" must still mean every network when the second one is asked for.
void store_for_networks(Profile &profile) {
    const FixedText<40> wanted = profile.network_name;
    zel_svc_for_each_network(wanted.view(), [&](const ZelSvcNetworkEntry &entry) {
        profile.network_name.assign(zel_svc_text_view(entry.network_name, sizeof entry.network_name));
        profile.mccmnc.assign(zel_svc_text_view(entry.mccmnc, sizeof entry.mccmnc));
        __zel_svc_connection_store_profile(gSpecIndex, profile);
    });
}

void store_for_operator(Profile &profile) {
    const ZelSvcSimOperator &current = zel_svc_current_operator();
    profile.mccmnc.assign(zel_svc_text_view(current.mccmnc, sizeof current.mccmnc));
    __zel_svc_connection_store_profile(gSpecIndex, profile);
}

void install(const Occurrence &occurrence, Profile &profile) {
    if (!zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_PROFILE, profile.network_name.view())) return;
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_FULL)
        store_for_networks(profile);
    else
        store_for_operator(profile);
    ++gSpecIndex;
}

void verify(const Occurrence &occurrence, Profile &profile) {
    if (!zel_svc_group_applies(occurrence, ZEL_SVC_AUTO_PROFILE)) return;
    __zel_svc_connection_verify_profile(gSpecIndex, profile);
    ++gSpecIndex;
}

} // namespace

void zel_svc_element_act_connection_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_CONNECTIONS) return;
    zel_svc_connection_clear_handles();
    gSpecIndex = 1;
    if (occurrence.installs()) zel_svc_connection_forget_cleaned();
}

void zel_svc_element_act_connection_profile_count(Occurrence &occurrence) {
    if (!occurrence.out) return;
    occurrence.out->assign(zel_svc_number_text(zel_svc_data_get_int(ZEL_SVC_DATA_CONNECTION, "spec", "count", 0)));
}

void zel_svc_element_act_connection_profile_start(Occurrence &occurrence) {
    if (!is_profile(occurrence)) return;
    gProfile.open();
    gEarlierDnsAddresses = zel_svc_element_get_count(ZEL_SVC_ELEMENT_DNS_IP_ADDR);
    if (gProfile && occurrence.exports()) __zel_svc_connection_read_profile(gSpecIndex, *gProfile);
}

void zel_svc_element_act_connection_profile_value(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_DNS_IP_ADDR) return copy_dns_address(occurrence);
    gProfile.copy(zel_svc_connection_profile_fields(), occurrence);
}

void zel_svc_element_act_connection_profile_end(Occurrence &occurrence) {
    if (!is_profile(occurrence)) return;
    const auto profile = gProfile.take();
    if (!profile) return;
    if (occurrence.installs()) install(occurrence, *profile);
    if (occurrence.verifies()) verify(occurrence, *profile);
    if (occurrence.exports()) ++gSpecIndex;
}

void zel_svc_element_act_connection_profile_begin_parse() { gProfile.close(); }

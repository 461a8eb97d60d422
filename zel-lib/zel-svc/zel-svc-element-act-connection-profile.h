#pragma once
// One APN profile, as the spec writes it: what is done with it, each in a file of its own.
//
//     __zel_svc_connection_store_profile(3, profile);    // the spec's third: a row of its network, with a mirror
//     __zel_svc_connection_verify_profile(3, profile);   // compared with that row, line by line
//     __zel_svc_connection_read_profile(3, profile);     // that row, back in the words of the spec
//
// The spec index counts a customer's profiles from 1 on and finds their rows again: the section store keeps
// the row's id under it.

#include "handler/zel-svc-record.h"

struct ZelSvcApnProfile {
    FixedText<40> network_name;
    FixedText<10> mccmnc; // of the network table or the operator, never of the spec
    FixedText<200> profile_name;
    FixedText<20> editable;
    FixedText<20> enable_status;
    FixedText<20> hidden_status;
    FixedText<20> roaming_enable_status;
    FixedText<20> ip_version;
    FixedText<20> roaming_ip_version;
    FixedText<20> auth;
    FixedText<200> user_id;
    FixedText<200> password;
    FixedText<200> apn;
    FixedText<200> home_url;
    FixedText<200> proxy_address;
    FixedText<10> proxy_port;
    FixedText<200> gateway_address; // no column of the database holds it
    FixedText<20> static_ip_flag;
    FixedText<200> static_ip_address;
    FixedText<20> static_dns_flag;
    FixedText<200> dns_address_1;
    FixedText<200> dns_address_2;
};
static_assert(sizeof(ZelSvcApnProfile) == 2240);

// In the order of the result lines. A field with words has the number of its column in them, and in `otherwise`
// what any other text means. The two name servers are the last ones and share their element.
std::span<const Field<ZelSvcApnProfile>> zel_svc_connection_profile_fields();
inline constexpr std::size_t ZEL_SVC_DNS_ADDRESSES = 2;

// "0.0.0.0" says that there is no address.
inline bool zel_svc_connection_is_no_address(std::string_view address) {
    return address.empty() || address == "0.0.0.0";
}

// Before the first profile of an MCC+MNC, drops the operator's earlier ones; then inserts the row.
void __zel_svc_connection_store_profile(int spec_index, ZelSvcApnProfile &profile);
// A `Connections` element begins: every MCC+MNC has its earlier profiles again.
void zel_svc_connection_forget_cleaned();
bool __zel_svc_connection_delete_operator_profiles(const char *mccmnc);

// Inserts one row and its mirror. A failure leaves the row out and is not reported.
void __zel_svc_element_act_connection_set_profile(int spec_index, ZelSvcApnProfile &profile);

// False, and the profile is left alone, when no row is known by that spec index or the database fails.
bool __zel_svc_connection_read_profile(int spec_index, ZelSvcApnProfile &profile);

// No line when the phone's profile cannot be read.
void __zel_svc_connection_verify_profile(int spec_index, ZelSvcApnProfile &spec);

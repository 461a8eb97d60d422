#include "zel-svc-element-act-connection-profile.h"
#include "zel-svc-network-database.h"

#include "base/zel-svc-number.h"

namespace {

using Profile = ZelSvcApnProfile;

constexpr const char *kSelectProfile = "select * from pdp_profile where profile_id=?";
constexpr const char *kSelectNetwork = "select network_name, mccmnc from network_info where network_info_id=?";

// The platform's own positions, counted from 0. Between `user_defined` and `is_roaming_apn` stands a column that
// only the platform knows.
enum Position : int {
    kProfileName = 1,
    kApn = 2,
    kAuthType = 3,
    kAuthId = 4,
    kAuthPwd = 5,
    kPdpProtocol = 6,
    kRoamPdpProtocol = 7,
    kProxyIpAddr = 8,
    kHomeUrl = 9,
    kIsStaticIpAddr = 12,
    kIpAddr = 13,
    kIsStaticDnsAddr = 14,
    kDnsAddr1 = 15,
    kDnsAddr2 = 16,
    kNetworkInfoId = 17,
    kHidden = 19,
    kEditable = 20,
    kIsRoamingApn = 24,
    kProfileEnable = 25,
};

// The spec's word for a number of a column; empty when it has none.
std::string word(ZelSvcElementId element, std::int32_t number) {
    const Field<Profile> *field = zel_svc_field_find(zel_svc_connection_profile_fields(), element);
    return zel_svc_accepts_text(field->rules.accepts, number).value_or("");
}

// Of the two words of a switch.
std::string switch_word(ZelSvcElementId element, bool is_on) { return word(element, is_on ? 1 : 0); }

bool is_port(std::string_view text) {
    if (text.empty() || text.find_first_not_of("0123456789") != std::string_view::npos) return false;
    return text.find_first_not_of('0') != std::string_view::npos;
}

// What follows the last colon is the port when it can be one; otherwise all of it is the address.
void split_proxy(std::string_view proxy, Profile &profile) {
    const std::size_t colon = proxy.rfind(':');
    const bool has_port = colon != std::string_view::npos && is_port(proxy.substr(colon + 1));
    profile.proxy_address.assign(has_port ? proxy.substr(0, colon) : proxy);
    profile.proxy_port.assign(has_port ? proxy.substr(colon + 1) : std::string_view{});
}

void fill_texts(const NetworkStatement &row, Profile &profile) {
    profile.profile_name.assign(row.text(kProfileName));
    profile.apn.assign(row.text(kApn));
    profile.user_id.assign(row.text(kAuthId));
    profile.password.assign(row.text(kAuthPwd));
    split_proxy(row.text(kProxyIpAddr), profile);
    profile.home_url.assign(row.text(kHomeUrl));
    profile.static_ip_address.assign(row.text(kIpAddr));
    profile.dns_address_1.assign(row.text(kDnsAddr1));
    profile.dns_address_2.assign(row.text(kDnsAddr2));
}

void fill_words(const NetworkStatement &row, Profile &profile) {
    profile.auth.assign(word(ZEL_SVC_ELEMENT_AUTH, row.integer(kAuthType)));
    profile.ip_version.assign(word(ZEL_SVC_ELEMENT_IP_VERSION, row.integer(kPdpProtocol)));
    profile.roaming_ip_version.assign(word(ZEL_SVC_ELEMENT_ROAMING_IP_VERSION, row.integer(kRoamPdpProtocol)));
    profile.static_ip_flag.assign(
        switch_word(ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG, row.integer(kIsStaticIpAddr) == 1));
    profile.static_dns_flag.assign(switch_word(ZEL_SVC_ELEMENT_DNS_ENABLE_FLAG, row.integer(kIsStaticDnsAddr) == 1));
    profile.hidden_status.assign(switch_word(ZEL_SVC_ELEMENT_PROFILE_HIDDEN_STATUS, row.integer(kHidden) == 1));
    profile.editable.assign(switch_word(ZEL_SVC_ELEMENT_PROFILE_EDITABLE, row.integer(kEditable) == 1));
    profile.roaming_enable_status.assign(
        switch_word(ZEL_SVC_ELEMENT_PROFILE_ROAMING_ENABLE_STATUS, row.integer(kIsRoamingApn) == 1));
    profile.enable_status.assign(switch_word(ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS, row.integer(kProfileEnable) != 0));
}

// A network that is gone leaves its name and MCC+MNC empty.
bool fill_network(NetworkDatabase &database, std::int32_t id, Profile &profile) {
    NetworkStatement select = database.prepare(kSelectNetwork);
    if (!select || !select.bind(1, id)) return false;
    const NetworkStep step = select.step();
    if (step != NetworkStep::Row) return step == NetworkStep::Done;
    profile.network_name.assign(select.text(0));
    profile.mccmnc.assign(select.text(1));
    return true;
}

// The id of its network; nothing when there is no such row.
std::optional<std::int32_t> fill_row(NetworkDatabase &database, std::int32_t id, Profile &profile) {
    NetworkStatement select = database.prepare(kSelectProfile);
    if (!select || !select.bind(1, id) || select.step() != NetworkStep::Row) return std::nullopt;
    fill_texts(select, profile);
    fill_words(select, profile);
    return select.integer(kNetworkInfoId);
}

} // namespace

bool __zel_svc_connection_read_profile(int spec_index, Profile &profile) {
    const std::string key = "profile_id_" + zel_svc_number_text(spec_index);
    const int id = zel_svc_data_get_int(ZEL_SVC_DATA_CONNECTION, "spec", key.c_str(), -1);
    if (id < 0) return false;
    NetworkDatabase database;
    Profile found;
    const auto network_id = fill_row(database, id, found);
    if (!network_id || !fill_network(database, *network_id, found)) return false;
    profile = found;
    return true;
}

#include "zel-svc-element-act-connection-profile.h"

namespace {

using Profile = ZelSvcApnProfile;

constexpr Word kEnableDisable[] = {{"enable", 1}, {"disable", 0}};
constexpr Word kHiddenShow[] = {{"hidden", 1}, {"show", 0}, {"on", 1}, {"off", 0}};
constexpr Word kProtocols[] = {{"ipv4", 2}, {"ipv6", 5}, {"ipv4v6", 6}};
constexpr Word kAuthentications[] = {{"none", 0}, {"normal", 1}, {"secure", 2}};

constexpr FieldRules text_as(std::string_view label, bool (*passes)(std::string_view, std::string_view) = nullptr) {
    return {.report = {.label = label, .passes = passes}};
}

constexpr FieldRules word_as(std::span<const Word> list, std::int32_t otherwise, FieldReport report) {
    return {.accepts = words(list),
            .others = FieldOthers::Kept,
            .record = {.form = FieldForm::Word, .otherwise = otherwise},
            .report = report};
}

constexpr FieldReport if_given(std::string_view label, bool (*passes)(std::string_view, std::string_view) = nullptr) {
    return {.label = label, .when = LineWhen::SpecGiven, .passes = passes};
}

bool same_visibility(std::string_view spec, std::string_view phone) {
    return (spec == "on" && phone == "hidden") || (spec == "off" && phone == "show");
}

bool both_no_address(std::string_view spec, std::string_view phone) {
    return zel_svc_connection_is_no_address(spec) && zel_svc_connection_is_no_address(phone);
}

bool nothing_is_off(std::string_view spec, std::string_view phone) { return spec.empty() && phone == "off"; }
bool nothing_is_no_address(std::string_view spec, std::string_view phone) { return spec.empty() && phone == "0.0.0.0"; }

// The lines of authentication and proxy port depend on more than the two texts and are written apart.
// clang-format off
constexpr Field<Profile> kFields[] = {
    field<&Profile::network_name>         (ZEL_SVC_ELEMENT_PROFILE_NETWORK_NAME),
    field<&Profile::profile_name>         (ZEL_SVC_ELEMENT_PROFILE_NAME,                  text_as("ProfileName")),
    field<&Profile::editable>             (ZEL_SVC_ELEMENT_PROFILE_EDITABLE,              word_as(kYesNo, 1, if_given("Editable"))),
    field<&Profile::enable_status>        (ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS,         word_as(kEnableDisable, 1, if_given("EnableStatus"))),
    field<&Profile::hidden_status>        (ZEL_SVC_ELEMENT_PROFILE_HIDDEN_STATUS,         word_as(kHiddenShow, 0, if_given("HiddenStatus", same_visibility))),
    field<&Profile::roaming_enable_status>(ZEL_SVC_ELEMENT_PROFILE_ROAMING_ENABLE_STATUS, word_as(kEnableDisable, 0, if_given("RoamingEnableStatus"))),
    field<&Profile::ip_version>           (ZEL_SVC_ELEMENT_IP_VERSION,                    word_as(kProtocols, 2, if_given("IpVersion"))),
    field<&Profile::roaming_ip_version>   (ZEL_SVC_ELEMENT_ROAMING_IP_VERSION,            word_as(kProtocols, 2, if_given("IpVerRoaming"))),
    field<&Profile::auth>                 (ZEL_SVC_ELEMENT_AUTH,                          word_as(kAuthentications, 0, {})),
    field<&Profile::user_id>              (ZEL_SVC_ELEMENT_PS_PARAM_USER_ID,              text_as("UserId")),
    field<&Profile::password>             (ZEL_SVC_ELEMENT_PS_PARAM_PASSWORD,             text_as("Password")),
    field<&Profile::apn>                  (ZEL_SVC_ELEMENT_APN,                           text_as("APN")),
    field<&Profile::home_url>             (ZEL_SVC_ELEMENT_PROFILE_URL,                   text_as("URL")),
    field<&Profile::proxy_address>        (ZEL_SVC_ELEMENT_PROXY_SERV_ADDR,               text_as("Proxy/ServAddr", both_no_address)),
    field<&Profile::proxy_port>           (ZEL_SVC_ELEMENT_PROXY_PORT),
    field<&Profile::gateway_address>      (ZEL_SVC_ELEMENT_GATEWAY_SERV_ADDR),
    field<&Profile::static_ip_flag>       (ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG,         word_as(kOnOff, 0, {.label = "StaticIP/EnableFlag", .passes = nothing_is_off})),
    field<&Profile::static_ip_address>    (ZEL_SVC_ELEMENT_STATIC_IP_ADDR,                text_as("StaticIP/IPAddr", nothing_is_no_address)),
    field<&Profile::static_dns_flag>      (ZEL_SVC_ELEMENT_DNS_ENABLE_FLAG,               word_as(kOnOff, 0, {.label = "DNS/EnableFlag", .passes = nothing_is_off})),
    field<&Profile::dns_address_1>        (ZEL_SVC_ELEMENT_DNS_IP_ADDR,                   text_as("DNS/IPAddr1", nothing_is_no_address)),
    field<&Profile::dns_address_2>        (ZEL_SVC_ELEMENT_DNS_IP_ADDR,                   text_as("DNS/IPAddr2", nothing_is_no_address)),
};
// clang-format on

} // namespace

std::span<const Field<Profile>> zel_svc_connection_profile_fields() { return kFields; }

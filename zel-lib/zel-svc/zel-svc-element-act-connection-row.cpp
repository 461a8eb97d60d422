#include "zel-svc-element-act-connection-row.h"

#include "base/zel-svc-number.h"

#include <array>
#include <db-util.h>
#include <variant>

namespace {

using Profile = ZelSvcApnProfile;
using Row = ZelSvcProfileRow;
using Value = std::variant<std::int32_t, std::string_view, std::nullptr_t>;

constexpr std::int32_t kLingerTime = 300;
constexpr std::int32_t kTrafficClass = 0;
constexpr std::int32_t kNotTheUsers = 0;

template <auto Member> Value text(const Row &row) { return (row.profile.*Member).view(); }
template <std::int32_t Number> Value fixed(const Row & /*row*/) { return Number; }

// The number of a field's word, or what its rules say of every other text.
template <ZelSvcElementId Element> std::int32_t number_of(const Row &row) {
    const Field<Profile> *field = zel_svc_field_find(zel_svc_connection_profile_fields(), Element);
    return zel_svc_field_number(field->rules, field->of(row.profile).view()).value_or(0);
}
template <ZelSvcElementId Element> Value word(const Row &row) { return number_of<Element>(row); }

// An address counts only while its switch is on.
template <auto Flag, auto Address> Value switched(const Row &row) {
    if (!((row.profile.*Flag) == "on")) return nullptr;
    return (row.profile.*Address).view();
}

// A profile that says nothing about its name servers takes them from where it takes its own address.
Value static_dns(const Row &row) {
    if (row.profile.static_dns_flag == "on") return 1;
    if (row.profile.static_dns_flag == "off") return 0;
    return number_of<ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG>(row);
}

struct Column {
    const char *name; // and, with the number of the profile behind it, the mirror's key
    Value (*value)(const Row &row);
};

// clang-format off
constexpr std::array kColumns{
    Column{"profile_id",           [](const Row &row) -> Value { return row.profile_id; }},
    Column{"profile_name",         text<&Profile::profile_name>},
    Column{"apn",                  text<&Profile::apn>},
    Column{"auth_type",            word<ZEL_SVC_ELEMENT_AUTH>},
    Column{"auth_id",              text<&Profile::user_id>},
    Column{"auth_pwd",             text<&Profile::password>},
    Column{"pdp_protocol",         word<ZEL_SVC_ELEMENT_IP_VERSION>},
    Column{"roam_pdp_protocol",    word<ZEL_SVC_ELEMENT_ROAMING_IP_VERSION>},
    Column{"proxy_ip_addr",        [](const Row &row) -> Value { return row.proxy.view(); }},
    Column{"home_url",             text<&Profile::home_url>},
    Column{"linger_time",          fixed<kLingerTime>},
    Column{"traffic_class",        fixed<kTrafficClass>},
    Column{"is_static_ip_addr",    word<ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG>},
    Column{"ip_addr",              switched<&Profile::static_ip_flag, &Profile::static_ip_address>},
    Column{"is_static_dns_addr",   static_dns},
    Column{"dns_addr1",            switched<&Profile::static_dns_flag, &Profile::dns_address_1>},
    Column{"dns_addr2",            switched<&Profile::static_dns_flag, &Profile::dns_address_2>},
    Column{"network_info_id",      [](const Row &row) -> Value { return row.network_id; }},
    Column{"svc_category_id",      [](const Row &row) -> Value { return row.category; }},
    Column{"hidden",               word<ZEL_SVC_ELEMENT_PROFILE_HIDDEN_STATUS>},
    Column{"editable",             word<ZEL_SVC_ELEMENT_PROFILE_EDITABLE>},
    Column{"default_internet_con", [](const Row &row) -> Value { return row.is_default; }},
    Column{"user_defined",         fixed<kNotTheUsers>},
    Column{"is_roaming_apn",       word<ZEL_SVC_ELEMENT_PROFILE_ROAMING_ENABLE_STATUS>},
    Column{"profile_enable",       word<ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS>},
};
// clang-format on
static_assert(kColumns.size() == ZEL_SVC_PROFILE_ENABLE_COLUMN, "the last column is the one that is logged");

std::string insert_statement() {
    std::string names;
    std::string parameters;
    for (const Column &column : kColumns) {
        const char *comma = names.empty() ? "" : ", ";
        names.append(comma).append(column.name);
        parameters.append(comma).append("?");
    }
    return "insert into pdp_profile( " + names + " ) values( " + parameters + " )";
}

struct Mirror {
    const char *key;

    void operator()(std::int32_t value) const {
        zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "connection", key, value);
    }
    void operator()(std::string_view value) const {
        zel_svc_data_set_str(ZEL_SVC_DATA_CONNECTION, "connection", key, value);
    }
    void operator()(std::nullptr_t /*null*/) const { (*this)(std::string_view{}); }
};

} // namespace

FixedText<200> zel_svc_profile_row_proxy(const Profile &profile) {
    FixedText<200> proxy;
    if (zel_svc_connection_is_no_address(profile.proxy_address.view())) return proxy;
    std::string text{profile.proxy_address.view()};
    if (!profile.proxy_port.empty() && !(profile.proxy_port == "0")) text.append(":").append(profile.proxy_port.view());
    proxy.assign(text);
    return proxy;
}

const char *zel_svc_profile_row_insert() {
    static const std::string statement = insert_statement();
    return statement.c_str();
}

std::int32_t zel_svc_profile_row_enable(const Row &row) {
    return number_of<ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS>(row);
}

std::optional<ZelSvcRefusedColumn> zel_svc_profile_row_bind(NetworkStatement &insert, const Row &row, int number) {
    const std::string suffix = "_" + zel_svc_number_text(number);
    int parameter = 0;
    for (const Column &column : kColumns) {
        ++parameter;
        const Value value = column.value(row);
        const int result = std::visit([&](auto bound) { return insert.bind_result(parameter, bound); }, value);
        if (result != SQLITE_OK) return ZelSvcRefusedColumn{parameter, result};
        const std::string key = column.name + suffix;
        std::visit(Mirror{key.c_str()}, value);
    }
    return std::nullopt;
}

#include "zel-svc-element-act-network-info.h"

#include "base/zel-svc-number.h"
#include "handler/zel-svc-record.h"
#include "zel-svc-network-info.h"

namespace {

struct NetworkIdentity {
    FixedText<40> network_name;
    FixedText<10> mccmnc;
    FixedText<10> sp_code;
    FixedText<10> subset_code;
    FixedText<15> sp_name;
};
static_assert(sizeof(NetworkIdentity) == 85);

constexpr FieldRules kInstallOnly{.fills = FieldFills::Install};

constexpr Field<NetworkIdentity> kFields[] = {
    field<&NetworkIdentity::network_name>(ZEL_SVC_ELEMENT_NETWORK_INFO_NETWORK_NAME, kInstallOnly),
    field<&NetworkIdentity::mccmnc>(ZEL_SVC_ELEMENT_MCCMNC, kInstallOnly),
    field<&NetworkIdentity::sp_code>(ZEL_SVC_ELEMENT_SP_CODE, kInstallOnly),
    field<&NetworkIdentity::subset_code>(ZEL_SVC_ELEMENT_SUBSET_CODE, kInstallOnly),
    field<&NetworkIdentity::sp_name>(ZEL_SVC_ELEMENT_SP_NAME, kInstallOnly),
};

OpenRecord<NetworkIdentity> gNetwork;

template <std::size_t N> void put(char (&field)[N], std::string_view text) { zel_svc_text_copy(field, N, text); }

std::string_view sales_code_or(std::string_view fallback) {
    return zel_svc_sales_code().empty() ? fallback : zel_svc_sales_code();
}

// The element names are older than the SIM's: SPCode holds leading digits of the MSIN, SubsetCode the GID.
void collect_operator(const NetworkIdentity &network) {
    ZelSvcOperatorList &list = zel_svc_collected_operators();
    if (list.count < 0 || static_cast<std::size_t>(list.count) >= list.entries.size()) return;
    ZelSvcSimOperator &entry = list.entries[static_cast<std::size_t>(list.count++)];
    put(entry.customer_name, sales_code_or(zel_svc_text_view(list.customer_name, sizeof list.customer_name)));
    put(entry.network_name, network.network_name.view());
    put(entry.mccmnc, network.mccmnc.view());
    put(entry.subset_code, network.sp_code.view());
    put(entry.gid, network.subset_code.view());
    put(entry.sp_name, network.sp_name.view());
}

// The customer's first network is its home network.
void record_home_network(std::string_view mccmnc) {
    const std::string_view mcc = mccmnc.substr(0, 3);
    zel_svc_data_set_int(ZEL_SVC_DATA_MAIN, "net_info", "mcc_1", zel_svc_number_from_text(mcc));
    zel_svc_data_set_int(ZEL_SVC_DATA_MAIN, "net_info", "mnc_1", zel_svc_number_from_text(mccmnc.substr(mcc.size())));
}

void register_network(const NetworkIdentity &network) {
    std::int32_t id = 0;
    if (!__zel_svc_network_info_get_id(network.network_name.c_str(), network.mccmnc.c_str(), 1, &id) || id < 1) return;
    if (zel_svc_network_table().empty()) record_home_network(network.mccmnc.view());
    ZelSvcNetworkEntry entry{};
    put(entry.sales_code, zel_svc_sales_code());
    put(entry.network_name, network.network_name.view());
    put(entry.mccmnc, network.mccmnc.view());
    put(entry.sp_code, network.sp_code.view());
    put(entry.subset_code, network.subset_code.view());
    put(entry.sp_name, network.sp_name.view());
    entry.network_id = id;
    zel_svc_network_table_append(entry);
}

} // namespace

void zel_svc_element_act_network_info_start(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_NETWORK_INFO && occurrence.installs()) gNetwork.open_unless_pending();
}

void zel_svc_element_act_network_info_value(Occurrence &occurrence) {
    if (occurrence.installs()) gNetwork.copy(kFields, occurrence);
}

void zel_svc_element_act_network_info_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_NETWORK_INFO || !occurrence.installs()) return;
    const auto network = gNetwork.take();
    if (!network) return;
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_OPERATOR_LIST) return collect_operator(*network);
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_FULL) register_network(*network);
}

void zel_svc_element_act_network_info_begin_parse() { gNetwork.close(); }

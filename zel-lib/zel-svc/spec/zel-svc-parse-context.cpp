#include "spec/zel-svc-parse-context.h"

#include "base/zel-svc-text.h"

ZelSvcParseAction geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_INSTALL;
ZelSvcParseMode geZelSvcParseMode = ZEL_SVC_PARSE_MODE_FULL;
std::array<std::int32_t, ZEL_SVC_AUTO_FLAG_COUNT> gbZelSvcNetworkAutoFlags = {};
char ZEL_SVC_NETWORK_DB_PATH[23] = {};

namespace {

std::array<ZelSvcNetworkEntry, ZEL_SVC_NETWORK_TABLE_MAX> gNetworks;
std::size_t gNetworkCount = 0;
FixedText<10> gSalesCode;

} // namespace

void zel_svc_set_network_db_path(std::string_view path) {
    zel_svc_text_copy(ZEL_SVC_NETWORK_DB_PATH, sizeof ZEL_SVC_NETWORK_DB_PATH, path);
}

void zel_svc_network_table_clear() {
    gNetworks.fill({});
    gNetworkCount = 0;
}

bool zel_svc_network_table_append(const ZelSvcNetworkEntry &entry) {
    if (gNetworkCount == gNetworks.size()) return false;
    gNetworks[gNetworkCount++] = entry;
    return true;
}

std::span<const ZelSvcNetworkEntry> zel_svc_network_table() { return {gNetworks.data(), gNetworkCount}; }

std::string_view zel_svc_sales_code() { return gSalesCode.view(); }
void zel_svc_set_sales_code(std::string_view code) { gSalesCode.assign(code); }

ZelSvcCustomerList &zel_svc_collected_customers() {
    static ZelSvcCustomerList customers;
    return customers;
}

ZelSvcOperatorList &zel_svc_collected_operators() {
    static ZelSvcOperatorList operators;
    return operators;
}

ZelSvcSecurityLock &zel_svc_collected_locks() {
    static ZelSvcSecurityLock locks;
    return locks;
}

ZelSvcSimOperator &zel_svc_current_operator() {
    static ZelSvcSimOperator current;
    return current;
}

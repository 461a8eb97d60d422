#pragma once
// What one parse is for and what it gathers. Callers set action, mode and, for an operator install, the
// current operator; handlers read them. All of it is process-wide and stays until the next caller sets it:
// one parse runs at a time.

#include "zel-svc.h"

#include <array>
#include <cstdint>
#include <span>
#include <string_view>

enum ZelSvcParseAction : std::uint32_t {
    ZEL_SVC_PARSE_ACTION_INSTALL = 0, // write the spec value to the phone, or collect it, as the mode says
    ZEL_SVC_PARSE_ACTION_VERIFY = 1,  // read the phone's value, compare, add a result line
    ZEL_SVC_PARSE_ACTION_ENCODE = 2,  // no spec text: give the phone's current value for the export
};

enum ZelSvcParseMode : std::uint32_t {
    ZEL_SVC_PARSE_MODE_FULL = 0,          // full install and upgrade of a customer, header install
    ZEL_SVC_PARSE_MODE_PARTIAL = 1,       // verification
    ZEL_SVC_PARSE_MODE_CUSTOMER_LIST = 2, // only the customer list is collected
    ZEL_SVC_PARSE_MODE_SECURITY_LOCK = 3, // only lock settings are collected
    ZEL_SVC_PARSE_MODE_OPERATOR_LIST = 4, // only operator entries are collected
    ZEL_SVC_PARSE_MODE_OPERATOR = 5,      // only the current operator's items are applied
    ZEL_SVC_PARSE_MODE_HEADER = 7,        // header and Auto flags only
};

extern ZelSvcParseAction geZelSvcParseAction;
extern ZelSvcParseMode geZelSvcParseMode;

// Which groups of operator data come from the inserted SIM instead of the customer's file.
enum ZelSvcAutoFlag : std::int32_t {
    ZEL_SVC_AUTO_PROFILE,
    ZEL_SVC_AUTO_VOICEMAIL,
    ZEL_SVC_AUTO_EMAIL_ACCOUNT,
    ZEL_SVC_AUTO_BOOKMARK,
    ZEL_SVC_AUTO_LINK,
    ZEL_SVC_AUTO_SYNCML,
    ZEL_SVC_AUTO_FOTA,
    ZEL_SVC_AUTO_FAST_DORMANCY,
    ZEL_SVC_AUTO_WB_AMR,
    ZEL_SVC_AUTO_MAX_PDP,
    ZEL_SVC_AUTO_FLAG_COUNT,
    ZEL_SVC_AUTO_NEVER = -1, // of a group that no flag covers
};

// Each 0 or 1, indexed by ZelSvcAutoFlag. Kept from parse to parse.
extern std::array<std::int32_t, ZEL_SVC_AUTO_FLAG_COUNT> gbZelSvcNetworkAutoFlags;

// The network database of the SIM being installed: "/opt/dbspace/.dnet.db" or "/opt/dbspace/.dnet2.db".
inline constexpr const char *ZEL_SVC_NETWORK_DB_PATH_SIM1 = "/opt/dbspace/.dnet.db";
inline constexpr const char *ZEL_SVC_NETWORK_DB_PATH_SIM2 = "/opt/dbspace/.dnet2.db";
extern char ZEL_SVC_NETWORK_DB_PATH[23];
void zel_svc_set_network_db_path(std::string_view path);

// The customer's networks in document order, resolved in the network database.
inline constexpr std::size_t ZEL_SVC_NETWORK_TABLE_MAX = 270;

struct ZelSvcNetworkEntry {
    char sales_code[10];
    char network_name[40];
    char mccmnc[10];
    char sp_code[10];
    char subset_code[10];
    char sp_name[15];
    std::int32_t network_id; // of the network_info row, 1 or more
};
static_assert(sizeof(ZelSvcNetworkEntry) == 100);

void zel_svc_network_table_clear();
// False when the table is full: the entry is dropped.
bool zel_svc_network_table_append(const ZelSvcNetworkEntry &entry);
std::span<const ZelSvcNetworkEntry> zel_svc_network_table();

// The sales code of the customer file being read, empty until its element came.
std::string_view zel_svc_sales_code();
void zel_svc_set_sales_code(std::string_view code);

// Customers of the package, collected in customer-list mode.
inline constexpr std::size_t ZEL_SVC_CUSTOMER_LIST_MAX = ZEL_SVC_MAX_CUSTOMERS;

struct ZelSvcCustomerList {
    std::array<ZelSvcCustomer, ZEL_SVC_CUSTOMER_LIST_MAX> entries;
    std::int32_t count;
};
ZelSvcCustomerList &zel_svc_collected_customers();

// Operators of customer files, collected in operator-list mode. `customer_name` is stamped into entries
// whose file names no sales code.
inline constexpr std::size_t ZEL_SVC_OPERATOR_LIST_MAX = ZEL_SVC_MAX_OPERATORS;

struct ZelSvcOperatorList {
    std::array<ZelSvcSimOperator, ZEL_SVC_OPERATOR_LIST_MAX> entries;
    std::int32_t count;
    char customer_name[10];
};
ZelSvcOperatorList &zel_svc_collected_operators();

// SIM personalisation data, collected in security-lock mode.
ZelSvcSecurityLock &zel_svc_collected_locks();

// The operator that an operator install is about.
ZelSvcSimOperator &zel_svc_current_operator();

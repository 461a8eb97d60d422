#include "support/bench-phone.h"
#include "support/spec-text.h"
#include "support/sqlite-file.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::IsEmpty;
using testing::SizeIs;

namespace {

constexpr const char *kAll = "select network_info_id, network_name, mccmnc from network_info order by network_info_id";

std::string leaf(const std::string &tag, const std::string &text) { return "<" + tag + ">" + text + "</" + tag + ">"; }

std::string network(const std::string &name, const std::string &mccmnc, const std::string &more = {}) {
    return "<NetworkInfo>" + leaf("NetworkName", name) + leaf("MCCMNC", mccmnc) + more + "</NetworkInfo>";
}

std::string general_info(const std::string &code, const std::string &networks) {
    return "<GeneralInfo>" + leaf("SalesCode", code) + networks + "</GeneralInfo>";
}

template <std::size_t N> std::string text(const char (&field)[N]) { return {field, strnlen(field, N)}; }

std::vector<std::string> fields(const ZelSvcNetworkEntry &entry) {
    return {text(entry.sales_code), text(entry.network_name), text(entry.mccmnc),
            text(entry.sp_code),    text(entry.subset_code),  text(entry.sp_name)};
}

std::vector<std::string> fields(const ZelSvcSimOperator &entry) {
    return {text(entry.customer_name), text(entry.network_name), text(entry.mccmnc),
            text(entry.subset_code),   text(entry.gid),          text(entry.sp_name)};
}

const std::string kCodes = leaf("SPCode", "123") + leaf("SubsetCode", "A1") + leaf("SPName", "Virtual");

} // namespace

class NetworkIdentities : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    }
    [[nodiscard]] SqliteRows rows() const { return SqliteFile{root() + ZEL_SVC_NETWORK_DB_PATH_SIM1}.rows(kAll); }
};

TEST_F(NetworkIdentities, AreRegisteredAndEnteredInTheTable) {
    install_spec(general_info("XFV", network("One", "26201", kCodes) + network("Two", "26202")));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "One", "26201"}, {"2", "Two", "26202"}}));
    ASSERT_THAT(zel_svc_network_table(), SizeIs(2));
    const ZelSvcNetworkEntry &one = zel_svc_network_table()[0];
    const ZelSvcNetworkEntry &two = zel_svc_network_table()[1];
    EXPECT_EQ(fields(one), (std::vector<std::string>{"XFV", "One", "26201", "123", "A1", "Virtual"}));
    EXPECT_EQ(one.network_id, 1);
    EXPECT_EQ(fields(two), (std::vector<std::string>{"XFV", "Two", "26202", "", "", ""}));
    EXPECT_EQ(two.network_id, 2);
}

TEST_F(NetworkIdentities, FirstOneIsRecordedAsTheHomeNetwork) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(general_info("XFV", network("One", "26201") + network("Two", "20810")));
    EXPECT_EQ(group.number("net_info", "mcc_1"), 262);
    EXPECT_EQ(group.number("net_info", "mnc_1"), 1);
}

TEST_F(NetworkIdentities, ThreeDigitMncIsRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(network("One", "310260"));
    EXPECT_EQ(group.number("net_info", "mcc_1"), 310);
    EXPECT_EQ(group.number("net_info", "mnc_1"), 260);
}

TEST_F(NetworkIdentities, EmptyPartsAreRecordedAsZero) {
    {
        const LoadedGroup group{ZEL_SVC_DATA_MAIN};
        install_spec("<NetworkInfo>" + leaf("NetworkName", "One") + "</NetworkInfo>");
        EXPECT_EQ(group.number("net_info", "mcc_1"), 0);
        EXPECT_EQ(group.number("net_info", "mnc_1"), 0);
    }
    zel_svc_network_table_clear();
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install_spec(network("Two", "26"));
    EXPECT_EQ(group.number("net_info", "mcc_1"), 26);
    EXPECT_EQ(group.number("net_info", "mnc_1"), 0);
}

TEST_F(NetworkIdentities, FieldsAreCutToTheirWidths) {
    const std::string letters(60, 'n');
    install_spec(general_info("XFV", network(letters, "12345678901",
                                             leaf("SPCode", "12345678901") + leaf("SubsetCode", "ABCDEFGHIJK") +
                                                 leaf("SPName", "ABCDEFGHIJKLMNOP"))));
    ASSERT_THAT(zel_svc_network_table(), SizeIs(1));
    EXPECT_EQ(fields(zel_svc_network_table()[0]),
              (std::vector<std::string>{"XFV", std::string(39, 'n'), "123456789", "123456789", "ABCDEFGHI",
                                        "ABCDEFGHIJKLMN"}));
    EXPECT_EQ(rows(), (SqliteRows{{"1", std::string(39, 'n'), "123456789"}}));
}

TEST_F(NetworkIdentities, CutNamesEndAtAWholeCharacter) {
    install_spec(network(std::string(38, 'n') + "é", "26201"));
    EXPECT_EQ(rows(), (SqliteRows{{"1", std::string(38, 'n'), "26201"}}));
}

TEST_F(NetworkIdentities, LaterTextReplacesAnEarlierOneWhole) {
    install_spec("<NetworkInfo>" + leaf("NetworkName", "Longer name") + leaf("NetworkName", "Short") +
                 leaf("MCCMNC", "26201") + "</NetworkInfo>");
    EXPECT_EQ(rows(), (SqliteRows{{"1", "Short", "26201"}}));
}

TEST_F(NetworkIdentities, NoNameIsRefused) {
    install_spec(network("default", "1") + network("It's &quot;x&quot;", "2") + "<NetworkInfo>" + leaf("MCCMNC", "3") +
                 "</NetworkInfo>");
    EXPECT_EQ(rows(), (SqliteRows{{"1", "default", "1"}, {"2", "It's \"x\"", "2"}, {"3", "", "3"}}));
    EXPECT_THAT(zel_svc_network_table(), SizeIs(3));
}

TEST_F(NetworkIdentities, UnresolvedNetworkIsLeftOut) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("db_util_open", "", 1, 1);
    install_spec(network("One", "26201") + network("Two", "20810"));
    ASSERT_THAT(zel_svc_network_table(), SizeIs(1));
    EXPECT_EQ(text(zel_svc_network_table()[0].network_name), "Two");
    EXPECT_EQ(group.number("net_info", "mcc_1"), 208);
    EXPECT_EQ(run_log(), "");
}

TEST_F(NetworkIdentities, IdBelowOneIsLeftOut) {
    SqliteFile{root() + ZEL_SVC_NETWORK_DB_PATH_SIM1}.run("insert into network_info values(-1, 'Minus', '20801')");
    install_spec(network("One", "26201"));
    EXPECT_THAT(zel_svc_network_table(), IsEmpty());
}

TEST_F(NetworkIdentities, NetworkPastTheTableIsResolvedButNotKept) {
    for (std::size_t i = 0; i < ZEL_SVC_NETWORK_TABLE_MAX; ++i)
        ASSERT_TRUE(zel_svc_network_table_append({.network_id = 1}));
    install_spec(network("One", "26201"));
    EXPECT_THAT(zel_svc_network_table(), SizeIs(270));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "One", "26201"}}));
}

TEST_F(NetworkIdentities, OperatorListCollectsThem) {
    install_spec(general_info("XFV", network("One", "26201", kCodes) + network("Two", "26202")),
                 ZEL_SVC_PARSE_MODE_OPERATOR_LIST);
    const ZelSvcOperatorList &list = zel_svc_collected_operators();
    ASSERT_EQ(list.count, 2);
    EXPECT_EQ(fields(list.entries[0]), (std::vector<std::string>{"XFV", "One", "26201", "123", "A1", "Virtual"}));
    EXPECT_EQ(fields(list.entries[1]), (std::vector<std::string>{"XFV", "Two", "26202", "", "", ""}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(zel_svc_network_table(), IsEmpty());
}

TEST_F(NetworkIdentities, OperatorsWithoutSalesCodeGetTheListsCustomer) {
    ZelSvcOperatorList &list = zel_svc_collected_operators();
    zel_svc_text_copy(list.customer_name, sizeof list.customer_name, "TFG");
    install_spec("<GeneralInfo></GeneralInfo>" + network("One", "26201"), ZEL_SVC_PARSE_MODE_OPERATOR_LIST);
    ASSERT_EQ(list.count, 1);
    EXPECT_EQ(text(list.entries[0].customer_name), "TFG");
    install_spec("<GeneralInfo></GeneralInfo>" + network("One", "26201"));
    ASSERT_THAT(zel_svc_network_table(), SizeIs(1));
    EXPECT_EQ(text(zel_svc_network_table()[0].sales_code), "");
}

TEST_F(NetworkIdentities, OperatorPastTheListIsIgnored) {
    ZelSvcOperatorList &list = zel_svc_collected_operators();
    list.count = 269;
    install_spec(network("One", "26201") + network("Two", "26202"), ZEL_SVC_PARSE_MODE_OPERATOR_LIST);
    EXPECT_EQ(list.count, 270);
    EXPECT_EQ(text(list.entries[269].network_name), "One");
}

TEST_F(NetworkIdentities, OtherModesAndActionsIgnoreThem) {
    for (const auto mode : {ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST,
                            ZEL_SVC_PARSE_MODE_SECURITY_LOCK, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER})
        install_spec(network("One", "26201"), mode);
    EXPECT_THAT(verify_spec(network("One", "26201"), ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(zel_svc_network_table(), IsEmpty());
    EXPECT_EQ(zel_svc_collected_operators().count, 0);
}

TEST_F(NetworkIdentities, RecordLeftOpenIsDroppedWhenTheNextParseBegins) {
    const std::string left_open = "<NetworkInfo>" + leaf("NetworkName", "Old") + leaf("SPName", "Old");
    geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_INSTALL;
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_FULL;
    const std::string document = "<SW-Configuration>" + left_open;
    zel_svc_spec_parse_buffer(document.data(), static_cast<std::int32_t>(document.size()));
    EXPECT_THAT(rows(), IsEmpty());
    install_spec(network("New", "26201"));
    ASSERT_THAT(zel_svc_network_table(), SizeIs(1));
    EXPECT_EQ(text(zel_svc_network_table()[0].network_name), "New");
    EXPECT_EQ(text(zel_svc_network_table()[0].sp_name), "");
}

TEST_F(NetworkIdentities, SecondStartWithinAParseKeepsThePendingRecord) {
    // The inner start opens nothing new: what was read before it stays.
    install_spec("<NetworkInfo>" + leaf("NetworkName", "One") + "<NetworkInfo>" + leaf("MCCMNC", "26201") +
                 "</NetworkInfo></NetworkInfo>");
    EXPECT_EQ(rows(), (SqliteRows{{"1", "One", "26201"}}));
}

TEST_F(NetworkIdentities, ValuesOutsideANetworkAreIgnored) {
    install_spec(leaf("MCCMNC", "26201") + leaf("SPName", "x"));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace zel_test

// What a verification and an export make of the state that earlier calls of the process left, and what they leave.

#include "unit/operator-items.h"

#include "spec/zel-svc-element-dispatcher.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

#include <memory>
#include <zel-svc.h>

namespace zel_test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

constexpr const char *kOutput = "/opt/system/zel-default/output/";
constexpr const char *kGpsData = "/opt/system/zel-default/data/zel-default-data-gps.ini";

class AnotherCallBefore : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        set_string("db/zel/salescode", "BTU");
        set_int("db/location/setting/GpsEnabled", 1);
        set_int("db/zel/network/wb_amr_codec", 1);
        write(kGpsData, "[gps]\ngps_activation = 1\n");
    }

    void write_customer(const std::string &elements) {
        write("/opt/system/zel/mps/ZEL/Customer/BTU/customer.xml",
              "\xEF\xBB\xBF<CustomerData>" + elements + "</CustomerData>");
    }

    // As an operator install of the second SIM that was broken off leaves it, at its worst.
    static void leave_everything_behind() {
        zel_svc_element_clear_enabled();
        zel_svc_element_enable(ZEL_SVC_ELEMENT_BOOKMARK);
        zel_svc_element_set_stop(ZEL_SVC_ELEMENT_WB_AMR);
        zel_svc_element_push(ZEL_SVC_ELEMENT_MAX_PDP);
        zel_svc_element_count_up(ZEL_SVC_ELEMENT_DNS_IP_ADDR);
        geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_ENCODE;
        geZelSvcParseMode = ZEL_SVC_PARSE_MODE_OPERATOR;
        gbZelSvcNetworkAutoFlags.fill(1);
        set_operator("First");
        zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM2);
        zel_svc_verification_add_result("[Left] behind", false);
        zel_svc_data_load(ZEL_SVC_DATA_GPS, ZEL_SVC_DATA_SIM1, 0);
        zel_svc_data_unset(ZEL_SVC_DATA_GPS, "gps", nullptr);
        zel_svc_data_load(ZEL_SVC_DATA_MAX_PDP, ZEL_SVC_DATA_SIM2, 1);
        zel_svc_data_set_int(ZEL_SVC_DATA_MAX_PDP, "max_pdp", "max_pdp_2g_1", 9);
    }

    static void expect_nothing_loaded() {
        for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group) {
            zel_svc_data_set_int(group, "any", "entry", 1);
            EXPECT_EQ(zel_svc_data_find(group, "any", "entry"), 0) << group;
        }
    }

    std::vector<ResultLine> verify(int expected = 1) {
        std::int32_t count = INT32_MIN;
        EXPECT_EQ(zel_svc_config_verification(results_.get(), &count), expected);
        std::vector<ResultLine> lines;
        for (std::int32_t i = 0; i < count; ++i)
            lines.push_back(
                {results_[static_cast<std::size_t>(i)].text, results_[static_cast<std::size_t>(i)].passed == 1});
        return lines;
    }

    std::string exported() {
        EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
        return read(std::string{kOutput} + "customer-phone.xml");
    }

  private:
    std::unique_ptr<ZelSvcVerificationResult[]> results_ =
        std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
};

constexpr const char *kEachPart = "<Settings><Main><Network>"
                                  "<MaxPDP><NetworkName>First</NetworkName><MaxPDP2G>2</MaxPDP2G></MaxPDP>"
                                  "<WbAmr><WbAmrCodec>on</WbAmrCodec></WbAmr>"
                                  "</Network></Main><GPS><GPSActivation>on</GPSActivation></GPS></Settings>";

TEST_F(AnotherCallBefore, LeavesNothingThatAVerificationWouldTake) {
    write("/opt/system/zel-default/data/zel-default-data-max-pdp.ini", "[max_pdp]\ncount = 1\nmax_pdp_2g_1 = 2\n");
    write_customer(kEachPart);
    leave_everything_behind();
    EXPECT_THAT(verify(),
                ElementsAre(passed("[App][Default] App NOT existed."), passed("[App][Customer] App NOT existed."),
                            passed("[Spec][MaxPDP1/MaxPDP2G] Spec='2',Phone='2'"),
                            passed("[Spec][Network/WbAmrCodec] Spec='on',Phone='on'"),
                            passed("[Spec][GPS/GPSActivation] Spec='on',Phone='on'")));
}

TEST_F(AnotherCallBefore, LeavesNothingThatAnExportWouldTake) {
    const std::string fresh = exported();
    EXPECT_THAT(fresh, HasSubstr("<GPSActivation>on</GPSActivation>\n"));
    leave_everything_behind();
    EXPECT_EQ(exported(), fresh);
    write_customer(kEachPart);
    verify();
    EXPECT_EQ(exported(), fresh);
}

// A document that ends inside an item leaves the item, and the agent, open.
TEST_F(AnotherCallBefore, ThatBrokeOffInsideAnItemLeavesNothingToAnExport) {
    call("bookmarks-add", {{"title", "A"}, {"url", "http://a.example.com/"}});
    call("sync-accounts-add", {{"name", "backup"}});
    const std::string fresh = exported();
    for (const char *item : {"<Bookmark><BookmarkName>left</BookmarkName>", "<QuickAccess><QATitle>left</QATitle>",
                             "<Connections><Profile><ProfileName>left</ProfileName><DNS><IPAddr>1</IPAddr>",
                             "<SyncML><DataSync><AccName>left</AccName>", "<FastDormancy><LCDStatus>on</LCDStatus>",
                             "<MaxPDP><MaxPDP2G>9</MaxPDP2G>"}) {
        write_customer(std::string{item} + "<=");
        verify();
        EXPECT_EQ(exported(), fresh) << item;
    }
}

TEST_F(AnotherCallBefore, ThatReadAFlagLeavesItToAFileWithoutNetworkOnly) {
    write_customer(kEachPart);
    gbZelSvcNetworkAutoFlags.fill(1);
    verify();
    EXPECT_THAT(gbZelSvcNetworkAutoFlags, testing::Each(0));
    gbZelSvcNetworkAutoFlags.fill(1);
    write_customer("<GPS><GPSActivation>on</GPSActivation></GPS>");
    verify();
    EXPECT_THAT(gbZelSvcNetworkAutoFlags, testing::Each(1));
}

TEST_F(AnotherCallBefore, VerificationLeavesNoResultAndNoGroup) {
    write_customer(kEachPart);
    verify();
    EXPECT_EQ(zel_svc_verification_count(), 0);
    expect_nothing_loaded();
    EXPECT_EQ(geZelSvcParseAction, ZEL_SVC_PARSE_ACTION_VERIFY);
    EXPECT_EQ(geZelSvcParseMode, ZEL_SVC_PARSE_MODE_PARTIAL);
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "/opt/dbspace/.dnet.db");
    fail("zel_platform_open", std::string{kOutput} + "zel-verification-report.log");
    EXPECT_EQ(verify(0).size(), 5U);
    EXPECT_EQ(zel_svc_verification_count(), 0) << "nor when the report cannot be opened";
    call("fault-clear");
    set_string("db/zel/salescode", "");
    zel_svc_verification_add_result("[Left] behind", false);
    EXPECT_EQ(verify().size(), 2U);
    EXPECT_EQ(zel_svc_verification_count(), 0) << "nor without a customer";
}

TEST_F(AnotherCallBefore, ExportLeavesNoElementAndNoGroup) {
    exported();
    expect_nothing_loaded();
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
    EXPECT_EQ(geZelSvcParseAction, ZEL_SVC_PARSE_ACTION_ENCODE);
    EXPECT_EQ(geZelSvcParseMode, ZEL_SVC_PARSE_MODE_HEADER);
    EXPECT_STREQ(ZEL_SVC_NETWORK_DB_PATH, "/opt/dbspace/.dnet.db");
    fail("zel_platform_open_parent");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 0);
    expect_nothing_loaded();
}

// The flags, networks and profiles of the last install are the phone's, not the export's.
TEST_F(AnotherCallBefore, ExportLeavesFlagsAndNetworksAsTheyAre) {
    gbZelSvcNetworkAutoFlags.fill(1);
    zel_svc_set_sales_code("BTU");
    zel_svc_network_table_append({.sales_code = "BTU",
                                  .network_name = "First",
                                  .mccmnc = "00101",
                                  .sp_code = "",
                                  .subset_code = "",
                                  .sp_name = "",
                                  .network_id = 7});
    exported();
    EXPECT_THAT(gbZelSvcNetworkAutoFlags, testing::Each(1));
    EXPECT_EQ(zel_svc_network_table().size(), 1U);
    EXPECT_EQ(zel_svc_sales_code(), "BTU");
}

} // namespace
} // namespace zel_test

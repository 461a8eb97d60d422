#include "sim-phone.h"

#include <gmock/gmock.h>

#include <cstring>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using zel_test::element;

std::string shown(const ZelSvcSimOperator &entry) {
    return std::string{entry.customer_name} + "/" + entry.network_name + "/" + entry.mccmnc + "/" + entry.subset_code +
           "/" + entry.gid + "/" + entry.sp_name;
}

class OperatorList : public zel_test::SimPhone {
  protected:
    std::vector<std::string> list(int all_customers) {
        int32_t count = -1;
        zel_svc_sim_auto_setting_get_operator_list(operators_.data(), &count, all_customers);
        std::vector<std::string> texts;
        for (std::size_t i = 0; i < static_cast<std::size_t>(count); ++i)
            texts.push_back(shown(operators_[i]));
        return texts;
    }
    void write_package(const std::vector<std::string> &sources) {
        std::string set = element("NbCustomer", std::to_string(sources.size()));
        for (const std::string &source : sources)
            set += "<CustomerData src=\"" + source + "\"/>\n";
        write_header(element("CustomerDataSet", set));
    }

    std::vector<ZelSvcSimOperator> operators_ = std::vector<ZelSvcSimOperator>(ZEL_SVC_MAX_OPERATORS);
};

} // namespace

TEST_F(OperatorList, HoldsTheActiveCustomersNetworksInOrder) {
    write_networks("TST", "TSX", {{"One", "26201", "11", "A1", "One Mobile"}, {"Two", "26202"}, {"One", "26201"}});
    EXPECT_THAT(list(0), ElementsAre("TSX/One/26201/11/A1/One Mobile", "TSX/Two/26202///", "TSX/One/26201///"));
}

TEST_F(OperatorList, TheSpCodeIsTheSubsetCodeAndTheSubsetCodeTheGid) {
    write_networks("TST", "", {{"One", "26201", "sp", "subset"}});
    list(0);
    EXPECT_STREQ(operators_[0].subset_code, "sp");
    EXPECT_STREQ(operators_[0].gid, "subset");
}

TEST_F(OperatorList, WithoutASalesCodeTheCustomersFolderNamesTheCustomer) {
    set_string("db/zel/salescode", "UFN"); // served by the folder TFG
    write_networks("TFG", "", {{"One", "26201"}});
    write_networks("UFN", "", {{"Wrong", "26201"}});
    EXPECT_THAT(list(0), ElementsAre("TFG/One/26201///"));
}

TEST_F(OperatorList, TextsAreCutToTheirFields) {
    write_networks("TST", "1234567890123",
                   {{std::string(60, 'n'), "1234567890123", "1234567890123", "1234567890123", "123456789012345678"}});
    EXPECT_THAT(list(0),
                ElementsAre("123456789/" + std::string(39, 'n') + "/123456789/123456789/123456789/12345678901234"));
}

TEST_F(OperatorList, EndsBehindTheFirstGeneralInfo) {
    write_customer("TST", element("GeneralInfo", element("NetworkInfo", element("NetworkName", "One"))) +
                              element("GeneralInfo", element("NetworkInfo", element("NetworkName", "Two"))));
    EXPECT_THAT(list(0), ElementsAre("TST/One////"));
}

TEST_F(OperatorList, HoldsAtMost270Entries) {
    std::vector<zel_test::Network> networks(271, {"N", "26201"});
    networks[269].name = "last";
    write_networks("TST", "TST", networks);
    EXPECT_EQ(list(0).size(), 270U);
    EXPECT_STREQ(operators_[269].network_name, "last");
}

TEST_F(OperatorList, IsReadAnewEachTime) {
    write_networks("TST", "TST", {{"One", "26201"}, {"Two", "26202"}});
    list(0);
    write_networks("TST", "TST", {{"Three", "26203"}});
    EXPECT_THAT(list(0), ElementsAre("TST/Three/26203///"));
}

TEST_F(OperatorList, IsEmptyWithoutAnActiveCustomer) {
    write_networks("TST", "TST", {{"One", "26201"}});
    write_networks("DEF", "DEF", {{"Wrong", "26201"}});
    list(0);
    for (const char *customer : {"", "DEF"}) {
        set_string("db/zel/salescode", customer);
        EXPECT_THAT(list(0), IsEmpty());
    }
}

TEST_F(OperatorList, IsEmptyWithoutAFileAndWithAHostileCode) {
    EXPECT_THAT(list(0), IsEmpty());
    write_networks("..", "TST", {{"One", "26201"}});
    for (const char *customer : {"..", ".", "a/b"}) {
        set_string("db/zel/salescode", customer);
        EXPECT_THAT(list(0), IsEmpty());
    }
}

TEST_F(OperatorList, OfABrokenFileHoldsWhatStandsBeforeTheError) {
    write_customer("TST", "<GeneralInfo><NetworkInfo><NetworkName>One</NetworkName></NetworkInfo>"
                          "<NetworkInfo><NetworkName>Two</NetworkName <");
    EXPECT_EQ(list(0).size(), 1U);
    EXPECT_STREQ(operators_[0].network_name, "One");
}

TEST_F(OperatorList, OfAllCustomersGathersTheFilesInTheListsOrder) {
    write_package({"/Customer/BBB/customer.xml", "/Customer/GON/customer.xml", "/Customer/AAA/customer.xml"});
    write_networks("AAA", "", {{"A1", "26201"}});
    write_networks("BBB", "BBX", {{"B1", "26202"}, {"B2", "26203"}});
    write_networks("TST", "TST", {{"Unlisted", "26204"}});
    EXPECT_THAT(list(1), ElementsAre("BBX/B1/26202///", "BBX/B2/26203///", "AAA/A1/26201///"));
    EXPECT_THAT(list(-1), ElementsAre("BBX/B1/26202///", "BBX/B2/26203///", "AAA/A1/26201///"));
}

TEST_F(OperatorList, AFileWithoutGeneralInfoHasNoSalesCodeOfTheFileBefore) {
    write_package({"/Customer/BBB/customer.xml", "/Customer/AAA/customer.xml"});
    write_networks("BBB", "BBX", {{"B1", "26202"}});
    write_customer("AAA", element("NetworkInfo", element("NetworkName", "A1")));
    EXPECT_THAT(list(1), ElementsAre("BBX/B1/26202///", "AAA/A1////"));
    set_string("db/zel/salescode", "AAA");
    EXPECT_THAT(list(0), ElementsAre("AAA/A1////"));
}

TEST_F(OperatorList, OfAllCustomersHasNothingOfEntriesThatNobodyDescribed) {
    write_header(element("CustomerDataSet",
                         element("NbCustomer", "120") + "<CustomerData src=\"/Customer/AAA/customer.xml\"/>\n"));
    write_networks("AAA", "AAA", {{"A1", "26201"}});
    EXPECT_THAT(list(1), ElementsAre("AAA/A1/26201///"));
}

TEST_F(OperatorList, OfAllCustomersNeedsNoActiveCustomer) {
    set_string("db/zel/salescode", "");
    write_package({"/Customer/AAA/customer.xml"});
    write_networks("AAA", "AAA", {{"A1", "26201"}});
    EXPECT_THAT(list(1), ElementsAre("AAA/A1/26201///"));
}

TEST_F(OperatorList, OfAllCustomersFollowsTheListedPath) {
    write_package({"/Customer/AAA/elsewhere/here.xml"});
    write_spec("/opt/system/zel/mps/ZEL/Customer/AAA/elsewhere/here.xml",
               "<?xml version=\"1.0\" encoding=\"UTF-8\"?><CustomerData><GeneralInfo><NetworkInfo><NetworkName>One"
               "</NetworkName></NetworkInfo></GeneralInfo></CustomerData>");
    EXPECT_EQ(list(1).size(), 1U);
    EXPECT_STREQ(operators_[0].network_name, "One");
}

TEST_F(OperatorList, OfAllCustomersIsEmptyWithoutCustomers) {
    write_networks("TST", "TST", {{"One", "26201"}});
    EXPECT_THAT(list(1), IsEmpty());
    write_package({});
    EXPECT_THAT(list(1), IsEmpty());
}

TEST_F(OperatorList, WritesNothingToThePhone) {
    // Before GeneralInfo ends, so that only what is read keeps them from being applied.
    const std::string settings =
        element("Settings", element("Main", element("Display", element("FontSize", "small")) +
                                                element("Network", element("AutoVoicemail", "on")) +
                                                element("WbAmr", element("WbAmrCodec", "on"))));
    write_customer("TST", settings + element("GeneralInfo", element("SalesCode", "TST") + element("CountryISO", "DE") +
                                                                element("NetworkInfo", element("NetworkName", "One"))));
    write_package({"/Customer/TST/customer.xml"});
    call("journal-start");
    EXPECT_EQ(list(0).size(), 1U);
    EXPECT_EQ(list(1).size(), 1U);
    for (const std::string &line : journal()) {
        EXPECT_THAT(line, Not(HasSubstr("vconf_set")));
        EXPECT_THAT(line, Not(HasSubstr("db_util_open")));
    }
}

TEST_F(OperatorList, WithoutListOrCountNothingHappens) {
    write_networks("TST", "TST", {{"One", "26201"}});
    int32_t count = 7;
    zel_svc_sim_auto_setting_get_operator_list(nullptr, &count, 0);
    EXPECT_EQ(count, 7);
    std::strcpy(operators_[0].network_name, "mine");
    zel_svc_sim_auto_setting_get_operator_list(operators_.data(), nullptr, 0);
    EXPECT_STREQ(operators_[0].network_name, "mine");
}

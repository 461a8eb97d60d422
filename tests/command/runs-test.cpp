#include "program.h"

using namespace zel_test;

namespace {

constexpr const char *kHeader = "/opt/system/zel/mps/ZEL/SW_Configuration.xml";
constexpr const char *kCustomer = "/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml";
constexpr const char *kMark = "\xEF\xBB\xBF";

struct ZelRun : ZelCommand {
    void give_package(const std::string &customer_file) {
        write(kHeader, std::string{kMark} + "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<CustomerDataSet>\n"
                                            "<ZELName>Q7N0</ZELName><ZELVersion>1A</ZELVersion>\n"
                                            "<NbCustomer>1</NbCustomer>\n"
                                            "<CustomerData src=\"/Customer/XFV/customer.xml\"/>\n</CustomerDataSet>\n");
        write(kCustomer, customer_file);
    }
    void give_good_package() {
        give_package(std::string{kMark} + "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<CustomerData>\n"
                                          "<GeneralInfo><SalesCode>XFV</SalesCode><CountryISO>GB</CountryISO>"
                                          "</GeneralInfo>\n</CustomerData>\n");
    }
};

} // namespace

TEST_F(ZelRun, InstallsACustomer) {
    give_good_package();
    const Outcome outcome = run_zel({"install", "XFV"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.out, "");
    EXPECT_EQ(get_string("db/zel/salescode"), "XFV");
    EXPECT_EQ(get_string("db/zel/country_iso"), "GB");
    EXPECT_EQ(get_int("db/private/telephony/zel_config"), 1);
}

TEST_F(ZelRun, ReportsItsPhasesAsJson) {
    give_good_package();
    const nlohmann::json answer = json_of({"install", "XFV"});
    EXPECT_EQ(answer["run"], "install");
    EXPECT_EQ(answer["customer"], "XFV");
    EXPECT_EQ(answer["done"], true);
    EXPECT_EQ(answer["problems"], nlohmann::json::array());
    ASSERT_GE(answer["phases"].size(), 3U);
    EXPECT_EQ(answer["phases"][0]["name"], "Set pre-config for configuration mode");
    EXPECT_EQ(answer["phases"][0]["depth"], 0);
    EXPECT_EQ(answer["phases"][1]["name"], "Install header");
    EXPECT_EQ(answer["phases"][1]["depth"], 1);
    for (const auto &phase : answer["phases"])
        EXPECT_EQ(phase["ended"], true) << phase;
}

TEST_F(ZelRun, OfAnUnlistedCustomerFails) {
    give_good_package();
    for (const char *run : {"install", "upgrade"}) {
        const Outcome outcome = run_zel({run, "ABC"});
        EXPECT_EQ(outcome.code, 1) << run;
        EXPECT_NE(outcome.err.find("the package does not list the customer 'ABC' in " + std::string{kHeader}),
                  std::string::npos)
            << outcome.err;
    }
}

TEST_F(ZelRun, WithoutTheCustomersFileFails) {
    give_good_package();
    call("reset");
    give_package("");
    for (const char *run : {"install", "upgrade"}) {
        const Outcome outcome = run_zel({run, "XFV"});
        EXPECT_EQ(outcome.code, 1) << run;
        EXPECT_NE(outcome.err.find(kCustomer), std::string::npos) << outcome.err;
    }
}

TEST_F(ZelRun, OfAFileWithoutMarkFails) {
    give_package("<CustomerData></CustomerData>\n");
    for (const char *run : {"install", "upgrade"}) {
        const Outcome outcome = run_zel({run, "XFV"});
        EXPECT_EQ(outcome.code, 1) << run;
        EXPECT_NE(outcome.err.find(kCustomer), std::string::npos) << outcome.err;
        EXPECT_NE(outcome.err.find("mark"), std::string::npos) << outcome.err;
    }
}

TEST_F(ZelRun, NamesThePlaceOfASyntaxError) {
    give_package(std::string{kMark} + "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<CustomerData>\n<A =1></A>\n"
                                      "</CustomerData>\n");
    for (const char *run : {"install", "upgrade"}) {
        const Outcome outcome = run_zel({run, "XFV"});
        EXPECT_EQ(outcome.code, 1) << run;
        EXPECT_NE(outcome.err.find(std::string{kCustomer} + ":3:"), std::string::npos) << outcome.err;
        EXPECT_NE(outcome.err.find(": syntax error"), std::string::npos) << outcome.err;
    }
}

TEST_F(ZelRun, AfterAnUpgradeHasChangedNothingOfTheCustomersSettings) {
    give_good_package();
    EXPECT_EQ(run_zel({"upgrade", "XFV"}).code, 0);
    EXPECT_EQ(get_string("db/zel/salescode"), "XFV");
    EXPECT_EQ(get_string("db/zel/country_iso"), std::nullopt);
}

TEST_F(ZelRun, BootWithoutAnActiveCustomerFails) {
    const Outcome outcome = run_zel({"boot"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_NE(outcome.err.find("no active customer"), std::string::npos) << outcome.err;
}

TEST_F(ZelRun, VerboseShowsTheRunLogOnStandardError) {
    give_good_package();
    const Outcome outcome = run_zel({"install", "XFV", "--verbose"});
    EXPECT_EQ(outcome.out, "");
    EXPECT_NE(outcome.err.find(" s  [Config/Start] Install header."), std::string::npos) << outcome.err;
}

TEST_F(ZelRun, ImeiStoresTheCustomerOnly) {
    EXPECT_EQ(run_zel({"imei", "XFV"}).code, 0);
    EXPECT_EQ(get_string("db/zel/salescode"), "XFV");
    EXPECT_EQ(get_int("db/private/telephony/zel_config"), std::nullopt);
}

TEST_F(ZelRun, LogShowsWhatWasDone) {
    EXPECT_EQ(run_zel({"log"}).code, 1);
    give_good_package();
    run_zel({"install", "XFV"});
    const Outcome outcome = run_zel({"log"});
    EXPECT_EQ(outcome.out, run_log());
    EXPECT_EQ(json_of({"log"})[0]["line"], "[Config/Start] * Set pre-config for configuration mode *");
    EXPECT_NE(run_zel({"log", "--system"}).out.find("API(customer='XFV') entered."), std::string::npos);
}

TEST_F(ZelRun, CustomersAreListed) {
    give_good_package();
    EXPECT_EQ(run_zel({"customers"}).out, "CUSTOMER  FILE\nXFV       /Customer/XFV/customer.xml\n");
    EXPECT_EQ(json_of({"customers"}),
              (nlohmann::json::parse(R"([{"customer": "XFV", "file": "/Customer/XFV/customer.xml"}])")));
}

TEST_F(ZelRun, CustomersWithoutAPackageFail) {
    const Outcome outcome = run_zel({"customers"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_NE(outcome.err.find(kHeader), std::string::npos) << outcome.err;
}

TEST_F(ZelRun, VersionIsNameAndVersion) {
    const Outcome unknown = run_zel({"version"});
    EXPECT_EQ(unknown.code, 1);
    EXPECT_EQ(unknown.out, "Q0000NXBBBB1\n");
    give_good_package();
    EXPECT_EQ(run_zel({"version"}).out, "Q7N01A\n");
}

TEST_F(ZelRun, SummaryShowsWhatThePhoneHolds) {
    give_good_package();
    run_zel({"install", "XFV"});
    const nlohmann::json answer = json_of({"summary"});
    EXPECT_EQ(answer["customer"]["code"], "XFV");
    EXPECT_EQ(answer["customer"]["country"], "GB");
    EXPECT_EQ(answer["customer"]["configured"], true);
    EXPECT_EQ(answer["auto_flags"]["AutoProfile"], false);
    const std::string page = run_zel({"summary"}).out;
    EXPECT_NE(page.find("Active customer  XFV"), std::string::npos) << page;
    EXPECT_NE(page.find("Country          GB"), std::string::npos) << page;
}

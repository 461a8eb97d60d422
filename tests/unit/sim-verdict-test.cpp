// What the matcher says of every entry, which the command shows; what it chooses, which the library installs.

#include "spec/zel-svc-element-stack.h"
#include "support/bench-phone.h"
#include "zel-svc-sim-auto-setting-match.h"
#include "zel-svc-sim-auto-setting-operators.h"

#include <cstring>
#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using Verdict = ZelSvcSimVerdict;

ZelSvcSimOperator entry(const char *mccmnc, const char *subset = "", const char *gid = "", const char *spn = "") {
    ZelSvcSimOperator result{};
    std::strcpy(result.mccmnc, mccmnc);
    std::strcpy(result.subset_code, subset);
    std::strcpy(result.gid, gid);
    std::strcpy(result.sp_name, spn);
    return result;
}

ZelSvcSimInfo sim(const char *mccmnc, const char *msin = "", const char *gid = "", const char *spn = "") {
    ZelSvcSimInfo result{};
    std::strcpy(result.mccmnc, mccmnc);
    std::strcpy(result.msin, msin);
    std::strcpy(result.gid, gid);
    std::strcpy(result.spn, spn);
    return result;
}

Verdict verdict(const ZelSvcSimOperator &one, const ZelSvcSimInfo &card) {
    return zel_svc_sim_match(std::vector{one}, card).verdicts.at(0);
}

TEST(SimVerdict, NamesWhatAnEntryAsksForAndTheSimLacks) {
    EXPECT_EQ(verdict(entry("21401"), sim("21402")), Verdict::OtherNetwork);
    EXPECT_EQ(verdict(entry("21401", "98"), sim("21402", "98")), Verdict::OtherNetwork);
    EXPECT_EQ(verdict(entry("21401", "98"), sim("21401", "97")), Verdict::OtherMsin);
    EXPECT_EQ(verdict(entry("21401", "98"), sim("21401")), Verdict::OtherMsin);
    EXPECT_EQ(verdict(entry("21401", "", "A3"), sim("21401", "1", "A4")), Verdict::OtherGid);
    EXPECT_EQ(verdict(entry("21401", "", "", "Yo"), sim("21401", "1", "A4", "Yes")), Verdict::OtherSpName);
    EXPECT_EQ(verdict(entry("21401"), sim("21401", "1", "A4", "Yes")), Verdict::Plain);
}

TEST(SimVerdict, IsDecisiveByTheFirstThingAskedFor) {
    EXPECT_EQ(verdict(entry("21401", "98", "A3", "Yo"), sim("21401", "981")), Verdict::Decisive);
    EXPECT_EQ(verdict(entry("21401", "98", "A3", "Yo"), sim("21401", "971", "A3", "Yo")), Verdict::OtherMsin);
    EXPECT_EQ(verdict(entry("21401", "", "A3", "Yo"), sim("21401", "", "A3")), Verdict::Decisive);
    EXPECT_EQ(verdict(entry("21401", "", "a3", "Yo"), sim("21401", "", "A3", "Yo")), Verdict::OtherGid);
    EXPECT_EQ(verdict(entry("21401", "", "", "YO"), sim("21401", "", "", "yo")), Verdict::Decisive);
}

TEST(SimVerdict, AnEntryAsksForTheFirstOfSubsetCodeGidAndSpName) {
    EXPECT_EQ(zel_svc_sim_asks(entry("21401", "98", "A3", "Yo")), ZelSvcSimAsks::Msin);
    EXPECT_EQ(zel_svc_sim_asks(entry("21401", "", "A3", "Yo")), ZelSvcSimAsks::Gid);
    EXPECT_EQ(zel_svc_sim_asks(entry("21401", "", "", "Yo")), ZelSvcSimAsks::SpName);
    EXPECT_EQ(zel_svc_sim_asks(entry("21401")), ZelSvcSimAsks::Nothing);
}

TEST(SimVerdict, OfASimWithoutNetworkIsAlwaysAnotherNetwork) {
    EXPECT_EQ(verdict(entry(""), sim("")), Verdict::OtherNetwork);
}

TEST(SimVerdict, TheFirstDecisiveEntryIsChosenAlone) {
    const std::vector entries{entry("21401"), entry("21401", "", "A3"), entry("21401", "98"), entry("21401")};
    const ZelSvcSimMatch match = zel_svc_sim_match(entries, sim("21401", "981", "A3"));
    EXPECT_THAT(match.chosen, ElementsAre(1U));
    EXPECT_THAT(match.verdicts, ElementsAre(Verdict::Plain, Verdict::Decisive, Verdict::Decisive, Verdict::Plain));
}

TEST(SimVerdict, PlainEntriesAreChosenTogether) {
    const std::vector entries{entry("21401"), entry("21401", "98"), entry("21402"), entry("21401")};
    EXPECT_THAT(zel_svc_sim_match(entries, sim("21401", "55")).chosen, ElementsAre(0U, 3U));
    EXPECT_THAT(zel_svc_sim_match(entries, sim("21403", "55")).chosen, IsEmpty());
    EXPECT_THAT(zel_svc_sim_match({}, sim("21401")).chosen, IsEmpty());
}

struct SimOperatorsOf : zel_test::BenchPhone {
    void write_customer(const std::string &customer, const std::string &network) {
        write("/opt/system/zel/mps/ZEL/Customer/" + customer + "/customer.xml",
              "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<CustomerData><GeneralInfo><NetworkInfo>"
              "<NetworkName>" +
                  network + "</NetworkName><MCCMNC>21401</MCCMNC></NetworkInfo></GeneralInfo></CustomerData>\n");
    }
    static std::vector<std::string> names(const char *customer) {
        std::vector<std::string> result;
        for (const ZelSvcSimOperator &one : zel_svc_sim_operators_of(customer))
            result.push_back(std::string(one.customer_name) + " " + one.network_name);
        return result;
    }
};

TEST_F(SimOperatorsOf, ACustomerNeedsNotBeActive) {
    write_customer("AAA", "One");
    write_customer("TFG", "Two");
    set_string("db/zel/salescode", "AAA");
    EXPECT_THAT(names("AAA"), ElementsAre("AAA One"));
    EXPECT_THAT(names("TFG"), ElementsAre("TFG Two"));
}

TEST_F(SimOperatorsOf, OnlyWhatANetworkSaysAboutItselfIsRead) {
    write_customer("AAA", "One");
    names("AAA");
    std::vector<int> enabled;
    for (int id = 0; id < ZEL_SVC_ELEMENT_COUNT; ++id)
        if (zel_svc_element_is_enabled(static_cast<ZelSvcElementId>(id)) == 1) enabled.push_back(id);
    EXPECT_THAT(enabled, ElementsAre(10, 11, 13, 14, 15, 16, 17, 18));
}

TEST_F(SimOperatorsOf, ACodeThatNamesNoFolderHasNone) {
    for (const char *customer : {"", "..", "A/B", "BBB"})
        EXPECT_THAT(names(customer), IsEmpty()) << customer;
}

} // namespace

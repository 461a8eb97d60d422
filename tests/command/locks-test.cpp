#include "program.h"

using namespace zel_test;

namespace {

constexpr const char *kCustomer = "/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml";
constexpr const char *kGroup = "/opt/system/zel-default/data/zel-default-data-security.ini";

struct ZelLocks : ZelCommand {
    void give_locks(const std::string &locks) {
        set_string("db/zel/salescode", "XFV");
        write(kCustomer,
              "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<CustomerData><Settings><Main><Security>" +
                  locks + "</Security></Main></Settings></CustomerData>\n");
    }
};

} // namespace

TEST_F(ZelLocks, ArePrintedAsJson) {
    give_locks("<NbNetworkLock>2</NbNetworkLock><NetworkLock>45001</NetworkLock><NetworkLock>45002</NetworkLock>"
               "<NbSPLock>9</NbSPLock><SPLock>77</SPLock><AutoNetworkLock>on</AutoNetworkLock>"
               "<AutoSIMLock>on</AutoSIMLock><AutoSPLock>off</AutoSPLock><UnlockCnt>10</UnlockCnt>");
    EXPECT_EQ(json_of({"locks"}), nlohmann::json::parse(R"({
        "networks": {"count": 2, "locks": [{"code": "45001"}, {"code": "45002"}]},
        "service_providers": {"count": 9, "locks": [{"code": "77"}]},
        "subsets": {"count": 0, "locks": []},
        "corporates": {"count": 0, "locks": []},
        "auto_network_lock": "on",
        "auto_sim_lock": true,
        "auto_sp_lock": false,
        "unlock_count": 10})"));
}

TEST_F(ZelLocks, ArePrintedForPeople) {
    give_locks("<NbNetworkLock>2</NbNetworkLock><NetworkLock>45001</NetworkLock><NetworkLock>45002</NetworkLock>"
               "<UnlockCnt>10</UnlockCnt>");
    const Outcome outcome = run_zel({"locks"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    for (const char *text : {"LOCKED TO", "45001 45002", "service providers", "unlock count", "10"})
        EXPECT_NE(outcome.out.find(text), std::string::npos) << outcome.out;
}

TEST_F(ZelLocks, AreRecordedByAsking) {
    give_locks("<NbNetworkLock>1</NbNetworkLock><NetworkLock>45001</NetworkLock>");
    EXPECT_EQ(run_zel({"locks"}).code, 0);
    EXPECT_NE(read(kGroup).find("net_lock_0"), std::string::npos);
}

TEST_F(ZelLocks, NeedAnActiveCustomer) {
    const Outcome outcome = run_zel({"locks", "--json"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_EQ(outcome.out, "");
    EXPECT_NE(outcome.err.find("has no active customer"), std::string::npos) << outcome.err;
}

TEST_F(ZelLocks, NeedTheCustomersFile) {
    set_string("db/zel/salescode", "XFV");
    const Outcome outcome = run_zel({"locks"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_EQ(outcome.out, "");
    EXPECT_NE(outcome.err.find(kCustomer), std::string::npos) << outcome.err;
}

TEST_F(ZelLocks, HelpSaysThatAskingWrites) {
    EXPECT_NE(run_zel({"locks", "--help"}).out.find("Writes:"), std::string::npos);
}

// zel sim run, install, active, clear: what is installed for whom.

#include "sim-phone.h"
#include "support/lines.h"
#include "support/phone-bus.h"

#include <cstdlib>
#include <gmock/gmock.h>
#include <sys/stat.h>

using namespace zel_test;
using nlohmann::json;
using ::testing::HasSubstr;
using ::testing::Not;

namespace {

constexpr const char *kSelection = "db/private/zel/sim_selection_show";
constexpr const char *kMsin = "db/private/zel/sim_msin";

struct ZelSimRun : TwoSimCommand {
    void insert(int slot, const char *mnc, const char *msin) {
        call("sim-insert", {{"slot", slot}, {"mcc", "214"}, {"mnc", mnc}, {"msin", msin}});
    }
};

} // namespace

TEST_F(ZelSimRun, InstallsAndTellsWhatItWroteAboutEachSlot) {
    insert(1, "05", "9812345678");
    const std::string page = run({"sim", "run"});
    EXPECT_THAT(page, HasSubstr("SIM 1\n  SIM1 normally inserted.\n"));
    EXPECT_THAT(page, HasSubstr("  AAA_Young('21405',(Subset)'98',(GID)'',(SPName)'') installed.\n"));
    EXPECT_THAT(page, HasSubstr("SIM 2\n  SIM2 not inserted(0).\n"));
    EXPECT_THAT(page, HasSubstr("An operator was installed.\n"));
    EXPECT_THAT(page, Not(HasSubstr("9812")));
    EXPECT_EQ(run({"sim", "active"}), "SIM  OPERATOR\n1    Young (21405, MSIN 98...) of AAA\n2    none\n");
    EXPECT_EQ(get_string(kMsin), "9812345678");
}

// The card's MSIN begins with the code of its operator, so that code is a part of the MSIN. The log's own lines
// about operators hold it whole.
TEST_F(ZelSimRun, ShowsThreeDigitsOfALongCodeThatTheCardHas) {
    write_networks("AAA", network("Long", "21405", one("SPCode", "987654321")) +
                              network("Other", "21405", one("SPCode", "5")));
    insert(1, "05", "9876543210");
    for (const std::string &line : lines_of(run({"sim", "run"})))
        EXPECT_TRUE(line.find("(Subset)") != line.npos || line.find("9876") == line.npos) << line;
    EXPECT_EQ(run({"sim", "active"}), "SIM  OPERATOR\n1    Long (21405, MSIN 987***) of AAA\n2    none\n");
    EXPECT_EQ(json_of({"sim", "active"}).at(0).at("subset_code"), "987***");
    EXPECT_EQ(json_of({"sim", "match"}).at("entries").at(0).at("reason"), "the MSIN begins with 987***");
    EXPECT_EQ(json_of({"sim", "match"}).at("entries").at(1).at("subset_code"), "5");
    for (const char *command : {"active", "info", "match"}) {
        EXPECT_THAT(run({"sim", command}), Not(HasSubstr("9876"))) << command;
        EXPECT_THAT(run({"sim", command, "--json"}), Not(HasSubstr("9876"))) << command;
        EXPECT_THAT(run({"sim", command, "--reveal"}), HasSubstr("987654321")) << command;
        EXPECT_THAT(run({"sim", command, "--json", "--reveal"}), HasSubstr("987654321")) << command;
    }
    EXPECT_EQ(json_of({"sim", "install", "Long"}).at("operator").at("subset_code"), "987***");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_subset_code"), "987654321");
}

TEST_F(ZelSimRun, JournalPageHidesTheMsinThatWasStored) {
    insert(1, "05", "9812345678");
    call("journal-start");
    EXPECT_EQ(json_of({"sim", "run"}).at("result"), 0);
    EXPECT_THAT(run({"phone", "journal-list"}), Not(HasSubstr("9812")));
    EXPECT_THAT(run({"phone", "journal-list", "--reveal"}), HasSubstr("9812345678"));
}

TEST_F(ZelSimRun, OfAKnownSimTellsThisRunsLinesOnly) {
    insert(1, "05", "9812345678");
    EXPECT_EQ(json_of({"sim", "run"}).at("result"), 0);
    const json again = json_of({"sim", "run"});
    EXPECT_EQ(again.at("result"), 2);
    EXPECT_EQ(again.at("meaning"), "nothing_installed");
    EXPECT_EQ(again.at("slots").at(0).at("lines").back().at("line"), "SIM not changed.");
}

TEST_F(ZelSimRun, LeavesTheChoiceToTheUser) {
    insert(1, "01", "5512345678");
    EXPECT_EQ(json_of({"sim", "run"}).at("meaning"), "user_chooses");
    EXPECT_EQ(get_int(kSelection), 1);
    EXPECT_EQ(run({"sim", "install", "South"}), "SIM 1: South of AAA is installed and active.\n");
    EXPECT_EQ(get_int(kSelection), 0);
    EXPECT_EQ(json_of({"sim", "active", "--slot", "1"}).at(0).at("network"), "South");
    EXPECT_EQ(get_string(kMsin), "5512345678");
    EXPECT_EQ(json_of({"sim", "run"}).at("meaning"), "nothing_installed"); // nobody is asked again
}

TEST_F(ZelSimRun, InstallsTheEntryThatIsNamed) {
    write_networks("AAA",
                   network("Net", "21401") + network("Net", "21405") + network("Net", "21405", one("SPCode", "1")));
    insert(2, "01", "5512345678");
    EXPECT_EQ(json_of({"sim", "install", "Net", "--slot", "2"}).at("operator").at("number"), 1);
    insert(2, "05", "5512345678");
    const Outcome several = run_zel({"sim", "install", "Net", "--slot", "2"});
    EXPECT_EQ(several.code, 1);
    EXPECT_THAT(several.err, HasSubstr("'Net' has several entries: 2, 3"));
    EXPECT_EQ(json_of({"sim", "install", "--number", "3", "--slot", "2"}).at("operator").at("subset_code"), "1");
    EXPECT_EQ(get_string("db/private/zel/sim2/sim_auto_op_subset_code"), "1");
    EXPECT_EQ(run_zel({"sim", "install", "None"}).code, 1);
    EXPECT_EQ(run_zel({"sim", "install", "Elsewhere", "--slot", "2"}).code, 1);
    EXPECT_EQ(run_zel({"sim", "install", "Elsewhere", "--slot", "2", "--all"}).code, 0);
    for (const char *number : {"0", "4", "-1", "99999999999999999999"})
        EXPECT_EQ(run_zel({"sim", "install", "--number", number}).code, 2) << number;
    EXPECT_EQ(run_zel({"sim", "install"}).code, 2);
    EXPECT_EQ(run_zel({"sim", "install", "Net", "--number", "1"}).code, 2);
}

TEST_F(ZelSimRun, InstallWithoutReadableSimKeepsNoIdentity) {
    const Outcome outcome = run_zel({"sim", "install", "Home"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_THAT(outcome.err, HasSubstr("no SIM can be read in slot 1"));
    EXPECT_EQ(get_string(kMsin), std::nullopt);
}

TEST_F(ZelSimRun, ClearMakesEverySimNew) {
    insert(1, "05", "1112345678");
    EXPECT_EQ(json_of({"sim", "run"}).at("result"), 0);
    EXPECT_EQ(json_of({"sim", "clear"}), json({{"done", true}}));
    EXPECT_EQ(json_of({"sim", "active"}).at(0).at("network"), "");
    EXPECT_EQ(json_of({"sim", "run"}).at("result"), 0);
    fail("vconf_set_str", kMsin);
    EXPECT_EQ(run_zel({"sim", "clear"}).code, 1);
}

TEST_F(ZelSimRun, NeedsACustomerThatLeavesSomethingToTheSim) {
    set_int("db/private/zel/sim_auto_enable", 0);
    const Outcome off = run_zel({"sim", "run", "--json"});
    EXPECT_EQ(off.code, 1);
    EXPECT_EQ(json::parse(off.out).at("meaning"), "disabled");
    EXPECT_THAT(off.err, HasSubstr("SIM auto setting is off"));
    EXPECT_THAT(run({"sim", "info"}), HasSubstr("SIM auto setting is off.\n"));
    call("vconf-unset", {{"key", "db/zel/salescode"}});
    const Outcome nobody = run_zel({"sim", "run"});
    EXPECT_EQ(nobody.code, 1);
    EXPECT_EQ(nobody.out, "");
    EXPECT_THAT(nobody.err, HasSubstr("has no active customer"));
}

TEST_F(ZelSimRun, SaysWhichFileWasNotReadToItsEnd) {
    insert(1, "05", "1112345678");
    write("/opt/system/zel/mps/ZEL/Customer/AAA/customer.xml", "no spec file");
    const Outcome outcome = run_zel({"sim", "run"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr("sim run: /opt/system/zel/mps/ZEL/Customer/AAA/customer.xml"));
}

// The telephony daemon is told on the phone's bus; the one that the user's environment names hears nothing.
TEST_F(ZelSimRun, TellsTheTelephonyDaemonOfThePhoneAlone) {
    write_networks("AAA", network("Home", "21405"), one("Network", one("AutoProfile", "on")));
    insert(2, "05", "1112345678");
    const std::string elsewhere = make_folder();
    for (const char *folder : {"/run", "/run/dbus"})
        ASSERT_EQ(::mkdir((elsewhere + folder).c_str(), 0700), 0);
    PhoneBus other(elsewhere);
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    ASSERT_EQ(::setenv("DBUS_SYSTEM_BUS_ADDRESS", other.address().c_str(), 1), 0);
    EXPECT_EQ(json_of({"sim", "run"}).at("result"), 0);
    EXPECT_THAT(bus.calls(), ::testing::ElementsAre("/modem2 com.tcore.ps.modem ResetProfile(int32 1)"));
    EXPECT_EQ(connections_seen(other.address()), 0);
    remove_folder(elsewhere);
}

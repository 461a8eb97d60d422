#include "program.h"

using namespace zel_test;

namespace {

struct ZelVconf : ZelCommand {};

constexpr const char *kBroken = "a\xFF\x1B[31mb";

} // namespace

TEST_F(ZelVconf, SetsAStringByDefault) {
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/key", "5"}).code, 0);
    EXPECT_EQ(get_string("db/test/key"), "5");
}

TEST_F(ZelVconf, SetsTheTypeThatIsAskedFor) {
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/int", "--type", "int", "-5"}).code, 0);
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/bool", "true", "--type", "bool"}).code, 0);
    EXPECT_EQ(get_int("db/test/int"), -5);
    EXPECT_EQ(get_bool("db/test/bool"), true);
}

TEST_F(ZelVconf, KeepsTheTypeOfAKnownKey) {
    set_int("db/test/int", 1);
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/int", "7"}).code, 0);
    EXPECT_EQ(get_int("db/test/int"), 7);
}

TEST_F(ZelVconf, RefusesWhatIsNoValueOfTheType) {
    set_int("db/test/int", 1);
    const Outcome outcome = run_zel({"vconf", "set", "db/test/int", "99999999999"});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_NE(outcome.err.find("'99999999999' is no value for the key 'db/test/int' of type int"), std::string::npos)
        << outcome.err;
    EXPECT_EQ(get_int("db/test/int"), 1);
}

TEST_F(ZelVconf, TakesAValueThatIsTheNameOfACommand) {
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/key", "reboot"}).code, 0);
    EXPECT_EQ(get_string("db/test/key"), "reboot");
}

TEST_F(ZelVconf, UnsetsAKey) {
    set_int("db/test/int", 1);
    EXPECT_EQ(run_zel({"vconf", "unset", "db/test/int"}).code, 0);
    EXPECT_EQ(get_int("db/test/int"), std::nullopt);
}

TEST_F(ZelVconf, MissesAKeyThatDoesNotExist) {
    for (const char *verb : {"get", "unset"}) {
        const Outcome outcome = run_zel({"vconf", verb, "db/test/none"});
        EXPECT_EQ(outcome.code, 1) << verb;
        EXPECT_EQ(outcome.out, "") << verb;
        EXPECT_EQ(outcome.err, "zel: the phone in '" + root() +
                                   "' has no key 'db/test/none'\n'zel vconf list' lists the keys that exist.\n");
    }
}

TEST_F(ZelVconf, ListsKeysBelowAPrefix) {
    set_int("db/test/b", 2);
    set_string("db/test/a", "one");
    set_string("db/other", "no");
    EXPECT_EQ(run_zel({"vconf", "list", "db/test/"}).out, "KEY        TYPE    VALUE\n"
                                                          "db/test/a  string  one\n"
                                                          "db/test/b  int     2\n");
}

TEST_F(ZelVconf, PrintsJsonWithStableNames) {
    set_bool("db/test/flag", true);
    const nlohmann::json entry = json_of({"vconf", "get", "db/test/flag"});
    EXPECT_EQ(entry, (nlohmann::json{{"key", "db/test/flag"}, {"type", "bool"}, {"value", true}}));
    EXPECT_EQ(json_of({"vconf", "list", "db/test/"}), nlohmann::json::array({entry}));
}

TEST_F(ZelVconf, MasksSecretsInListsOnly) {
    set_string("db/private/zel/sim_msin", "0123456789");
    set_string("db/test/MailPassword", "hunter2");
    set_string("db/test/wifi_pwd", "hunter3");
    set_string("db/msin/name", "open");
    const std::string list = run_zel({"vconf", "list", "db/"}).out;
    const std::string json = run_zel({"vconf", "list", "db/", "--json"}).out;
    for (const char *secret : {"0123456789", "hunter2", "hunter3"}) {
        EXPECT_EQ(list.find(secret), std::string::npos) << secret;
        EXPECT_EQ(json.find(secret), std::string::npos) << secret;
    }
    EXPECT_NE(list.find("open"), std::string::npos);
    EXPECT_NE(run_zel({"vconf", "list", "db/", "--reveal"}).out.find("hunter2"), std::string::npos);
    EXPECT_EQ(run_zel({"vconf", "get", "db/private/zel/sim_msin"}).out, "0123456789\n");
}

TEST_F(ZelVconf, MasksSecretsOnTerminals) {
    set_string("db/private/zel/sim_msin", "0123456789");
    EXPECT_EQ(run_zel_on_terminal({"vconf", "get", "db/private/zel/sim_msin"}).out, "********\r\n");
    EXPECT_EQ(run_zel_on_terminal({"vconf", "get", "db/private/zel/sim_msin", "--reveal"}).out, "0123456789\r\n");
}

TEST_F(ZelVconf, LeavesAnEmptySecretEmpty) {
    set_string("db/test/pwd", "");
    EXPECT_EQ(run_zel({"vconf", "list", "db/test/"}).out.find("****"), std::string::npos);
}

TEST_F(ZelVconf, CarriesAnyBytes) {
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/key", kBroken}).code, 0);
    EXPECT_EQ(run_zel({"vconf", "get", "db/test/key"}).out, std::string{kBroken} + "\n");
    const nlohmann::json entry = json_of({"vconf", "get", "db/test/key"});
    EXPECT_EQ(entry["value"], "a\xEF\xBF\xBD\x1B[31mb");
    EXPECT_EQ(entry["value_hex"], "61ff1b5b33316d62");
}

TEST_F(ZelVconf, EscapesControlBytesOnTerminals) {
    run_zel({"vconf", "set", "db/test/key", kBroken});
    EXPECT_EQ(run_zel_on_terminal({"vconf", "get", "db/test/key"}).out, "a\\xFF\\x1B[31mb\r\n");
    EXPECT_EQ(run_zel_on_terminal({"vconf", "get", "db/test/key", "--json"}).out.find('\x1B'), std::string::npos);
    run_zel({"vconf", "set", "db/test/key",
             "a\xE2\x80\xAE\xC2\x9B"
             "b"});
    EXPECT_EQ(run_zel_on_terminal({"vconf", "get", "db/test/key"}).out, "a\\u{202E}\\u{009B}b\r\n");
}

// The install of one operator: which groups it starts afresh, whose entries it takes, what it leaves alone.

#include "sim-phone.h"
#include "support/sqlite-file.h"

#include <algorithm>
#include <cstring>
#include <gmock/gmock.h>
#include <map>

namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::ElementsAreArray;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;
using zel_test::element;
using zel_test::SqliteFile;
using zel_test::SqliteRows;

constexpr const char *kUpdated = "memory/zel/sim_auto_setting_updated";

// A switch of the Network element, the group that it leaves to the SIM, and that group's file of slot 2.
struct Group {
    const char *flag;
    const char *first_sim;
    const char *second_sim;
};
constexpr Group kGroups[] = {
    {"AutoProfile", "connection", "connection-2"},
    {"AutoBookmark", "bookmark", "bookmark"},
    {"AutoVoicemail", "voice-mail", "voice-mail-2"},
    {"AutoEmailAccount", "email-account", "email-account"},
    {"AutoWbAmr", "wb-amr", "wb-amr"},
    {"AutoFastDormancy", "fast-dormancy", "fast-dormancy-2"},
    {"AutoMaxPDP", "max-pdp", "max-pdp-2"},
};
const std::vector<std::string> kEveryFile = {
    "security",     "network",      "wb-amr",    "contact",         "calendar",   "multimedia",    "connectivity",
    "voice-mail",   "message",      "email",     "email-account",   "connection", "fast-dormancy", "bookmark",
    "quick-access", "browser",      "syncml-ds", "max-pdp",         "gps",        "ims",           "active-sync",
    "voice-mail-2", "connection-2", "max-pdp-2", "fast-dormancy-2", "ims-2"};

std::string network(const std::vector<std::string> &flags) {
    std::string text;
    for (const std::string &flag : flags)
        text += element(flag, "on");
    return element("Network", text);
}

std::string name(const std::string &text) { return element("NetworkName", text); }

// An entry of each group for one network. What is applied shows in the keys, rows and files.
std::string voicemail(const std::string &network_name, const std::string &number) {
    return element("Voicemail", name(network_name) + element("VoicemailName", "Box") + element("TelNum", number));
}
std::string account(const std::string &network_name, const std::string &account_name) {
    return element("Account", name(network_name) + element("AccountName", account_name));
}
std::string wb_amr(const std::string &network_name, const std::string &codec) {
    return element("WbAmr", name(network_name) + element("WbAmrCodec", codec));
}
std::string dormancy(const std::string &network_name, const std::string &seconds) {
    return element("FastDormancy", name(network_name) + element("FastDormancyEnableStatus", "on") +
                                       element("TimeoutValue", seconds) + element("LCDStatus", "on"));
}
std::string max_pdp(const std::string &network_name, const std::string &limit) {
    return element("MaxPDP", name(network_name) + element("MaxPDP3G", limit));
}
std::string bookmark(const std::string &network_name, const std::string &title) {
    return element("Bookmark",
                   name(network_name) + element("BookmarkName", title) + element("URL", "http://x.example"));
}
std::string profile(const std::string &network_name, const std::string &apn) {
    return element("Profile",
                   name(network_name) + element("ProfileName", "Web") + element("PSparam", element("APN", apn)));
}
std::string connections() {
    return element("Connections", element("ProfileHandle", name("One") + element("ProfBrowser", "Web")) +
                                      profile("Two", "two.apn") + profile("One", "one.apn") +
                                      profile("default", "any.apn"));
}
std::string ims(const std::string &network_name, const std::string &joyn) {
    return element("Setting", name(network_name) + element("RCS", element("Joyn", joyn)));
}

// Two networks' entries of every group whose entries can be told apart here.
std::string items_of_both() {
    return voicemail("Two", "22") + voicemail("One", "11") + account("Two", "second") + account("One", "first") +
           wb_amr("Two", "off") + wb_amr("One", "on") + dormancy("Two", "2") + dormancy("One", "1.5") + connections() +
           bookmark("Two", "second") + bookmark("One", "first") + bookmark("default", "all") + max_pdp("Two", "2") +
           max_pdp("One", "7") + element("IMSSetting", ims("Two", "off") + ims("One", "on"));
}

std::vector<std::string> all_flags() {
    std::vector<std::string> flags;
    for (const Group &group : kGroups)
        flags.emplace_back(group.flag);
    return flags;
}

class OperatorInstall : public zel_test::TwoSimPhone {
  protected:
    void SetUp() override {
        TwoSimPhone::SetUp();
        choose("TST", "One");
    }
    void choose(const char *customer, const char *network_name) {
        operator_ = {};
        std::strcpy(operator_.customer_name, customer);
        std::strcpy(operator_.network_name, network_name);
        std::strcpy(operator_.mccmnc, "26201");
    }
    void install(int slot = 1) { zel_svc_sim_auto_setting_install_operator(&operator_, slot); }
    void mark_every_file() {
        for (const std::string &file : kEveryFile)
            mark_group(file);
    }
    // The files that were started afresh since they were marked.
    std::vector<std::string> rewritten() {
        std::vector<std::string> files;
        for (const std::string &file : kEveryFile)
            if (!group_is_marked(file)) files.push_back(file);
        std::sort(files.begin(), files.end());
        return files;
    }
    // Rows that another network has in every table of both databases.
    void fill_databases() {
        for (const char *database : {kDatabase, kDatabase2}) {
            const SqliteFile file{root() + database};
            file.run("insert into network_info(network_info_id, network_name, mccmnc) values(40, 'Old', '26209')");
            file.run("insert into fast_dormancy(dormant_id, network_info_id, lcd_on_timeout) values(0, 40, 9)");
            file.run("insert into max_pdp(max_id, network_info_id, max_pdp_3g) values(1, 40, 9)");
            file.run("insert into pdp_profile(profile_id, network_info_id) values(1, 40)");
        }
    }
    nlohmann::json bookmark_titles() {
        nlohmann::json titles = nlohmann::json::array();
        const nlohmann::json list = call("bookmarks");
        for (const nlohmann::json &entry : list.at("bookmarks"))
            titles.push_back(entry.at("title"));
        return titles;
    }
    // Everything that an install may change, by name.
    std::map<std::string, std::string> state() {
        std::map<std::string, std::string> all;
        for (const std::string &file : kEveryFile)
            all[file] = read(data_path(file));
        for (const auto &[sim, database] : {std::pair{"", kDatabase}, {"2/", kDatabase2}})
            for (const char *table : {"network_info", "fast_dormancy", "max_pdp", "pdp_profile"})
                all[std::string{sim} + table] =
                    nlohmann::json(rows(database, std::string{"select * from "} + table)).dump();
        all["bookmarks"] = bookmark_titles().dump();
        const nlohmann::json keys = call("vconf-list");
        for (const nlohmann::json &key : keys.at("keys"))
            all[key.at("key").get<std::string>()] = key.at("value").dump();
        return all;
    }
    // The names of what an install changed.
    std::vector<std::string> changed_by_install(int slot) {
        mark_every_file();
        set_int("db/zel/network/wb_amr_codec", 5);
        std::map<std::string, std::string> before = state();
        install(slot);
        std::vector<std::string> names;
        for (const auto &[name, content] : state())
            if (before[name] != content) names.push_back(name);
        return names;
    }
    SqliteRows rows(const char *database, const std::string &sql) { return SqliteFile{root() + database}.rows(sql); }
    static constexpr const char *kDatabase = "/opt/dbspace/.dnet.db";
    static constexpr const char *kDatabase2 = "/opt/dbspace/.dnet2.db";

    ZelSvcSimOperator operator_ = {};
};

// Where the first and the last call with a text stand; it must be there.
std::pair<std::ptrdiff_t, std::ptrdiff_t> calls_that_name(const std::string &text,
                                                          const std::vector<std::string> &calls) {
    const auto names = [&](const std::string &call) { return call.ends_with(text); };
    const auto first = std::find_if(calls.begin(), calls.end(), names);
    const auto last = std::find_if(calls.rbegin(), calls.rend(), names);
    EXPECT_NE(first, calls.end()) << text;
    return {first - calls.begin(), calls.rend() - last - 1};
}

std::vector<std::string> sorted(std::vector<std::string> texts) {
    std::sort(texts.begin(), texts.end());
    return texts;
}

} // namespace

TEST_F(OperatorInstall, EachFlagAloneStartsItsGroupAndImsAfresh) {
    for (const Group &group : kGroups) {
        write_networks("TST", "TST", {}, network({group.flag}));
        mark_every_file();
        install(1);
        EXPECT_THAT(rewritten(), ElementsAreArray(sorted({group.first_sim, "ims"}))) << group.flag;
        mark_every_file();
        install(2);
        EXPECT_THAT(rewritten(), ElementsAreArray(sorted({group.second_sim, "ims-2"}))) << group.flag;
    }
}

// What each group brings beside its file; IMS comes in any case.
TEST_F(OperatorInstall, EachFlagAloneLeavesEverythingElseAlone) {
    struct Change {
        const char *flag;
        std::vector<std::string> first_sim;
        std::vector<std::string> second_sim;
    };
    const Change changes[] = {
        {"AutoBookmark", {"bookmark", "bookmarks"}, {"bookmark", "bookmarks"}},
        {"AutoVoicemail", {"voice-mail"}, {"voice-mail-2"}},
        {"AutoEmailAccount", {"email-account"}, {"email-account"}},
        {"AutoWbAmr", {"wb-amr", "db/zel/network/wb_amr_codec"}, {"wb-amr", "db/zel/network/wb_amr_codec"}},
        {"AutoFastDormancy",
         {"fast-dormancy", "fast_dormancy", "network_info"},
         {"fast-dormancy-2", "2/fast_dormancy", "2/network_info"}},
        {"AutoProfile", {"connection", "pdp_profile"}, {"connection-2", "2/pdp_profile"}},
        {"AutoMaxPDP", {"max-pdp", "max_pdp"}, {"max-pdp-2", "2/max_pdp"}},
    };
    fill_databases();
    set_int(kUpdated, 1);
    for (const Change &change : changes) {
        write_networks("TST", "TST", {}, network({change.flag}) + items_of_both());
        std::vector<std::string> expected = change.first_sim;
        expected.emplace_back("ims");
        EXPECT_THAT(changed_by_install(1), ElementsAreArray(sorted(expected))) << change.flag;
        expected = change.second_sim;
        expected.emplace_back("ims-2");
        EXPECT_THAT(changed_by_install(2), ElementsAreArray(sorted(expected))) << change.flag;
    }
}

TEST_F(OperatorInstall, FlagsWithoutAGroupHereDecideNothing) {
    write_networks("TST", "TST", {}, network({"AutoLink", "AutoSyncML", "AutoFOTA"}));
    mark_every_file();
    install();
    EXPECT_THAT(rewritten(), ElementsAre("ims"));
}

TEST_F(OperatorInstall, AllFlagsTogetherStartEveryGroupOfTheSlotAfresh) {
    write_networks("TST", "TST", {}, network(all_flags()));
    mark_every_file();
    install(1);
    EXPECT_THAT(rewritten(), ElementsAre("bookmark", "connection", "email-account", "fast-dormancy", "ims", "max-pdp",
                                         "voice-mail", "wb-amr"));
    mark_every_file();
    install(2);
    EXPECT_THAT(rewritten(), ElementsAre("bookmark", "connection-2", "email-account", "fast-dormancy-2", "ims-2",
                                         "max-pdp-2", "voice-mail-2", "wb-amr"));
}

TEST_F(OperatorInstall, AnyOtherSlotIsTheFirst) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    mark_every_file();
    install(7);
    EXPECT_THAT(rewritten(), ElementsAre("ims", "voice-mail"));
    EXPECT_THAT(lines_in(kSettingLog), ElementsAre("TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed."));
    EXPECT_TRUE(system_logged("[SIM7] API(pszCustomerName='TST',pszNetworkName='One') run."));
}

TEST_F(OperatorInstall, TakesTheOperatorsEntriesOnly) {
    write_networks("TST", "TST", {}, network(all_flags()) + items_of_both());
    install();
    const std::string voicemails = read(data_path("voice-mail"));
    EXPECT_THAT(voicemails, HasSubstr("11"));
    EXPECT_THAT(voicemails, Not(HasSubstr("22")));
    const std::string accounts = read(data_path("email-account"));
    EXPECT_THAT(accounts, HasSubstr("first"));
    EXPECT_THAT(accounts, Not(HasSubstr("second")));
    EXPECT_EQ(get_int("db/zel/network/wb_amr_codec"), 1);
    EXPECT_EQ(bookmark_titles(), nlohmann::json({"first", "all"}));
    EXPECT_EQ(rows(kDatabase, "select network_name, mccmnc from network_info"), (SqliteRows{{"One", "26201"}}));
    EXPECT_EQ(rows(kDatabase, "select lcd_on_timeout from fast_dormancy"), (SqliteRows{{"1500"}}));
    EXPECT_EQ(rows(kDatabase, "select max_pdp_3g from max_pdp"), (SqliteRows{{"7"}}));
    EXPECT_EQ(rows(kDatabase, "select profile_name, apn, default_internet_con from pdp_profile"),
              (SqliteRows{{"Web", "one.apn", "1"}}));
    EXPECT_TRUE(system_logged("[AutoSIM] IMS setting / NetworkName='One' information found."));
    for (const char *table : {"network_info", "fast_dormancy", "max_pdp", "pdp_profile"})
        EXPECT_THAT(rows(kDatabase2, std::string{"select * from "} + table), IsEmpty()) << table;
}

TEST_F(OperatorInstall, OfTheSecondSlotFillsItsDatabase) {
    write_networks("TST", "TST", {}, network(all_flags()) + items_of_both());
    install(2);
    EXPECT_EQ(rows(kDatabase2, "select lcd_on_timeout from fast_dormancy"), (SqliteRows{{"1500"}}));
    EXPECT_EQ(rows(kDatabase2, "select max_pdp_3g from max_pdp"), (SqliteRows{{"7"}}));
    EXPECT_EQ(rows(kDatabase2, "select profile_name, apn from pdp_profile"), (SqliteRows{{"Web", "one.apn"}}));
    for (const char *table : {"network_info", "fast_dormancy", "max_pdp", "pdp_profile"})
        EXPECT_THAT(rows(kDatabase, std::string{"select * from "} + table), IsEmpty()) << table;
    EXPECT_THAT(read(data_path("voice-mail-2")), HasSubstr("11"));
    EXPECT_FALSE(exists(data_path("voice-mail")));
}

TEST_F(OperatorInstall, WithoutFlagsAppliesImsAlone) {
    write_networks("TST", "TST", {}, items_of_both());
    set_int("db/zel/network/wb_amr_codec", 5);
    install();
    EXPECT_EQ(get_int("db/zel/network/wb_amr_codec"), 5);
    EXPECT_FALSE(exists(data_path("voice-mail")));
    EXPECT_THAT(rows(kDatabase, "select * from network_info"), IsEmpty());
    EXPECT_TRUE(system_logged("[AutoSIM] IMS setting / NetworkName='One' information found."));
}

TEST_F(OperatorInstall, AnOperatorWithoutAnEntryLeavesEmptyGroups) {
    write_networks("TST", "TST", {}, network(all_flags()) + items_of_both());
    choose("TST", "Three");
    install();
    EXPECT_THAT(read(data_path("voice-mail")), Not(HasSubstr("tel_num")));
    EXPECT_THAT(rows(kDatabase, "select * from fast_dormancy"), IsEmpty());
}

TEST_F(OperatorInstall, AnOperatorWithoutANameMatchesNothing) {
    write_networks("TST", "TST", {}, network(all_flags()) + element("Voicemail", element("TelNum", "33")));
    choose("TST", "");
    install();
    EXPECT_THAT(read(data_path("voice-mail")), Not(HasSubstr("33")));
}

TEST_F(OperatorInstall, FlagsAreTheActiveCustomersAndEntriesTheOperators) {
    set_string("db/zel/salescode", "UFN"); // served by the folder TFG
    write_networks("TFG", "TFG", {}, network({"AutoVoicemail"}));
    write_networks("OPR", "OPR", {}, network({"AutoEmailAccount"}) + voicemail("One", "44") + account("One", "other"));
    choose("OPR", "One");
    install();
    EXPECT_THAT(read(data_path("voice-mail")), HasSubstr("44"));
    EXPECT_FALSE(exists(data_path("email-account")));
}

TEST_F(OperatorInstall, TheOperatorsCustomerIsTheFolderAsItIs) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    write_networks("UFN", "", {}, voicemail("One", "55"));
    write_networks("TFG", "", {}, voicemail("One", "66"));
    choose("UFN", "One");
    install();
    EXPECT_THAT(read(data_path("voice-mail")), HasSubstr("55"));
}

TEST_F(OperatorInstall, AMissingCustomersFileLeavesEmptyGroups) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    for (const char *customer : {"GON", "", "..", "a/b"}) {
        mark_every_file();
        choose(customer, "One");
        install();
        EXPECT_THAT(rewritten(), ElementsAre("ims", "voice-mail")) << customer;
    }
    EXPECT_EQ(get_int(kUpdated), 1);
    EXPECT_EQ(lines_in(kSettingLog).size(), 4U);
}

TEST_F(OperatorInstall, WithoutAnActiveCustomerNoFlagIsSet) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    install();
    set_string("db/zel/salescode", "");
    mark_every_file();
    install();
    EXPECT_THAT(rewritten(), ElementsAre("ims"));
}

TEST_F(OperatorInstall, WithoutTheActiveCustomersFileNoFlagIsSet) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    install();
    set_string("db/zel/salescode", "GON");
    mark_every_file();
    install();
    EXPECT_THAT(rewritten(), ElementsAre("ims"));
}

TEST_F(OperatorInstall, AFileWithoutSwitchesLeavesTheFlagsAsTheyWere) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    install();
    write_networks("TST", "TST", {});
    mark_every_file();
    install();
    EXPECT_THAT(rewritten(), ElementsAre("ims", "voice-mail"));
}

TEST_F(OperatorInstall, TellsItsStartAndItsEnd) {
    write_networks("TST", "TST", {});
    std::strcpy(operator_.subset_code, "12");
    std::strcpy(operator_.gid, "A1");
    std::strcpy(operator_.sp_name, "One Mobile");
    install(2);
    EXPECT_THAT(messages(), ElementsAre("***** ZEL SIM auto settings / Install operator *****",
                                        "[SIM2] API(pszCustomerName='TST',pszNetworkName='One') run."));
    EXPECT_THAT(lines_in(kSettingLog2),
                ElementsAre("TST_One('26201',(Subset)'12',(GID)'A1',(SPName)'One Mobile') installed."));
    EXPECT_FALSE(exists(kSettingLog));
    EXPECT_EQ(get_int(kUpdated), 1);
    const nlohmann::json log = call("stat", {{"path", kSettingLog2}});
    EXPECT_EQ(log.at("mode"), "0644");
    EXPECT_EQ(log.at("owner"), 200);
    EXPECT_EQ(log.at("group"), 5000);
    EXPECT_EQ(log.at("label"), "*");
}

TEST_F(OperatorInstall, AppendsToTheSettingLogOfEarlierInstalls) {
    write_networks("TST", "TST", {});
    install();
    choose("TST", "Two");
    install();
    EXPECT_THAT(lines_in(kSettingLog), ElementsAre("TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed.",
                                                   "TST_Two('26201',(Subset)'',(GID)'',(SPName)'') installed."));
}

TEST_F(OperatorInstall, ASettingLogThatCannotBeOpenedIsPassedOver) {
    write_networks("TST", "TST", {});
    fail("zel_platform_open", kSettingLog);
    install();
    EXPECT_FALSE(exists(kSettingLog));
    EXPECT_EQ(get_int(kUpdated), 1);
}

TEST_F(OperatorInstall, WritesItsLineWhateverFails) {
    write_networks("TST", "TST", {}, network(all_flags()) + items_of_both());
    fail("vconf_set_int");
    fail("vconf_set_str");
    fail("db_util_open");
    fail("zel_platform_open", data_path("voice-mail"));
    install();
    EXPECT_EQ(get_int(kUpdated), std::nullopt);
    EXPECT_THAT(lines_in(kSettingLog), ElementsAre("TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed."));
}

TEST_F(OperatorInstall, ResetsTheProfilesOfTheTelephonyDaemonOnlyWhenTheyCameFromTheSim) {
    write_networks("TST", "TST", {}, network({"AutoVoicemail"}));
    install();
    EXPECT_FALSE(system_logged("[SIM1] dbus_bus_get() failed, return."));
    write_networks("TST", "TST", {}, network({"AutoProfile"}));
    install();
    EXPECT_TRUE(system_logged("[SIM1] dbus_bus_get() failed, return."));
}

TEST_F(OperatorInstall, WithoutABusGoesOn) {
    write_networks("TST", "TST", {}, network({"AutoProfile", "AutoVoicemail"}) + voicemail("One", "11"));
    install(2);
    EXPECT_THAT(messages(), ElementsAre("***** ZEL SIM auto settings / Install operator *****",
                                        "[SIM2] API(pszCustomerName='TST',pszNetworkName='One') run.",
                                        "vconf_get_int(SimSlotCount,2)=0 run.", "tel_get_cp_name_list() succeeded.",
                                        "[SIM2] dbus_bus_get() failed, return."));
    EXPECT_THAT(read(data_path("voice-mail-2")), HasSubstr("11"));
}

TEST_F(OperatorInstall, WithoutModemNamesGoesOnWithoutTheReset) {
    write_networks("TST", "TST", {}, network({"AutoProfile", "AutoVoicemail"}) + voicemail("One", "11"));
    fail("tel_get_cp_name_list");
    install();
    EXPECT_THAT(messages(),
                ElementsAre("***** ZEL SIM auto settings / Install operator *****",
                            "[SIM1] API(pszCustomerName='TST',pszNetworkName='One') run.",
                            "vconf_get_int(SimSlotCount,2)=0 run.", "tel_get_cp_name_list() failed, return."));
    EXPECT_THAT(read(data_path("voice-mail")), HasSubstr("11"));
}

// The daemon reads the profiles when it is told of them, so they must stand in the files by then; and the
// other groups need not wait for it.
TEST_F(OperatorInstall, ResetsRightBehindTheProfiles) {
    write_networks("TST", "TST", {}, network({"AutoProfile", "AutoBookmark"}));
    call("journal-start");
    install();
    const std::vector<std::string> calls = journal();
    const auto [reset, answered] = calls_that_name("tel_get_cp_name_list", calls);
    EXPECT_EQ(reset, answered);
    EXPECT_LT(calls_that_name(data_path("connection"), calls).second, reset);
    EXPECT_LT(reset, calls_that_name(data_path("bookmark"), calls).first);
}

TEST_F(OperatorInstall, GroupsAreInstalledOneBehindTheOtherThenTheUpdateIsTold) {
    write_networks("TST", "TST", {}, network(all_flags()) + items_of_both());
    call("journal-start");
    install(2);
    const std::vector<std::string> calls = journal();
    std::ptrdiff_t before = -1;
    for (const std::string &text :
         {data_path("connection-2"), data_path("bookmark"), data_path("voice-mail-2"), data_path("email-account"),
          data_path("wb-amr"), data_path("fast-dormancy-2"), data_path("max-pdp-2"), data_path("ims-2"),
          std::string{kUpdated}, std::string{kSettingLog2}}) {
        const auto [first, last] = calls_that_name(text, calls);
        EXPECT_LT(before, first) << text;
        before = last;
    }
}

TEST_F(OperatorInstall, FieldsWithoutATerminatorAreReadToTheirEnd) {
    write_networks("TST", "TST", {}, network(all_flags()) + items_of_both());
    std::memset(&operator_, 'x', sizeof operator_);
    install();
    EXPECT_THAT(lines_in(kSettingLog),
                ElementsAre(std::string(10, 'x') + "_" + std::string(40, 'x') + "('" + std::string(10, 'x') +
                            "',(Subset)'" + std::string(10, 'x') + "',(GID)'" + std::string(10, 'x') + "',(SPName)'" +
                            std::string(20, 'x') + "') installed."));
}

TEST_F(OperatorInstall, WithoutAnOperatorDoesNothing) {
    zel_svc_sim_auto_setting_install_operator(nullptr, 1);
    EXPECT_TRUE(system_log().empty());
    EXPECT_EQ(get_int(kUpdated), std::nullopt);
}

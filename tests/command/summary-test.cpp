// What `zel summary` says of the options that the section store keeps.

#include "program.h"
#include "support/sqlite-file.h"

using namespace zel_test;

namespace {

constexpr const char *kData = "/opt/system/zel-default/data/zel-default-data-";

struct ZelSummary : ZelCommand {
    void record(const std::string &group, const std::string &text) { write(kData + group + ".ini", text); }

    // The rows of --json with this name.
    nlohmann::json records_of(const std::string &name) {
        nlohmann::json rows = nlohmann::json::array();
        const nlohmann::json answer = json_of({"summary"});
        for (const auto &row : answer["records"])
            if (row["name"] == name) rows.push_back(row);
        return rows;
    }
};

} // namespace

TEST_F(ZelSummary, OfABlankPhoneHasNoRecordedOptions) {
    EXPECT_EQ(json_of({"summary"})["records"], nlohmann::json::array());
    EXPECT_EQ(run_zel({"summary"}).out.find("Recorded options"), std::string::npos);
}

TEST_F(ZelSummary, ShowsWhatIsRecorded) {
    record("voice-mail", "[voice_mail]\ncount = 2\nname_1 = \"Mailbox\"\ntel_num_1 = \"0123\"\nname_2 = \"Box\"\n");
    record("email", "[email]\nsend_signature = \"Sent; from # here\"\nrecv_poll_time = \"1h\"\n");
    record("active-sync", "[general]\nuse_ssl = 1\n\n[sync_schedule]\npeak_time_start = \"08:00\"\n");
    record("ims", "[attr]\nenable_ims = 1\n\n[volte]\nenable_volte = 0\n");
    record("security", "[security]\nnet_lock_count = 3\nunlock_count = -1\n");
    const Outcome outcome = run_zel({"summary"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    EXPECT_NE(outcome.out.find("\nRecorded options (0: off, 1: on)\n"
                               "  SIM locks: networks            3\n"
                               "  SIM locks: attempts to unlock  -1\n"
                               "  Voicemail 1                    Mailbox\n"
                               "  Voicemail 2                    Box\n"
                               "  Voicemail number 1             0123\n"
                               "  E-mail signature               Sent; from # here\n"
                               "  E-mail poll time               1h\n"
                               "  ActiveSync over SSL            1\n"
                               "  ActiveSync peak time, from     08:00\n"
                               "  IMS                            1\n"
                               "  VoLTE                          0\n"),
              std::string::npos)
        << outcome.out;
}

TEST_F(ZelSummary, NamesTheEntriesInJson) {
    record("email-account", "[email_account]\ncount = 1\nname_1 = \"Gr\xC3\xBC\xC3\x9F\x65\"\npwd_1 = \"hidden\"\n");
    EXPECT_EQ(records_of("E-mail account 1"), nlohmann::json::parse(R"([{"name": "E-mail account 1", "sim": 1,
        "section": "email_account", "key": "name_1", "value": "Grüße"}])"));
    EXPECT_EQ(run_zel({"summary", "--json", "--reveal"}).out.find("hidden"), std::string::npos);
}

TEST_F(ZelSummary, TellsTheSecondSimsFilesApart) {
    record("ims", "[attr]\nenable_ims = 1\n");
    record("ims-2", "[attr]\nenable_ims = 0\n");
    record("email-2", "[email]\nsend_signature = \"nobody's\"\n");
    const nlohmann::json rows = records_of("IMS");
    ASSERT_EQ(rows.size(), 2U);
    EXPECT_EQ(rows[0]["sim"], 1);
    EXPECT_EQ(rows[0]["value"], "1");
    EXPECT_EQ(rows[1]["sim"], 2);
    EXPECT_EQ(rows[1]["value"], "0");
    EXPECT_EQ(records_of("E-mail signature"), nlohmann::json::array());
    EXPECT_NE(run_zel({"summary"}).out.find("IMS, SIM 2"), std::string::npos);
}

TEST_F(ZelSummary, ListsGoByTheirEntriesNotByTheCount) {
    record("voice-mail", "[voice_mail]\ncount = 2147483647\nname_1 = \"Mailbox\"\nname_3 = \"Lost\"\n");
    EXPECT_EQ(records_of("Voicemail 1").size(), 1U);
    EXPECT_EQ(records_of("Voicemail 3").size(), 0U);
}

TEST_F(ZelSummary, DamagedFilesAreToldOfOnceAndEscaped) {
    record("security", "[security\n\x1B[31mred\n");
    record("email", "[email]\nrecv_poll_time = \"1h\"\n");
    const Outcome outcome = run_zel({"summary"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_NE(outcome.out.find("E-mail poll time  1h"), std::string::npos) << outcome.out;
    EXPECT_EQ(outcome.err.find('\x1B'), std::string::npos);
    const std::size_t first = outcome.err.find("\\x1B[31mred");
    EXPECT_NE(first, std::string::npos) << outcome.err;
    EXPECT_EQ(outcome.err.find("\\x1B[31mred", first + 1), std::string::npos) << outcome.err;
}

TEST_F(ZelSummary, LocksAreShownOnceTheyWereAskedFor) {
    set_string("db/zel/salescode", "XFV");
    write("/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml",
          "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<CustomerData><Settings><Main><Security>"
          "<NbNetworkLock>2</NbNetworkLock><UnlockCnt>10</UnlockCnt></Security></Main></Settings></CustomerData>\n");
    EXPECT_EQ(records_of("SIM locks: networks").size(), 0U);
    ASSERT_EQ(run_zel({"locks"}).code, 0);
    ASSERT_EQ(records_of("SIM locks: networks").size(), 1U);
    EXPECT_EQ(records_of("SIM locks: networks")[0]["value"], "2");
    EXPECT_EQ(records_of("SIM locks: attempts to unlock")[0]["value"], "10");
}

namespace {

struct NetworkSummary : ZelSummary {
    void fill(const std::string &sql) const {
        const SqliteFile networks{root() + "/opt/dbspace/.dnet.db"};
        networks.run(sql);
    }
    static std::string profile(int id, const std::string &name, int network, int category, int is_default) {
        return "insert into pdp_profile(profile_id, profile_name, apn, network_info_id, svc_category_id, "
               "default_internet_con) values(" +
               std::to_string(id) + ", '" + name + "', 'apn" + std::to_string(id) + "', " + std::to_string(network) +
               ", " + std::to_string(category) + ", " + std::to_string(is_default) + ");";
    }
};

} // namespace

TEST_F(NetworkSummary, ShowsEachNetworksProfilesOnceItsDefaultsFirst) {
    fill("insert into network_info values(1, 'One', '26201'), (2, 'One', '26202'), (3, 'Two', '26203');" +
         profile(1, "Other", 3, 1, 0) + profile(2, "Web", 3, 1, 1) + profile(3, "Pictures", 3, 2, 1) +
         profile(4, "Emergency", 3, 6, 1) + profile(5, "Last", 3, 0, 0));
    EXPECT_NE(run_zel({"summary"})
                  .out.find("\nNetworks (MCC+MNC) and their profiles (APN), SIM 1\n"
                            "  One          26201 26202\n"
                            "  Two          26203\n"
                            "    Web        apn2         internet        default\n"
                            "    Pictures   apn3         MMS             default\n"
                            "    Emergency  apn4         emergency call  default\n"
                            "    Other      apn1         internet\n"
                            "    +1 more\n"),
              std::string::npos)
        << run_zel({"summary"}).out;
    EXPECT_EQ(json_of({"summary"})["sims"][0]["networks"][2]["profiles"].size(), 5U);
}

TEST_F(NetworkSummary, NetworksOfOneNameWithOtherProfilesStandApart) {
    fill("insert into network_info values(1, 'One', '26201'), (2, 'One', '26202'), (3, 'One', '26203');" +
         profile(1, "Web", 2, 1, 1));
    EXPECT_NE(run_zel({"summary"})
                  .out.find("  One    26201 26203\n"
                            "  One    26202\n"
                            "    Web  apn1         internet  default\n"),
              std::string::npos)
        << run_zel({"summary"}).out;
}

TEST_F(NetworkSummary, LongNamesAreShortenedAtAWholeCharacter) {
    fill("insert into network_info values(1, 'One', '26201');" +
         profile(1, std::string(32, 'n') + "\xC3\xA9" + std::string(9, 'x'), 1, 1, 0));
    EXPECT_NE(run_zel({"summary"}).out.find(std::string(32, 'n') + "...  apn1"), std::string::npos)
        << run_zel({"summary"}).out;
}

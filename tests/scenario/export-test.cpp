// What does this phone say? Its settings, written as a customer's file.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <csignal>
#include <sys/resource.h>
#include <unistd.h>

namespace {

using ::testing::HasSubstr;
using ::testing::Not;
using ::testing::StartsWith;

constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";
constexpr const char *kPending = "/opt/system/zel-default/output/customer-phone.xml.new";

class Export : public zel_test::ServicePhone {
  protected:
    std::string document() { return read(kDocument); }
    void record(const std::string &group, const std::string &section, const std::string &entries) {
        write(data_path(group), "[" + section + "]\n" + entries);
    }
};

} // namespace

TEST_F(Export, OfAFreshPhoneIsADocumentOfEmptyLeaves) {
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_THAT(document(), StartsWith("\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n"
                                       "<CustomerData>\n"
                                       "  <GeneralInfo>\n"
                                       "    <SalesCode></SalesCode>\n"
                                       "    <CountryISO></CountryISO>\n"
                                       "  </GeneralInfo>\n"
                                       "  <Settings>\n"
                                       "    <Main>\n"
                                       "      <Network>\n"
                                       "        <NbMaxPDP></NbMaxPDP>\n"));
    EXPECT_THAT(document(), ::testing::EndsWith("    <GPS>\n"
                                                "      <GPSActivation></GPSActivation>\n"
                                                "    </GPS>\n"
                                                "  </Settings>\n"
                                                "</CustomerData>\n"));
    EXPECT_EQ(document().find('\0'), std::string::npos);
}

TEST_F(Export, WritesNoRunLogLineOfItsOwn) {
    set_string("db/zel/salescode", "BTU");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_THAT(document(), HasSubstr("<SalesCode>BTU</SalesCode>\n"));
    EXPECT_EQ(run_log(), "");
}

TEST_F(Export, DocumentHasTheAttributesOfEveryLog) {
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    const auto stat = call("stat", {{"path", kDocument}});
    EXPECT_EQ(stat["mode"], "0644");
    EXPECT_EQ(stat["owner"], 200);
    EXPECT_EQ(stat["group"], 5000);
    EXPECT_EQ(stat["label"], "*");
    EXPECT_FALSE(exists(kPending));
}

TEST_F(Export, TellsThePhonesValuesNotTheRecordedOnes) {
    record("gps", "gps", "gps_activation = 1\n");
    set_int("db/location/setting/GpsEnabled", 0);
    zel_svc_config_encoding_xml();
    EXPECT_THAT(document(), HasSubstr("<GPSActivation>off</GPSActivation>\n"));
}

TEST_F(Export, WritesAmpersandsAsEntitiesAndNothingElse) {
    set_string("db/zel/country_iso", "a&b<c>\"d\"");
    zel_svc_config_encoding_xml();
    EXPECT_THAT(document(), HasSubstr("<CountryISO>a&amp;b<c>\"d\"</CountryISO>\n"));
}

TEST_F(Export, LanguagesAreWrittenWhenTheyWereRecorded) {
    set_string("db/menu_widget/language", "en_GB.UTF-8");
    zel_svc_config_encoding_xml();
    EXPECT_THAT(document(), Not(HasSubstr("<DefLanguage")));
    write("/opt/system/zel-default/data/zel-default-data.ini",
          "[phone]\nlang_automatic = 0\nlang_no_sim = \"en_GB.UTF-8\"\n");
    zel_svc_config_encoding_xml();
    EXPECT_THAT(document(), HasSubstr("      <Phone>\n        <DefLanguage>"));
    EXPECT_THAT(document(), HasSubstr("</DefLanguage>\n        <DefLanguageNoSIM>"));
}

TEST_F(Export, LooksAtTheFirstSimsFilesOnly) {
    for (const char *group : {"connection", "fast-dormancy", "max-pdp"})
        write(data_path(std::string{group} + "-2"), "[spec]\ncount = 3\n[max_pdp]\ncount = 3\n");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_THAT(document(), Not(HasSubstr("<MaxPDP>")));
    EXPECT_THAT(document(), Not(HasSubstr("<FastDormancy>")));
    EXPECT_THAT(document(), Not(HasSubstr("<Profile>")));
}

TEST_F(Export, CanBeReadBack) {
    set_string("db/zel/country_iso", "A & B");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    write("/opt/system/zel/mps/ZEL/Customer/BTU/customer.xml", document());
    set_string("db/zel/salescode", "BTU");
    ZelSvcSecurityLock locks;
    EXPECT_EQ(zel_svc_config_get_security_lock_info(&locks), 1);
    set_string("db/zel/country_iso", "FR");
    char line[128];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1);
    EXPECT_STREQ(line, "[Spec][CountryISO] Spec='A & B',Phone='FR'");
}

TEST_F(Export, ReplacesAnEarlierDocument) {
    set_string("db/zel/country_iso", std::string(150, 'x'));
    zel_svc_config_encoding_xml();
    const std::size_t longer = document().size();
    set_string("db/zel/country_iso", "GB");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_EQ(document().size(), longer - 148);
}

TEST_F(Export, WithoutItsFolderGivesZeroAndMakesNone) {
    ASSERT_EQ(::rename((root() + "/opt/system/zel-default/output").c_str(), (root() + "/opt/moved").c_str()), 0);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 0);
    EXPECT_FALSE(exists("/opt/system/zel-default/output"));
}

TEST_F(Export, ThatFallsShortGivesZeroAndKeepsTheEarlierDocument) {
    write(kDocument, "an earlier document");
    std::signal(SIGXFSZ, SIG_IGN);
    struct rlimit before = {};
    ASSERT_EQ(::getrlimit(RLIMIT_FSIZE, &before), 0);
    const struct rlimit limit = {1000, before.rlim_max};
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    const int result = zel_svc_config_encoding_xml();
    ::setrlimit(RLIMIT_FSIZE, &before);
    EXPECT_EQ(result, 0);
    EXPECT_EQ(document(), "an earlier document");
    EXPECT_FALSE(exists(kPending));
}

TEST_F(Export, GivesZeroWhenThePhoneRefusesAFile) {
    write(kDocument, "an earlier document");
    for (const char *function : {"zel_platform_open", "zel_platform_open_parent"}) {
        fail(function, function == std::string{"zel_platform_open"} ? kPending : kDocument);
        EXPECT_EQ(zel_svc_config_encoding_xml(), 0) << function;
        EXPECT_EQ(document(), "an earlier document");
        call("fault-clear");
    }
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_FALSE(exists(kPending));
}

TEST_F(Export, TakesAwayWhatARunThatWasCutOffLeft) {
    write(kPending, "half a document", 0600);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_FALSE(exists(kPending));
    EXPECT_THAT(document(), StartsWith("\xEF\xBB\xBF"));
}

TEST_F(Export, ThroughALinkLeavesWhatTheLinkNames) {
    write("/opt/system/elsewhere", "kept");
    ASSERT_EQ(::symlink("/opt/system/elsewhere", (root() + kDocument).c_str()), 0);
    ASSERT_EQ(::symlink("/opt/system/elsewhere", (root() + kPending).c_str()), 0);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_EQ(read("/opt/system/elsewhere"), "kept");
    EXPECT_EQ(call("stat", {{"path", kDocument}})["kind"], "file");
}

TEST_F(Export, IsTheSameAgainAndAgain) {
    zel_svc_config_encoding_xml();
    const std::string first = document();
    zel_svc_config_encoding_xml();
    EXPECT_EQ(document(), first);
}

TEST_F(Export, OfRecordedCountsThatNoCustomerHasEndsQuickly) {
    record("max-pdp", "max_pdp", "count = 2147483647\n");
    record("fast-dormancy", "spec", "count = -5\n");
    record("connection", "spec", "count = 10001\n");
    record("quick-access", "quickaccess", "count = 99999999999\n");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    for (const char *item : {"<MaxPDP>", "<FastDormancy>", "<Profile>", "<QuickAccess>"})
        EXPECT_THAT(document(), Not(HasSubstr(item)));
}

TEST_F(Export, OfAProfileHasBothOfItsAddresses) {
    const auto profile = [](const std::string &name, const std::string &first, const std::string &second) {
        return "<Profile><NetworkName>First</NetworkName><ProfileName>" + name +
               "</ProfileName><DNS><EnableFlag>on</EnableFlag><IPAddr>" + first + "</IPAddr><IPAddr>" + second +
               "</IPAddr></DNS></Profile>";
    };
    write_customer("BTU", "<GeneralInfo><SalesCode>BTU</SalesCode><NetworkInfo><MCCMNC>00101</MCCMNC>"
                          "<NetworkName>First</NetworkName></NetworkInfo></GeneralInfo>"
                          "<Settings><Main><Network></Network></Main><Connections><NbProfile>2</NbProfile>" +
                              profile("one", "10.0.0.1", "10.0.0.2") + profile("two", "10.0.0.3", "10.0.0.4") +
                              "</Connections></Settings>");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_THAT(document(), HasSubstr("      <NbProfile>2</NbProfile>\n"));
    for (const auto &[first, second] : {std::pair{"10.0.0.1", "10.0.0.2"}, {"10.0.0.3", "10.0.0.4"}})
        EXPECT_THAT(document(), HasSubstr(std::string{"        <DNS>\n"
                                                      "          <EnableFlag>on</EnableFlag>\n"
                                                      "          <IPAddr>"} +
                                          first + "</IPAddr>\n          <IPAddr>" + second +
                                          "</IPAddr>\n"
                                          "        </DNS>\n"));
}

TEST_F(Export, WritesNoItemWhereAServiceHasNone) {
    zel_svc_config_encoding_xml();
    EXPECT_THAT(document(), HasSubstr("      <NbBookmark>0</NbBookmark>\n      <NbQuickAccess>0</NbQuickAccess>\n"));
    EXPECT_THAT(document(), HasSubstr("      <NbDataSync>0</NbDataSync>\n    </SyncML>\n"));
    call("bookmarks-add", {{"title", "A & B"}, {"url", "http://a.example.com/"}});
    zel_svc_config_encoding_xml();
    EXPECT_THAT(document(), HasSubstr("      <NbBookmark>1</NbBookmark>\n"
                                      "      <Bookmark>\n"
                                      "        <Editable>yes</Editable>\n"
                                      "        <Folder></Folder>\n"
                                      "        <BookmarkName>A &amp; B</BookmarkName>\n"
                                      "        <URL>http://a.example.com/</URL>\n"
                                      "      </Bookmark>\n"
                                      "      <NbQuickAccess>0</NbQuickAccess>\n"));
}

TEST_F(Export, OfServicesThatRefuseHasTheCountAsUnreadableAndNoItems) {
    call("bookmarks-add", {{"title", "A"}, {"url", "http://a.example.com/"}});
    fail("bookmark_zel_initialize");
    fail("sync_agent_ds_init");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_THAT(document(), HasSubstr("<NbBookmark>?\?</NbBookmark>\n      <NbQuickAccess>"));
    EXPECT_THAT(document(), HasSubstr("<NbDataSync>?\?</NbDataSync>\n    </SyncML>\n"));
}

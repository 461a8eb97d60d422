// Export of a phone whose recorded entries somebody has changed: strange numbers, missing entries, long texts.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <sys/stat.h>

namespace {

using ::testing::HasSubstr;

constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";

class ExportOfEntries : public zel_test::ServicePhone {
  protected:
    std::string exported() {
        EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
        return read(kDocument);
    }
    void record(const std::string &group, const std::string &entries) { write(data_path(group), entries); }
};

std::ptrdiff_t times(const std::string &text, const std::string &part) {
    std::ptrdiff_t count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + part.size()))
        ++count;
    return count;
}

} // namespace

TEST_F(ExportOfEntries, LimitsAreNumbersOrNothing) {
    record("max-pdp", "[max_pdp]\ncount = 3\nnetwork_name_1 = \"a & b\"\nmax_pdp_2g_1 = -1\nmax_pdp_3g_1 = 0x10\n"
                      "network_name_2 = \"" +
                          std::string(50, 'n') + "\"\nmax_pdp_2g_2 = two\nmax_pdp_3g_2 = -2\n");
    EXPECT_THAT(exported(), HasSubstr("        <NbMaxPDP></NbMaxPDP>\n"
                                      "        <MaxPDP>\n"
                                      "          <NetworkName>a &amp; b</NetworkName>\n"
                                      "          <MaxPDP2G></MaxPDP2G>\n"
                                      "          <MaxPDP3G>16</MaxPDP3G>\n"
                                      "        </MaxPDP>\n"
                                      "        <MaxPDP>\n"
                                      "          <NetworkName>" +
                                      std::string(39, 'n') +
                                      "</NetworkName>\n"
                                      "          <MaxPDP2G>0</MaxPDP2G>\n"
                                      "          <MaxPDP3G>-2</MaxPDP3G>\n"
                                      "        </MaxPDP>\n"
                                      "        <MaxPDP>\n"
                                      "          <NetworkName></NetworkName>\n"
                                      "          <MaxPDP2G></MaxPDP2G>\n"
                                      "          <MaxPDP3G></MaxPDP3G>\n"
                                      "        </MaxPDP>\n"
                                      "        <NbFastDormancy>0</NbFastDormancy>\n"));
}

TEST_F(ExportOfEntries, DormanciesAreWordsAndSecondsOrNothing) {
    record("fast-dormancy", "[spec]\ncount = 2\nenable_1 = 2\nlcd_1 = -1\ntime_out_1 = -5\nversion_1 = \"" +
                                std::string(30, 'v') +
                                "\"\nenable_2 = 0\nlcd_2 = 1\ntime_out_2 = 1234567\nnetwork_name_2 = \"\"\n");
    EXPECT_THAT(exported(), HasSubstr("        <NbFastDormancy>2</NbFastDormancy>\n"
                                      "        <FastDormancy>\n"
                                      "          <NetworkName></NetworkName>\n"
                                      "          <FastDormancyEnableStatus></FastDormancyEnableStatus>\n"
                                      "          <TimeoutValue></TimeoutValue>\n"
                                      "          <LCDStatus></LCDStatus>\n"
                                      "          <Version>" +
                                      std::string(19, 'v') +
                                      "</Version>\n"
                                      "        </FastDormancy>\n"
                                      "        <FastDormancy>\n"
                                      "          <NetworkName></NetworkName>\n"
                                      "          <FastDormancyEnableStatus>off</FastDormancyEnableStatus>\n"
                                      "          <TimeoutValue>1234.57</TimeoutValue>\n"
                                      "          <LCDStatus>on</LCDStatus>\n"
                                      "          <Version></Version>\n"
                                      "        </FastDormancy>\n"
                                      "        <WbAmr>\n"));
}

TEST_F(ExportOfEntries, QuickAccessIsCutAtAWholeCharacter) {
    std::string title = "x";
    for (int i = 0; i < 120; ++i)
        title += "\xC3\xA9";
    record("quick-access", "[quickaccess]\ncount = 2\neditable_1 = 3\ntitle_1 = \"" + title +
                               "\"\nurl_1 = \"http://a/?b&c\"\neditable_2 = 0\n");
    EXPECT_THAT(exported(), HasSubstr("      <NbQuickAccess>2</NbQuickAccess>\n"
                                      "      <QuickAccess>\n"
                                      "        <Editable></Editable>\n"
                                      "        <QATitle>" +
                                      title.substr(0, 199) +
                                      "</QATitle>\n"
                                      "        <QAURL>http://a/?b&amp;c</QAURL>\n"
                                      "      </QuickAccess>\n"
                                      "      <QuickAccess>\n"
                                      "        <Editable>no</Editable>\n"
                                      "        <QATitle></QATitle>\n"
                                      "        <QAURL></QAURL>\n"
                                      "      </QuickAccess>\n"));
    title.insert(1, "y");
    record("quick-access", "[quickaccess]\ncount = 1\ntitle_1 = \"" + title + "\"\n");
    EXPECT_THAT(exported(), HasSubstr("<QATitle>" + title.substr(0, 198) + "</QATitle>\n"));
}

TEST_F(ExportOfEntries, ProfilesWithoutARowHaveEmptyLeaves) {
    record("connection", "[spec]\ncount = 4\nprofile_id_1 = -1\nprofile_id_2 = 99999\nprofile_id_3 = some\n");
    const std::string document = exported();
    EXPECT_THAT(document, HasSubstr("      <NbProfile>4</NbProfile>\n"
                                    "      <Profile>\n"
                                    "        <NetworkName></NetworkName>\n"
                                    "        <ProfileName></ProfileName>\n"
                                    "        <Editable></Editable>\n"));
    EXPECT_EQ(times(document, "<Profile>\n"), 4);
    EXPECT_EQ(times(document, "        <Auth></Auth>\n        <PSparam>\n          <APN></APN>\n"), 4);
    EXPECT_EQ(times(document, "          <IPAddr></IPAddr>\n          <IPAddr></IPAddr>\n        </DNS>\n"), 4);
}

// Entries of the section store in the form of a section have no value.
TEST_F(ExportOfEntries, SectionsInTheNameOfAnEntryAreNone) {
    record("max-pdp", "[max_pdp:count]\n");
    record("fast-dormancy", "[spec:count]\n");
    record("quick-access", "[quickaccess:count]\n");
    record("connection", "[spec:count]\n");
    const std::string document = exported();
    for (const char *count : {"NbFastDormancy", "NbQuickAccess", "NbProfile"})
        EXPECT_THAT(document, HasSubstr(std::string{"<"} + count + ">0</" + count + ">\n"));
    for (const char *item : {"<MaxPDP>", "<FastDormancy>", "<QuickAccess>", "<Profile>"})
        EXPECT_EQ(times(document, item), 0) << item;
}

TEST_F(ExportOfEntries, FilesThatDoNotLoadAreAsGoodAsNone) {
    const std::string fresh = exported();
    for (const char *group : {"max-pdp", "fast-dormancy", "quick-access", "connection", "gps"})
        record(group, "[unclosed\ncount = 3\n");
    EXPECT_EQ(exported(), fresh);
    for (const char *group : {"message", "browser"})
        write(data_path(group) + "/a-folder-of-that-name", "");
    EXPECT_EQ(exported(), fresh);
}

TEST_F(ExportOfEntries, DocumentInTheNameOfAFolderIsNone) {
    ASSERT_EQ(::mkdir((root() + kDocument).c_str(), 0755), 0);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 0);
    EXPECT_FALSE(exists(std::string{kDocument} + ".new"));
    EXPECT_EQ(call("stat", {{"path", kDocument}})["kind"], "folder");
}

// Another component has the value behind the key in its own type.
TEST_F(ExportOfEntries, KeysOfAnotherTypeAreUnreadable) {
    record("gps", "[gps]\ngps_activation = 1\n");
    set_string("db/location/setting/GpsEnabled", "on");
    record("contact", "[contact]\nmatch_digit = 7\n");
    set_bool("db/contacts-svc/phonenumber_min_match_digit", true);
    set_int("db/zel/country_iso", 44);
    set_int("db/ciss/minute_minder", 1);
    set_bool("db/private/sound/volume/ringtone", true);
    write("/opt/system/zel-default/data/zel-default-data.ini", "[phone]\nlang_automatic = 0\nlang_no_sim = a\n");
    set_int("db/menu_widget/language", 1);
    const std::string document = exported();
    for (const char *leaf : {"<GPSActivation>?\?</GPSActivation>\n", "<CLIDigits>-999</CLIDigits>\n",
                             "<CountryISO></CountryISO>\n", "<MinuteMind></MinuteMind>\n", "<RngVolume></RngVolume>\n",
                             "<DefLanguage>?\?</DefLanguage>\n", "<DefLanguageNoSIM>?\?</DefLanguageNoSIM>\n"})
        EXPECT_THAT(document, HasSubstr(leaf));
}

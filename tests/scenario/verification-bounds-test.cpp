// Verification: where texts are cut, how small a caller's buffer may be, and what may stand in the way of the report.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <memory>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::StartsWith;

constexpr const char *kReport = "/opt/system/zel-default/output/zel-verification-report.log";
constexpr const char *kApp = "/opt/system/zel-default/app/";

class VerificationBounds : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        set_string("db/zel/salescode", "BTU");
        set_string("db/zel/country_iso", "GB");
    }

    // A file whose one line is `label`, then `spec` and what the phone says instead.
    void make_differing(const std::string &spec) {
        write_customer("BTU", "<GeneralInfo><CountryISO>" + spec + "</CountryISO></GeneralInfo>");
    }

    std::unique_ptr<ZelSvcVerificationResult[]> results_ =
        std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
};

} // namespace

// "[Spec][CountryISO] Spec='" are 25 bytes, so 280 of the value are left; each character has two.
TEST_F(VerificationBounds, SpecLineIsCutAtAWholeCharacter) {
    std::string even;
    for (int i = 0; i < 200; ++i)
        even += "\xC3\xA9";
    make_differing(even);
    EXPECT_EQ(verified_lines().at(2), "-[Spec][CountryISO] Spec='" + even.substr(0, 280));
    make_differing("x" + even);
    EXPECT_EQ(verified_lines().at(2), "-[Spec][CountryISO] Spec='x" + even.substr(0, 278))
        << "304 bytes, not half a character";
    EXPECT_THAT(read(kReport), HasSubstr("Spec='x" + even.substr(0, 278) + " ==> Failure\n"));
}

// "[App][Customer1] " are 17 bytes, so 288 of the name are left.
TEST_F(VerificationBounds, ApplicationLineAndItsPartsAreCutAtWholeCharacters) {
    std::string name;
    for (int i = 0; i < 200; ++i)
        name += "\xC3\xA9";
    write(std::string{kApp} + "applist.ini",
          "[zel packages]\nname_001 = x" + name + "\nname_002 = a\ntype_002 = 12345678" + name + "\n");
    write(std::string{kApp} + "appresult.ini", "[result]\ncount = 2\ndescription_001 = op=x\nresult_001 = success\n"
                                               "description_002 = op=1234567890123456789" +
                                                   name + "\nresult_002 = success\n");
    const auto lines = verified_lines();
    EXPECT_EQ(lines.at(1), "+[App][Customer1] x" + name.substr(0, 286));
    EXPECT_EQ(lines.at(2), "+[App][Customer2] a(12345678,1234567890123456789)");
}

TEST_F(VerificationBounds, HeadHasNineBytesOfTheCodeAndOfEachPartOfTheVersion) {
    set_string("db/private/zel/bin_name", "NAME56789-and-more");
    set_string("db/private/zel/bin_version", "VERS56789-and-more");
    set_string("db/zel/salescode", "CODE56789-and-more");
    write_customer("CODE56789", "<GeneralInfo><SalesCode>CODE56789</SalesCode></GeneralInfo>");
    EXPECT_THAT(verified_lines("[Spec]"), ElementsAre("+[Spec][SalesCode] Spec='CODE56789',Phone='CODE56789'"));
    EXPECT_THAT(read(kReport), StartsWith("ZEL Version : NAME56789VERS56789\nSales code : CODE56789\n---"));
}

TEST_F(VerificationBounds, CodesThatNameNoFolderCompareNoFile) {
    write_spec("/opt/system/zel/mps/ZEL/Customer/customer.xml", "<CountryISO>FR</CountryISO>");
    write_spec("/opt/system/zel/mps/ZEL/customer.xml", "<CountryISO>FR</CountryISO>");
    write_customer("a/b", "<CountryISO>FR</CountryISO>");
    for (const std::string code : {".", "..", "a/b", "/", "DEF"}) {
        set_string("db/zel/salescode", code);
        EXPECT_THAT(verified_lines("[Spec]"), ::testing::IsEmpty()) << code;
        EXPECT_THAT(read(kReport), HasSubstr("\nSales code : " + (code == "DEF" ? "" : code) + "\n---")) << code;
        EXPECT_THAT(read(kReport), HasSubstr("\nVerification Result : OK!\n")) << code;
    }
}

TEST_F(VerificationBounds, AFullEntryIsTerminatedAndTheNextOneUntouched) {
    make_differing(std::string(400, 'x'));
    std::int32_t count = -7;
    results_[3].text[0] = 'k';
    results_[3].passed = 77;
    EXPECT_EQ(zel_svc_config_verification(results_.get(), &count), 1);
    ASSERT_EQ(count, 3);
    EXPECT_EQ(results_[2].text[304], 'x');
    EXPECT_EQ(results_[2].text[305], '\0');
    EXPECT_EQ(results_[3].text[0], 'k');
    EXPECT_EQ(results_[3].passed, 77);
}

TEST_F(VerificationBounds, ForImeiOfTheSmallestBuffers) {
    make_differing("FR");
    char line[4] = {'a', 'b', 'c', 'd'};
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, 1), 1);
    EXPECT_EQ(line[0], '\0') << "room for nothing but the end";
    EXPECT_EQ(line[1], 'b');
    line[0] = 'a';
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, -1), 1);
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, INT32_MIN), 1);
    EXPECT_EQ(line[0], 'a');
    EXPECT_EQ(zel_svc_config_verification_for_imei(nullptr, 0), 1);
    set_string("db/zel/salescode", "");
    for (const int size : {0, -1, INT32_MIN})
        EXPECT_EQ(zel_svc_config_verification_for_imei(line, size), 1);
    EXPECT_EQ(line[0], 'a');
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, 1), 1);
    EXPECT_EQ(line[0], '\0');
}

TEST_F(VerificationBounds, ForImeiCutsTheLineAtAWholeCharacter) {
    make_differing("x\xE4\xB8\xAD");
    char line[64];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, 29), 1);
    EXPECT_STREQ(line, "[Spec][CountryISO] Spec='x") << "two of the character's three bytes had found room";
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, 30), 1);
    EXPECT_STREQ(line, "[Spec][CountryISO] Spec='x\xE4\xB8\xAD");
}

TEST_F(VerificationBounds, ForImeiCountsEveryKindAndGivesTheFirstOfTheList) {
    write("/opt/system/zel-default/output/zel-fs-status-config.ini", "[media]\nvideo_size = 7\nvideo_count = 1\n");
    write(std::string{kApp} + "applist.ini", "[zel packages]\nname_001 = a\n");
    write(std::string{kApp} + "appresult.ini", "[result]\ncount = 1\nresult_001 = fail\n");
    make_differing("FR");
    char line[64];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 4);
    EXPECT_STREQ(line, "[FS] media/video size 7=>0");
}

TEST_F(VerificationBounds, FiguresOfAnInstallAreReadAsNumbersWhateverStandsThere) {
    make_differing("GB");
    write("/opt/usr/media/Images/a.png", "12345");
    struct Figures {
        const char *entries;
        const char *size;
        const char *count;
    };
    for (const Figures &figures : {Figures{"image_size = -5\nimage_count = -1\n", "-0", "--1"},
                                   {"image_size = 99999999999999999999\nimage_count = 0x10\n", "-4294967295", "-16"},
                                   {"image_size = \"5 bytes\"\nimage_count = one\n", "+5", "-0"},
                                   {"image_size = 0x5\nimage_count = 01\n", "-0", "+1"},
                                   {"image_size = +5\nimage_count = 010\n", "+5", "-8"},
                                   {"image_size =\nimage_count =\n", "-0", "-0"}}) {
        write("/opt/system/zel-default/output/zel-fs-status-config.ini", std::string{"[media]\n"} + figures.entries);
        const auto line = [](char passed, const std::string &what, const std::string &now) {
            return passed + ("[FS] media/image " + what) + "=>" + now;
        };
        EXPECT_THAT(verified_lines("[FS] media/image"),
                    ElementsAre(line(*figures.size, std::string{"size "} + (figures.size + 1), "5"),
                                line(*figures.count, std::string{"count "} + (figures.count + 1), "1")))
            << figures.entries;
    }
}

// The INI library's own reading decides what a count is.
TEST_F(VerificationBounds, CountsOfApplicationsInStrangeForms) {
    write_customer("BTU", "");
    write(std::string{kApp} + "applist.ini", "[zel packages]\n");
    for (const auto &[count, expected] : {std::pair{"\"2\"", 2U},
                                          {"0x3", 3U},
                                          {"010", 8U},
                                          {"2 and more", 2U},
                                          {"two", 0U},
                                          {"", 0U},
                                          {"-2147483648", 0U},
                                          {"-1", 0U},
                                          {"1000", 999U}}) {
        write(std::string{kApp} + "appresult.ini", std::string{"[result]\ncount = "} + count + "\n");
        EXPECT_EQ(verified_lines().size(), 1 + expected) << count;
    }
}

// A section of an entry's name has no value.
TEST_F(VerificationBounds, SectionsInTheNameOfAnEntryAreNone) {
    write_customer("BTU", "");
    write(std::string{kApp} + "applist.ini", "[zel packages:name_001]\n[zel packages]\ntype_001 = tpk\n");
    write(std::string{kApp} + "appresult.ini",
          "[result:result_001]\n[result:description_002]\n[result]\ncount = 2\ndescription_001 = op=x\n"
          "result_002 = success\n");
    EXPECT_THAT(verified_lines(),
                ElementsAre("+[App][Default] App NOT existed.", "-[App][Customer1] unknown(tpk,x),Result unknown",
                            "+[App][Customer2] File unknown"));
}

// The INI library reads a folder as it reads an empty file.
TEST_F(VerificationBounds, FoldersInTheNameOfAFileHoldNothing) {
    write_customer("BTU", "");
    for (const char *name : {"appresult.ini/x", "applist_def.ini/x", "applist.ini/x"})
        write(std::string{kApp} + name, "");
    write(std::string{kApp} + "appresult_def.ini", "[result]\ncount = 1\ndescription_001 = op=x\nresult_001 = fail\n");
    write("/opt/system/zel-default/output/zel-fs-status-config.ini/x", "");
    const auto lines = verified_lines();
    ASSERT_EQ(lines.size(), 21U);
    EXPECT_EQ(lines.at(0), "+[FS] media/wallpaper size 0=>0");
    EXPECT_EQ(lines.at(20), "-[App][Default1] unknown(unknown,x),fail");
}

TEST_F(VerificationBounds, OperationEndsAtTheFirstOfItsEnds) {
    write_customer("BTU", "");
    write(std::string{kApp} + "applist.ini", "[zel packages]\nname_001 = a\nname_002 = b\nname_003 = c\nname_004 =\n");
    write(std::string{kApp} + "appresult.ini", "[result]\ncount = 4\n"
                                               "description_001 = 'op=:install'\nresult_001 = success\n"
                                               "description_002 = stop=now op=install\nresult_002 = success\n"
                                               "description_003 = op=\nresult_003 = success\n"
                                               "description_004 = op=op=x\nresult_004 = success\n");
    const auto lines = verified_lines();
    EXPECT_EQ(lines.at(1), "+[App][Customer1] a(unknown,)");
    EXPECT_EQ(lines.at(2), "+[App][Customer2] b(unknown,now op=install)") << "the first \"op=\", wherever it stands";
    EXPECT_EQ(lines.at(3), "+[App][Customer3] c(unknown,)");
    EXPECT_EQ(lines.at(4), "+[App][Customer4] (unknown,op=x)") << "an empty name is a name";
}

TEST_F(VerificationBounds, ReportReplacesALinkAndLeavesWhatItNames) {
    make_differing("GB");
    write("/opt/system/elsewhere", "kept");
    ASSERT_EQ(::symlink("/opt/system/elsewhere", (root() + kReport).c_str()), 0);
    verified_lines();
    EXPECT_EQ(read("/opt/system/elsewhere"), "kept");
    EXPECT_THAT(read(kReport), StartsWith("ZEL Version : "));
}

TEST_F(VerificationBounds, ReportInTheNameOfAFolderOrWithoutItsFolderIsNone) {
    make_differing("GB");
    std::int32_t count = 0;
    ASSERT_EQ(::mkdir((root() + kReport).c_str(), 0755), 0);
    EXPECT_EQ(zel_svc_config_verification(results_.get(), &count), 0);
    EXPECT_EQ(count, 3);
    ASSERT_EQ(::rename((root() + "/opt/system/zel-default/output").c_str(), (root() + "/opt/moved").c_str()), 0);
    EXPECT_EQ(zel_svc_config_verification(results_.get(), &count), 0);
    EXPECT_EQ(count, 3);
    EXPECT_FALSE(exists("/opt/system/zel-default/output"));
}

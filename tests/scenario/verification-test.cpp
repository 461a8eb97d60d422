// Is this phone what its customer's file says? The list, the report and the answer for the IMEI tools.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <memory>
#include <span>
#include <sys/stat.h>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

constexpr const char *kOutput = "/opt/system/zel-default/output/";
constexpr const char *kApp = "/opt/system/zel-default/app/";
constexpr const char *kGpsKey = "db/location/setting/GpsEnabled";

class Verification : public zel_test::ServicePhone {
  protected:
    void make_active(const std::string &customer) { set_string("db/zel/salescode", customer); }

    // A phone of customer BTU whose file says one thing, which the phone says as well.
    void make_good() {
        make_active("BTU");
        write_customer("BTU", "<GPS><GPSActivation>on</GPSActivation></GPS>");
        set_int(kGpsKey, 1);
    }

    int verify() { return zel_svc_config_verification(results_.get(), &count_); }
    [[nodiscard]] std::span<const ZelSvcVerificationResult> results() const {
        return {results_.get(), static_cast<std::size_t>(count_)};
    }

    // "+" for a passed line and "-" for a failed one in front of it.
    [[nodiscard]] std::vector<std::string> lines(std::string_view label = "") const {
        std::vector<std::string> found;
        for (const ZelSvcVerificationResult &result : results())
            if (std::string_view{result.text}.starts_with(label))
                found.push_back((result.passed == 1 ? "+" : "-") + std::string{result.text});
        return found;
    }
    std::string report() { return read(std::string{kOutput} + "zel-verification-report.log"); }

    void write_status(const std::string &file, const std::string &entries) {
        write(std::string{kOutput} + "zel-fs-status-" + file + ".ini", "[media]\n" + entries);
    }

    int count_ = -1;
    std::unique_ptr<ZelSvcVerificationResult[]> results_ =
        std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
};

} // namespace

TEST_F(Verification, ReportOfAPhoneThatIsWhatItsPackageSays) {
    make_good();
    EXPECT_EQ(verify(), 1);
    EXPECT_THAT(lines(), ElementsAre("+[App][Default] App NOT existed.", "+[App][Customer] App NOT existed.",
                                     "+[Spec][GPS/GPSActivation] Spec='on',Phone='on'"));
    EXPECT_EQ(report(), "ZEL Version : Q0000NXBBBB1\n"
                        "Sales code : BTU\n"
                        "---------------------------------\n"
                        "Verification Result : OK!\n"
                        "---------------------------------\n"
                        "Pass count : 3\n"
                        "Failure count : 0\n"
                        "\n"
                        "[App][Default] App NOT existed. ==> Pass\n"
                        "[App][Customer] App NOT existed. ==> Pass\n"
                        "[Spec][GPS/GPSActivation] Spec='on',Phone='on' ==> Pass\n");
}

TEST_F(Verification, ReportOfAPhoneThatIsNot) {
    make_good();
    set_int(kGpsKey, 0);
    write_header("<CustomerDataSet><ZELName>Q7N0O</ZELName><ZELVersion>ZL1BVA1</ZELVersion></CustomerDataSet>");
    EXPECT_EQ(verify(), 1);
    EXPECT_EQ(report(), "ZEL Version : Q7N0OZL1BVA1\n"
                        "Sales code : BTU\n"
                        "---------------------------------\n"
                        "Verification Result : NOT OK!\n"
                        "---------------------------------\n"
                        "Pass count : 2\n"
                        "Failure count : 1\n"
                        "\n"
                        "[App][Default] App NOT existed. ==> Pass\n"
                        "[App][Customer] App NOT existed. ==> Pass\n"
                        "[Spec][GPS/GPSActivation] Spec='on',Phone='off' ==> Failure\n");
}

TEST_F(Verification, ReportNamesTheInternalNameOfASharedFolder) {
    make_active("UFN");
    write_customer("TFG", "<GPS><GPSActivation>on</GPSActivation></GPS>");
    EXPECT_EQ(verify(), 1);
    EXPECT_THAT(report(), HasSubstr("\nSales code : UFN(internal:TFG)\n-"));
    EXPECT_THAT(lines("[Spec]"), ElementsAre("-[Spec][GPS/GPSActivation] Spec='on',Phone='?\?'"));
}

TEST_F(Verification, ReportHasTheAttributesOfEveryLogAndReplacesTheLastOne) {
    make_good();
    write(std::string{kOutput} + "zel-verification-report.log", "an earlier report\n", 0600);
    EXPECT_EQ(verify(), 1);
    EXPECT_THAT(report(), ::testing::StartsWith("ZEL Version : "));
    const auto stat = call("stat", {{"path", std::string{kOutput} + "zel-verification-report.log"}});
    EXPECT_EQ(stat["mode"], "0644");
    EXPECT_EQ(stat["owner"], 200);
    EXPECT_EQ(stat["group"], 5000);
    EXPECT_EQ(stat["label"], "*");
}

TEST_F(Verification, GivesZeroAndAFullListWhenTheReportCannotBeOpened) {
    make_good();
    set_int(kGpsKey, 0);
    fail("zel_platform_open", std::string{kOutput} + "zel-verification-report.log");
    EXPECT_EQ(verify(), 0);
    EXPECT_EQ(lines("[Spec]").size(), 1U);
    char line[64];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1) << "it counts the list all the same";
    EXPECT_STREQ(line, "[Spec][GPS/GPSActivation] Spec='on',Phone='off'");
}

TEST_F(Verification, StartsFromNothingEachTime) {
    make_good();
    set_int(kGpsKey, 0);
    verify();
    set_int(kGpsKey, 1);
    EXPECT_EQ(verify(), 1);
    EXPECT_EQ(count_, 3);
    EXPECT_THAT(report(), HasSubstr("Verification Result : OK!\n"));
}

TEST_F(Verification, WithoutAnActiveCustomerComparesNoFile) {
    write_customer("BTU", "<GPS><GPSActivation>on</GPSActivation></GPS>");
    write("/opt/system/zel/mps/ZEL/Customer/customer.xml", "\xEF\xBB\xBF<GPS><GPSActivation>on</GPSActivation></GPS>");
    EXPECT_EQ(verify(), 1);
    EXPECT_EQ(count_, 2);
    EXPECT_THAT(report(), HasSubstr("\nSales code : \n"));
    EXPECT_THAT(report(), HasSubstr("Verification Result : OK!\n"));
}

TEST_F(Verification, WithoutTheCustomersFileComparesNothing) {
    make_active("BTU");
    EXPECT_EQ(verify(), 1);
    EXPECT_EQ(count_, 2);
}

TEST_F(Verification, ReadsTheAutoFlagsOfTheFileFirst) {
    make_active("BTU");
    const auto file = [](const char *flag) {
        return "<Settings><Main><Network><WbAmr><WbAmrCodec>on</WbAmrCodec></WbAmr><AutoWbAmr>" + std::string{flag} +
               "</AutoWbAmr></Network></Main></Settings>";
    };
    write_customer("BTU", file("on"));
    verify();
    EXPECT_THAT(lines("[Spec]"), IsEmpty()) << "the codec is the SIM's: the flag stands behind it in the file";
    write_customer("BTU", file("off"));
    verify();
    EXPECT_EQ(lines("[Spec]").size(), 1U);
}

TEST_F(Verification, ChangesNothingOfThePhonesSettings) {
    make_good();
    mark_group("gps");
    mark_group("max-pdp");
    set_int(kGpsKey, 0);
    set_string("db/zel/country_iso", "GB");
    write_customer("BTU", "<GeneralInfo><CountryISO>FR</CountryISO></GeneralInfo>"
                          "<GPS><GPSActivation>on</GPSActivation></GPS>");
    verify();
    EXPECT_EQ(get_int(kGpsKey), 0);
    EXPECT_EQ(get_string("db/zel/country_iso"), "GB");
    EXPECT_TRUE(group_is_marked("gps"));
    EXPECT_TRUE(group_is_marked("max-pdp"));
    EXPECT_EQ(run_log(), "");
}

TEST_F(Verification, RefusesANullListOrCount) {
    make_good();
    EXPECT_EQ(zel_svc_config_verification(nullptr, &count_), 0);
    EXPECT_EQ(zel_svc_config_verification(results_.get(), nullptr), 0);
    EXPECT_FALSE(exists(std::string{kOutput} + "zel-verification-report.log"));
}

TEST_F(Verification, OfMediaComparesEachCategoryWithTheInstall) {
    make_good();
    write("/opt/usr/media/Images/a.png", "12345");
    write("/opt/usr/media/DCIM/b.jpg", "123");
    write_status("config", "wallpaper_size = 0\nwallpaper_count = 0\nringtone_size = 7\nringtone_count = 0\n"
                           "alerttone_size = 0\nalerttone_count = 2\nimage_size = 5\nimage_count = 1\n"
                           "camera_size = 4294967295\ncamera_count = 1\n");
    verify();
    EXPECT_THAT(lines("[FS]"), ElementsAre("+[FS] media/wallpaper size 0=>0", "+[FS] media/wallpaper count 0=>0",
                                           "-[FS] media/ringtone size 7=>0", "+[FS] media/ringtone count 0=>0",
                                           "+[FS] media/alerttone size 0=>0", "-[FS] media/alerttone count 2=>0",
                                           "+[FS] media/alarmtone size 0=>0", "+[FS] media/alarmtone count 0=>0",
                                           "+[FS] media/image size 5=>5", "+[FS] media/image count 1=>1",
                                           "+[FS] media/sound size 0=>0", "+[FS] media/sound count 0=>0",
                                           "+[FS] media/video size 0=>0", "+[FS] media/video count 0=>0",
                                           "+[FS] media/others size 0=>0", "+[FS] media/others count 0=>0",
                                           "-[FS] media/camera size 4294967295=>3", "+[FS] media/camera count 1=>1",
                                           "+[FS] media/screenshot size 0=>0", "+[FS] media/screenshot count 0=>0"));
    EXPECT_TRUE(exists(std::string{kOutput} + "zel-fs-status-verify.ini"));
}

TEST_F(Verification, WhereOnlyAMediaFolderChangedIsStillOk) {
    make_good();
    write_status("config", "image_size = 4\nimage_count = 1\n");
    write("/opt/usr/media/Images/a.png", "12345");
    EXPECT_EQ(verify(), 1);
    EXPECT_THAT(report(), HasSubstr("Verification Result : OK!\n---------------------------------\n"
                                    "Pass count : 23\nFailure count : 0\n\n"));
    EXPECT_THAT(report(), HasSubstr("[FS] media/image size 4=>5 ==> Failure\n"
                                    "[FS] media/image count 1=>1 ==> Pass\n"));
    char line[64];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1);
    EXPECT_STREQ(line, "[FS] media/image size 4=>5");
}

TEST_F(Verification, OfMediaNeedsBothStatusFiles) {
    make_good();
    verify();
    EXPECT_THAT(lines("[FS]"), IsEmpty()) << "no figures of an install";
    write_status("config", "");
    fail("zel_platform_open", std::string{kOutput} + "zel-fs-status-verify.ini");
    verify();
    EXPECT_THAT(lines("[FS]"), IsEmpty());
}

TEST_F(Verification, OfApplicationsTellsWhatBecameOfEach) {
    make_good();
    write(std::string{kApp} + "applist_def.ini", "[zel packages]\nname_001 = com.example.mail\ntype_001 = tpk\n"
                                                 "name_002 = com.example.shop\nname_004 = com.example.maps\n"
                                                 "type_004 = longer-than-nine\n");
    write(std::string{kApp} + "appresult_def.ini",
          "[result]\ncount = 6\n"
          "description_001 = \"pkg:com.example.mail op=install:rest op=second\"\nresult_001 = success\n"
          "description_002 = \"op=enable\"\nresult_002 = fail\n"
          "result_003 = success\n"
          "description_004 = \"op=a-very-long-operation-indeed\"\n"
          "description_005 = \"nothing to see\"\nresult_005 =\n"
          "description_006 = 'op=say\"quoted\"'\nresult_006 = SUCCESS\n");
    write(std::string{kApp} + "applist.ini", "[zel packages]\nname_001 = com.example.own\ntype_001 = wgt\n");
    write(std::string{kApp} + "appresult.ini",
          "[result]\ncount = 1\ndescription_001 = \"op=install\"\nresult_001 = success\n");
    verify();
    EXPECT_THAT(lines("[App]"),
                ElementsAre("+[App][Default1] com.example.mail(tpk,install)",
                            "-[App][Default2] com.example.shop(unknown,enable),fail", "+[App][Default3] File unknown",
                            "-[App][Default4] com.example.maps(longer-th,a-very-long-operatio),Result unknown",
                            "-[App][Default5] unknown(unknown,unknown),",
                            "-[App][Default6] unknown(unknown,say),SUCCESS",
                            "+[App][Customer1] com.example.own(wgt,install)"));
    EXPECT_THAT(report(), HasSubstr("[App][Default2] com.example.shop(unknown,enable),fail ==> Failure\n"));
    EXPECT_THAT(report(), HasSubstr("Verification Result : OK!\n"));
    EXPECT_THAT(report(), HasSubstr("Failure count : 0\n"));
    char line[64];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 4);
    EXPECT_STREQ(line, "[App][Default2] com.example.shop(unknown,enable),fail");
}

TEST_F(Verification, OfApplicationsAddsNothingWhereAFileDoesNotLoad) {
    make_good();
    write(std::string{kApp} + "appresult_def.ini", "[result]\ncount = 1\nresult_001 = fail\n");
    write(std::string{kApp} + "appresult.ini", "[unclosed\n");
    write(std::string{kApp} + "applist.ini", "[zel packages]\nname_001 = a\n");
    verify();
    EXPECT_THAT(lines("[App]"), IsEmpty()) << "the default set has no list, the customer's result is no INI file";
}

TEST_F(Verification, OfApplicationsWithoutACountHasNoLines) {
    make_good();
    for (const char *result : {"[result]\nresult_001 = fail\n", "[result]\ncount = -3\n", "[result]\ncount = x\n"}) {
        write(std::string{kApp} + "appresult.ini", result);
        write(std::string{kApp} + "applist.ini", "[zel packages]\n");
        verify();
        EXPECT_THAT(lines("[App]"), ElementsAre("+[App][Default] App NOT existed.")) << result;
    }
}

TEST_F(Verification, OfApplicationsEndsWhenTheListIsFull) {
    make_good();
    write(std::string{kApp} + "applist_def.ini", "[zel packages]\n");
    write(std::string{kApp} + "appresult_def.ini", "[result]\ncount = 2147483647\n");
    EXPECT_EQ(verify(), 1);
    EXPECT_EQ(count_, 1000);
    EXPECT_STREQ(results()[998].text, "[App][Default999] File unknown,Result unknown");
    EXPECT_STREQ(results()[999].text, "[App][Default1000] File unknown,Result unknown");
    EXPECT_THAT(report(), HasSubstr("Pass count : 1000\nFailure count : 0\n"));
}

TEST_F(Verification, CutsALineAt305BytesItsLabelIncluded) {
    make_good();
    write(std::string{kApp} + "applist.ini", "[zel packages]\nname_001 = " + std::string(400, 'n') + "\n");
    write(std::string{kApp} + "appresult.ini", "[result]\ncount = 1\ndescription_001 = op=x\nresult_001 = success\n");
    write_customer("BTU", "<GeneralInfo><CountryISO>" + std::string(400, 'c') + "</CountryISO></GeneralInfo>");
    set_string("db/zel/country_iso", "GB");
    verify();
    ASSERT_EQ(count_, 3);
    EXPECT_EQ(std::string{results()[1].text}, "[App][Customer1] " + std::string(288, 'n'));
    EXPECT_EQ(results()[1].passed, 1);
    EXPECT_EQ(std::string{results()[2].text}, "[Spec][CountryISO] Spec='" + std::string(280, 'c'));
    EXPECT_EQ(results()[2].passed, 0);
}

// Two application lines come first, so N compared values make N + 2 lines.
TEST_F(Verification, KeepsAThousandLinesAndLosesTheRest) {
    make_active("BTU");
    set_int(kGpsKey, 1);
    const auto lines_of_values = [&](int values, const char *last) {
        std::string elements;
        for (int i = 1; i < values; ++i)
            elements += "<GPSActivation>on</GPSActivation>";
        write_customer("BTU", "<GPS>" + elements + "<GPSActivation>" + last + "</GPSActivation></GPS>");
        EXPECT_EQ(verify(), 1);
        return count_;
    };
    EXPECT_EQ(lines_of_values(997, "on"), 999);
    EXPECT_THAT(report(), HasSubstr("Pass count : 999\nFailure count : 0\n"));
    EXPECT_EQ(lines_of_values(998, "off"), 1000);
    EXPECT_EQ(results()[999].passed, 0);
    EXPECT_THAT(report(), HasSubstr("Pass count : 999\nFailure count : 1\n"));
    EXPECT_EQ(lines_of_values(999, "off"), 1000);
    EXPECT_EQ(results()[999].passed, 1) << "the failed line is lost";
    EXPECT_THAT(report(), HasSubstr("Verification Result : NOT OK!\n")) << "but it counts";
    EXPECT_THAT(report(), HasSubstr("Pass count : 999\nFailure count : 1\n"));
    EXPECT_EQ(lines_of_values(1001, "off"), 1000);
    EXPECT_THAT(report(), HasSubstr("Verification Result : OK!\n")) << "no line behind the thousandth value is known";
}

TEST_F(Verification, ForImeiOfAGoodPhoneIsZeroAndAnEmptyText) {
    make_good();
    char line[16] = "what was before";
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 0);
    EXPECT_STREQ(line, "");
    EXPECT_THAT(report(), HasSubstr("Verification Result : OK!\n"));
}

TEST_F(Verification, ForImeiWithoutACustomerIsOneFailure) {
    char line[64];
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1);
    EXPECT_STREQ(line, "Pre-configuration not found!");
    char few[5] = {'x', 'x', 'x', 'x', 'x'};
    EXPECT_EQ(zel_svc_config_verification_for_imei(few, 4), 1);
    EXPECT_STREQ(few, "Pre");
    EXPECT_EQ(few[4], 'x') << "behind the caller's size nothing is written";
    EXPECT_EQ(zel_svc_config_verification_for_imei(nullptr, 64), 1);
    set_string("db/zel/salescode", "DEF");
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1);
    EXPECT_FALSE(exists(std::string{kOutput} + "zel-verification-report.log")) << "nothing was verified";
}

TEST_F(Verification, ForImeiCutsTheLineToTheCallersSize) {
    make_good();
    set_int(kGpsKey, 0);
    char line[12] = {'x', 'x', 'x', 'x', 'x', 'x', 'x', 'x', 'x', 'x', 'x', 'x'};
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, 11), 1);
    EXPECT_STREQ(line, "[Spec][GPS");
    EXPECT_EQ(line[11], 'x');
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, 0), 1);
    EXPECT_STREQ(line, "[Spec][GPS") << "a size of 0 touches nothing";
    EXPECT_EQ(zel_svc_config_verification_for_imei(nullptr, 11), 1);
}

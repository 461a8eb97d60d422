#include "program.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>

using namespace zel_test;
using ::testing::HasSubstr;
using ::testing::Not;
using ::testing::StartsWith;

namespace {

constexpr const char *kMark = "\xEF\xBB\xBF";
constexpr const char *kGpsKey = "db/location/setting/GpsEnabled";
constexpr const char *kReport = "/opt/system/zel-default/output/zel-verification-report.log";

struct ZelVerify : ZelCommand {
    // A phone of XFV whose file says these things; the location switch is on.
    void make_phone(const std::string &more = "") {
        set_string("db/zel/salescode", "XFV");
        set_int(kGpsKey, 1);
        write_file("<GPS><GPSActivation>on</GPSActivation></GPS>" + more);
    }
    void write_file(const std::string &elements) {
        write("/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml",
              kMark + ("<CustomerData>" + elements) + "</CustomerData>");
    }
    static std::string content_of(const std::string &path) {
        std::ifstream file{path, std::ios::binary};
        return {std::istreambuf_iterator<char>{file}, {}};
    }
    nlohmann::json json_that_differs(std::vector<std::string> arguments) {
        arguments.emplace_back("--json");
        const Outcome outcome = run_zel(arguments);
        EXPECT_EQ(outcome.code, 4) << outcome.err;
        return nlohmann::json::parse(outcome.out);
    }
};

} // namespace

TEST_F(ZelVerify, OfAPhoneThatIsWhatItsPackageSaysExitsZero) {
    make_phone();
    const Outcome outcome = run_zel({"verify"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    EXPECT_EQ(outcome.out, "Package        Q0000NXBBBB1\n"
                           "Sales code     XFV\n"
                           "Result         OK: the phone has all 1 values of the customer's file\n"
                           "Media folders  0 of 0 figures changed since the install\n"
                           "Applications   0 of 2 results are failures\n"
                           "\n"
                           "RESULT  VALUE              EXPECTED          PHONE\n"
                           "pass    Default            App NOT existed.\n"
                           "pass    Customer           App NOT existed.\n"
                           "pass    GPS/GPSActivation  on                on\n");
    EXPECT_THAT(read(kReport), HasSubstr("Verification Result : OK!\n"));
}

TEST_F(ZelVerify, ShowsFailuresFirstAndExitsFour) {
    make_phone();
    set_int(kGpsKey, 0);
    const Outcome outcome = run_zel({"verify"});
    EXPECT_EQ(outcome.code, 4);
    EXPECT_THAT(outcome.out,
                HasSubstr("\nResult         NOT OK: the phone differs in 1 of 1 values of the customer's file\n"));
    EXPECT_THAT(outcome.out, HasSubstr("PHONE\nFAILURE  GPS/GPSActivation  on                off\n"
                                       "pass     Default            App NOT existed.\n"));
    const Outcome failures = run_zel({"verify", "--failures"});
    EXPECT_EQ(failures.code, 4);
    EXPECT_THAT(failures.out, HasSubstr("FAILURE  GPS/GPSActivation"));
    EXPECT_THAT(failures.out, Not(HasSubstr("pass ")));
}

TEST_F(ZelVerify, OfAChangedMediaFolderExitsFourThoughTheResultIsOk) {
    make_phone();
    write("/opt/system/zel-default/output/zel-fs-status-config.ini", "[media]\nimage_size = 0\n");
    write("/opt/usr/media/Images/a.png", "12345");
    const Outcome outcome = run_zel({"verify", "--failures"});
    EXPECT_EQ(outcome.code, 4);
    EXPECT_THAT(outcome.out, HasSubstr("Result         OK: "));
    EXPECT_THAT(outcome.out, HasSubstr("Media folders  2 of 20 figures changed since the install\n"));
    EXPECT_THAT(outcome.out, HasSubstr("FAILURE  media/image size   0         5\n"));
    EXPECT_THAT(read(kReport), HasSubstr("Verification Result : OK!\n"));
}

TEST_F(ZelVerify, TellsTheInternalNameOfASharedFolder) {
    set_string("db/zel/salescode", "UFN");
    write("/opt/system/zel/mps/ZEL/Customer/TFG/customer.xml", kMark + std::string{"<CustomerData></CustomerData>"});
    EXPECT_THAT(run_zel({"verify"}).out, HasSubstr("Sales code     UFN (internal name TFG)\n"));
    EXPECT_EQ(json_of({"verify"})["internal_name"], "TFG");
}

TEST_F(ZelVerify, JsonHoldsEveryValue) {
    make_phone("<GeneralInfo><CountryISO>GB</CountryISO></GeneralInfo>");
    set_string("db/zel/country_iso", "FR");
    const nlohmann::json answer = json_that_differs({"verify"});
    EXPECT_EQ(answer["package"], "Q0000NXBBBB1");
    EXPECT_EQ(answer["sales_code"], "XFV");
    EXPECT_EQ(answer["ok"], false);
    EXPECT_EQ(answer["failed"], (nlohmann::json{{"spec", 1}, {"media", 0}, {"applications", 0}}));
    ASSERT_EQ(answer["values"].size(), 4U);
    EXPECT_EQ(answer["values"][0]["kind"], "application");
    EXPECT_EQ(answer["values"][3], (nlohmann::json{{"kind", "spec"},
                                                   {"passed", false},
                                                   {"value", "CountryISO"},
                                                   {"expected", "GB"},
                                                   {"phone", "FR"},
                                                   {"line", "[Spec][CountryISO] Spec='GB',Phone='FR'"}}));
    EXPECT_EQ(json_that_differs({"verify", "--failures"})["values"].size(), 1U);
}

TEST_F(ZelVerify, JsonIsValidForAnyBytesOfThePhone) {
    make_phone("<GeneralInfo><CountryISO>GB</CountryISO></GeneralInfo>");
    set_string("db/zel/country_iso", "\x1B[31m\"\n\xD8\x9C\xE2\x80\xAE',Phone='x");
    const nlohmann::json value = json_that_differs({"verify"})["values"][3];
    EXPECT_EQ(value["value"], "CountryISO");
    EXPECT_EQ(value["phone"], "\x1B[31m\"\n\xD8\x9C\xE2\x80\xAE',Phone='x");
    const std::string shown = run_zel_on_terminal({"verify"}).out;
    EXPECT_EQ(shown.find('\x1B'), std::string::npos);
    EXPECT_THAT(shown, HasSubstr("\\x0A\\u{061C}\\u{202E}'"));
}

TEST_F(ZelVerify, LongValuesAreShortInTheTableAndWholeInJson) {
    const std::string country(100, 'x');
    make_phone("<GeneralInfo><CountryISO>" + country + "</CountryISO></GeneralInfo>");
    set_string("db/zel/country_iso", country);
    EXPECT_THAT(run_zel({"verify"}).out, HasSubstr("CountryISO         " + std::string(57, 'x') + "...  xxx"));
    EXPECT_EQ(json_of({"verify"})["values"][3]["phone"], country);
}

TEST_F(ZelVerify, ForImeiPrintsTheCountAndTheFirstFailure) {
    make_phone();
    Outcome outcome = run_zel({"verify", "--imei"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_EQ(outcome.out, "0\n");
    set_int(kGpsKey, 0);
    outcome = run_zel({"verify", "--imei"});
    EXPECT_EQ(outcome.code, 4);
    EXPECT_EQ(outcome.out, "1\n[Spec][GPS/GPSActivation] Spec='on',Phone='off'\n");
    EXPECT_EQ(json_that_differs({"verify", "--imei"}),
              (nlohmann::json{{"failed", 1}, {"first", "[Spec][GPS/GPSActivation] Spec='on',Phone='off'"}}));
}

TEST_F(ZelVerify, WithoutAnActiveCustomerFails) {
    const Outcome outcome = run_zel({"verify"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr("has no active customer"));
    EXPECT_EQ(outcome.out, "");
    const Outcome imei = run_zel({"verify", "--imei"});
    EXPECT_EQ(imei.code, 4);
    EXPECT_EQ(imei.out, "1\nPre-configuration not found!\n");
}

TEST_F(ZelVerify, OfAFileThatCannotBeReadToItsEndFails) {
    make_phone();
    write_file("<A =1></A>");
    const Outcome outcome = run_zel({"verify"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr("Customer/XFV/customer.xml:1:"));
    EXPECT_THAT(outcome.out,
                HasSubstr("Result         INCOMPLETE: the phone has all 0 values that could be compared\n"));
}

// Nothing failed, but nobody may take that for a phone that is what its package says.
TEST_F(ZelVerify, OfAFileThatCannotBeReadToItsEndIsNowhereOk) {
    make_phone();
    write_file("<GPS><GPSActivation>on</GPSActivation></GPS><A =1></A>");
    const std::string folder = make_folder();
    const Outcome outcome = run_zel({"verify", "--json", "--html", folder + "/page.html"});
    EXPECT_EQ(outcome.code, 1);
    const auto answer = nlohmann::json::parse(outcome.out);
    EXPECT_EQ(answer["ok"], false);
    EXPECT_EQ(answer["failed"]["spec"], 0);
    ASSERT_EQ(answer["problems"].size(), 1U);
    EXPECT_THAT(answer["problems"][0]["problem"].get<std::string>(), HasSubstr("customer.xml:1:"));
    const std::string page = content_of(folder + "/page.html");
    EXPECT_THAT(page, HasSubstr("<p class=\"verdict not-ok\">INCOMPLETE</p>\n<ul class=\"problems\">\n<li>"));
    EXPECT_THAT(page, HasSubstr("customer.xml:1:"));
    const Outcome imei = run_zel({"verify", "--imei"});
    EXPECT_EQ(imei.code, 1);
    EXPECT_EQ(imei.out, "0\n");
    EXPECT_THAT(imei.err, HasSubstr("customer.xml:1:"));
    remove_folder(folder);
}

TEST_F(ZelVerify, RefusesOptionsThatCannotGoTogether) {
    make_phone();
    for (const std::vector<std::string> &words : {std::vector<std::string>{"verify", "--imei", "--html", "page.html"},
                                                  {"verify", "--imei", "--failures"},
                                                  {"verify", "--json", "--html", "-"}}) {
        const Outcome outcome = run_zel(words);
        EXPECT_EQ(outcome.code, 2) << words[1];
        EXPECT_EQ(outcome.out, "");
        EXPECT_THAT(outcome.err, StartsWith("zel: verify: --"));
    }
    EXPECT_FALSE(exists(kReport)) << "nothing was done";
}

TEST_F(ZelVerify, PageGoesToStandardOutputInPlaceOfTheReport) {
    make_phone();
    const std::string folder = make_folder();
    const Outcome outcome = run_zel({"verify", "--html", "-"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_THAT(outcome.out, StartsWith("<!DOCTYPE html>\n"));
    run_zel({"verify", "--html", folder + "/page.html"});
    EXPECT_EQ(outcome.out, content_of(folder + "/page.html"));
    remove_folder(folder);
}

TEST_F(ZelVerify, WhoseReportCannotBeWrittenFails) {
    make_phone();
    fail("zel_platform_open", kReport);
    const Outcome outcome = run_zel({"verify"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr(std::string{"cannot write the report to "} + kReport));
    EXPECT_THAT(outcome.out, HasSubstr("GPS/GPSActivation")) << "the values are printed all the same";
}

TEST_F(ZelVerify, WarnsWhenThereIsNoRoomForFurtherValues) {
    std::string elements;
    for (int i = 0; i < 999; ++i)
        elements += "<GPSActivation>on</GPSActivation>";
    make_phone("<GPS>" + elements + "</GPS>");
    const Outcome outcome = run_zel({"verify", "--failures"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr("no room for more than 1000 values"));
}

TEST_F(ZelVerify, MasksPasswordsUntilTheyAreAskedFor) {
    make_phone("<SyncML><NbDataSync>1</NbDataSync></SyncML>");
    call("sync-accounts-add", {{"name", "backup"}, {"password", "secret-of-the-phone"}});
    write_file("<SyncML><NbDataSync>1</NbDataSync><DataSync><AccName>backup</AccName>"
               "<Password>secret-of-the-package</Password></DataSync></SyncML>");
    const std::string folder = make_folder();
    const std::vector<std::string> words{"verify", "--html", folder + "/page.html"};
    for (const std::vector<std::string> &options : {std::vector<std::string>{}, {"--json"}}) {
        std::vector<std::string> all = words;
        all.insert(all.end(), options.begin(), options.end());
        const Outcome hidden = run_zel(all);
        EXPECT_EQ(hidden.code, 4);
        EXPECT_THAT(hidden.out, HasSubstr("SyncML_DS1/Password"));
        EXPECT_THAT(hidden.out, Not(HasSubstr("secret-of")));
        EXPECT_THAT(content_of(folder + "/page.html"), Not(HasSubstr("secret-of")));
        all.emplace_back("--reveal");
        EXPECT_THAT(run_zel(all).out, HasSubstr("secret-of-the-phone"));
        EXPECT_THAT(content_of(folder + "/page.html"), HasSubstr("secret-of-the-package"));
    }
    remove_folder(folder);
}

// A lap is two numbers, of which the second lost its sign in print.
TEST_F(ZelVerify, PageShowsLapsInTheirTrueLength) {
    make_phone();
    write("/opt/system/zel-default/output/zel-time-lap.log",
          "Time lap (Spec) : 2.4294467296 sec\nTime lap (App) : 0.7 sec\nTime lap (Spec(SIM2)/APN) : 1.250000 sec\n"
          "Time lap (Usr) : 1.5\nTime lap (Usr) : x.5 sec\nTime lap (Usr) : 1.99999999999 sec\nsomething else\n"
          "Time lap (Set back) : 4294967295.4294467296 sec");
    const std::string folder = make_folder();
    EXPECT_EQ(run_zel({"verify", "--html", folder + "/page.html"}).code, 0);
    const std::string page = content_of(folder + "/page.html");
    for (const char *lap :
         {"<span>Spec</span>", "<span>1.500 s</span>", "<span>App</span>", "<span>0.000 s</span>",
          "<span>Spec(SIM2)/APN</span>", "<span>1.250 s</span>", "<span>Set back</span>", "<span>-1.500 s</span>",
          "<rect width=\"100.00\"", "<rect width=\"83.33\"", "<rect width=\"0.00\""})
        EXPECT_THAT(page, HasSubstr(lap));
    EXPECT_THAT(page, Not(HasSubstr("<span>Usr</span>")));
    remove_folder(folder);
}

TEST_F(ZelVerify, ShowsWhatAServiceCouldNotTellAsItStands) {
    make_phone("<Browser><NbBookmark>1</NbBookmark><Bookmark><URL>http://a.example.com/</URL></Bookmark></Browser>");
    const nlohmann::json value = json_that_differs({"verify", "--failures"})["values"][1];
    EXPECT_EQ(value["value"], "Bookmark1");
    EXPECT_EQ(value["expected"], "Reading phone failed");
    EXPECT_EQ(value["phone"], "");
    EXPECT_EQ(value["line"], "[Spec][Bookmark1] Reading phone failed");
    const std::string folder = make_folder();
    EXPECT_EQ(run_zel({"verify", "--html", folder + "/page.html"}).code, 4);
    EXPECT_THAT(content_of(folder + "/page.html"),
                HasSubstr("<span>Bookmark1</span><i>Reading phone failed</i></div>"));
    remove_folder(folder);
}

TEST_F(ZelVerify, PageIsOneFile) {
    make_phone("<GeneralInfo><CountryISO>&lt;b&gt;GB</CountryISO></GeneralInfo>");
    set_string("db/zel/country_iso", "<script>alert(1)</script>");
    const std::string folder = make_folder();
    EXPECT_EQ(run_zel({"verify", "--html", folder + "/page.html"}).code, 4);
    const std::string page = content_of(folder + "/page.html");
    EXPECT_THAT(page, StartsWith("<!DOCTYPE html>\n"));
    EXPECT_THAT(page, HasSubstr("<i data-is=\"package\">&lt;b&gt;GB</i><u data-is=\"phone\">"
                                "&lt;script&gt;alert(1)&lt;/script&gt;</u>"));
    EXPECT_THAT(page, Not(HasSubstr("alert(1)</script>")));
    EXPECT_THAT(page, Not(HasSubstr("http://")));
    EXPECT_THAT(page, Not(HasSubstr("https://")));
    const Outcome outcome = run_zel({"verify", "--html", folder + "/missing/page.html"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err,
                HasSubstr("cannot write the page to '" + folder + "/missing/page.html': No such file or directory\n"));
    EXPECT_THAT(outcome.out, HasSubstr("FAILURE  CountryISO")) << "the values are printed all the same";
    remove_folder(folder);
}

// An exported document is a customer's file: installed on a second phone, it makes that phone say the same.

#include "program.h"

#include "support/source-dir.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>
#include <regex>

using namespace zel_test;
using ::testing::HasSubstr;
using ::testing::Not;

namespace {

std::string output_of(const std::vector<std::string> &words, int code = 0) {
    const Outcome outcome = run_zel(words);
    EXPECT_EQ(outcome.code, code) << words[2] << outcome.err;
    return outcome.out;
}

// A phone with the example package beside the test's own.
class OtherPhone {
  public:
    OtherPhone() { output_of({"--root", root(), "phone", "create", "--package", source_dir() + "/examples/package"}); }
    OtherPhone(const OtherPhone &) = delete;
    OtherPhone &operator=(const OtherPhone &) = delete;
    ~OtherPhone() { remove_folder(folder_); }

    [[nodiscard]] std::string root() const { return folder_ + "/phone"; }
    std::string run(std::vector<std::string> words, int code = 0) const {
        words.insert(words.begin(), {"--root", root()});
        return output_of(words, code);
    }
    // Puts a document in the place of a customer's file, and installs it.
    void install(const std::string &customer, const std::string &folder, const std::string &document,
                 int code = 0) const {
        const std::string path = root() + "/opt/system/zel/mps/ZEL/Customer/" + folder + "/customer.xml";
        std::ofstream{path, std::ios::binary | std::ios::trunc} << document;
        run({"install", customer}, code);
    }

  private:
    std::string folder_ = make_folder();
};

struct Sold {
    const char *customer;
    const char *folder;
};
constexpr Sold kSold[] = {{"XFV", "XFV"}, {"UFN", "TFG"}, {"INS", "INS"}, {"IMN", "IMN"}, {"MCI", "MCI"}};

std::string without_connections(const std::string &document) {
    const std::size_t start = document.find("    <Connections>\n");
    const std::size_t end = document.find("    </Connections>\n");
    EXPECT_NE(end, std::string::npos);
    return end == std::string::npos ? document : document.substr(0, start) + document.substr(end);
}

struct ExportRoundTrip : ZelCommand {};

} // namespace

TEST_F(ExportRoundTrip, OfAnInstallableDocumentGivesTheSameDocument) {
    for (const Sold &sold : kSold) {
        const OtherPhone first;
        first.run({"install", sold.customer});
        const std::string document = first.run({"export", "--installable"});
        EXPECT_THAT(document, HasSubstr("    </NetworkInfo>\n  </GeneralInfo>\n")) << sold.customer;
        const OtherPhone second;
        second.install(sold.customer, sold.folder, document);
        EXPECT_EQ(second.run({"export", "--installable"}), document) << sold.customer;
    }
}

TEST_F(ExportRoundTrip, WithoutNetworksLosesTheProfilesAlone) {
    for (const Sold &sold : kSold) {
        const OtherPhone first;
        first.run({"install", sold.customer});
        const std::string document = first.run({"export"});
        const OtherPhone second;
        second.install(sold.customer, sold.folder, document);
        const std::string again = second.run({"export"});
        EXPECT_EQ(without_connections(again), without_connections(document)) << sold.customer;
        EXPECT_THAT(again, Not(HasSubstr("<Profile>"))) << sold.customer;
    }
}

namespace {

// What a key of the settings store becomes when the document of a phone is installed on a second one.
struct Passed {
    std::string value;
    std::string written;
    std::string becomes;
    int code = 0; // of the second install
};

} // namespace

TEST_F(ExportRoundTrip, OfOddTextsIsAsTheDocumentationTells) {
    const OtherPhone first;
    const OtherPhone second;
    first.run({"install", "MCI"});
    for (const Passed &text :
         {Passed{"A & B", "A &amp; B", "A & B"}, Passed{"&lt;b&gt;", "&amp;lt;b&amp;gt;", "<b>"},
          Passed{" \t GB ", " \t GB ", "GB "}, Passed{"\"GB\" 'x' >", "\"GB\" 'x' >", "\"GB\" 'x' >"},
          Passed{"G<B", "G<B", "G", 1}, Passed{std::string(250, 'x'), std::string(199, 'x'), std::string(199, 'x')}}) {
        first.run({"vconf", "set", "db/zel/country_iso", text.value});
        const std::string document = first.run({"export"});
        EXPECT_THAT(document, HasSubstr("<CountryISO>" + text.written + "</CountryISO>\n"));
        // What stands behind a "<" is read as a tag; the value in front of it counts.
        second.install("MCI", "MCI", document, text.code);
        EXPECT_EQ(second.run({"vconf", "get", "db/zel/country_iso"}), text.becomes + "\n") << text.value;
    }
}

TEST_F(ExportRoundTrip, OfAnUnreadableNumberIsZeroAndOfAnUnreadableWordNothing) {
    const OtherPhone first;
    const OtherPhone second;
    first.run({"install", "XFV"});
    second.run({"install", "XFV"});
    const std::string policy = second.run({"vconf", "get", "file/private/wifi/sleep_policy"});
    first.run({"vconf", "unset", "db/private/com.quorvex.message-lite/sms_page_limit"});
    first.run({"vconf", "unset", "file/private/wifi/sleep_policy"});
    const std::string document = first.run({"export"});
    EXPECT_THAT(document, HasSubstr("<PageLimit>?\?</PageLimit>\n"));
    EXPECT_THAT(document, HasSubstr("<SleepPolicy>?\?</SleepPolicy>\n"));
    second.install("XFV", "XFV", document);
    EXPECT_EQ(second.run({"vconf", "get", "db/private/com.quorvex.message-lite/sms_page_limit"}), "0\n");
    EXPECT_EQ(second.run({"vconf", "get", "file/private/wifi/sleep_policy"}), policy);
}

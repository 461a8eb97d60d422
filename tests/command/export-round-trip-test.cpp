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

std::string good_output(const std::vector<std::string> &words) {
    const Outcome outcome = run_zel(words);
    EXPECT_EQ(outcome.code, 0) << words[2] << outcome.err;
    return outcome.out;
}

// A phone with the example package beside the test's own.
class OtherPhone {
  public:
    OtherPhone() {
        good_output({"--root", root(), "phone", "create", "--package", source_dir() + "/examples/package"});
    }
    OtherPhone(const OtherPhone &) = delete;
    OtherPhone &operator=(const OtherPhone &) = delete;
    ~OtherPhone() { remove_folder(folder_); }

    [[nodiscard]] std::string root() const { return folder_ + "/phone"; }
    std::string run(std::vector<std::string> words) const {
        words.insert(words.begin(), {"--root", root()});
        return good_output(words);
    }
    // Puts a document in the place of a customer's file, and installs it.
    void install(const std::string &customer, const std::string &folder, const std::string &document) const {
        const std::string path = root() + "/opt/system/zel/mps/ZEL/Customer/" + folder + "/customer.xml";
        std::ofstream{path, std::ios::binary | std::ios::trunc} << document;
        run({"install", customer});
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

// The report of a verification and the document of an export where they cannot be written.

#include "service-phone.h"

#include <gmock/gmock.h>

#include <csignal>
#include <memory>
#include <sys/resource.h>
#include <sys/stat.h>

namespace {

using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::StartsWith;

constexpr const char *kOutput = "/opt/system/zel-default/output";
constexpr const char *kReport = "/opt/system/zel-default/output/zel-verification-report.log";
constexpr const char *kStatus = "/opt/system/zel-default/output/zel-fs-status-verify.ini";
constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";
constexpr const char *kPending = "/opt/system/zel-default/output/customer-phone.xml.new";
constexpr const char *kEarlier = "an earlier one\n";
constexpr const char *kFailed = "[Spec][GPS/GPSActivation] Spec='on',Phone='off'";

// No file of this process grows beyond a size: the file system is full.
class FullAt {
  public:
    explicit FullAt(rlim_t size) {
        std::signal(SIGXFSZ, SIG_IGN);
        ::getrlimit(RLIMIT_FSIZE, &before_);
        const struct rlimit limit = {size, before_.rlim_max};
        EXPECT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    }
    FullAt(const FullAt &) = delete;
    FullAt &operator=(const FullAt &) = delete;
    ~FullAt() { ::setrlimit(RLIMIT_FSIZE, &before_); }

  private:
    struct rlimit before_ = {};
};

// A phone of customer BTU, of whose two values one is not what the file says.
class OutputFaults : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        set_string("db/zel/salescode", "BTU");
        set_string("db/zel/country_iso", "GB");
        set_int("db/location/setting/GpsEnabled", 0);
        write_customer("BTU", "<GeneralInfo><CountryISO>GB</CountryISO></GeneralInfo>"
                              "<GPS><GPSActivation>on</GPSActivation></GPS>");
    }

    int verify() { return zel_svc_config_verification(results_.get(), &count_); }
    // The list is as long as ever, and the IMEI tool's answer is what it is on a phone with a report.
    void expect_full_list() {
        EXPECT_EQ(count_, 4);
        EXPECT_STREQ(results_[3].text, kFailed);
        char line[64] = "";
        EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1);
        EXPECT_STREQ(line, kFailed);
    }
    void expect_good_report() {
        EXPECT_EQ(verify(), 1);
        EXPECT_THAT(read(kReport), StartsWith("ZEL Version : Q0000NXBBBB1\nSales code : BTU\n"));
        EXPECT_THAT(read(kReport), EndsWith(std::string{kFailed} + " ==> Failure\n"));
    }
    void expect_good_export() {
        EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
        EXPECT_THAT(read(kDocument), HasSubstr("<CountryISO>GB</CountryISO>"));
        EXPECT_THAT(read(kDocument), EndsWith("</CustomerData>\n"));
        EXPECT_FALSE(exists(kPending));
    }
    void make_folder(const char *path) { ASSERT_EQ(::mkdir((root() + path).c_str(), 0755), 0); }
    void move_outputs(const char *from, const char *to) {
        ASSERT_EQ(::rename((root() + from).c_str(), (root() + to).c_str()), 0);
    }

    int count_ = -1;
    std::unique_ptr<ZelSvcVerificationResult[]> results_ =
        std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
};

} // namespace

TEST_F(OutputFaults, OfAReportWithoutItsFolderGiveZeroAndMakeNone) {
    move_outputs(kOutput, "/opt/moved");
    EXPECT_EQ(verify(), 0);
    expect_full_list();
    EXPECT_FALSE(exists(kOutput));
    move_outputs("/opt/moved", kOutput);
    expect_good_report();
}

TEST_F(OutputFaults, OfAReportWhoseNameIsAFoldersGiveZero) {
    make_folder(kReport);
    EXPECT_EQ(verify(), 0);
    expect_full_list();
    EXPECT_EQ(call("stat", {{"path", kReport}})["kind"], "folder");
}

TEST_F(OutputFaults, OfAReportOnAFullDiskGiveZeroAndTakeTheEarlierOne) {
    write(kReport, kEarlier);
    fail("disk_full", kReport);
    EXPECT_EQ(verify(), 0);
    expect_full_list();
    EXPECT_FALSE(exists(kReport)) << "a report of another day would tell another phone";
    call("fault-clear");
    expect_good_report();
}

TEST_F(OutputFaults, OfAReportThatFallsShortGiveOneForItWasOpened) {
    const int whole = verify();
    EXPECT_EQ(whole, 1);
    const std::string report = read(kReport);
    {
        const FullAt limit{100};
        EXPECT_EQ(verify(), 1);
    }
    EXPECT_EQ(read(kReport), report.substr(0, 100));
    expect_good_report();
    EXPECT_EQ(read(kReport), report);
}

TEST_F(OutputFaults, OfAReportThatCannotBeDeletedAppendNothingToIt) {
    write(kReport, kEarlier);
    fail("zel_platform_open_parent", kReport);
    expect_good_report();
}

TEST_F(OutputFaults, OfTheStatusOnAFullDiskTakeTheMediaLinesOnly) {
    write(std::string{kOutput} + "/zel-fs-status-config.ini", "[media]\nimage_size = 5\nimage_count = 1\n");
    write("/opt/usr/media/Images/a.png", "12345");
    fail("disk_full", kStatus);
    EXPECT_EQ(verify(), 1);
    expect_full_list();
    EXPECT_FALSE(exists(kStatus));
    call("fault-clear");
    EXPECT_EQ(verify(), 1);
    EXPECT_EQ(count_, 24);
    EXPECT_STREQ(results_[8].text, "[FS] media/image size 5=>5");
}

// What was written of it is compared: a size that is missing is 0.
TEST_F(OutputFaults, OfAStatusThatFallsShortFailTheMediaLinesOnly) {
    write(std::string{kOutput} + "/zel-fs-status-config.ini", "[media]\nimage_size = 5\nimage_count = 1\n");
    write("/opt/usr/media/Images/a.png", "12345");
    {
        const FullAt limit{0};
        EXPECT_EQ(verify(), 1);
    }
    ASSERT_EQ(count_, 24);
    EXPECT_STREQ(results_[8].text, "[FS] media/image size 5=>0");
    EXPECT_STREQ(results_[9].text, "[FS] media/image count 1=>0");
    EXPECT_EQ(results_[8].passed + results_[9].passed, 0);
    EXPECT_STREQ(results_[23].text, kFailed);
    EXPECT_EQ(read(kReport), "") << "nor was there room for the report";
    expect_good_report();
}

TEST_F(OutputFaults, OfADocumentOnAFullDiskGiveZeroAndKeepTheEarlierOne) {
    write(kDocument, kEarlier);
    for (const char *what : {kPending, ""}) {
        fail("disk_full", what);
        EXPECT_EQ(zel_svc_config_encoding_xml(), 0) << what;
        EXPECT_EQ(read(kDocument), kEarlier);
        EXPECT_FALSE(exists(kPending));
        call("fault-clear");
    }
    expect_good_export();
}

TEST_F(OutputFaults, OfADocumentAtEachSizeThatIsTooSmallGiveZero) {
    expect_good_export();
    const std::string whole = read(kDocument);
    for (const std::size_t size : {std::size_t{0}, std::size_t{1}, whole.size() / 2, whole.size() - 1}) {
        write(kDocument, kEarlier);
        const FullAt limit{size};
        EXPECT_EQ(zel_svc_config_encoding_xml(), 0) << size;
        EXPECT_EQ(read(kDocument), kEarlier);
        EXPECT_FALSE(exists(kPending));
    }
    const FullAt limit{whole.size()};
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    EXPECT_EQ(read(kDocument), whole);
}

TEST_F(OutputFaults, OfADocumentWhoseNameIsAFoldersGiveZeroAndLeaveNothing) {
    make_folder(kDocument);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 0);
    EXPECT_EQ(call("stat", {{"path", kDocument}})["kind"], "folder");
    EXPECT_FALSE(exists(kPending));
}

TEST_F(OutputFaults, OfADocumentWhosePendingNameIsAFoldersKeepTheEarlierOne) {
    write(kDocument, kEarlier);
    make_folder(kPending);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 0);
    EXPECT_EQ(read(kDocument), kEarlier);
}

TEST_F(OutputFaults, OfADocumentsFolderKeepNothingFromTheNextExport) {
    move_outputs(kOutput, "/opt/moved");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 0);
    EXPECT_FALSE(exists(kOutput));
    move_outputs("/opt/moved", kOutput);
    expect_good_export();
}

// The library's own reader finds nothing in the example package that it does not know or accept.

#include "base/zel-svc-observer.h"
#include "spec/zel-svc-spec-file.h"
#include "spec/zel-svc-xml.h"
#include "support/source-dir.h"

#include "support/bench-phone.h"

#include <fstream>
#include <gmock/gmock.h>
#include <iterator>
#include <string>
#include <vector>

namespace {

const std::string kPackage = zel_test::source_dir() + "/examples/package/mps/ZEL";

std::string file_of_workstation(const std::string &path) {
    std::ifstream file{path, std::ios::binary};
    return {std::istreambuf_iterator<char>{file}, {}};
}

class Listener : public ZelSvcObserver {
  public:
    void refused_text(std::string_view tag, std::string_view text, std::int32_t /*offset*/) override {
        refused.push_back(std::string{tag} + "=" + std::string{text});
    }
    void unknown_element(std::string_view tag, std::int32_t /*offset*/) override { unknown.emplace_back(tag); }
    void disabled_element(std::string_view tag, std::int32_t /*offset*/) override { disabled.emplace_back(tag); }
    void parsed_file(std::string_view /*path*/, std::int32_t result, ZelSvcTextPosition /*end*/) override {
        results.push_back(result);
    }

    std::vector<std::string> refused;
    std::vector<std::string> unknown;
    std::vector<std::string> disabled;
    std::vector<std::int32_t> results;
};

class ExamplePackage : public zel_test::BenchPhone, public ::testing::WithParamInterface<const char *> {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        zel_svc_set_observer(&listener);
    }
    void TearDown() override {
        zel_svc_set_observer(nullptr);
        BenchPhone::TearDown();
    }

    Listener listener;
};

TEST_P(ExamplePackage, IsReadToItsEndWithoutAnythingUnknownOrRefused) {
    const std::string phone_path = std::string{ZEL_SVC_SPEC_ROOT} + GetParam();
    write(phone_path, file_of_workstation(kPackage + GetParam()));

    // Header mode reads everything and installs the least.
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_HEADER;
    ASSERT_EQ(1, zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, phone_path.c_str(), 1));

    EXPECT_THAT(listener.results, ::testing::ElementsAre(ZEL_SVC_XML_OK));
    EXPECT_THAT(listener.unknown, ::testing::IsEmpty());
    EXPECT_THAT(listener.refused, ::testing::IsEmpty());
    EXPECT_THAT(listener.disabled, ::testing::Each(std::string{"SW-Configuration"}));
}

INSTANTIATE_TEST_SUITE_P(SpecFiles, ExamplePackage,
                         ::testing::Values("/SW_Configuration.xml", "/Customer/XFV/customer.xml",
                                           "/Customer/INS/customer.xml", "/Customer/TFG/customer.xml",
                                           "/Customer/IMN/customer.xml", "/Customer/MCI/customer.xml"));

} // namespace

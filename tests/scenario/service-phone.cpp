#include "service-phone.h"

#include "support/lines.h"

#include <algorithm>
#include <memory>

namespace zel_test {

namespace {

constexpr const char *kDeclaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

} // namespace

void ServicePhone::write_header(const std::string &elements) {
    write_spec(kHeader, kDeclaration + ("<SW-Configuration>\n" + elements) + "</SW-Configuration>\n");
}

void ServicePhone::write_customer(const std::string &customer, const std::string &elements) {
    write_spec("/opt/system/zel/mps/ZEL/Customer/" + customer + "/customer.xml",
               kDeclaration + ("<CustomerData>\n" + elements) + "</CustomerData>\n");
}

bool ServicePhone::group_is_marked(const std::string &group) {
    return read(data_path(group)).find("kept") != std::string::npos;
}

std::vector<std::string> ServicePhone::run_log_lines() { return lines_of(run_log()); }

std::vector<std::string> ServicePhone::laps() {
    std::vector<std::string> phases;
    for (const std::string &line : lines_of(read(kLapLog))) {
        const std::string head = "Time lap (";
        const std::size_t end = line.find(") : ");
        if (line.rfind(head, 0) == 0 && end != std::string::npos)
            phases.push_back(line.substr(head.size(), end - head.size()));
        else
            phases.push_back("unexpected: " + line);
    }
    return phases;
}

::testing::AssertionResult ServicePhone::logged_in_order(const std::vector<std::string> &lines) {
    const std::vector<std::string> log = run_log_lines();
    auto place = log.begin();
    for (const std::string &line : lines) {
        place = std::find(place, log.end(), line);
        if (place == log.end())
            return ::testing::AssertionFailure() << "missing or too early: " << line << "\n" << run_log();
        ++place;
    }
    return ::testing::AssertionSuccess();
}

bool ServicePhone::logged(const std::string &line) {
    const std::vector<std::string> log = run_log_lines();
    return std::find(log.begin(), log.end(), line) != log.end();
}

bool ServicePhone::system_logged(const std::string &text) {
    const std::string end = ") > " + text;
    for (const std::string &message : system_log())
        if (message.size() >= end.size() && message.compare(message.size() - end.size(), end.size(), end) == 0)
            return true;
    return false;
}

std::vector<std::string> ServicePhone::verified_lines(std::string_view begin) {
    const auto results = std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
    std::int32_t count = INT32_MIN; // what a caller's variable may hold
    EXPECT_EQ(zel_svc_config_verification(results.get(), &count), 1);
    std::vector<std::string> lines;
    for (std::int32_t i = 0; i < count; ++i) {
        const ZelSvcVerificationResult &result = results[static_cast<std::size_t>(i)];
        if (std::string_view{result.text}.starts_with(begin))
            lines.push_back((result.passed == 1 ? "+" : "-") + std::string{result.text});
    }
    return lines;
}

} // namespace zel_test

#include "verification.h"

#include "auto-flags.h"
#include "package-check.h"
#include "secrets.h"

#include <zel-svc.h>

#include <algorithm>

namespace zel_command {
namespace {

constexpr const char *kReportPath = "/opt/system/zel-default/output/zel-verification-report.log";

bool take(std::string_view &text, std::string_view prefix) {
    if (!text.starts_with(prefix)) return false;
    text.remove_prefix(prefix.size());
    return true;
}

// "[GPS/GPSActivation] Spec='on',Phone='off'"
void read_spec_line(VerifiedValue &value, std::string_view text) {
    constexpr std::string_view kSpec = "] Spec='";
    constexpr std::string_view kPhone = "',Phone='";
    const std::size_t spec = text.find(kSpec);
    const std::size_t phone = spec == std::string_view::npos ? spec : text.find(kPhone, spec + kSpec.size());
    const std::size_t label_end = std::min(text.find(']'), text.size());
    value.label = text.substr(text.starts_with('[') ? 1 : 0, label_end - (text.starts_with('[') ? 1 : 0));
    value.secret = is_secret(value.label);
    // A line that was cut has no values that could be told from each other.
    if (phone == std::string_view::npos || !text.ends_with('\'')) {
        value.expected = text.substr(std::min(label_end + 2, text.size()));
        return;
    }
    value.compared = true;
    const std::size_t first = spec + kSpec.size();
    const std::size_t second = phone + kPhone.size();
    value.expected = text.substr(first, phone - first);
    if (second < text.size()) value.phone = text.substr(second, text.size() - 1 - second);
}

// "media/image size 10=>20"
void read_media_line(VerifiedValue &value, std::string_view text) {
    const std::size_t blank = text.rfind(' ');
    const std::size_t arrow = text.rfind("=>");
    value.label = text.substr(0, blank);
    if (blank == std::string_view::npos || arrow == std::string_view::npos || arrow < blank) return;
    value.compared = true;
    value.expected = text.substr(blank + 1, arrow - blank - 1);
    value.phone = text.substr(arrow + 2);
}

// "[Customer1] com.example.shop(tpk,install),fail"
void read_application_line(VerifiedValue &value, std::string_view text) {
    const std::size_t end = std::min(text.find(']'), text.size());
    value.label = text.substr(std::min<std::size_t>(1, end), end - std::min<std::size_t>(1, end));
    value.expected = text.substr(std::min(end + 2, text.size()));
}

std::string package_version() {
    char version[20] = {};
    zel_svc_config_get_zel_bin_version(version, sizeof version);
    return version;
}

std::string active_customer() {
    char customer[10] = {};
    zel_svc_config_get_active_customer_name(customer, sizeof customer);
    return customer;
}

void add_problems(Verification &found, const RunWatch &watch) {
    found.problems = customer_file_problems(watch);
    // The library's list holds no more, so there may have been more.
    if (found.values.size() >= ZEL_SVC_MAX_RESULTS)
        found.problems.push_back("there is no room for more than " + std::to_string(ZEL_SVC_MAX_RESULTS) +
                                 " values; further ones may differ unseen");
    found.complete = found.problems.empty();
    if (!found.report_written) found.problems.push_back(std::string{"cannot write the report to "} + kReportPath);
}

} // namespace

VerifiedValue verified_value(std::string_view line, bool passed) {
    VerifiedValue value{VerifiedKind::kSpec, passed, false, false, std::string{line}, {}, {}, {}};
    if (take(line, "[FS] ")) {
        value.kind = VerifiedKind::kMedia;
        read_media_line(value, line);
    } else if (take(line, "[App]")) {
        value.kind = VerifiedKind::kApplication;
        read_application_line(value, line);
    } else {
        take(line, "[Spec]");
        read_spec_line(value, line);
    }
    return value;
}

VerifiedValue shown(VerifiedValue value, bool reveal) {
    if (reveal || !value.secret) return value;
    value.expected = masked(value.expected);
    value.phone = masked(value.phone);
    if (!value.compared) value.text = "[Spec][" + value.label + "] " + value.expected;
    if (value.compared)
        value.text = "[Spec][" + value.label + "] Spec='" + value.expected + "',Phone='" + value.phone + "'";
    return value;
}

std::string VerifiedValue::group() const {
    if (kind == VerifiedKind::kMedia) return "Media folders";
    if (kind == VerifiedKind::kApplication) return "Applications";
    const std::size_t slash = label.find('/');
    return slash == std::string::npos ? "Main settings" : label.substr(0, slash);
}

std::size_t Verification::count(VerifiedKind kind) const {
    return static_cast<std::size_t>(
        std::count_if(values.begin(), values.end(), [&](const VerifiedValue &value) { return value.kind == kind; }));
}

std::size_t Verification::failed(VerifiedKind kind) const {
    return static_cast<std::size_t>(std::count_if(
        values.begin(), values.end(), [&](const VerifiedValue &value) { return value.kind == kind && !value.passed; }));
}

std::size_t Verification::failed() const {
    return static_cast<std::size_t>(
        std::count_if(values.begin(), values.end(), [](const VerifiedValue &value) { return !value.passed; }));
}

std::vector<std::string> customer_file_problems(const RunWatch &watch) {
    std::vector<std::string> problems;
    const std::string path = customer_file_path(active_customer());
    for (const FileProblem &problem : watch.file_problems())
        if (problem.path == path) problems.push_back(problem_text(problem));
    return problems;
}

std::string Verification::verdict() const {
    if (failed(VerifiedKind::kSpec) != 0) return "NOT OK";
    return complete ? "OK" : "INCOMPLETE";
}

Verification verify_phone(const RunWatch &watch) {
    Verification found;
    found.sales_code = active_customer();
    found.internal_name = internal_name_of(found.sales_code);
    found.package_version = package_version();
    std::vector<ZelSvcVerificationResult> results(ZEL_SVC_MAX_RESULTS);
    std::int32_t count = 0;
    found.report_written = zel_svc_config_verification(results.data(), &count) == 1;
    for (std::size_t i = 0; i < static_cast<std::size_t>(count); ++i)
        found.values.push_back(verified_value(results[i].text, results[i].passed == 1));
    add_problems(found, watch);
    return found;
}

} // namespace zel_command

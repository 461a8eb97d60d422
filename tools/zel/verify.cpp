// Is this phone what its package says?

#include "auto-flags.h"
#include "commands.h"
#include "failure.h"
#include "package-check.h"
#include "time-laps.h"
#include "verification.h"
#include "verify-page.h"

#include <zel-svc.h>

#include <base/zel-svc-text.h>

#include <algorithm>
#include <fstream>

namespace zel_command {
namespace {

constexpr const char *kReportPath = "/opt/system/zel-default/output/zel-verification-report.log";
constexpr const char *kLapPath = "/opt/system/zel-default/output/zel-time-lap.log";
constexpr std::size_t kShownWidth = 60; // of a value in the table; the report and the page hold all of it

const char *kind_name(VerifiedKind kind) {
    if (kind == VerifiedKind::kMedia) return "media";
    return kind == VerifiedKind::kApplication ? "application" : "spec";
}

std::string sales_code_text(const Verification &found) {
    if (found.internal_name == found.sales_code) return found.sales_code;
    return found.sales_code + " (internal name " + found.internal_name + ")";
}

std::string result_text(const Verification &found) {
    const std::size_t failed = found.failed(VerifiedKind::kSpec);
    const std::string all = std::to_string(found.count(VerifiedKind::kSpec)) + " values of the customer's file";
    if (failed == 0) return "OK: the phone has all " + all;
    return "NOT OK: the phone differs in " + std::to_string(failed) + " of " + all;
}

std::string failed_text(const Verification &found, VerifiedKind kind, const char *what) {
    return std::to_string(found.failed(kind)) + " of " + std::to_string(found.count(kind)) + " " + what;
}

std::string short_text(const std::string &text) {
    if (text.size() <= kShownWidth) return text;
    return text.substr(0, zel_svc_text_cut(text, kShownWidth - 3)) + "...";
}

// Failures first; each part keeps the order of the report.
void print_values(const Verification &found, const Invocation &invocation) {
    std::vector<std::vector<std::string>> rows;
    for (const bool passed : {false, true}) {
        if (passed && invocation.has("failures")) continue;
        for (const VerifiedValue &value : found.values) {
            if (value.passed != passed) continue;
            const VerifiedValue seen = shown(value, invocation.reveal);
            rows.push_back(
                {passed ? "pass" : "FAILURE", seen.label, short_text(seen.expected), short_text(seen.phone)});
        }
    }
    if (rows.empty()) return;
    print_line("");
    print_table({"RESULT", "VALUE", "EXPECTED", "PHONE"}, rows);
}

void print_page(const Verification &found, const Invocation &invocation) {
    print_table({}, {{"Package", found.package_version},
                     {"Sales code", sales_code_text(found)},
                     {"Result", result_text(found)},
                     {"Media folders", failed_text(found, VerifiedKind::kMedia, "figures changed since the install")},
                     {"Applications", failed_text(found, VerifiedKind::kApplication, "results are failures")}});
    print_values(found, invocation);
}

Json value_json(const VerifiedValue &value, bool reveal) {
    const VerifiedValue seen = shown(value, reveal);
    Json entry{{"kind", kind_name(seen.kind)}, {"passed", seen.passed}};
    put_text(entry, "value", seen.label);
    put_text(entry, "expected", seen.expected);
    put_text(entry, "phone", seen.phone);
    put_text(entry, "line", seen.text);
    return entry;
}

void print_verification_json(const Verification &found, const Invocation &invocation) {
    Json answer = Json::object();
    put_text(answer, "package", found.package_version);
    put_text(answer, "sales_code", found.sales_code);
    put_text(answer, "internal_name", found.internal_name);
    const std::size_t failed = found.failed(VerifiedKind::kSpec);
    answer["ok"] = failed == 0;
    answer["failed"] = Json{{"spec", failed},
                            {"media", found.failed(VerifiedKind::kMedia)},
                            {"applications", found.failed(VerifiedKind::kApplication)}};
    answer["values"] = Json::array();
    for (const VerifiedValue &value : found.values)
        if (!value.passed || !invocation.has("failures"))
            answer["values"].push_back(value_json(value, invocation.reveal));
    print_json(answer);
}

// The page is about the phone, so the laps are those of its last install.
void write_page(const Verification &found, const Invocation &invocation) {
    Json answer;
    const bool has_laps = invocation.phone.try_call("read", {{"path", kLapPath}}, answer) == 0;
    const std::string page = verify_page(
        {found, has_laps ? time_laps(bytes_of(answer, "content")) : std::vector<TimeLap>{}, invocation.reveal});
    const std::string path = invocation.value("html");
    std::ofstream file{path, std::ios::binary};
    file << page;
    if (!file.flush()) throw Failure{kFailed, "verify: cannot write the page to '" + path + "'"};
}

void print_imei_answer(const Invocation &invocation, int failed, const std::string &line) {
    const VerifiedValue first = shown(verified_value(line, false), invocation.reveal);
    if (invocation.json) {
        Json answer{{"failed", failed}};
        put_text(answer, "first", first.text);
        return print_json(answer);
    }
    print_line(std::to_string(failed));
    if (!first.text.empty()) print_line(escaped_line(first.text));
}

int verify_for_imei(const Invocation &invocation) {
    ZelSvcVerificationResult first{};
    const int failed = zel_svc_config_verification_for_imei(first.text, sizeof first.text);
    print_imei_answer(invocation, failed, first.text);
    return failed == 0 ? kDone : kDifferences;
}

// What makes the answer worth less than it looks.
std::vector<std::string> problems_of(const Verification &found, const RunWatch &watch) {
    std::vector<std::string> problems;
    const std::string path = customer_file_path(found.sales_code);
    for (const FileProblem &problem : watch.file_problems())
        if (problem.path == path) problems.push_back(problem_text(problem));
    if (!found.report_written) problems.push_back(std::string{"cannot write the report to "} + kReportPath);
    if (found.is_full())
        problems.push_back("there is no room for more than " + std::to_string(ZEL_SVC_MAX_RESULTS) +
                           " values; further ones may differ unseen");
    return problems;
}

} // namespace

int verify(Invocation &invocation) {
    if (zel_svc_config_chk_active_customer_exist() == 0 && !invocation.has("imei"))
        throw Failure{kFailed, "verify: the phone in '" + invocation.root + "' has no active customer",
                      "Configure it with 'zel install CUSTOMER' first."};
    const RunWatch watch{invocation.verbose};
    if (invocation.has("imei")) return verify_for_imei(invocation);
    const Verification found = verify_phone();
    if (invocation.json)
        print_verification_json(found, invocation);
    else
        print_page(found, invocation);
    if (invocation.has("html")) write_page(found, invocation);
    const std::vector<std::string> problems = problems_of(found, watch);
    for (const std::string &problem : problems)
        report("verify: " + problem);
    if (!problems.empty()) return kFailed;
    return found.failed() == 0 ? kDone : kDifferences;
}

} // namespace zel_command

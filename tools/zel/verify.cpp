// Is this phone what its package says?

#include "commands.h"
#include "failure.h"
#include "output-file.h"
#include "time-laps.h"
#include "verification.h"
#include "verify-page.h"

#include <zel-svc.h>

#include <base/zel-svc-text.h>

namespace zel_command {
namespace {

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
    const std::string all = std::to_string(found.count(VerifiedKind::kSpec));
    const std::string what = found.complete ? " values of the customer's file" : " values that could be compared";
    if (failed == 0) return found.verdict() + ": the phone has all " + all + what;
    return found.verdict() + ": the phone differs in " + std::to_string(failed) + " of " + all + what;
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

void print_report(const Verification &found, const Invocation &invocation) {
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
    answer["ok"] = found.verdict() == "OK";
    answer["failed"] = Json{{"spec", found.failed(VerifiedKind::kSpec)},
                            {"media", found.failed(VerifiedKind::kMedia)},
                            {"applications", found.failed(VerifiedKind::kApplication)}};
    answer["values"] = Json::array();
    for (const VerifiedValue &value : found.values)
        if (!value.passed || !invocation.has("failures"))
            answer["values"].push_back(value_json(value, invocation.reveal));
    answer["problems"] = Json::array();
    for (const std::string &problem : found.problems)
        put_text(answer["problems"].emplace_back(Json::object()), "problem", problem);
    print_json(answer);
}

// The page is about the phone, so the laps are those of its last install.
std::string page_of(const Verification &found, const Invocation &invocation) {
    Json answer;
    const bool has_laps = invocation.phone.try_call("read", {{"path", kLapPath}}, answer) == 0;
    return verify_page(
        {found, has_laps ? time_laps(bytes_of(answer, "content")) : std::vector<TimeLap>{}, invocation.reveal});
}

void print_verification(const Verification &found, const Invocation &invocation) {
    if (invocation.json) return print_verification_json(found, invocation);
    if (invocation.has("html") && !invocation.names_file("html")) return print(page_of(found, invocation));
    print_report(found, invocation);
}

// An empty text when there is nothing to say.
std::string write_page(const Verification &found, const Invocation &invocation) {
    if (!invocation.names_file("html")) return {};
    const std::string path = invocation.value("html");
    const std::string error = write_file(path, page_of(found, invocation));
    return error.empty() ? error : "cannot write the page to '" + path + "': " + error;
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

// Each on standard error; the exit code that they make of another.
int reported(const std::vector<std::string> &problems, int code) {
    for (const std::string &problem : problems)
        report("verify: " + problem);
    return problems.empty() ? code : kFailed;
}

int verify_for_imei(const Invocation &invocation, const RunWatch &watch) {
    ZelSvcVerificationResult first{};
    const int failed = zel_svc_config_verification_for_imei(first.text, sizeof first.text);
    print_imei_answer(invocation, failed, first.text);
    return reported(customer_file_problems(watch), failed == 0 ? kDone : kDifferences);
}

// Words that would not do what they say.
void check_options(const Invocation &invocation) {
    if (invocation.has("imei") && (invocation.has("failures") || invocation.has("html")))
        throw Failure{kUsage, "verify: --imei goes with neither --failures nor --html"};
    if (invocation.json && invocation.has("html") && !invocation.names_file("html"))
        throw Failure{kUsage, "verify: --json and --html - both want standard output"};
}

} // namespace

int verify(Invocation &invocation) {
    check_options(invocation);
    if (zel_svc_config_chk_active_customer_exist() == 0 && !invocation.has("imei"))
        throw Failure{kFailed, "verify: the phone in '" + invocation.root + "' has no active customer",
                      "Configure it with 'zel install CUSTOMER' first."};
    const RunWatch watch{invocation.verbose};
    if (invocation.has("imei")) return verify_for_imei(invocation, watch);
    const Verification found = verify_phone(watch);
    print_verification(found, invocation);
    std::vector<std::string> problems = found.problems;
    if (std::string problem = write_page(found, invocation); !problem.empty()) problems.push_back(std::move(problem));
    return reported(problems, found.failed() == 0 ? kDone : kDifferences);
}

} // namespace zel_command

#include "spec/zel-svc-verification.h"

#include "base/zel-svc-text.h"

#include <array>
#include <memory>
#include <new>
#include <string>

namespace {

struct Result {
    std::unique_ptr<ZelSvcVerificationLine> line;
    int flag = 1;
};

std::array<Result, ZEL_SVC_VERIFICATION_MAX> gResults;
std::size_t gResultCount = 0;

} // namespace

void zel_svc_verification_clear_results() {
    gResults = {};
    gResultCount = 0;
}

void zel_svc_verification_add_result(std::string_view line, bool matched) {
    if (line.empty() || line.front() == '\0' || gResultCount == gResults.size()) return;
    std::unique_ptr<ZelSvcVerificationLine> copy{new (std::nothrow) ZelSvcVerificationLine};
    if (!copy) return;
    zel_svc_text_copy(copy->text, sizeof copy->text, line);
    Result &result = gResults[gResultCount++];
    result.line = std::move(copy);
    result.flag = matched ? 1 : 0;
}

void zel_svc_verification_add_compared(std::string_view label, std::string_view spec, std::string_view phone,
                                       bool matched) {
    std::string line;
    line.reserve(label.size() + spec.size() + phone.size() + 24);
    line.append("[").append(label).append("] Spec='").append(spec).append("',Phone='").append(phone).append("'");
    zel_svc_verification_add_result(line, matched);
}

int zel_svc_verification_count() { return static_cast<int>(gResultCount); }

const char *zel_svc_verification_line(std::size_t index) {
    const auto &line = gResults.at(index).line;
    return line ? line->text : nullptr;
}

int zel_svc_verification_flag(std::size_t index) { return gResults.at(index).flag; }

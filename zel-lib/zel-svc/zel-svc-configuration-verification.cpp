// Whether the phone is what its customer's file says.

#include "zel-svc-configuration-verification.h"

#include "base/zel-svc-guard.h"
#include "base/zel-svc-text.h"
#include "spec/zel-svc-verification.h"

#include <algorithm>
#include <array>

namespace {

ZelSvcVerifiedPhone who_is_verified() {
    ZelSvcVerifiedPhone phone;
    phone.customer = zel_svc_current_customer();
    auto &version = phone.package_version;
    zel_svc_config_get_zel_bin_version(version.data(), static_cast<int>(version.width));
    return phone;
}

// Each part goes on where another one ran out of memory.
int verify(ZelSvcResultList &list) {
    const ZelSvcVerifiedPhone phone = who_is_verified();
    zel_svc_guarded([&] { zel_svc_config_verify_media(list); });
    zel_svc_guarded([&] { zel_svc_config_verify_applications(list); });
    int failed = 0;
    zel_svc_guarded([&] { failed = zel_svc_config_verify_spec(phone.customer.folder.view(), list); });
    return zel_svc_config_write_report(phone, list, failed) ? 1 : 0;
}

// Of the one verification that runs at a time: too large for a caller's stack.
std::array<ZelSvcVerificationResult, ZEL_SVC_MAX_RESULTS> gResults;

int count_failures(char *buffer, std::size_t size) {
    std::int32_t count = 0;
    zel_svc_config_verification(gResults.data(), &count);
    zel_svc_text_copy(buffer, size, {});
    const auto end = gResults.begin() + count;
    const auto failed = [](const ZelSvcVerificationResult &result) { return result.passed == 0; };
    const auto first = std::find_if(gResults.begin(), end, failed);
    if (first != end) zel_svc_text_copy(buffer, size, zel_svc_text_view(first->text, sizeof first->text));
    return static_cast<int>(std::count_if(first, end, failed));
}

} // namespace

void ZelSvcResultList::add(std::string_view text, bool passed) {
    if (is_full()) return;
    ZelSvcVerificationResult &entry = results_[(*count_)++];
    zel_svc_text_copy(entry.text, sizeof entry.text, text);
    entry.passed = passed ? 1 : 0;
}

int zel_svc_config_verification(ZelSvcVerificationResult *results, int32_t *count) {
    if (!results || !count) return 0;
    ZelSvcResultList list{results, count};
    const int written = zel_svc_guarded_or(0, [&] { return verify(list); });
    zel_svc_verification_clear_results();
    return written;
}

int zel_svc_config_verification_for_imei(char *buffer, int size) {
    const std::size_t room = buffer ? zel_svc_buffer_size(size) : 0;
    if (zel_svc_current_customer().code.empty()) {
        zel_svc_text_copy(buffer, room, "Pre-configuration not found!");
        return 1;
    }
    return count_failures(buffer, room);
}

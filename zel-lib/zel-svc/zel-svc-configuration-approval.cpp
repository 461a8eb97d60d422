// The approval versions of the phone's software, kept in an INI file that the image carries.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-ini.h"
#include "base/zel-svc-text.h"
#include "zel-svc.h"

#include <cstring>

namespace {

constexpr const char *kApprovalPath = "/opt/system/zel-default/usr/zel/zel-approval-ver.ini";
constexpr const char *kAp = "info:ap";
constexpr const char *kCp = "info:cp";
constexpr const char *kZel = "info:zel";

// An empty value may stand in the file as two quotes; that, and what sorts before it (as bytes), states nothing.
bool is_version(std::string_view value) { return value > std::string_view{"\"\""}; }

template <std::size_t N> bool fill(char (&field)[N], const ZelSvcIni &file, const char *key) {
    const std::string_view value = zel_svc_text_view(file.text(key));
    if (!is_version(value)) return false;
    zel_svc_text_copy(field, N, value);
    return true;
}

bool fill_versions(ZelSvcApprovalVersion &versions) {
    const ZelSvcIni file = ZelSvcIni::load(kApprovalPath);
    if (!file) return false;
    const bool ap = file.has(kAp) && fill(versions.ap, file, kAp);
    // A package's version is approved together with the communication processor's, never without one.
    if (!file.has(kCp)) return ap;
    const bool cp = fill(versions.cp, file, kCp);
    const bool zel = fill(versions.zel, file, kZel);
    return ap || cp || zel;
}

bool states_a_version() {
    const ZelSvcIni file = ZelSvcIni::load(kApprovalPath);
    return file && (file.has(kAp) || file.has(kCp) || file.has(kZel));
}

} // namespace

int zel_svc_config_get_approval_version(ZelSvcApprovalVersion *result) {
    if (!result) return 0;
    std::memset(result, 0, sizeof *result);
    return zel_svc_guarded_or(0, [=] { return fill_versions(*result) ? 1 : 0; });
}

int zel_svc_config_chk_approval_version_exist() {
    return zel_svc_guarded_or(0, [] { return states_a_version() ? 1 : 0; });
}

#include "zel-svc-configuration-verification.h"

#include "base/zel-svc-fs-status.h"
#include "base/zel-svc-ini.h"
#include "base/zel-svc-number.h"
#include "base/zel-svc-text.h"

namespace {

// Sizes use all of an unsigned 32-bit number, which the INI library's own reading does not.
std::uint32_t size_in(const ZelSvcIni &status, const std::string &key) {
    return zel_svc_unsigned_from_text(zel_svc_text_view(status.text(key)));
}

// "size 10=>20": after the install, now.
template <class Number>
void compare(ZelSvcResultList &list, std::string_view category, std::string_view what, Number before, Number now) {
    std::string line = "[FS] media/";
    line.append(category).append(" ").append(what).append(" ");
    line.append(std::to_string(before)).append("=>").append(std::to_string(now));
    list.add(line, before == now);
}

} // namespace

void zel_svc_config_verify_media(ZelSvcResultList &list) {
    __zel_svc_config_fs_status_write(0);
    const ZelSvcIni before = ZelSvcIni::load(ZEL_SVC_FS_STATUS_CONFIG_PATH);
    const ZelSvcIni now = ZelSvcIni::load(ZEL_SVC_FS_STATUS_VERIFY_PATH);
    if (!before || !now) return;
    for (const char *category : ZEL_SVC_FS_STATUS_CATEGORIES) {
        const std::string key = std::string{"media:"} + category;
        compare(list, category, "size", size_in(before, key + "_size"), size_in(now, key + "_size"));
        compare(list, category, "count", before.number(key + "_count", 0), now.number(key + "_count", 0));
    }
}

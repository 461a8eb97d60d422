#include "zel-svc-sim-auto-setting-log.h"

#include "base/zel-svc-file.h"

#include <array>
#include <cstdarg>
#include <cstdio>
#include <fcntl.h>

namespace {

constexpr std::size_t kShownDigits = 3;

} // namespace

ZelSvcSimMessage zel_svc_sim_message(const char *format, ...) {
    std::array<char, 1024> text{}; // longer than a message, so that its cut falls on a whole character
    std::va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(text.data(), text.size(), format, arguments);
    va_end(arguments);
    return ZelSvcSimMessage{std::string_view{text.data()}};
}

void zel_svc_sim_log_append(const char *path, const ZelSvcSimMessage &message) {
    ZelSvcFd log = zel_svc_file_open(path, O_WRONLY | O_CREAT | O_APPEND, 0644);
    if (!log) return;
    zel_svc_file_write_all(log.get(), std::string{message.view()}.append("\n"));
    log.close();
    zel_svc_file_set_output_attr(path, "*");
}

std::string zel_svc_sim_msin_shown(std::string_view msin) {
    return std::string{msin.substr(0, zel_svc_text_cut(msin, kShownDigits))};
}

std::string zel_svc_sim_operator_text(const ZelSvcSimOperator &entry) {
    return zel_svc_sim_text(entry.customer_name) + "_" + zel_svc_sim_text(entry.network_name) + "('" +
           zel_svc_sim_text(entry.mccmnc) + "',(Subset)'" + zel_svc_sim_text(entry.subset_code) + "',(GID)'" +
           zel_svc_sim_text(entry.gid) + "',(SPName)'" + zel_svc_sim_text(entry.sp_name) + "')";
}

#include "zel-svc-sim-auto-setting-log.h"

#include "base/zel-svc-file.h"

#include <array>
#include <cstdarg>
#include <cstdio>
#include <fcntl.h>

namespace {

constexpr std::size_t kShownDigits = 3;

template <std::size_t N> std::string text_of(const char (&field)[N]) {
    return std::string{zel_svc_text_view(field, N)};
}

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
    return text_of(entry.customer_name) + "_" + text_of(entry.network_name) + "('" + text_of(entry.mccmnc) +
           "',(Subset)'" + text_of(entry.subset_code) + "',(GID)'" + text_of(entry.gid) + "',(SPName)'" +
           text_of(entry.sp_name) + "')";
}

#include "zel-svc-configuration-verification.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-text.h"

#include <fcntl.h>

namespace {

constexpr std::string_view kRule = "---------------------------------\n";

std::string_view text_of(const ZelSvcVerificationResult &entry) {
    return zel_svc_text_view(entry.text, sizeof entry.text);
}

std::string head(const ZelSvcVerifiedPhone &phone) {
    std::string text = "ZEL Version : " + phone.package_version + "\nSales code : " + phone.sales_code;
    if (!phone.internal_name.empty()) text += "(internal:" + phone.internal_name + ")";
    return text + '\n';
}

std::string summary(std::size_t count, int failed) {
    std::string text{kRule};
    text += failed > 0 ? "Verification Result : NOT OK!\n" : "Verification Result : OK!\n";
    text += kRule;
    text += "Pass count : " + std::to_string(static_cast<int>(count) - failed) + '\n';
    text += "Failure count : " + std::to_string(failed) + "\n\n";
    return text;
}

std::string lines(const ZelSvcResultList &list) {
    std::string text;
    for (const ZelSvcVerificationResult &entry : list.entries())
        text.append(text_of(entry)).append(entry.passed == 1 ? " ==> Pass\n" : " ==> Failure\n");
    return text;
}

} // namespace

bool zel_svc_config_write_report(const ZelSvcVerifiedPhone &phone, const ZelSvcResultList &list, int failed) {
    zel_svc_file_remove(ZEL_SVC_REPORT_PATH);
    ZelSvcFd report = zel_svc_file_open(ZEL_SVC_REPORT_PATH, O_WRONLY | O_CREAT | O_APPEND, 0644);
    if (!report) return false;
    zel_svc_file_write_all(report.get(), head(phone) + summary(list.entries().size(), failed) + lines(list));
    report.close();
    zel_svc_file_set_output_attr(ZEL_SVC_REPORT_PATH, "*");
    return true;
}

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
    const ZelSvcCurrentCustomer &customer = phone.customer;
    std::string text{"ZEL Version : "};
    text.append(phone.package_version.view()).append("\nSales code : ").append(customer.code.view());
    if (customer.shares_folder) text.append("(internal:").append(customer.folder.view()).append(")");
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
    // Put together before there is a file: without memory there is no report rather than an empty one.
    const std::string text = head(phone) + summary(list.entries().size(), failed) + lines(list);
    // One that could not be removed must not stand in front of this one.
    ZelSvcFd report = zel_svc_file_open(ZEL_SVC_REPORT_PATH, O_WRONLY | O_CREAT | O_TRUNC | O_APPEND, 0644);
    if (!report) return false;
    zel_svc_file_write_all(report.get(), text);
    report.close();
    zel_svc_file_set_output_attr(ZEL_SVC_REPORT_PATH, "*");
    return true;
}

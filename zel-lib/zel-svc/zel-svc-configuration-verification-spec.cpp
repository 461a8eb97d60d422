#include "zel-svc-configuration-verification.h"

#include "base/zel-svc-text.h"
#include "spec/zel-svc-spec-file.h"
#include "spec/zel-svc-verification.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-configuration-recorded-groups.h"
#include "zel-svc-selective-pass.h"

namespace {

// The handlers compare with the phone, and for what it cannot tell with what the install recorded.
void compare_with_phone(const std::string &path) {
    const ZelSvcRecordedGroups groups;
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_PARTIAL;
    zel_svc_guarded([&] { zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_VERIFY, path.c_str(), 1); });
}

int failed_lines() {
    int failed = 0;
    for (std::size_t i = 0; i < static_cast<std::size_t>(zel_svc_verification_count()); ++i)
        failed += zel_svc_verification_flag(i) == 0 ? 1 : 0;
    return failed;
}

void copy_lines(ZelSvcResultList &list) {
    for (std::size_t i = 0; i < static_cast<std::size_t>(zel_svc_verification_count()); ++i)
        list.add(std::string{"[Spec]"}.append(zel_svc_text_view(zel_svc_verification_line(i))),
                 zel_svc_verification_flag(i) == 1);
}

} // namespace

int zel_svc_config_verify_spec(std::string_view customer, ZelSvcResultList &list) {
    const std::string path = zel_svc_customer_spec_path(customer);
    if (path.empty()) return 0;
    // What comes from the SIM card is not compared.
    zel_svc_selective_pass_read_auto_flags(path, ZEL_SVC_PARSE_ACTION_VERIFY);
    zel_svc_verification_clear_results();
    compare_with_phone(path);
    const int failed = failed_lines();
    zel_svc_guarded([&] { copy_lines(list); });
    return failed;
}

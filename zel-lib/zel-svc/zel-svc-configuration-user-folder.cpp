#include "base/zel-svc-file.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"

namespace {

constexpr const char *kUserFolder = "/opt/system/zel-default/usr";

void copy_user_files(std::string_view customer) {
    const std::string source = zel_svc_customer_preconfig_path(customer, "usr");
    zel_svc_guarded([&] { __zel_svc_config_copy_dir(source.c_str(), kUserFolder); });
}

} // namespace

void zel_svc_config_copy_user_folder(std::string_view customer) {
    zel_svc_phase("Copy user folder", ZEL_TIME_LAP_USR, [customer] {
        zel_svc_guarded([] { __zel_svc_config_clear_dir(kUserFolder, 0); });
        copy_user_files(ZEL_SVC_PRECONFIG_EVERY_CUSTOMER);
        copy_user_files(customer);
    });
}

#include "base/zel-svc-file.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"

#include <vconf.h>

namespace {

// The key names the folder: the player picks the power-off animation from it as well.
void offer_animations(std::string_view customer) {
    const std::string folder = zel_svc_customer_preconfig_path(customer, "power-ani");
    if (folder.empty() || __zel_svc_config_file_exists((folder + "/poweron.edj").c_str()) == 0) return;
    vconf_set_str("db/zel/power_ani_file_path", folder.c_str());
}

} // namespace

void zel_svc_config_set_power_animation(std::string_view customer) {
    zel_svc_phase("Set power animation", ZEL_TIME_LAP_NONE, [customer] { offer_animations(customer); });
}

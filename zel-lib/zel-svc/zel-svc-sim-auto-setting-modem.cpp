#include "zel-svc-sim-auto-setting-modem.h"

#include "base/zel-svc-log.h"
#include "base/zel-svc-text.h"
#include "zel-svc-sim-auto-setting-slot.h"

#include <telephony.h>

#include <cstdlib>
#include <memory>

bool gbZelSvcSimAutoSettingSimCpRead = false;

namespace {

struct FreeNames {
    void operator()(char **names) const {
        for (char **name = names; *name; ++name)
            std::free(*name);
        std::free(names);
    }
};
using NameList = std::unique_ptr<char *, FreeNames>;

std::array<FixedText<100>, 2> gModemNames;

void keep_names(char *const *list) {
    for (FixedText<100> &name : gModemNames)
        name.assign(*list ? *list++ : "");
}

} // namespace

bool zel_svc_sim_modems_are_several() {
    const ZelSvcSimNumber slots = zel_svc_sim_number(ZEL_SVC_SIM_SLOT_COUNT_KEY);
    ZEL_SVC_LOG("vconf_get_int(SimSlotCount,%d)=%d run.", slots.value, slots.result);
    return slots.result == 0 && slots.value > 1;
}

bool zel_svc_sim_modem_names_read() {
    if (gbZelSvcSimAutoSettingSimCpRead) {
        ZEL_SVC_LOG("gbZelSvcSimAutoSettingSimCpRead=TRUE.");
        return true;
    }
    const NameList list{tel_get_cp_name_list()};
    if (!list) {
        ZEL_SVC_LOG("tel_get_cp_name_list() failed, return.");
        return false;
    }
    ZEL_SVC_LOG("tel_get_cp_name_list() succeeded.");
    keep_names(list.get());
    gbZelSvcSimAutoSettingSimCpRead = true;
    return true;
}

const char *zel_svc_sim_modem_name(int slot) { return gModemNames[slot == 2 ? 1 : 0].c_str(); }

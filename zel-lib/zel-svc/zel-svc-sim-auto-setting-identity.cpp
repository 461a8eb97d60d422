// Reads who a SIM belongs to: the IMSI, in its parts.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-log.h"
#include "base/zel-svc-text.h"
#include "zel-svc-sim-auto-setting-log.h"
#include "zel-svc-sim-auto-setting-modem.h"

#include <telephony.h>

#include <cstring>
#include <string>

namespace {

// The parts of an IMSI, terminated whatever the modem put there: an MNC that ran on would show the MSIN.
struct Imsi {
    FixedText<sizeof(tel_sim_imsi::mcc)> mcc;
    FixedText<sizeof(tel_sim_imsi::mnc)> mnc;
    FixedText<sizeof(tel_sim_imsi::msin)> msin;
};

template <std::size_t N> FixedText<N> field_of(const char (&bytes)[N]) {
    return FixedText<N>{zel_svc_text_view(bytes, N)};
}

// Null for a phone with one slot, whose only modem needs no name; false when the names cannot be read.
bool find_modem(int slot, const char *&name) {
    name = nullptr;
    if (!zel_svc_sim_modems_are_several()) return true;
    if (!zel_svc_sim_modem_names_read()) return false;
    name = zel_svc_sim_modem_name(slot);
    return true;
}

bool read_imsi(tel_handle *modem, int slot, Imsi &imsi) {
    tel_sim_imsi read = {};
    const int error = tel_get_sim_imsi(modem, &read);
    if (error != 0) {
        ZEL_SVC_LOG("tel_get_sim()=%d failed.", error);
        return false;
    }
    imsi = {field_of(read.mcc), field_of(read.mnc), field_of(read.msin)};
    ZEL_SVC_LOG("[SIM%d] SIM(%s_%s_%s) read.", slot, imsi.mcc.c_str(), imsi.mnc.c_str(),
                zel_svc_sim_msin_shown(imsi.msin.view()).c_str());
    return true;
}

bool read_sim(int slot, Imsi &imsi) {
    const char *name = nullptr;
    if (!find_modem(slot, name)) return false;
    tel_handle *modem = tel_init(name);
    if (!modem) {
        ZEL_SVC_LOG("tapi init() failed.");
        return false;
    }
    ZEL_SVC_LOG("tel_init() succeeded.");
    const bool read = zel_svc_guarded_or(false, [&] { return read_imsi(modem, slot, imsi); });
    tel_deinit(modem);
    ZEL_SVC_LOG("tel_deinit() run.");
    return read;
}

} // namespace

int zel_svc_sim_auto_setting_get_sim_info(ZelSvcSimInfo *info, int slot) {
    if (!info) return 0;
    std::memset(info, 0, sizeof *info);
    return zel_svc_guarded_or(0, [=] {
        Imsi imsi;
        if (!read_sim(slot, imsi)) return 0;
        const std::string mccmnc = std::string{imsi.mcc.view()}.append(imsi.mnc.view());
        zel_svc_text_copy(info->mccmnc, sizeof info->mccmnc, mccmnc);
        zel_svc_text_copy(info->msin, sizeof info->msin, imsi.msin.view());
        return 1;
    });
}

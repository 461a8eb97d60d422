#include "preset/zel-svc-preset.h"

#include "base/zel-svc-guard.h"
#include "base/zel-svc-ini.h"
#include "preset/zel-svc-preset-merge.h"
#include "preset/zel-svc-preset-table.h"

#include <vconf.h>

#include <string>

namespace {

void store_number(const ZelSvcPresetRow &row, const ZelSvcIni &merged, const std::string &key) {
    constexpr int kNoValue = -1;
    const bool boolean = row.type == ZelSvcPresetType::Boolean;
    const int value = boolean ? merged.boolean(key, kNoValue) : merged.number(key, kNoValue);
    if (value == kNoValue) return;
    if (boolean)
        vconf_set_bool(row.store, value);
    else
        vconf_set_int(row.store, value);
}

void apply_row(const ZelSvcPresetRow &row, const ZelSvcIni &merged) {
    const std::string key = std::string{"default:"} + row.key;
    const char *value = merged.text(key);
    if (!value) return;
    if (row.act)
        row.act(value);
    else if (row.type == ZelSvcPresetType::String)
        vconf_set_str(row.store, value);
    else
        store_number(row, merged, key);
}

void apply(const ZelSvcPresetFlags &chosen) {
    const ZelSvcIni merged = ZelSvcIni::load(ZEL_SVC_PRESET_MERGED_PATH);
    for (std::size_t i = 0; i < ZEL_SVC_PRESET_COUNT; ++i)
        if (chosen[i]) zel_svc_guarded([&] { apply_row(ZEL_SVC_PRESETS[i], merged); });
}

} // namespace

void zel_svc_preset_install(std::string_view customer, int kind) {
    ZelSvcPresetFlags chosen = {};
    if (zel_svc_preset_merge(customer, kind, chosen)) apply(chosen);
}

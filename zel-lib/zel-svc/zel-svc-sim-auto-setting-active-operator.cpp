// The operator that SIM auto setting installed for each slot, in the settings store.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-key-text.h"
#include "base/zel-svc-log.h"
#include "base/zel-svc-text.h"
#include "zel-svc-sim-auto-setting-slot.h"
#include "zel-svc.h"

#include <array>
#include <cstring>

namespace {

constexpr const char *kCustomerNameKey = "db/private/zel/sim_auto_op_customer_name"; // one for both slots

struct OperatorField {
    std::size_t offset;
    std::size_t width;      // of the member
    std::size_t read_width; // what a read fills of it
    std::array<ZelSvcSimKey, 2> slots;
    bool told; // every write is logged with its value, not failures only
};

#define ZEL_MEMBER(member) offsetof(ZelSvcSimOperator, member), sizeof(ZelSvcSimOperator::member)

// The GID stands under the key "sp_code" and the subset code under "subset_code", named for where the phone's
// other software looks for them and not for the spec elements they come from. The first slot's word for the
// MCC+MNC lacks the "Auto" of all others; log readers know it so.
constexpr OperatorField kSlotFields[] = {
    {ZEL_MEMBER(network_name),
     40,
     {{{"db/private/zel/sim_auto_op_network_name", "ZelSimAutoOpNetName"},
       {"db/private/zel/sim2/sim_auto_op_network_name", "ZelSim2AutoOpNetName"}}},
     true},
    {ZEL_MEMBER(mccmnc),
     10,
     {{{"db/private/zel/sim_auto_op_mcc_mnc", "ZelSimOpMccMnc"},
       {"db/private/zel/sim2/sim_auto_op_mcc_mnc", "ZelSim2AutoOpMccMnc"}}},
     false},
    {ZEL_MEMBER(subset_code),
     10,
     {{{"db/private/zel/sim_auto_op_subset_code", "ZelSimAutoOpSubSetCode"},
       {"db/private/zel/sim2/sim_auto_op_subset_code", "ZelSim2AutoOpSubSetCode"}}},
     false},
    {ZEL_MEMBER(gid),
     10,
     {{{"db/private/zel/sim_auto_op_sp_code", "ZelSimAutoOpSpCode"},
       {"db/private/zel/sim2/sim_auto_op_sp_code", "ZelSim2AutoOpSpCode"}}},
     false},
    {ZEL_MEMBER(sp_name),
     15, // readers compare it with the 14 bytes that a network entry keeps
     {{{"db/private/zel/sim_auto_op_sp_name", "ZelSimAutoOpSpName"},
       {"db/private/zel/sim2/sim_auto_op_sp_name", "ZelSim2AutoOpSpName"}}},
     false},
};
#undef ZEL_MEMBER

std::size_t slot_index(int slot) { return slot == 2 ? 1 : 0; }

std::string member_text(const ZelSvcSimOperator &entry, const OperatorField &field) {
    const char *bytes = reinterpret_cast<const char *>(&entry) + field.offset;
    return std::string{zel_svc_text_view(bytes, field.width)};
}

bool write_told(const ZelSvcSimKey &slot, const std::string &value) {
    const int result = vconf_set_str(slot.key, value.c_str());
    if (result == 0)
        ZEL_SVC_LOG("vconf_set_str(%s,'%s') succeeded.", slot.word, value.c_str());
    else
        ZEL_SVC_LOG("vconf_set_str(%s,'%s')=%d failed.", slot.word, value.c_str(), result);
    return result == 0;
}

bool write_untold(const ZelSvcSimKey &slot, const std::string &value) {
    const int result = vconf_set_str(slot.key, value.c_str());
    if (result != 0) ZEL_SVC_LOG("vconf_set_str(%s)=%d failed.", slot.word, result);
    return result == 0;
}

// An empty customer name leaves the last customer in force.
bool write_customer_name(const ZelSvcSimOperator &entry) {
    const std::string name{zel_svc_text_view(entry.customer_name, sizeof entry.customer_name)};
    return name.empty() || write_told({kCustomerNameKey, "ZelSimAutoOpCustomerName"}, name);
}

bool write_operator(const ZelSvcSimOperator &entry, int slot) {
    bool written = write_customer_name(entry);
    for (const OperatorField &field : kSlotFields) {
        const std::string value = member_text(entry, field);
        const ZelSvcSimKey &key = field.slots[slot_index(slot)];
        written = (field.told ? write_told(key, value) : write_untold(key, value)) && written;
    }
    return written;
}

bool clear_selections() {
    bool cleared = true;
    for (const ZelSvcSimSlot &slot : kZelSvcSimSlots) {
        const int result = vconf_set_int(slot.selection.key, 0);
        if (result != 0) ZEL_SVC_LOG("vconf_set_int(%s,0)=%d failed.", slot.selection.word, result);
        cleared = result == 0 && cleared;
    }
    return cleared;
}

bool clear_text(const ZelSvcSimKey &key) {
    const int result = vconf_set_str(key.key, "");
    if (result != 0) ZEL_SVC_LOG("vconf_set_str(%s,'')=%d failed.", key.word, result);
    return result == 0;
}

// Without a stored identity, every inserted SIM counts as another one.
bool clear_identities() {
    bool cleared = true;
    for (const ZelSvcSimSlot &slot : kZelSvcSimSlots) {
        cleared = clear_text(slot.mccmnc) && cleared;
        cleared = clear_text(slot.msin) && cleared;
    }
    return cleared;
}

bool clear_changed_flags() {
    bool cleared = true;
    for (const ZelSvcSimSlot &slot : kZelSvcSimSlots)
        cleared = vconf_set_bool(slot.changed.key, 0) == 0 && cleared;
    return cleared;
}

bool clear_operators() {
    const ZelSvcSimOperator nobody = {};
    bool cleared = zel_svc_sim_auto_setting_set_active_operator(&nobody, 1) == 1;
    cleared = zel_svc_sim_auto_setting_set_active_operator(&nobody, 2) == 1 && cleared;
    cleared = clear_selections() && cleared;
    cleared = clear_identities() && cleared;
    return clear_changed_flags() && cleared;
}

// `target` may be null: then it only tells whether the key is there.
bool read_key(const char *key, char *target, std::size_t width) {
    const std::optional<std::string> value = zel_svc_key_text(key);
    if (value && target) zel_svc_text_copy(target, width, *value);
    return value.has_value();
}

bool read_operator(ZelSvcSimOperator *entry, int slot) {
    bool read = read_key(kCustomerNameKey, entry ? entry->customer_name : nullptr, sizeof entry->customer_name);
    for (const OperatorField &field : kSlotFields) {
        char *target = entry ? reinterpret_cast<char *>(entry) + field.offset : nullptr;
        read = read_key(field.slots[slot_index(slot)].key, target, field.read_width) && read;
    }
    return read;
}

} // namespace

int zel_svc_sim_auto_setting_set_active_operator(const ZelSvcSimOperator *operator_entry, int slot) {
    if (!operator_entry) return 0;
    const bool written = zel_svc_guarded_or(false, [=] { return write_operator(*operator_entry, slot); });
    ZEL_SVC_LOG("Setting active operator(vconf) %s.", written ? "succeeded" : "failed");
    return written ? 1 : 0;
}

int zel_svc_sim_auto_setting_clear_active_operator() {
    const bool cleared = zel_svc_guarded_or(false, [] { return clear_operators(); });
    ZEL_SVC_LOG("Clearing active operator(vconf) %s.", cleared ? "succeeded" : "failed");
    return cleared ? 1 : 0;
}

int zel_svc_sim_auto_setting_get_active_operator(ZelSvcSimOperator *operator_entry, int slot) {
    if (operator_entry) std::memset(operator_entry, 0, sizeof *operator_entry);
    return zel_svc_guarded_or(0, [=] { return read_operator(operator_entry, slot) ? 1 : 0; });
}
